#!/usr/bin/env bash
# Runs the suite with counters in every line and prints how many lines of the hand-written code ran, folder by
# folder, and the files that lie below 95 %. A page a file is in build-coverage/html/.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/install_packages.sh build test coverage
scripts/build_preset.sh coverage
find build-coverage -name '*.gcda' -delete
ctest --preset coverage --parallel "$(nproc)" --quiet

root=$PWD
rooms=(platform runtime V2 codegen zip flat)
included=()
for room in "${rooms[@]}"; do included+=(--include "$root/$room/*"); done
trace=build-coverage/hand_written.info
lcov --quiet --capture --directory build-coverage --base-directory "$root" --no-external \
    "${included[@]}" --output-file "$trace"
genhtml --quiet --prefix "$root" --output-directory build-coverage/html "$trace"

awk -v root="$root/" '
    /^SF:/ { file = substr($0, 4); sub(root, "", file); next }
    # A line comes once for each instance of its template, and for each source that includes it.
    /^DA:/ {
        split(substr($0, 4), line, ",")
        if (!known[file, line[1]]++) ++lines[file]
        if (line[2] > 0 && !hit[file, line[1]]++) ++ran[file]
    }
    END {
        for (f in lines) {
            folder = f; sub(/\/[^\/]*$/, "", folder)
            folder_lines[folder] += lines[f]; folder_ran[folder] += ran[f]
            all_lines += lines[f]; all_ran += ran[f]
            if (ran[f] < 0.95 * lines[f]) {
                printf "below  %-46s %6d of %6d  %5.1f %%\n", f, ran[f], lines[f], 100 * ran[f] / lines[f]
            }
        }
        for (d in folder_lines) {
            printf "folder %-46s %6d of %6d  %5.1f %%\n", d, folder_ran[d], folder_lines[d], 100 * folder_ran[d] / folder_lines[d]
        }
        printf "total  %-46s %6d of %6d  %5.1f %%\n", "hand-written", all_ran, all_lines, 100 * all_ran / all_lines
    }' "$trace" | sort
