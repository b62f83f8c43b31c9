#!/usr/bin/env bash
# Form and warnings: clang-format on what is written by hand, then clang-tidy and the warnings of g++ and
# clang++, as errors, on everything, generated sources included. Goes through all of it before it fails.
set -uo pipefail
cd "$(dirname "$0")/.."

scripts/install_packages.sh build test bench lint || exit 1
failed=()

echo "== clang-format"
git ls-files -z '*.h' '*.cpp' ':!:tests/codegen/golden' | xargs -0 clang-format --dry-run -Werror || failed+=(clang-format)

for compiler in g++ clang++; do
    echo "== $compiler"
    folder=build-lint/$compiler
    launcher=()
    if command -v ccache >/dev/null; then launcher=(-DCMAKE_CXX_COMPILER_LAUNCHER=ccache); fi
    # The optimiser sees more, so warnings are asked for at the level that ships. Without precompiled headers each
    # file has to include what it uses.
    cmake -S . -B "$folder" -G Ninja -DCMAKE_BUILD_TYPE=Release -DCMAKE_CXX_COMPILER=$compiler \
        -DVRL_BUILD_BENCH=ON -DCMAKE_EXPORT_COMPILE_COMMANDS=ON \
        -DCMAKE_COMPILE_WARNING_AS_ERROR=ON -DCMAKE_DISABLE_PRECOMPILE_HEADERS=ON "${launcher[@]}" \
        >/dev/null &&
        cmake --build "$folder" -- -k 0 || failed+=("$compiler")
done

echo "== clang-tidy"
run-clang-tidy -quiet -p build-lint/clang++ "$PWD/(platform|runtime|V2|zip|flat|codegen|tests|fuzz|examples|bench)/" ||
    failed+=(clang-tidy)
# Generated functions are lists of calls: exploring the same paths below them two hundred times takes an hour.
run-clang-tidy -quiet -p build-lint/clang++ -checks='-clang-analyzer-*' "$PWD/build-lint/clang[+][+]/generated/" ||
    failed+=("clang-tidy on generated sources")

if [ ${#failed[@]} -gt 0 ]; then
    echo "lint: failed: ${failed[*]}"
    exit 1
fi
echo "lint: clean"
