// The data compiler object: compile only; parse and elaborate are rejected.
#ifndef TARN_TN_VCIDATACOMPILER_H
#define TARN_TN_VCIDATACOMPILER_H

#include "src/tn_vcibase.h"

class Tn_VciDataCompiler : public Tn_VciBase {
protected:
    Tn_VpiPtr run(Operation op, const ArgList& args) override;
};

#endif
