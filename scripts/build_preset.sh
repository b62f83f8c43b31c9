#!/usr/bin/env bash
# Configures and builds one preset of CMakePresets.json, through ccache where it is installed.
# usage: scripts/build_preset.sh <preset> [cmake --build option]...
set -euo pipefail
cd "$(dirname "$0")/.."

preset=$1
shift
options=()
if command -v ccache >/dev/null; then
    options+=(-DCMAKE_C_COMPILER_LAUNCHER=ccache -DCMAKE_CXX_COMPILER_LAUNCHER=ccache)
    # What ccache asks for before it keeps what was built on a precompiled header.
    export CCACHE_SLOPPINESS=pch_defines,time_macros
fi
cmake --preset "$preset" "${options[@]}"
cmake --build --preset "$preset" "$@"
