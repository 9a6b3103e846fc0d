#include "access/tn_vpierrorrecord.h"

void Tn_VpiErrorRecord::clear() {
    state_ = 1;
    level_ = LEVEL_NONE;
    message_.Empty();
    product_ = "Tarn Verilog Compiler";
    code_.Empty();
    file_.Empty();
    line_ = 0;
}

void Tn_VpiErrorRecord::set(const Port_String& message, const Port_String& file, int32_t line) {
    level_ = LEVEL_ERROR;
    message_ = message;
    file_ = file;
    line_ = line;
}

int32_t Tn_VpiErrorRecord::fill(p_vpi_error_info info) {
    if (info) {
        info->state = state_;
        info->level = level_;
        info->message = const_cast<char*>(message_.c_str());
        info->product = const_cast<char*>(product_.c_str());
        info->code = const_cast<char*>(code_.c_str());
        info->file = const_cast<char*>(file_.c_str());
        info->line = line_;
    }
    return level_;
}
