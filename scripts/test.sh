#!/usr/bin/env bash
# Installs what is missing, builds, and runs the whole suite: as it ships, then under the address and
# undefined-behavior sanitizers. Ends with ctest's summary, that of the first run that failed if one does.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/install_packages.sh build test
for preset in release asan-ubsan; do
    scripts/build_preset.sh "$preset"
    ctest --preset "$preset" --parallel "$(nproc)"
done
