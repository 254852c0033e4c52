#!/usr/bin/env bash
# Times our .xls writer beside libxlsxwriter and python3-xlwt writing the same content
# (bench/xls_content.h), each as a whole process, in one hyperfine run per size.
# Usage: bench/xls_peers.sh [bench build folder, default build/bench]
set -euo pipefail
cd "$(dirname "$0")/.."
build=${1:-build/bench}
if [ ! -x "$build/bench/xls_write_tool" ]; then
    cmake --preset bench >/dev/null
    cmake --build --preset bench --target xls_write_tool xlsxwriter_peer
fi
out=$(mktemp -d)
trap 'rm -rf "$out"' EXIT
for size in "44 16" "32768 136"; do
    set -- $size
    # xlwt needs minutes for the large sheet: one run there is enough.
    runs=$([ "$1" -gt 1000 ] && echo 1 || echo 20)
    echo "== $1 rows x $2 columns"
    hyperfine --warmup "$([ "$runs" -gt 1 ] && echo 2 || echo 0)" --runs "$runs" --export-markdown "$out/$1.md" \
        -n penmoor "$build/bench/xls_write_tool $1 $2 $out/penmoor.xls" \
        -n libxlsxwriter "$build/bench/xlsxwriter_peer $1 $2 $out/peer.xlsx" \
        -n xlwt "/usr/bin/python3 bench/peers/xlwt_peer.py $1 $2 $out/peer.xls"
    cat "$out/$1.md"
    ls -l "$out"/penmoor.xls "$out"/peer.xlsx "$out"/peer.xls | awk '{ print $5, $9 }'
done
