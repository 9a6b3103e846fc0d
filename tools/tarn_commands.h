// Subcommands of the tarn command. Each takes the Verilog command line (the
// program name "tarn" first) and returns the exit status.
#ifndef TARN_TOOLS_TARN_COMMANDS_H
#define TARN_TOOLS_TARN_COMMANDS_H

#include <vector>

#include "tarn/port_stringbase.h"

typedef std::vector<Port_String> TarnArgs;

int tarnCompile(const TarnArgs& args);
int tarnParse(const TarnArgs& args);
int tarnElaborate(const TarnArgs& args);
int tarnData(const TarnArgs& args);
int tarnEval(const TarnArgs& args);
int tarnTokens(const TarnArgs& args);

#endif
