// Checking and constant evaluation of expressions, parsed once: nanoseconds
// per expression to check (typeAs), to size (contextWidth, isSigned) and to
// evaluate (value), over the cross-check expressions of tests/data/eval.
//
//   build-bench/bench/bench_eval [tests/data/eval/expected.tsv]
#include <chrono>
#include <cstdio>
#include <fstream>
#include <string>
#include <vector>

#include "src/tn_verilogoptions.h"
#include "tarn/port_msgmandata.h"
#include "verilog/tn_verilogdesignunit.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"
#include "verilog/tn_verilogparser.h"

namespace {

class Quiet : public Port_MsgSink {
public:
    void receive(const Port_MsgRecord&) override {}
};

template <class F>
double nanosecondsPer(size_t count, int rounds, F f) {
    const auto start = std::chrono::steady_clock::now();
    for (int r = 0; r < rounds; ++r) f();
    const std::chrono::duration<double, std::nano> d = std::chrono::steady_clock::now() - start;
    return d.count() / (static_cast<double>(count) * rounds);
}

}  // namespace

int main(int argc, char** argv) {
    const std::string table = argc > 1 ? argv[1] : "tests/data/eval/expected.tsv";
    std::ifstream in(table);
    if (!in) {
        std::fprintf(stderr, "bench_eval: cannot read %s\n", table.c_str());
        return 1;
    }
    Quiet quiet;
    Port_MsgManData::setSink(&quiet);
    Tn_VerilogOptions options;
    Tn_VerilogDesignUnit unit("work", "bench", options);
    Tn_VerilogRoot* root = unit.factory().createRoot();
    unit.setRoot(root);
    std::vector<Tn_VerilogExpression*> exprs;
    for (std::string line; std::getline(in, line);) {
        if (line.empty()) continue;
        try {
            exprs.push_back(Tn_VerilogParser::parseExpression(Port_String(line.substr(0, line.find('\t')).c_str()),
                                                              unit.factory(), options));
        } catch (const Tn_VerilogExpressionSyntaxError&) {
        }
    }
    Tn_VerilogElabContext ctx(true, &options, nullptr, &unit);
    ctx.pushScope(root, root);
    const int rounds = 200;
    uint64_t sink = 0;
    const double check = nanosecondsPer(exprs.size(), rounds, [&] {
        for (Tn_VerilogExpression* e : exprs) sink += e->typeAs(ctx, Tn_Verilog::Value)->isError();
    });
    const double size = nanosecondsPer(exprs.size(), rounds, [&] {
        for (Tn_VerilogExpression* e : exprs) sink += e->contextWidth(0) + e->isSigned(true);
    });
    const double eval = nanosecondsPer(exprs.size(), rounds, [&] {
        for (Tn_VerilogExpression* e : exprs) sink += e->value()->width();
    });
    std::printf("%zu expressions (%u nodes), %d rounds\n", exprs.size(), static_cast<unsigned>(unit.nodes().size()),
                rounds);
    std::printf("check    %8.0f ns per expression\n", check);
    std::printf("size     %8.0f ns per expression\n", size);
    std::printf("evaluate %8.0f ns per expression\n", eval);
    return sink == 0 ? 2 : 0;
}
