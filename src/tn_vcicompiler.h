// The Verilog compiler object: each operation runs a fresh driver.
#ifndef TARN_TN_VCICOMPILER_H
#define TARN_TN_VCICOMPILER_H

#include "src/tn_vcibase.h"

class Tn_VciCompiler : public Tn_VciBase {
protected:
    Tn_VpiPtr run(Operation op, const ArgList& args) override;
};

#endif
