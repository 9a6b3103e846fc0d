// Byte input streams: over a file (or standard input) and over a string.
#ifndef TARN_TN_ISTREAM_H
#define TARN_TN_ISTREAM_H

#include <cstddef>

#include "tarn/port_stringbase.h"

namespace Port {
class Stream;
}

class Tn_IStream {
public:
    virtual ~Tn_IStream();
    virtual bool eof() const = 0;
    virtual bool bad() const { return false; }
    virtual bool fail() const { return false; }
    // Bytes delivered by the last read.
    virtual size_t gcount() const = 0;
    // Returns the number of bytes delivered (fewer than size only at the end).
    virtual size_t read(char* buf, size_t size) = 0;
};

class Tn_IFileStream : public Tn_IStream {
public:
    // Takes ownership of an open stream (closed on destruction).
    explicit Tn_IFileStream(Port::Stream* s) : s_(s), owned_(true) {}
    // Opens name for reading; isOpen() tells whether that worked.
    explicit Tn_IFileStream(const char* name);
    ~Tn_IFileStream() override;
    Tn_IFileStream(const Tn_IFileStream&) = delete;
    Tn_IFileStream& operator=(const Tn_IFileStream&) = delete;

    bool isOpen() const { return s_ != nullptr; }
    bool eof() const override;
    size_t gcount() const override { return last_; }
    size_t read(char* buf, size_t size) override;

    // The process-wide stream over standard input, made on first use.
    static Tn_IFileStream& standardInput();

private:
    struct Borrowed {};
    Tn_IFileStream(Port::Stream* s, Borrowed) : s_(s), owned_(false) {}
    Port::Stream* s_;
    bool owned_;
    size_t last_ = 0;
};

class Tn_IStringStream : public Tn_IStream {
public:
    explicit Tn_IStringStream(const Port_String& text) : text_(text) {}
    bool eof() const override { return pos_ >= static_cast<size_t>(text_.GetLength()); }
    size_t gcount() const override { return last_; }
    size_t read(char* buf, size_t size) override;

private:
    Port_String text_;
    size_t pos_ = 0;
    size_t last_ = 0;
};

#endif
