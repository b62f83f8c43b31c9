#!/usr/bin/env bash
# The main job on all example documents: each is loaded, listed, edited, saved, validated by an independent judge,
# and compared with what its file holds when it is loaded again; then it is packed, unpacked by another program and by
# the library, and compared again.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/install_packages.sh build demo
scripts/build_preset.sh release --target load_edit_save convert_document

color=()
if [ -t 1 ] && [ "${TERM:-dumb}" != dumb ] && [ -z "${NO_COLOR:-}" ]; then color=(--color); fi

saved=build/demo
mkdir -p "$saved"
documents=0
for document in examples/documents/*.vrl; do
    copy=$saved/$(basename "$document")
    echo
    echo "== $document"
    build/bin/load_edit_save "${color[@]}" "$document" "$copy"
    xmllint --noout --schema schema/vrl.xsd "$copy"

    packed=${copy}z
    unpacked=$saved/unpacked.vrl
    build/bin/convert_document "$copy" "$packed"
    unzip -p "$packed" | cmp - "$copy"
    build/bin/convert_document "$packed" "$unpacked"
    cmp "$unpacked" "$copy"
    echo "packed to $(stat -c %s "$packed") of $(stat -c %s "$copy") bytes, and unpacked to the same"
    documents=$((documents + 1))
done

echo
echo "demo: $documents documents, all well"
