// The Verilog compiler object: each operation runs a fresh driver.
#ifndef TARN_TN_VCICOMPILER_H
#define TARN_TN_VCICOMPILER_H

#include "tarn/tn_vci.h"

class Tn_VciCompiler : public Tn_Vci {
public:
    Tn_VpiPtr compile(const ArgList& args) override;
    Tn_VpiPtr compile(int argc, const char* const* argv) override { return compile(argList(argc, argv)); }
    Tn_VpiPtr parse(const ArgList& args) override;
    Tn_VpiPtr parse(int argc, const char* const* argv) override { return parse(argList(argc, argv)); }
    Tn_VpiPtr elaborate(const ArgList& args) override;
    Tn_VpiPtr elaborate(int argc, const char* const* argv) override { return elaborate(argList(argc, argv)); }
};

#endif
