// Wall-clock time of the portability layer.
#ifndef TARN_UT_TIME_H
#define TARN_UT_TIME_H

#include <cstdint>

#include "tarn/port_stringbase.h"

class UT_TIME {
public:
    // Seconds since the epoch.
    static int64_t Time();
    // The time as text, e.g. "Sun Dec  6 21:16:15 2026" (no newline).
    static Port_String CTime(int64_t t);
};

#endif
