#include "port/port_exception.h"

#include "tarn/port_msgmandata.h"

namespace Port {

Exception::Exception(const char* file, const char* revision, int line)
    : file_(file), revision_(revision), line_(line) {}

Exception::~Exception() {}

void Exception::setDescription(const char* fmt, ...) {
    va_list ap;
    va_start(ap, fmt);
    text_.FormatV(fmt, ap);
    va_end(ap);
}

Port_String Exception::getLocalized() const { return text_; }

void Exception::report() const {
    Port_MsgManData::createObject("ZORIveravaro", file_.c_str(), line_, revision_.c_str())
        .issueError("%s", getLocalized().c_str());
}

}  // namespace Port
