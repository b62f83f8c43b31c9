#!/usr/bin/env bash
# Installs the Debian packages of the sets that are named, as root or with sudo. Where nothing is missing it does
# nothing, quickly and without asking for a password.
# usage: scripts/install_packages.sh <build|demo|test|bench|fuzz|lint|coverage>...
set -euo pipefail

packages_of() {
    case $1 in
        # What a configuration with default options looks for, the framework of the tests included.
        build) echo g++ cmake ninja-build ccache pkg-config libxml2-dev zlib1g-dev libbz2-dev nettle-dev libgtest-dev ;;
        demo) echo libxml2-utils unzip ;;
        # Judges from outside: of documents, of archives, of the managed layer.
        test) echo libxml2-utils zip unzip p7zip-full python3 mono-mcs mono-runtime ;;
        # The peers that the benchmarks run beside.
        bench) echo libexpat1-dev libpugixml-dev xsdcxx libxerces-c-dev libzip-dev libminizip-dev ;;
        fuzz) echo clang libclang-rt-dev llvm ;;
        lint) echo clang clang-format clang-tidy ;;
        coverage) echo lcov ;;
        *)
            echo "install_packages.sh: no set of packages is named $1" >&2
            return 1
            ;;
    esac
}

is_installed() {
    [ "$(dpkg-query --show --showformat='${db:Status-Status}' "$1" 2>/dev/null)" = installed ]
}

missing=()
for set in "$@"; do
    packages=$(packages_of "$set")
    for package in $packages; do
        if ! is_installed "$package"; then missing+=("$package"); fi
    done
done
if [ ${#missing[@]} -eq 0 ]; then exit 0; fi

if ! command -v apt-get >/dev/null; then
    echo "install_packages.sh: this is no Debian system; needed are: ${missing[*]}" >&2
    exit 1
fi
as_root=()
if [ "$(id -u)" -ne 0 ]; then
    if ! command -v sudo >/dev/null; then
        echo "install_packages.sh: run it as root, or install: ${missing[*]}" >&2
        exit 1
    fi
    as_root=(sudo)
fi

echo "installing: ${missing[*]}"
"${as_root[@]}" apt-get update -qq
"${as_root[@]}" env DEBIAN_FRONTEND=noninteractive apt-get install -y -qq --no-install-recommends "${missing[@]}"
