// What checking tests share: a module m to declare in, the messages captured,
// the errors of checking one expression, and tables of expected messages.
#ifndef TARN_TESTS_CHECKFIXTURE_H
#define TARN_TESTS_CHECKFIXTURE_H

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/support/capturesink.h"
#include "tests/support/designbuilder.h"

typedef std::vector<std::string> Texts;

// One expression, the use it is checked for, and the one error expected
// (empty: none).
struct MessageCase {
    const char* expr;
    Tn_Verilog::ValueType use;
    std::string message;
};

class CheckFixture : public ::testing::Test {
protected:
    DesignBuilder b;
    CaptureSink sink;
    Tn_VerilogModule* m = b.module("m");

    // The errors of checking e in scope (m when null) for a use; the type it
    // checked to is left in checked.
    Texts errorsOf(const std::string& e, Tn_VerilogScope* scope = nullptr, Tn_Verilog::ValueType use = Tn_Verilog::Value);
    // Each case checked in scope gives exactly its message, and the error
    // type exactly when it has one.
    void expectMessages(const std::vector<MessageCase>& cases, Tn_VerilogScope* scope = nullptr);

    Tn_VerilogTypePtr checked;
};

#endif
