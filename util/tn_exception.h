// Base of Tarn's own exceptions; the flows catch it, report it and go on.
#ifndef TARN_TN_EXCEPTION_H
#define TARN_TN_EXCEPTION_H

#include "port/port_exception.h"
#include "util/tn_message.h"

class Tn_Exception : public Port::Exception {
public:
    Tn_Exception(const char* file, const char* revision, int line) : Port::Exception(file, revision, line) {}
    ~Tn_Exception() override;
};

#endif
