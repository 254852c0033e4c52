#!/usr/bin/env bash
# Builds Penmoor (optimised) and starts the desktop program. Arguments are passed on to it.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/install-deps.sh
cmake --preset release >/dev/null
cmake --build --preset release

program=build/release/app/penmoor
if [ ! -x "$program" ]; then
    echo "The desktop program is not built yet: app/ does not define the penmoor executable." >&2
    exit 1
fi
exec "$program" "$@"
