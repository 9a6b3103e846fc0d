#!/usr/bin/env python3
"""Writes a large Verilog-2001 source for the preprocess+scan benchmark.

    scan_input.py OUTDIR [MEGABYTES]   (default 64)

OUTDIR/top.v holds generated modules that use plain and parameterised
macros, `ifdef/`else, line and block comments, strings and based numbers,
and include OUTDIR/inc/defs.vh (guarded) and OUTDIR/inc/body.vh (a small
piece of module text included in every module). The same input is given to
tarn, iverilog -E and verilator -E.
"""
import os
import random
import sys

out = sys.argv[1]
target = int(sys.argv[2]) * 1024 * 1024 if len(sys.argv) > 2 else 64 * 1024 * 1024
rnd = random.Random(1364)
os.makedirs(os.path.join(out, "inc"), exist_ok=True)

with open(os.path.join(out, "inc", "defs.vh"), "w") as f:
    f.write("""`ifndef BENCH_DEFS_VH
`define BENCH_DEFS_VH
`define WIDTH 32
`define DEPTH 16
`define RESET_VALUE 32'hDEAD_BEEF
`define MAX(a, b) ((a) > (b) ? (a) : (b))
`define MIN(a, b) ((a) < (b) ? (a) : (b))
`define REG_UPDATE(q, d, en) if (en) q <= d; else q <= q;
`define USE_FAST_PATH
`endif
""")

with open(os.path.join(out, "inc", "body.vh"), "w") as f:
    f.write("""  // Shared body: a small register file slice.
  reg [`WIDTH-1:0] shared_q;
  always @(posedge clk) shared_q <= rst ? `RESET_VALUE : shared_q ^ 32'h0000_00FF;
""")

words = ["state", "count", "data", "valid", "ready", "addr", "wdata", "rdata", "sel", "mask"]


def module(i):
    n = rnd.randrange(4, 9)
    sig = [rnd.choice(words) + "_" + str(k) for k in range(n)]
    s = []
    s.append("/* Module %d: generated for the scanner benchmark.\n * It has no meaning beyond its tokens.\n */\n" % i)
    s.append("module m%d #(parameter P = %d) (input clk, input rst, input [`WIDTH-1:0] din, output reg [`WIDTH-1:0] dout);\n" % (i, rnd.randrange(1, 64)))
    s.append('`include "body.vh"\n')
    for name in sig:
        s.append("  reg [`WIDTH-1:0] %s; // %s register\n" % (name, name))
    s.append("  always @(posedge clk) begin\n")
    s.append("    if (rst) begin\n")
    for name in sig:
        s.append("      %s <= %d'b%s;\n" % (name, 8, "".join(rnd.choice("01") for _ in range(8))))
    s.append("    end else begin\n")
    for k, name in enumerate(sig):
        other = sig[(k + 1) % n]
        form = rnd.randrange(4)
        if form == 0:
            s.append("      %s <= `MAX(%s, din) + 16'h%04X;\n" % (name, other, rnd.randrange(65536)))
        elif form == 1:
            s.append("      %s <= `MIN(%s & 32'o%o, din);\n" % (name, other, rnd.randrange(1 << 30)))
        elif form == 2:
            s.append("      `REG_UPDATE(%s, %s + %d, din[%d])\n" % (name, other, rnd.randrange(1000), rnd.randrange(32)))
        else:
            s.append("      %s <= {%s[15:0], %s[31:16]} ^ 'd%d;\n" % (name, other, other, rnd.randrange(100000)))
    s.append("    end\n  end\n")
    s.append("`ifdef USE_FAST_PATH\n")
    s.append("  always @(posedge clk) dout <= %s ^ shared_q;\n" % sig[0])
    s.append("`else\n  always @(posedge clk) dout <= %s;\n`endif\n" % sig[-1])
    s.append('  initial $display("m%d: P=%%0d width=%%0d", P, `WIDTH);\n' % i)
    s.append("endmodule\n\n")
    return "".join(s)


with open(os.path.join(out, "top.v"), "w") as f:
    f.write('`timescale 1ns / 1ps\n`include "defs.vh"\n\n')
    size, i = 0, 0
    while size < target:
        text = module(i)
        f.write(text)
        size += len(text)
        i += 1
print("%s: %d modules, %.1f MB" % (os.path.join(out, "top.v"), i, os.path.getsize(os.path.join(out, "top.v")) / 1e6))
