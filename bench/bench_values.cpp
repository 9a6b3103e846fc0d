// Four-state vector and value operators: nanoseconds per operation at 8, 32,
// 64, 128 and 1024 bits, with heap allocations per operation ("allocs"
// counter; every malloc of the process is counted, the library's included).
//
//   build-bench/bench/bench_values [--benchmark_filter=Add]
#include <benchmark/benchmark.h>


#include <cstdint>
#include <random>

#include "verilog/tn_verilogvalue.h"
#include "verilog/tn_verilogvector.h"

namespace {
uint64_t g_allocations = 0;
}

extern "C" void* __libc_malloc(size_t) noexcept;
extern "C" void* malloc(size_t size) noexcept {
    ++g_allocations;
    return __libc_malloc(size);
}

namespace {

typedef Tn_VerilogVector Vec;

// Every bit random and known; the top bit set so that the value is full width.
Vec operand(uint32_t width, uint32_t seed, uint32_t significant) {
    std::mt19937 rng(seed);
    Vec v(false, width);
    for (uint32_t i = 0; i < width; ++i) v.setBit(i, i >= significant ? 0 : i + 1 == significant ? 1 : rng() & 1);
    return v;
}

void reportAllocations(benchmark::State& state, uint64_t before) {
    state.counters["allocs"] =
        benchmark::Counter(static_cast<double>(g_allocations - before), benchmark::Counter::kAvgIterations);
}

// Times op over a pair of operands and reports allocations per operation.
template <class Op>
void run(benchmark::State& state, Op op, uint32_t rightSignificant) {
    uint32_t width = static_cast<uint32_t>(state.range(0));
    Vec l = operand(width, 1, width), r = operand(width, 2, rightSignificant ? rightSignificant : width);
    uint64_t before = g_allocations;
    for (auto _ : state) benchmark::DoNotOptimize(op(l, r));
    reportAllocations(state, before);
}

void Add(benchmark::State& s) { run(s, [](const Vec& a, const Vec& b) { return a.add(b); }, 0); }
void Multiply(benchmark::State& s) { run(s, [](const Vec& a, const Vec& b) { return a.multiply(b); }, 0); }
// Divisor of half the width: a real long division for the wide sizes.
void Divide(benchmark::State& s) {
    run(s, [](const Vec& a, const Vec& b) { return a.divide(b); }, static_cast<uint32_t>(s.range(0) / 2 + 1));
}
void LessThan(benchmark::State& s) { run(s, [](const Vec& a, const Vec& b) { return a.lessThan(b); }, 0); }
void Equal(benchmark::State& s) { run(s, [](const Vec& a, const Vec& b) { return a.equal(b); }, 0); }
void DecimalText(benchmark::State& s) { run(s, [](const Vec& a, const Vec&) { return a.toDecimalText(); }, 0); }

// Value level: addition of two values fitted to a self-determined context.
void runValueAdd(benchmark::State& state, const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r) {
    Tn_VerilogEvalContext ctx;
    uint64_t before = g_allocations;
    for (auto _ : state) benchmark::DoNotOptimize(Tn_VerilogValue::addition(l, r, ctx));
    reportAllocations(state, before);
}

void ValueAdd(benchmark::State& state) {
    uint32_t width = static_cast<uint32_t>(state.range(0));
    runValueAdd(state, Tn_VerilogValue::createVector(operand(width, 1, width)),
                Tn_VerilogValue::createVector(operand(width, 2, width)));
}

void ValueIntegerAdd(benchmark::State& state) {
    runValueAdd(state, Tn_VerilogValue::createInteger(12345), Tn_VerilogValue::createInteger(-678));
}

// Reference point: the bare machine addition the 64-bit path competes with.
void NativeAdd64(benchmark::State& state) {
    uint64_t a = 0x123456789abcdefULL, b = 0xfedcba987654321ULL;
    for (auto _ : state) {
        benchmark::DoNotOptimize(a);
        benchmark::DoNotOptimize(a + b);
    }
}

}  // namespace

#define TN_WIDTHS Arg(8)->Arg(32)->Arg(64)->Arg(128)->Arg(1024)
BENCHMARK(Add)->TN_WIDTHS;
BENCHMARK(Multiply)->TN_WIDTHS;
BENCHMARK(Divide)->TN_WIDTHS;
BENCHMARK(LessThan)->TN_WIDTHS;
BENCHMARK(Equal)->TN_WIDTHS;
BENCHMARK(DecimalText)->TN_WIDTHS;
BENCHMARK(ValueAdd)->TN_WIDTHS;
BENCHMARK(ValueIntegerAdd);
BENCHMARK(NativeAdd64);

BENCHMARK_MAIN();
