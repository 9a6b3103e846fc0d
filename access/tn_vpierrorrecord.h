// The last failure of a design-access operation, in the shape chk_error hands out.
#ifndef TARN_TN_VPIERRORRECORD_H
#define TARN_TN_VPIERRORRECORD_H

#include <cstdint>

#include "tarn/port_stringbase.h"
#include "tarn/tn_vpiuser.h"

class Tn_VpiErrorRecord {
public:
    enum { LEVEL_NONE = 0, LEVEL_ERROR = 3 };

    Tn_VpiErrorRecord() { clear(); }
    void clear();
    void set(const Port_String& message, const Port_String& file = Port_String(), int32_t line = 0);

    int32_t level() const { return level_; }
    const Port_String& message() const { return message_; }
    const Port_String& file() const { return file_; }
    int32_t line() const { return line_; }
    // Fills info (strings point into this record) and returns the level.
    int32_t fill(p_vpi_error_info info);

private:
    int32_t state_;
    int32_t level_;
    Port_String message_;
    Port_String product_;
    Port_String code_;
    Port_String file_;
    int32_t line_;
};

#endif
