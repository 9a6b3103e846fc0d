// Byte output streams: to a file and to a string.
#ifndef TARN_TN_OSTREAM_H
#define TARN_TN_OSTREAM_H

#include <cstddef>
#include <cstdint>

#include "tarn/port_stringbase.h"

namespace Port {
class Stream;
}

class Tn_OStream {
public:
    virtual ~Tn_OStream();
    virtual void write(const char* buf, size_t size) = 0;
    virtual void write(const char* text) = 0;
    virtual void write(int32_t v) = 0;
    virtual void write(int16_t v) = 0;
    virtual void write(char c) = 0;
};

class Tn_OFileStream : public Tn_OStream {
public:
    explicit Tn_OFileStream(Port::Stream* s, bool owned = true) : s_(s), owned_(owned) {}
    // Opens name for writing; isOpen() tells whether that worked.
    explicit Tn_OFileStream(const char* name);
    ~Tn_OFileStream() override;
    Tn_OFileStream(const Tn_OFileStream&) = delete;
    Tn_OFileStream& operator=(const Tn_OFileStream&) = delete;

    bool isOpen() const { return s_ != nullptr; }
    void write(const char* buf, size_t size) override;
    void write(const char* text) override;
    void write(int32_t v) override;
    void write(int16_t v) override;
    void write(char c) override;

private:
    Port::Stream* s_;
    bool owned_;
};

class Tn_OStringStream : public Tn_OStream {
public:
    void write(const char* buf, size_t size) override { s_.Append(buf, static_cast<int>(size)); }
    void write(const char* text) override { s_ += text; }
    void write(int32_t v) override;
    void write(int16_t v) override;
    void write(char c) override { s_ += c; }
    const Port_String& str() const { return s_; }

private:
    Port_String s_;
};

#endif
