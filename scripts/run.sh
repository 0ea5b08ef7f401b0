#!/usr/bin/env bash
# Installs what is missing, builds, and opens a copy of the sample configuration in the editor.
source "$(dirname "${BASH_SOURCE[0]}")/common.sh"

install_missing "${BUILD_PACKAGES[@]}"
build zidovade-config

if [ -z "${DISPLAY:-}" ] && [ -z "${WAYLAND_DISPLAY:-}" ]; then
    echo "No display: start the editor from a desktop session (or ssh -X), or run scripts/test.sh." >&2
    exit 1
fi

scratch=$(mktemp -d "${TMPDIR:-/tmp}/zidovade.XXXXXX")
cp "$ROOT/samples/example.ini" "$scratch/example.ini"
echo "Editing $scratch/example.ini (a copy of samples/example.ini)"
"$BUILD_DIR/zidovade-config" "$scratch/example.ini"
