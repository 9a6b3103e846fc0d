#!/bin/sh
# Preprocess+scan throughput of Tarn beside iverilog -E and verilator -E, on
# one generated input (macros, includes, comments, based numbers) in one run.
#
#   bench/scan_throughput.sh [MEGABYTES]     (default 64; needs python3, hyperfine,
#                                             iverilog, verilator: TARN_BENCH_DEPS=1
#                                             scripts/install-deps)
#
# Tarn is timed with `tarn tokens -count`: every token is made as the parser
# receives it, then dropped. TARN=<tarn binary> (default build/tarn),
# RUNS=<timed runs> (default 5), BENCH_DIR=<scratch> (default build/bench-scan).
set -eu
cd "$(dirname "$0")/.."
mb=${1:-64}
tarn=$(realpath "${TARN:-build/tarn}")
runs=${RUNS:-5}
work=${BENCH_DIR:-build/bench-scan}
mkdir -p "$work"
work=$(realpath "$work")

if [ ! -f "$work/top.v" ] || [ "$(cat "$work/size" 2>/dev/null)" != "$mb" ]; then
    python3 bench/scan_input.py "$work" "$mb"
    echo "$mb" > "$work/size"
fi
cd "$work"
# The bytes read, include files counted each time they are read, as every tool reads them.
bytes=$("$tarn" tokens -count +incdir+inc top.v 2>/dev/null | sed -n 's/.* tokens, \([0-9]*\) bytes/\1/p')
tokens=$("$tarn" tokens -count +incdir+inc top.v 2>/dev/null | sed -n 's/^\([0-9]*\) tokens.*/\1/p')
echo "input: $bytes bytes, $tokens tokens; $(nproc) cores, load $(cut -d' ' -f1-3 /proc/loadavg)"

hyperfine --warmup 1 --runs "$runs" -N --export-json times.json \
    -n tarn "$tarn tokens -count +incdir+inc top.v" \
    -n "iverilog -E" "iverilog -E -Iinc -o /dev/null top.v" \
    -n "verilator -E" "verilator -E -Iinc top.v" >/dev/null

python3 - "$bytes" <<'PY'
import json, sys
size = int(sys.argv[1]) / 1e6
results = {r["command"]: r for r in json.load(open("times.json"))["results"]}
base = size / results["iverilog -E"]["median"]
print("%-14s %10s %10s %10s %16s" % ("tool", "median s", "user s", "MB/s", "vs iverilog -E"))
for name in ("tarn", "iverilog -E", "verilator -E"):
    r = results[name]
    rate = size / r["median"]
    print("%-14s %10.2f %10.2f %10.1f %15.2fx" % (name, r["median"], r["user"], rate, rate / base))
PY
