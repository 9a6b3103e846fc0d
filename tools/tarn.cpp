// tarn: the command-line front end of libtarn.
#include <cstdio>
#include <cstring>

#include "tarn/port_msgmandata.h"
#include "tools/tarn_commands.h"

namespace {

struct Command {
    const char* name;
    const char* synopsis;
    int (*run)(const TarnArgs& args);
};

const Command kCommands[] = {
    {"compile", "parse the sources and elaborate them in memory", tarnCompile},
    {"parse", "parse the sources into binary libraries, checking each unit", tarnParse},
    {"elaborate", "elaborate units stored in binary libraries", tarnElaborate},
    {"data", "read only modules, ports, parameters and instances", tarnData},
    {"eval", "evaluate constant expressions as Tarn does", tarnEval},
    {"tokens", "preprocess and scan the sources, print every token (-count: only count)", tarnTokens},
};

void usage(std::FILE* out) {
    std::fprintf(out, "Usage: tarn <command> ARGS...\n\nCommands:\n");
    for (const Command& c : kCommands) std::fprintf(out, "  %-10s %s\n", c.name, c.synopsis);
    std::fprintf(out,
                 "\nARGS is a Verilog command line: source files, -f files, -y/-v libraries,\n"
                 "+incdir+, +define+, -top, -G overrides and plus-arguments ('tarn compile -h'\n"
                 "lists them). Exit status: 0 without errors, 1 with errors, 2 on a usage mistake.\n");
}

const char* plural(int n) { return n == 1 ? "" : "s"; }

}  // namespace

int main(int argc, char** argv) {
    if (argc < 2) {
        usage(stderr);
        return 2;
    }
    const char* name = argv[1];
    if (!std::strcmp(name, "-h") || !std::strcmp(name, "--help") || !std::strcmp(name, "help")) {
        usage(stdout);
        return 0;
    }
    for (const Command& c : kCommands) {
        if (std::strcmp(name, c.name)) continue;
        TarnArgs args{Port_String("tarn")};
        for (int i = 2; i < argc; ++i) args.push_back(Port_String(argv[i]));
        int status = c.run(args);
        const int errors = Port_MsgDispatcher::getErrCount(false);
        const int warnings = Port_MsgDispatcher::getWarnCount(false);
        if (errors && status == 0) status = 1;
        std::fflush(stdout);
        std::fprintf(stderr, "tarn: %d error%s, %d warning%s\n", errors, plural(errors), warnings, plural(warnings));
        return status;
    }
    std::fprintf(stderr, "tarn: unknown command '%s'\n\n", name);
    usage(stderr);
    return 2;
}
