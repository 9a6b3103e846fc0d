#!/bin/sh
# Constant evaluation: `tarn eval` beside Icarus Verilog computing the same
# values, on the cross-check expressions of tests/data/eval (repeated COPIES
# times, default 10).
#
#   bench/eval_bench.sh        (needs python3, hyperfine, iverilog:
#                               TARN_BENCH_DEPS=1 scripts/install-deps)
#
# iverilog has no evaluate-only mode: it compiles a test bench that displays
# each value and runs it, so its time includes code generation and the
# simulator start; the ratio says how the two compare at the same job, not
# which evaluator is faster. TARN=<tarn binary> (default build/tarn),
# RUNS=<timed runs> (default 5), BENCH_DIR=<scratch> (default build/bench-eval).
set -eu
cd "$(dirname "$0")/.."
tarn=$(realpath "${TARN:-build/tarn}")
runs=${RUNS:-5}
copies=${COPIES:-10}
work=${BENCH_DIR:-build/bench-eval}
mkdir -p "$work"
work=$(realpath "$work")

python3 - "$work" "$copies" tests/data/eval/expected.tsv <<'PY'
import sys
work, copies, table = sys.argv[1], int(sys.argv[2]), sys.argv[3]
exprs = [l.split("\t")[0] for l in open(table) if l.strip()] * copies
with open(work + "/args.txt", "w") as f:
    f.write("".join(e.replace("\\", "\\\\").replace("'", "'\\''") + "\n" for e in exprs))
with open(work + "/t.v", "w") as f:
    f.write("module t;\ninitial begin\n")
    for e in exprs:
        f.write('  $display("%%b", %s);\n' % e)
    f.write("end\nendmodule\n")
print(len(exprs))
PY
count=$(wc -l < "$work/args.txt")
# The expressions as one argument list for tarn eval.
{ printf '#!/bin/sh\nexec "%s" eval' "$tarn"; while IFS= read -r e; do printf " '%s'" "$e"; done < "$work/args.txt"; printf '\n'; } > "$work/tarn_eval.sh"
chmod +x "$work/tarn_eval.sh"
printf '#!/bin/sh\niverilog -g2001 -gstrict-expr-width -o "%s/t.vvp" "%s/t.v" && vvp -n "%s/t.vvp"\n' "$work" "$work" "$work" > "$work/iverilog.sh"
chmod +x "$work/iverilog.sh"
echo "input: $count constant expressions; $(nproc) cores, load $(cut -d' ' -f1-3 /proc/loadavg)"

hyperfine --warmup 1 --runs "$runs" -N --export-json "$work/times.json" \
    -n "tarn eval" "$work/tarn_eval.sh" \
    -n "iverilog + vvp" "$work/iverilog.sh" >/dev/null

python3 - "$count" "$work/times.json" <<'PY'
import json, sys
count = int(sys.argv[1])
results = {r["command"]: r for r in json.load(open(sys.argv[2]))["results"]}
base = results["iverilog + vvp"]["median"]
for name, r in results.items():
    m = r["median"]
    print("%-16s %8.3f s median  %10.0f expressions/s  %6.2fx iverilog" % (name, m, count / m, base / m))
PY
