#!/usr/bin/env bash
# Builds the fuzz targets and runs each in turn, 60 seconds or as many as are given. Fails on any finding; the
# input that shows it is then in build-fuzz/findings/.
# usage: scripts/fuzz.sh [SECONDS]
set -euo pipefail
cd "$(dirname "$0")/.."

seconds=${1:-60}
scripts/install_packages.sh build fuzz
scripts/build_preset.sh fuzz

# The names of the document format are in the schema; so the dictionary never lags behind it.
dictionary=build-fuzz/fuzz.dict
{
    cat fuzz/xml.dict
    grep -oh '\bname="[^"]*"' schema/*.xsd | sed 's/^name=//' | sort -u
    grep -oh '<xs:enumeration value="[^"]*"' schema/*.xsd | sed 's/^.*value=//' | sort -u
} >"$dictionary"

findings=build-fuzz/findings
mkdir -p "$findings"
failed=0
report=()
for target in scanner document load_save_load packed_load archive; do
    # What this machine found before comes first: new inputs are written there, never among the seeds.
    grown=build-fuzz/corpus/$target
    mkdir -p "$grown"
    corpora=("$grown" "fuzz/corpus/$target")
    if [ "$target" = load_save_load ]; then corpora+=(fuzz/corpus/document); fi
    log=build-fuzz/$target.log
    echo "fuzz_$target: $seconds s"
    outcome=clean
    if ! build-fuzz/bin/fuzz_"$target" -max_total_time="$seconds" -timeout=20 -rss_limit_mb=2500 \
        -max_len=8000 -dict="$dictionary" -artifact_prefix="$findings/$target-" -print_final_stats=1 \
        "${corpora[@]}" >"$log" 2>&1; then
        outcome=FINDING
        failed=1
        tail -n 60 "$log"
    fi
    runs=$(sed -n 's/^stat::number_of_executed_units: *//p' "$log")
    coverage=$(grep -o 'cov: [0-9]* ft: [0-9]* corp: [0-9]*' "$log" | tail -n 1)
    report+=("$(printf '%-16s %9s executions  %s  %s' "$target" "${runs:-0}" "$coverage" "$outcome")")
done

printf '%s\n' "${report[@]}"
exit "$failed"
