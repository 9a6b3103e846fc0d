#include "util/tn_ostream.h"

#include "port/port_file.h"

Tn_OStream::~Tn_OStream() {}

Tn_OFileStream::Tn_OFileStream(const char* name) : s_(Port::File::open(name, Port::File::WRITE)), owned_(true) {}

Tn_OFileStream::~Tn_OFileStream() {
    if (owned_) Port::File::close(s_);
}

void Tn_OFileStream::write(const char* buf, size_t size) {
    if (s_) s_->write(buf, size);
}

void Tn_OFileStream::write(const char* text) {
    if (s_) *s_ << text;
}

void Tn_OFileStream::write(int32_t v) {
    if (s_) *s_ << v;
}

void Tn_OFileStream::write(int16_t v) {
    if (s_) *s_ << v;
}

void Tn_OFileStream::write(char c) {
    if (s_) *s_ << c;
}

void Tn_OStringStream::write(int32_t v) { s_ += Port_String::doFormat("%d", static_cast<int>(v)); }

void Tn_OStringStream::write(int16_t v) { s_ += Port_String::doFormat("%d", static_cast<int>(v)); }
