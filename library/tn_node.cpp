#include "library/tn_node.h"

#include <new>

#include "port/kor_memory.h"

int32_t Tn_Node::s_generation = 0;

namespace {

// Free lists by size (in steps of 16 bytes) for nodes up to kLargest bytes;
// larger ones use the global allocator. Under AddressSanitizer every node
// gets its own storage, so that use after destruction is still caught.
#if defined(__SANITIZE_ADDRESS__)
const bool kPooling = false;
#else
const bool kPooling = true;
#endif
const std::size_t kStep = 16;
const std::size_t kLargest = 1024;
const std::size_t kBlock = std::size_t(4) << 20;

struct FreeNode {
    FreeNode* next;
};

struct NodePool {
    FreeNode* free[kLargest / kStep + 1] = {};
    char* next = nullptr;  // unused rest of the current block
    char* end = nullptr;
};

NodePool& pool() {
    static NodePool* p = new NodePool;
    return *p;
}

std::size_t sizeClass(std::size_t size) { return (size + kStep - 1) / kStep; }

}  // namespace

void* Tn_Node::operator new(std::size_t size) {
    if (!kPooling || size > kLargest) return ::operator new(size);
    NodePool& p = pool();
    const std::size_t c = sizeClass(size);
    if (FreeNode* f = p.free[c]) {
        p.free[c] = f->next;
        return f;
    }
    const std::size_t bytes = c * kStep;
    if (static_cast<std::size_t>(p.end - p.next) < bytes) {
        // Blocks live as long as the process; their nodes are reused.
        p.next = static_cast<char*>(kor_allocBlock(kBlock));
        if (!p.next) throw std::bad_alloc();
        p.end = p.next + kBlock;
    }
    void* r = p.next;
    p.next += bytes;
    return r;
}

void Tn_Node::operator delete(void* ptr, std::size_t size) {
    if (!ptr) return;
    if (!kPooling || size > kLargest) {
        ::operator delete(ptr);
        return;
    }
    NodePool& p = pool();
    FreeNode* f = static_cast<FreeNode*>(ptr);
    const std::size_t c = sizeClass(size);
    f->next = p.free[c];
    p.free[c] = f;
}

Tn_Node::~Tn_Node() {}

Port_String Tn_Location::text() const {
    if (!file.IsEmpty()) {
        if (line < 1) return Port_String::doFormat("\"%s\" ", file.c_str());
        return Port_String::doFormat("\"%s\" line %d ", file.c_str(), line);
    }
    if (line >= 1) return Port_String::doFormat("line %d ", line);
    return Port_String();
}
