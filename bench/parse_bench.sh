#!/usr/bin/env bash
# Parse benchmark: times Tarn and the open peers parsing the same generated
# design (bench/gen_design.py) at several sizes, in one run, and prints wall
# time (best of N), lines per second, peak memory and the Tarn/yosys ratios.
#
# Usage: bench/parse_bench.sh [options]
#   --tarn PATH        tarn binary (default build-bench/tarn, built or brought up to date)
#   --no-tarn          time the peers only
#   --sizes "N ..."    design sizes in lines (default "250000 500000 1000000")
#   --runs N           timed runs per tool and size; the best is kept (default 3)
#   --seed N           generator seed (default 1)
#   --work DIR         where designs are generated and kept (default build-bench/parse-bench)
#   --no-verilator     skip verilator even when it is installed
#   --validate         instead of timing: generate a small design and check
#                      that iverilog -g2001, yosys and verilator accept it
set -u
cd "$(dirname "$0")/.." || exit 1
root=$(pwd)

tarn=""
use_tarn=1
sizes="250000 500000 1000000"
runs=3
seed=1
work="$root/build-bench/parse-bench"
use_verilator=1
validate=0
while [ $# -gt 0 ]; do
    case "$1" in
        --tarn) tarn=$2; shift ;;
        --no-tarn) use_tarn=0 ;;
        --sizes) sizes=$2; shift ;;
        --runs) runs=$2; shift ;;
        --seed) seed=$2; shift ;;
        --work) work=$2; shift ;;
        --no-verilator) use_verilator=0 ;;
        --validate) validate=1 ;;
        -h|--help) sed -n '2,/^set -u/p' "$0" | sed '$d; s/^# \{0,1\}//'; exit 0 ;;
        *) echo "parse_bench: unknown option '$1' (see --help)" >&2; exit 2 ;;
    esac
    shift
done
case "$runs" in ''|*[!0-9]*|0) echo "parse_bench: --runs needs a positive number" >&2; exit 2 ;; esac

TARN_BENCH_DEPS=1 scripts/install-deps || exit 1
mkdir -p "$work"
work=$(cd "$work" && pwd)

gen_digest=$(sha256sum bench/gen_design.py | cut -c1-16)

# Generates the design of $1 lines into $work/L$1 unless an identical one is there.
design_dir() {
    local dir="$work/L$1"
    if [ "$(cat "$dir/stamp" 2>/dev/null)" != "lines=$1 seed=$seed gen=$gen_digest" ]; then
        rm -rf "$dir"
        python3 bench/gen_design.py --lines "$1" --seed "$seed" --out "$dir" >&2 || exit 1
    fi
    echo "$dir"
}

# Lines a tool reads from a file list: the sources plus the header once.
count_lines() {
    (cd "$1" && xargs cat bench_defs.vh < "$2" | wc -l)
}

if [ "$validate" = 1 ]; then
    dir=$(design_dir 30000) || exit 1
    cd "$dir" || exit 1
    status=0
    echo "validating $dir"
    # shellcheck disable=SC2046
    iverilog -g2001 -o /dev/null -s bench_top $(cat files_udp.txt) || status=1
    # shellcheck disable=SC2046
    iverilog -g2001 -o /dev/null -s bench_top $(cat files_noudp.txt) || status=1
    yosys -q -p "read_verilog $(tr '\n' ' ' < files_noudp.txt); hierarchy -check -top bench_top; proc" || status=1
    if command -v verilator >/dev/null; then
        # shellcheck disable=SC2046
        verilator --lint-only --no-timing -Wno-fatal -Wno-lint -Wno-style --top-module bench_top \
            $(cat files_noudp.txt) || status=1
    fi
    [ $status = 0 ] && echo "valid: iverilog -g2001, yosys and verilator accept the generated design"
    exit $status
fi

if [ "$use_tarn" = 1 ]; then
    if [ -z "$tarn" ]; then
        # Brought up to date first, so the figures are those of the sources.
        tarn="$root/build-bench/tarn"
        if [ ! -f build-bench/build.ninja ]; then
            cmake -S . -B build-bench -G Ninja -DCMAKE_BUILD_TYPE=Release -DTARN_BENCH=ON >/dev/null || exit 1
        fi
        echo "parse_bench: building $tarn" >&2
        cmake --build build-bench --target tarn-cli >/dev/null || exit 1
    fi
    [ -x "$tarn" ] || { echo "parse_bench: no tarn binary at '$tarn'" >&2; exit 1; }
    tarn=$(cd "$(dirname "$tarn")" && pwd)/$(basename "$tarn")
fi
have_verilator=0
[ "$use_verilator" = 1 ] && command -v verilator >/dev/null && have_verilator=1

# Other work on the machine skews the figures: say how busy it was.
load=$(cut -d' ' -f1 /proc/loadavg)
results="$work/results.tsv"
printf 'size\ttool\tlines\tseconds\tcpu_seconds\tpeak_kb\tstatus\n' > "$results"
log="$work/last-run.log"
: > "$log"

# measure SIZE TOOL LINES DIR CMD...: best wall time and best CPU time
# (user + system, steadier on a busy machine) of $runs runs and the largest
# peak RSS seen, appended to the results.
measure() {
    local size=$1 tool=$2 lines=$3 dir=$4; shift 4
    local best="" cpu="" peak=0 status=ok t0 t1 ms kb c
    for _ in $(seq "$runs"); do
        t0=$(date +%s%N)
        (cd "$dir" && /usr/bin/time -v -o "$work/time.txt" "$@") >> "$log" 2>&1
        local rc=$?
        t1=$(date +%s%N)
        if [ $rc -ne 0 ]; then
            status="exit$rc"
            echo "parse_bench: $tool failed on $size lines (exit $rc); see $log" >&2
            break
        fi
        ms=$(( (t1 - t0) / 1000000 ))
        kb=$(awk -F': ' '/Maximum resident set size/ {print $2}' "$work/time.txt")
        c=$(awk -F': ' '/(User|System) time \(seconds\)/ {s += $2} END {printf "%d", s * 1000}' "$work/time.txt")
        if [ -z "$best" ] || [ "$ms" -lt "$best" ]; then best=$ms; fi
        if [ -z "$cpu" ] || [ "$c" -lt "$cpu" ]; then cpu=$c; fi
        if [ "$kb" -gt "$peak" ]; then peak=$kb; fi
    done
    printf '%s\t%s\t%s\t%s\t%s\t%s\t%s\n' "$size" "$tool" "$lines" \
        "$(awk -v m="${best:-0}" 'BEGIN{printf "%.3f", m/1000}')" \
        "$(awk -v m="${cpu:-0}" 'BEGIN{printf "%.3f", m/1000}')" "$peak" "$status" >> "$results"
}

for size in $sizes; do
    dir=$(design_dir "$size") || exit 1
    udp_lines=$(count_lines "$dir" files_udp.txt)
    noudp_lines=$(count_lines "$dir" files_noudp.txt)
    read -r -a noudp < <(tr '\n' ' ' < "$dir/files_noudp.txt")
    echo "== $size lines: $dir" >&2
    if [ "$use_tarn" = 1 ]; then
        measure "$size" tarn "$udp_lines" "$dir" "$tarn" compile -f parse.f
    fi
    measure "$size" yosys "$noudp_lines" "$dir" yosys -q -p "read_verilog -defer ${noudp[*]}"
    if [ "$have_verilator" = 1 ]; then
        measure "$size" verilator "$noudp_lines" "$dir" verilator --lint-only --debug-exit-parse \
            -Wno-fatal --top-module bench_top "${noudp[@]}"
    fi
done

echo
echo "Parse benchmark ($(nproc) cores, load average at start $load; best of $runs runs; memory is peak RSS)"
echo
awk -F'\t' '
NR == 1 { next }
{
    key = $1 SUBSEP $2
    lines[key] = $3; secs[key] = $4; cpu[key] = $5; kb[key] = $6; st[key] = $7
    if (!($1 in seen)) { seen[$1] = 1; order[++n] = $1 }
    if (!($2 in tseen)) { tseen[$2] = 1; tools[++m] = $2 }
}
function lps(k) { return secs[k] > 0 ? lines[k] / secs[k] : 0 }
function per100k(k) { return kb[k] / 1024 / (lines[k] / 100000) }
function ok(k) { return (k in st) && st[k] == "ok" }
END {
    printf "%-9s %-10s %9s %9s %8s %12s %10s %12s\n", "size", "tool", "lines", "best s", "cpu s", "lines/s", "peak MB", "MB/100k ln"
    for (i = 1; i <= n; i++) for (j = 1; j <= m; j++) {
        k = order[i] SUBSEP tools[j]
        if (!(k in st)) continue
        if (!ok(k)) { printf "%-9s %-10s %9d %9s\n", order[i], tools[j], lines[k], "FAILED (" st[k] ")"; continue }
        printf "%-9s %-10s %9d %9.3f %8.3f %12.0f %10.1f %12.1f\n", order[i], tools[j], lines[k], secs[k], cpu[k], lps(k), kb[k] / 1024, per100k(k)
    }
    print ""
    print "Tarn / yosys (targets: lines/s >= 5.0, memory per line <= 0.5)"
    for (i = 1; i <= n; i++) {
        t = order[i] SUBSEP "tarn"; y = order[i] SUBSEP "yosys"
        if (!ok(t) || !ok(y) || lps(y) == 0 || per100k(y) == 0) continue
        printf "  %-9s lines/s x%.2f (by CPU time x%s)   memory per line x%.2f\n", order[i], lps(t) / lps(y),
               (cpu[t] > 0 ? sprintf("%.2f", cpu[y] / cpu[t]) : "-"), per100k(t) / per100k(y)
    }
    if (n >= 2) {
        lo = order[1]; hi = order[n]
        printf "\nGrowth from %s to %s lines (x%.2f lines; x1.00 per line is linear)\n", lo, hi, lines[hi SUBSEP "yosys"] / lines[lo SUBSEP "yosys"]
        for (j = 1; j <= m; j++) {
            a = lo SUBSEP tools[j]; b = hi SUBSEP tools[j]
            if (!ok(a) || !ok(b) || secs[a] == 0 || kb[a] == 0) continue
            g = lines[b] / lines[a]
            printf "  %-10s time x%.2f (x%.2f per line; CPU x%s per line)   memory x%.2f (x%.2f per line)\n", tools[j],
                   secs[b] / secs[a], secs[b] / secs[a] / g, (cpu[a] > 0 ? sprintf("%.2f", cpu[b] / cpu[a] / g) : "-"),
                   kb[b] / kb[a], kb[b] / kb[a] / g
        }
    }
}' "$results"
echo
echo "raw figures: $results; tool output: $log"
# A run that failed makes the whole benchmark fail, after the table.
! cut -f7 "$results" | grep -q '^exit'
