#include "util/tn_istream.h"

#include <algorithm>
#include <cstring>

#include "port/port_file.h"

Tn_IStream::~Tn_IStream() {}

Tn_IFileStream::Tn_IFileStream(const char* name) : s_(Port::File::open(name, Port::File::READ)), owned_(true) {}

Tn_IFileStream::~Tn_IFileStream() {
    if (owned_) Port::File::close(s_);
}

bool Tn_IFileStream::eof() const { return !s_ || s_->geteof(); }

size_t Tn_IFileStream::read(char* buf, size_t size) {
    last_ = s_ ? s_->read(buf, size) : 0;
    return last_;
}

Tn_IFileStream& Tn_IFileStream::standardInput() {
    static Tn_IFileStream in(Port::File::getCin(), Borrowed());
    return in;
}

size_t Tn_IStringStream::read(char* buf, size_t size) {
    const size_t len = static_cast<size_t>(text_.GetLength());
    size_t n = 0;
    if (pos_ < len) n = std::min(size, len - pos_);
    if (n) std::memcpy(buf, text_.c_str() + pos_, n);
    pos_ += n;
    last_ = n;
    return n;
}
