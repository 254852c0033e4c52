#!/usr/bin/env bash
# Builds Penmoor (optimised) and starts the desktop program. Arguments are passed on to it.
# Until the desktop program exists, it builds an example workbook with penmoor-build instead.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/install-deps.sh
cmake --preset release >/dev/null
cmake --build --preset release

program=build/release/app/penmoor
if [ -x "$program" ]; then
    exec "$program" "$@"
fi

# The desktop program is not built yet: show the headless builder at work instead.
example=build/example
mkdir -p "$example"
build/release/app/buildtool/penmoor-build --company Harlenby --by-month 2013 2013 \
    --picture "$example/cashflow.png" -o "$example/cashflow.xls"
echo "Wrote $example/cashflow.xls and its picture $example/cashflow.png"
