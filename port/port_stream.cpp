#include "port/port_stream.h"

namespace Port {

Stream::~Stream() {
    if (owned_ && f_) std::fclose(f_);
}

size_t Stream::read(void* buf, size_t size) { return (f_ && size) ? std::fread(buf, 1, size, f_) : 0; }

size_t Stream::write(const void* buf, size_t size) { return (f_ && size) ? std::fwrite(buf, 1, size, f_) : 0; }

bool Stream::geteof() const { return !f_ || std::feof(f_) != 0; }

bool Stream::geterror() const { return !f_ || std::ferror(f_) != 0; }

void Stream::flush() {
    if (f_) std::fflush(f_);
}

Stream& Stream::operator<<(const char* text) {
    if (f_ && text) std::fputs(text, f_);
    return *this;
}

Stream& Stream::operator<<(int32_t v) {
    if (f_) std::fprintf(f_, "%d", static_cast<int>(v));
    return *this;
}

Stream& Stream::operator<<(int16_t v) {
    if (f_) std::fprintf(f_, "%d", static_cast<int>(v));
    return *this;
}

Stream& Stream::operator<<(char c) {
    if (f_) std::fputc(static_cast<unsigned char>(c), f_);
    return *this;
}

}  // namespace Port
