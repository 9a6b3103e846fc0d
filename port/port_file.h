// File system access of the portability layer.
#ifndef TARN_PORT_FILE_H
#define TARN_PORT_FILE_H

#include <cstdint>

#include "port/port_stream.h"

namespace Port {

class File {
public:
    enum Access { READ = 1, WRITE = 2, APPEND = 4 };
    // Open flags: TEXT is accepted for symmetry; POSIX makes no difference.
    enum Flags { BINARY = 0, TEXT = 1 };

    // A new stream the caller closes with close(), or null when the file
    // cannot be opened (directories never open).
    static Stream* open(const char* name, int access, int flags = BINARY);
    static void close(Stream* s);

    static bool isfile(const char* name);
    static bool isdir(const char* name);
    // Creates one directory level; true when it exists afterwards.
    static bool mkdir(const char* name);
    // Modification time in seconds since the epoch; 0 when unknown.
    static int64_t getdatetime(const char* name);

    // The process's standard streams (owned by the layer, never closed).
    static Stream* getCin();
    static Stream* getCout();
    static Stream* getCerr();
};

}  // namespace Port

#endif
