#!/usr/bin/env python3
"""Constant expressions for Tarn's evaluator, checked against Icarus Verilog.

    crosscheck.py generate [--seed N] [--count N] > exprs.txt
        curated edge cases, then random constant expressions, one a line
        ("<tab>real" after those whose value is real): x/z digits, signed and
        unsigned mixes, widths over 64 bits, shifts, powers, replications,
        concatenations, reductions, relational and case equality, the
        conditional operator, and a few mixed with reals.

    crosscheck.py expect exprs.txt > expected.tsv
        each expression with the value iverilog -g2001 -gstrict-expr-width
        computes for it (without the second option iverilog widens
        expressions with unsized operands so that they cannot overflow), in
        the form `tarn eval` prints: "<width> <s|u> <binary> <decimal>" or
        "real <%.17g>". The values come from $display in a generated test
        bench: %b gives the width and the bits, %0d the decimal text, and
        (((E) & 1'sb0) + 1'sb1) < 0 the signedness (1'sb1 is -1 in a signed
        context and 1 in an unsigned one).

    crosscheck.py classify iverilog.tsv tarn.tsv > expected.tsv
        where Tarn's value (tarn.tsv: expression, tab, value) differs, adds
        it and the class of difference (CLASSES below; "?" for none, which
        is a fault to look into).

The result is committed (tests/data/eval/expected.tsv) so that the tests need
no iverilog. To regenerate (iverilog from `TARN_BENCH_DEPS=1 scripts/install-deps`):

    python3 crosscheck.py generate > /tmp/exprs.txt
    python3 crosscheck.py expect /tmp/exprs.txt > /tmp/iverilog.tsv
    cp /tmp/iverilog.tsv expected.tsv
    TARN_EVAL_RECORD=/tmp/tarn.tsv build/tests/tarn_tests --gtest_filter='EvalCrossCheck.*'
    python3 crosscheck.py classify /tmp/iverilog.tsv /tmp/tarn.tsv > expected.tsv
"""

import argparse
import os
import random
import re
import subprocess
import sys
import tempfile

WIDTHS = [1, 1, 2, 3, 4, 4, 5, 7, 8, 8, 8, 12, 16, 16, 31, 32, 32, 33, 48, 63, 64, 65, 70, 96, 100, 128]


class Generator:
    def __init__(self, rng):
        self.r = rng

    def digits(self, base, count, unknown):
        alphabet = {"b": "01", "o": "01234567", "h": "0123456789abcdef"}[base]
        out = []
        for _ in range(count):
            if unknown and self.r.random() < 0.15:
                out.append(self.r.choice("xz"))
            else:
                out.append(self.r.choice(alphabet))
        return "".join(out)

    def sized(self):
        w = self.r.choice(WIDTHS)
        s = "s" if self.r.random() < 0.4 else ""
        base = self.r.choice("bohd")
        unknown = self.r.random() < 0.3
        if base == "d":
            if unknown and self.r.random() < 0.3:
                return "%d'%sd%s" % (w, s, self.r.choice("xz"))
            v = self.r.getrandbits(min(w, 64))
            return "%d'%sd%d" % (w, s, v)
        per = {"b": 1, "o": 3, "h": 4}[base]
        n = max(1, (w + per - 1) // per)
        d = self.digits(base, n, unknown)
        # The top digit holds only the bits the width leaves for it.
        extra = n * per - w
        if extra and d[0] not in "xz":
            d = str(int(d[0], 16) & ((1 << (per - extra)) - 1)) + d[1:]
        return "%d'%s%s%s" % (w, s, base, d)

    def unsized(self):
        k = self.r.random()
        if k < 0.5:
            return str(self.r.choice([0, 1, 2, 3, 5, 7, 10, 15, 31, 32, 63, 100, 255, 1000, 65535, 2147483647]))
        if k < 0.65:
            return "-" + str(self.r.choice([1, 2, 3, 7, 8, 100, 2147483647]))
        base = self.r.choice("bhd")
        s = "s" if self.r.random() < 0.3 else ""
        if base == "d":
            return "'%sd%d" % (s, self.r.choice([0, 1, 5, 77, 4294967295]))
        return "'%s%s%s" % (s, base, self.digits(base, self.r.choice([1, 2, 3, 8]), self.r.random() < 0.4))

    def leaf(self, sized_only):
        if sized_only or self.r.random() < 0.75:
            return self.sized()
        return self.unsized()

    def expr(self, depth, sized_only=False):
        if depth == 0 or self.r.random() < 0.2:
            return self.leaf(sized_only)
        k = self.r.random()
        d = depth - 1
        if k < 0.12:
            op = self.r.choice(["-", "~", "!", "&", "~&", "|", "~|", "^", "~^", "+"])
            return "%s(%s)" % (op, self.expr(d, sized_only))
        if k < 0.62:
            op = self.r.choice(["+", "-", "*", "/", "%", "&", "|", "^", "~^", "==", "!=", "===", "!==",
                                "<", "<=", ">", ">=", "&&", "||", "<<", ">>", "<<<", ">>>", "**"])
            left = self.expr(d, sized_only)
            if op == "**":
                # Small exponents keep the powers meaningful.
                right = self.r.choice(["2", "3", "4'd5", "2'b11", "3'sd2", "1'bx", "0", "7", "8'd0"])
            elif op in ("<<", ">>", "<<<", ">>>"):
                right = self.r.choice(["1", "2", "3", "4'd7", "8'd40", "0", "1'bx", "31", "65", "100"])
            else:
                right = self.expr(d, sized_only)
            return "(%s %s %s)" % (left, op, right)
        if k < 0.77:
            items = [self.expr(d, True) for _ in range(self.r.randint(1, 3))]
            return "{%s}" % ", ".join(items)
        if k < 0.85:
            count = self.r.choice(["1", "2", "3", "4", "2'd2", "(1+2)"])
            items = [self.expr(d, True) for _ in range(self.r.randint(1, 2))]
            return "{%s{%s}}" % (count, ", ".join(items))
        cond = self.r.choice([self.expr(d, sized_only), "1'bx", "2'b0x", "4'b1x00", "1'b1", "1'b0"])
        return "(%s ? %s : %s)" % (cond, self.expr(d, sized_only), self.expr(d, sized_only))

    def real(self):
        reals = ["1.5", "0.25", "2.0", "3.75", "1e3", "2.5e-1", "0.1"]
        ints = ["2", "3", "4'd5", "8'sd3", "-3", "7", "16'hff"]
        a = self.r.choice(reals)
        b = self.r.choice(reals + ints)
        if self.r.random() < 0.5:
            a, b = b, a
        op = self.r.choice(["+", "-", "*", "/", "**", "==", "!=", "<", ">=", "&&", "||"])
        return "(%s %s %s)" % (a, op, b)


# Expressions always included: edge cases of the rules, and one or more of
# each class of difference.
CURATED = [
    "8'sd3 + 4'd1", "8'sd3 >>> 1", "-4'sd1 + 8'd0", "(4'd1 + 4'd15) == 5'd16", "&4'hf", "!4'b0000",
    "4'b10x1 + 4'b0001", "8'sb1000_0000 + 16'd0", "8'b1000_0000 + 16'd0", "'bx + 16'd0", "4'bx + 16'd0",
    "4'b1x00 == 4'b0x00", "4'b1x00 == 4'b1000", "4'b1x00 === 4'b1x00", "4'b1x00 !== 4'b1x01",
    "4'b1x00 ? 4'd3 : 4'd5", "4'b0x00 ? 4'b1100 : 4'b1010", "1'bz ? 8'hf0 : 8'hff",
    "4'd1 / 4'd0", "4'd7 % 4'd0", "1 / 0", "-2147483648 / -1", "-2147483648 % -1", "-7 / 2", "-7 % 2",
    "100'd1267650600228229401496703205375 / 7", "100'd1267650600228229401496703205375 % 1000000007",
    "-100'sd12345678901234567890123 / 100'sd3", "70'h3fffffffffffffffff * 70'h3fffffffffffffffff",
    "2 ** 10", "2 ** 31", "2 ** 32", "(-2) ** 3", "4'd3 ** 2", "4'sd3 ** 2", "0 ** 0", "0 ** 5", "2 ** 1'bx",
    "2 ** -1", "(-2) ** -1", "(-1) ** -3", "1 ** -1", "0 ** -1", "4'sd2 ** -4'sd1",
    "1 << 40", "8'hff << 8'd9", "8'sh80 >>> 3", "8'h80 >>> 3", "8'sh80 >> 3", "1 << 64'hffffffff00000000",
    "8'hff >> 1'bx", "{2'b11, {0{1'b1}}}", "{4{1'b1}}", "{2{3'b101, 1'bz}}", "{1'b1, 70'd0}",
    "\"AB\"", "\"A\" + 1", "{\"a\", 8'd0}",
    "1.5 + 2", "2.5 * 4'd2", "7 / 2.0", "2.0 ** 0.5", "1.5 > 1", "0.0 || 1'b0", "-1.5 + 1",
    "3'd7 + 3'd1 + 0.0", "4'd15 * 4'd15 + 0.5",
]
CURATED_REAL = {"1.5 + 2", "2.5 * 4'd2", "7 / 2.0", "2.0 ** 0.5", "-1.5 + 1", "3'd7 + 3'd1 + 0.0",
                "4'd15 * 4'd15 + 0.5"}

# Classes decided by the curated expressions themselves: text -> class.
CURATED_CLASSES = {
    "1 / 0": "integer-divide-by-zero",
    "2 ** -1": "negative-exponent", "(-2) ** -1": "negative-exponent", "(-1) ** -3": "negative-exponent",
    "1 ** -1": "negative-exponent", "4'sd2 ** -4'sd1": "negative-exponent",
    "3'd7 + 3'd1 + 0.0": "real-operand-width", "4'd15 * 4'd15 + 0.5": "real-operand-width",
}


def generate(args):
    rng = random.Random(args.seed)
    g = Generator(rng)
    seen = set(CURATED)
    out = [e + ("\treal" if e in CURATED_REAL else "") for e in CURATED]
    while len(out) < args.count:
        # Reals come from arithmetic on a real literal; compared or tested they give bits.
        real = rng.random() < 0.06
        e = g.real() if real else g.expr(rng.choice([1, 2, 2, 3, 3, 4]))
        if e not in seen:
            seen.add(e)
            out.append(e + ("\treal" if real and e.split()[1] in ("+", "-", "*", "/", "**") else ""))
    sys.stdout.write("".join(e + "\n" for e in out))


def expect(args):
    rows = [l.rstrip("\n").split("\t") for l in open(args.exprs) if l.strip()]
    exprs = [r[0] for r in rows]
    lines = ["module crosscheck;", "initial begin"]
    for i, e in enumerate(exprs):
        if len(rows[i]) > 1 and rows[i][1] == "real":
            lines.append('  $display("R%d real %%.17g", %s);' % (i, e))
        else:
            lines.append('  $display("R%d %%b|%%0d|%%b", %s, %s, (((%s) & 1\'sb0) + 1\'sb1) < 0);' % (i, e, e, e))
    lines += ["end", "endmodule", ""]
    with tempfile.TemporaryDirectory() as tmp:
        src = os.path.join(tmp, "t.v")
        exe = os.path.join(tmp, "t.vvp")
        with open(src, "w") as f:
            f.write("\n".join(lines))
        subprocess.run(["iverilog", "-g2001", "-gstrict-expr-width", "-o", exe, src], check=True, stderr=subprocess.DEVNULL)
        out = subprocess.run(["vvp", "-n", exe], check=True, capture_output=True, text=True).stdout
    results = {}
    for line in out.splitlines():
        m = re.match(r"R(\d+) (.*)$", line)
        if not m:
            continue
        i, rest = int(m.group(1)), m.group(2)
        if rest.startswith("real "):
            results[i] = rest
        else:
            bits, dec, sign = rest.split("|")
            results[i] = "%d %s %s %s" % (len(bits), "s" if sign == "1" else "u", bits, dec)
    for i, e in enumerate(exprs):
        sys.stdout.write("%s\t%s\n" % (e, results.get(i, "?")))


# The classes of difference between Tarn and iverilog, each a rule Tarn
# follows on purpose. A difference outside them is a fault to investigate.
CLASSES = [
    # An unsized signed based constant whose digits are fewer than 32 bits is
    # padded with zeros, like any based constant ('sh939 is 2361); iverilog
    # extends the top digit's bit ('sh939 is -1735).
    ("unsized-signed", lambda e: re.search(r"(?<![\w'])'s(b1|o[4-7]|h[89a-f])", e) is not None),
    # In + and - (unary minus too) the bits below the lowest unknown bit of the
    # operands keep their sum; iverilog makes the whole result x.
    ("unknown-sum", lambda e: re.search(r"'s?[bohd][0-9a-f_]*[xz]", e) is not None and re.search(r"[-+]", e) is not None),
]


def classify(args):
    tarn = {}
    for line in open(args.tarn):
        if "\t" in line:
            e, v = line.rstrip("\n").split("\t", 1)
            tarn[e] = v
    for line in open(args.expected):
        e, iv = line.rstrip("\n").split("\t")[:2]
        t = tarn.get(e)
        if t is None or t == iv:
            sys.stdout.write("%s\t%s\n" % (e, iv))
            continue
        cls = CURATED_CLASSES.get(e) or next((name for name, test in CLASSES if test(e)), "?")
        sys.stdout.write("%s\t%s\t%s\t%s\n" % (e, iv, t, cls))


def main():
    p = argparse.ArgumentParser(description=__doc__, formatter_class=argparse.RawDescriptionHelpFormatter)
    sub = p.add_subparsers(dest="cmd", required=True)
    g = sub.add_parser("generate")
    g.add_argument("--seed", type=int, default=8)
    g.add_argument("--count", type=int, default=640)
    e = sub.add_parser("expect")
    e.add_argument("exprs")
    c = sub.add_parser("classify")
    c.add_argument("expected")
    c.add_argument("tarn")
    args = p.parse_args()
    {"generate": generate, "expect": expect, "classify": classify}[args.cmd](args)


if __name__ == "__main__":
    main()
