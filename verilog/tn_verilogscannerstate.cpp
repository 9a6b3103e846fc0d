#include "verilog/tn_verilogscannerstate.h"

#include <cstring>

#include "port/port_file.h"

Tn_VerilogScannerState::Input::Input(Kind kind, const Port_String& name, Port::Stream* stream)
    : kind_(kind), name_(name), stream_(stream) {}

Tn_VerilogScannerState::Input::Input(Kind kind, const Port_String& name, std::string text)
    : kind_(kind), name_(name), stream_(nullptr), text_(std::move(text)) {}

Tn_VerilogScannerState::Input::~Input() {
    if (stream_) Port::File::close(stream_);
}

size_t Tn_VerilogScannerState::Input::read(char* buf, size_t size) {
    if (stream_) return stream_->read(buf, size);
    const size_t n = std::min(size, text_.size() - pos_);
    std::memcpy(buf, text_.data() + pos_, n);
    pos_ += n;
    return n;
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
