#!/bin/sh
# Makes the golden files anew: regenerate.sh BUILD_FOLDER/bin/vrl_codegen
set -eu
compiler=$(realpath "$1")
cd "$(dirname "$0")"
made=$(mktemp -d)
trap 'rm -rf "$made"' EXIT
for schema in *.xsd; do
    kind=${schema%.xsd}
    "$compiler" "$schema" "$made/$kind"
    cp "$made/$kind/V2/$kind.h" "$made/$kind/V2/$kind.cpp" .
done
mkdir -p shared
for header in forward tokens format Vrl; do
    cp "$made/group/V2/$header.h" shared
done
cp "$made/group/driver/group.cpp" shared/driver.cpp
cp "$made/group/driver/classes.cpp" shared/driver_classes.cpp
