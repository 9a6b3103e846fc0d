// An iterator that is always exhausted.
#ifndef TARN_TN_VPINULLITR_H
#define TARN_TN_VPINULLITR_H

#include "tarn/tn_vpihandle.h"

class Tn_VpiNullItr : public Tn_VpiIterator {
public:
    Tn_VpiHandlePtr scan() override { return Tn_VpiHandlePtr(); }
};

#endif
