// What the two compiler objects share: every operation, in both its forms,
// comes down to run(operation, argument list).
#ifndef TARN_TN_VCIBASE_H
#define TARN_TN_VCIBASE_H

#include "tarn/tn_vci.h"

class Tn_VciBase : public Tn_Vci {
public:
    enum Operation { COMPILE, PARSE, ELABORATE };

    Tn_VpiPtr compile(const ArgList& args) override { return run(COMPILE, args); }
    Tn_VpiPtr compile(int argc, const char* const* argv) override { return run(COMPILE, argList(argc, argv)); }
    Tn_VpiPtr parse(const ArgList& args) override { return run(PARSE, args); }
    Tn_VpiPtr parse(int argc, const char* const* argv) override { return run(PARSE, argList(argc, argv)); }
    Tn_VpiPtr elaborate(const ArgList& args) override { return run(ELABORATE, args); }
    Tn_VpiPtr elaborate(int argc, const char* const* argv) override { return run(ELABORATE, argList(argc, argv)); }

protected:
    virtual Tn_VpiPtr run(Operation op, const ArgList& args) = 0;
};

#endif
