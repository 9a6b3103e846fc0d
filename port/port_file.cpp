#include "port/port_file.h"

#include <cerrno>
#include <sys/stat.h>
#include <sys/types.h>

namespace Port {

Stream* File::open(const char* name, int access, int /*flags*/) {
    if (!name || !*name) return nullptr;
    const char* mode = "rb";
    if (access & APPEND)
        mode = "ab";
    else if (access & WRITE)
        mode = (access & READ) ? "r+b" : "wb";
    if (isdir(name)) return nullptr;  // fopen succeeds on directories for reading
    std::FILE* f = std::fopen(name, mode);
    return f ? new Stream(f, true) : nullptr;
}

void File::close(Stream* s) { delete s; }

bool File::isfile(const char* name) {
    struct stat st;
    return name && *name && ::stat(name, &st) == 0 && S_ISREG(st.st_mode);
}

bool File::isdir(const char* name) {
    struct stat st;
    return name && *name && ::stat(name, &st) == 0 && S_ISDIR(st.st_mode);
}

bool File::mkdir(const char* name) {
    if (!name || !*name) return false;
    if (::mkdir(name, 0777) == 0) return true;
    return errno == EEXIST && isdir(name);
}

bool File::sameFile(const char* a, const char* b) {
    struct stat sa, sb;
    return a && b && ::stat(a, &sa) == 0 && ::stat(b, &sb) == 0 && sa.st_dev == sb.st_dev && sa.st_ino == sb.st_ino;
}

int64_t File::getdatetime(const char* name) {
    struct stat st;
    if (!name || ::stat(name, &st) != 0) return 0;
    return static_cast<int64_t>(st.st_mtime);
}

Stream* File::getCin() {
    static Stream s(stdin, false);
    return &s;
}

Stream* File::getCout() {
    static Stream s(stdout, false);
    return &s;
}

Stream* File::getCerr() {
    static Stream s(stderr, false);
    return &s;
}

}  // namespace Port
