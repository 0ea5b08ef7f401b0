#!/usr/bin/env bash
# Installs what is missing, builds, and runs every test (GUI tests under Xvfb).
source "$(dirname "${BASH_SOURCE[0]}")/common.sh"

install_missing "${BUILD_PACKAGES[@]}" "${TEST_PACKAGES[@]}"
build
ctest --test-dir "$BUILD_DIR" --output-on-failure
