#!/usr/bin/env bash
# Installs the peers, builds the benchmarks, runs them and prints the table. Fails if a target is missed.
# With --record the table also goes into docs/performance.md.
# usage: scripts/bench.sh [--record]
set -euo pipefail
cd "$(dirname "$0")/.."

record=no
if [ "${1:-}" = --record ]; then record=yes; fi

scripts/install_packages.sh build bench
launcher=()
if command -v ccache >/dev/null; then
    launcher=(-DCMAKE_C_COMPILER_LAUNCHER=ccache -DCMAKE_CXX_COMPILER_LAUNCHER=ccache)
fi
cmake -S . -B build-bench -G Ninja -DCMAKE_BUILD_TYPE=Release -DVRL_BUILD_BENCH=ON -DVRL_BUILD_TESTS=OFF \
    -DVRL_BUILD_EXAMPLES=OFF "${launcher[@]}"
cmake --build build-bench --target vrl_bench

# The documents are made anew: they shall be what the library writes today.
documents=build-bench/documents
table=build-bench/table.md
rm -rf "$documents"
mkdir -p "$documents"
outcome=0
build-bench/bin/vrl_bench "$documents" >"$table" || outcome=$?
cat "$table"

if [ "$record" = yes ] && [ "$outcome" -le 1 ]; then
    page=docs/performance.md
    {
        sed '/^<!-- table -->$/q' "$page"
        printf '\n'
        grep -v '^vrl_bench:' "$table"
        sed -n '/^<!-- end of table -->$/,$p' "$page"
    } >build-bench/performance.md
    cp build-bench/performance.md "$page"
    echo "recorded in $page"
fi
exit "$outcome"
