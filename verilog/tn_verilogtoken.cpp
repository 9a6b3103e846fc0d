#include "verilog/tn_verilogtoken.h"

#include <new>

namespace {

// Freed token storage, linked through its first word. Process-wide and
// unlocked, like every scanner structure (one compiler call at a time).
struct FreeBlock {
    FreeBlock* next;
};
FreeBlock* g_free = nullptr;
std::size_t g_pooled = 0;

// Under AddressSanitizer every token gets fresh storage, so that a token used
// after its last reference went is still caught.
#if defined(__SANITIZE_ADDRESS__)
const bool kPooling = false;
#else
const bool kPooling = true;
#endif

const std::string& emptyName() {
    static const std::string empty;
    return empty;
}

}  // namespace

Tn_VerilogToken::Tn_VerilogToken(int type, const std::string& txt, const Tn_RCStringPtr& file, int atLine, int atColumn)
    : antlr::CommonHiddenStreamToken(type, txt), file_(file) {
    line = atLine;
    col = atColumn;
}

Tn_VerilogToken::~Tn_VerilogToken() {}

const std::string& Tn_VerilogToken::getFilename() const { return file_ ? file_->str() : emptyName(); }

void Tn_VerilogToken::setFilename(const std::string& file) { file_ = Tn_RCString::create(file); }

std::string Tn_VerilogToken::toString() const {
    std::string s = "[\"" + text + "\",<" + std::to_string(getType()) + ">,<" + getFilename() + ">,<";
    s += std::to_string(line) + ">,<" + std::to_string(col) + ">]";
    return s;
}

void* Tn_VerilogToken::operator new(std::size_t size) {
    if (kPooling && size == sizeof(Tn_VerilogToken) && g_free) {
        FreeBlock* b = g_free;
        g_free = b->next;
        --g_pooled;
        return b;
    }
    return ::operator new(size);
}

void Tn_VerilogToken::operator delete(void* p, std::size_t size) {
    if (!p) return;
    if (!kPooling || size != sizeof(Tn_VerilogToken)) {
        ::operator delete(p);
        return;
    }
    FreeBlock* b = static_cast<FreeBlock*>(p);
    b->next = g_free;
    g_free = b;
    ++g_pooled;
}

std::size_t Tn_VerilogToken::pooled() { return g_pooled; }
