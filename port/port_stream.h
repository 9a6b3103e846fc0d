// A byte stream over an open file (or a standard stream).
#ifndef TARN_PORT_STREAM_H
#define TARN_PORT_STREAM_H

#include <cstddef>
#include <cstdint>
#include <cstdio>

namespace Port {

class Stream {
public:
    Stream(std::FILE* f, bool owned) : f_(f), owned_(owned) {}
    ~Stream();
    Stream(const Stream&) = delete;
    Stream& operator=(const Stream&) = delete;

    // Bytes delivered; fewer than size only at end of file or on a read error.
    size_t read(void* buf, size_t size);
    size_t write(const void* buf, size_t size);
    bool geteof() const;
    bool geterror() const;
    void flush();

    // Text output: integers as decimal text.
    Stream& operator<<(const char* text);
    Stream& operator<<(int32_t v);
    Stream& operator<<(int16_t v);
    Stream& operator<<(char c);

    std::FILE* handle() const { return f_; }

    // What the open file is: two streams with equal device and inode read
    // the same file; size is meaningful for regular files. False without a file.
    struct FileId {
        uint64_t device;
        uint64_t inode;
        int64_t size;
        bool regular;
        bool directory;
    };
    bool fileId(FileId& id) const;

private:
    std::FILE* f_;
    bool owned_;
    // fileId() asks the system once.
    mutable FileId id_ = FileId();
    mutable int idState_ = 0;  // 0 not asked, 1 known, -1 failed
};

}  // namespace Port

#endif
