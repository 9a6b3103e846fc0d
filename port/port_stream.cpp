#include "port/port_stream.h"

#include <sys/stat.h>

namespace Port {

Stream::~Stream() {
    if (owned_ && f_) std::fclose(f_);
}

size_t Stream::read(void* buf, size_t size) { return (f_ && size) ? std::fread(buf, 1, size, f_) : 0; }

size_t Stream::write(const void* buf, size_t size) { return (f_ && size) ? std::fwrite(buf, 1, size, f_) : 0; }

bool Stream::fileId(FileId& id) const {
    if (idState_ == 0) {
        struct stat st;
        idState_ = (f_ && ::fstat(fileno(f_), &st) == 0) ? 1 : -1;
        if (idState_ > 0) {
            id_.device = static_cast<uint64_t>(st.st_dev);
            id_.inode = static_cast<uint64_t>(st.st_ino);
            id_.size = static_cast<int64_t>(st.st_size);
            id_.regular = S_ISREG(st.st_mode);
            id_.directory = S_ISDIR(st.st_mode);
        }
    }
    id = id_;
    return idState_ > 0;
}

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
