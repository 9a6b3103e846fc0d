#include "verilog/tn_verilogscannerstate.h"

#include <algorithm>
#include <cstring>

#include "port/port_file.h"

Tn_VerilogScannerState::Input::Input(Kind kind, const Port_String& name, Port::Stream* stream)
    : kind_(kind), name_(name), stream_(stream) {
    hasId_ = stream_ && stream_->fileId(id_);
}

Tn_VerilogScannerState::Input::Input(Kind kind, const Port_String& name, std::string text)
    : kind_(kind), name_(name), stream_(nullptr), text_(std::move(text)) {}

Tn_VerilogScannerState::Input::~Input() {
    if (stream_) Port::File::close(stream_);
}

size_t Tn_VerilogScannerState::Input::read(char* buf, size_t size) {
    if (stream_) {
        // A regular file is read up to its size and no further, so that its
        // end costs no extra system call; a short read is the end of anything.
        if (ended_) return 0;
        if (hasId_ && id_.regular) size = std::min(size, static_cast<size_t>(std::max<int64_t>(id_.size - pos_, 0)));
        const size_t n = size ? stream_->read(buf, size) : 0;
        pos_ += n;
        if (n < size || (hasId_ && id_.regular && static_cast<int64_t>(pos_) >= id_.size)) ended_ = true;
        return n;
    }
    const size_t n = std::min(size, text_.size() - pos_);
    std::memcpy(buf, text_.data() + pos_, n);
    pos_ += n;
    return n;
}

bool Tn_VerilogScannerState::Input::sameFile(const Port::Stream::FileId& id) const {
    return hasId_ && id_.device == id.device && id_.inode == id.inode;
}

Tn_VerilogScannerState::Tn_VerilogScannerState(const Tn_VerilogOptions& options, Tn_VerilogDirectiveState& directives)
    : options_(&options), directives_(&directives) {}

Tn_VerilogScannerState::~Tn_VerilogScannerState() {}

Port_String Tn_VerilogScannerState::locationText(const std::string& file, int line) {
    if (!file.empty()) {
        if (line >= 1) return Port_String::doFormat("\"%s\" line %d ", file.c_str(), line);
        return Port_String::doFormat("\"%s\" ", file.c_str());
    }
    if (line >= 1) return Port_String::doFormat("line %d ", line);
    return Port_String();
}

Port_String Tn_VerilogScannerState::locationText() const { return locationText(fileName(), line); }

const std::string& Tn_VerilogScannerState::fileName() const {
    static const std::string empty;
    return file ? file->str() : empty;
}

Port_String Tn_VerilogScannerState::currentFilePath() const {
    for (auto it = inputs.rbegin(); it != inputs.rend(); ++it)
        if ((*it)->isFile()) return (*it)->name();
    return Port_String();
}
