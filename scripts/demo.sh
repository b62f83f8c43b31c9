#!/usr/bin/env bash
# The main job on all example documents: each is loaded, listed, edited, saved, validated by an independent judge,
# and compared with what its file holds when it is loaded again.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/install_packages.sh build demo
scripts/build_preset.sh release --target load_edit_save

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
    documents=$((documents + 1))
done

echo
echo "demo: $documents documents, all well"
