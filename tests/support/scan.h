// Runs the scanner over sources the way a compilation opens it (options,
// directive reset, +define+ macros) and collects every token.
#ifndef TARN_TESTS_SCAN_H
#define TARN_TESTS_SCAN_H

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "tests/support/capturesink.h"
#include "tests/support/testfiles.h"

struct ScannedToken {
    int type;
    std::string text;
    std::string file;
    int line;
    int column;
};

struct ScanResult {
    std::vector<ScannedToken> tokens;  // up to and including EOF, or up to the error
    bool failed = false;               // a scanner error ended the scan
    std::string error;                 // its message, file and line
    std::string errorFile;
    int errorLine = 0;

    // Texts of the tokens before EOF, joined by single blanks.
    std::string text() const;
    std::vector<int> types() const;
};

class Tn_VerilogLexer;
// Reads every token of a started lexer.
ScanResult drainTokens(Tn_VerilogLexer& lexer);

// Scans with a Verilog command line ("tarn" is put in front). Without
// strict, missing includes and undefined macros are only warnings (as in the
// data compiler's flow).
ScanResult scanArgs(const std::vector<std::string>& args, bool strict = true);
// Writes source to dir/name and scans it, with further arguments after it.
ScanResult scanSource(const TempDir& dir, const std::string& source, const std::vector<std::string>& args = {},
                      const std::string& name = "t.v", bool strict = true);

// A fixture scanning sources written into a scratch directory as t.v, with
// every message captured.
class ScanTest : public ::testing::Test {
protected:
    // The token texts of a scan that must succeed.
    std::string scanText(const std::string& source, const std::vector<std::string>& args = {}) {
        ScanResult r = scanSource(dir, source, args);
        EXPECT_FALSE(r.failed) << r.error;
        return r.text();
    }
    // A scan that must end in a scanner error.
    ScanResult scanFailing(const std::string& source, const std::vector<std::string>& args = {}) {
        ScanResult r = scanSource(dir, source, args);
        EXPECT_TRUE(r.failed) << source;
        return r;
    }
    // The location prefix of messages about line of t.v.
    std::string loc(int line) const { return "\"" + (dir / "t.v") + "\" line " + std::to_string(line) + " "; }

    TempDir dir;
    CaptureSink sink;
};

#endif
