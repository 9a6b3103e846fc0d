// One token of the Verilog scanner: type, text, file, line and the column
// just after its last character. Storage comes from a process-wide free list.
#ifndef TARN_TN_VERILOGTOKEN_H
#define TARN_TN_VERILOGTOKEN_H

#include <antlr/CommonHiddenStreamToken.hpp>
#include <cstddef>
#include <string>

#include "util/tn_rcstring.h"

class Tn_VerilogToken : public antlr::CommonHiddenStreamToken {
public:
    Tn_VerilogToken(int type, const std::string& text, const Tn_RCStringPtr& file, int line, int column);
    ~Tn_VerilogToken() override;

    const std::string& getFilename() const override;
    void setFilename(const std::string& file) override;
    // ["text",<type>,<file>,<line>,<column>]
    std::string toString() const override;
    // The text and the file without copies (the parser interns them).
    const std::string& textRef() const { return text; }
    const Tn_RCStringPtr& fileRef() const { return file_; }

    // Storage pooling: freed tokens go to a free list that new tokens use first.
    static void* operator new(std::size_t size);
    static void operator delete(void* p, std::size_t size);
    // Tokens the pool holds for reuse (for tests and memory reports).
    static std::size_t pooled();

private:
    Tn_RCStringPtr file_;
};

#endif
