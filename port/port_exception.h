// Base exception of the portability layer: carries its text and where it was
// raised, and reports itself as an error message.
#ifndef TARN_PORT_EXCEPTION_H
#define TARN_PORT_EXCEPTION_H

#include <exception>

#include "tarn/port_stringbase.h"

namespace Port {

class Exception : public std::exception {
public:
    Exception(const char* file, const char* revision, int line);
    ~Exception() override;

    void setDescription(const char* fmt, ...) __attribute__((format(printf, 2, 3)));
    virtual Port_String getLocalized() const;
    // Issues the text as an error message from the raising file and line.
    virtual void report() const;

    const char* what() const noexcept override { return text_.c_str(); }
    const Port_String& file() const { return file_; }
    int line() const { return line_; }

private:
    Port_String file_;
    Port_String revision_;
    int line_;
    Port_String text_;
};

}  // namespace Port

#endif
