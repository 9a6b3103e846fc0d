// Plus-argument queries over the options of the run that made a root.
#ifndef TARN_TN_VPIOPTIONS_H
#define TARN_TN_VPIOPTIONS_H

#include "tarn/port_stringbase.h"

class Tn_VpiOptions {
public:
    virtual ~Tn_VpiOptions();
    // True when some plus-argument of the run begins with prefix.
    virtual bool has_plusarg(const Port_String& prefix) const = 0;
    // The rest of the first plus-argument that begins with prefix; empty if none.
    virtual Port_String plusarg_value(const Port_String& prefix) const = 0;

protected:
    Tn_VpiOptions() {}
};

#endif
