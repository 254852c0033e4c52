#!/usr/bin/env bash
# Builds Penmoor (optimised) and starts the desktop program. Arguments are passed on to it.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/install-deps.sh
cmake --preset release >/dev/null
cmake --build --preset release

exec build/release/app/penmoor "$@"
