// Parses Verilog the way a compilation does (options, directive reset,
// +define+ macros) into a transient work library, with every message
// captured, and helps tests look at what was built.
#ifndef TARN_TESTS_PARSE_H
#define TARN_TESTS_PARSE_H

#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "library/tn_transientlibrary.h"
#include "tests/support/capturesink.h"
#include "tests/support/testfiles.h"
#include "verilog/tn_verilogdesignunit.h"
#include "verilog/tn_verilognodes.h"

struct ParseResult {
    std::unique_ptr<Tn_TransientLibraryManager> libraries;
    Tn_Library* work = nullptr;
    Tn_StringList compiled;  // names of the units parsed, in order

    Tn_VerilogDesignUnit* unit(const std::string& name) const;
    Tn_VerilogModule* module(const std::string& name) const;
    Tn_VerilogUdpDefn* udp(const std::string& name) const;
    // findTopUnits over the work library.
    std::vector<std::string> tops(bool recursive = true) const;
};

// Parses the files of a Verilog command line ("tarn" is put in front).
ParseResult parseArgs(const std::vector<std::string>& args);

// Compact text of an expression tree: (op l r), (?: c t f), names, numbers.
std::string shape(Tn_VerilogNode* e);
// The dump of a node as the dump format prints it.
std::string dumpOf(const Tn_VerilogNode* n, const char* label = "Node");

// A fixture writing sources into a scratch directory as t.v and parsing them.
class ParseTest : public ::testing::Test {
protected:
    ParseResult parse(const std::string& source, const std::vector<std::string>& args = {});
    // The location prefix of messages about line of t.v.
    std::string loc(int line) const { return "\"" + (dir / "t.v") + "\" line " + std::to_string(line) + " "; }
    // Error and warning texts without the final newline.
    std::vector<std::string> errors() const;
    std::vector<std::string> warnings() const;
    // The one module of a parse that must succeed without a message.
    Tn_VerilogModule* clean(const std::string& source, const std::vector<std::string>& args = {});

    TempDir dir;
    CaptureSink sink;
    ParseResult result;
};

typedef std::vector<std::string> Texts;

#endif
