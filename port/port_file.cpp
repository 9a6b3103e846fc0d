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
    std::FILE* f = std::fopen(name, mode);
    if (!f) return nullptr;
    // fopen succeeds on directories for reading.
    Stream* s = new Stream(f, true);
    Stream::FileId id;
    if (s->fileId(id) && id.directory) {
        delete s;
        return nullptr;
    }
    return s;
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
