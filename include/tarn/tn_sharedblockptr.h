// Pointer sharing a separately allocated control block (object pointer and
// count): the pointee needs no count of its own. Base of Tn_VciPtr/Tn_VpiPtr.
#ifndef TARN_TN_SHAREDBLOCKPTR_H
#define TARN_TN_SHAREDBLOCKPTR_H

#include <cstddef>
#include <cstdint>
#include <utility>

template <class T>
class Tn_SharedBlockPtr {
public:
    class Tester {
        void operator delete(void*);
    };

    Tn_SharedBlockPtr() : b_(new Block{nullptr, 1}) {}
    explicit Tn_SharedBlockPtr(T* p) : b_(new Block{p, 1}) {}
    Tn_SharedBlockPtr(const Tn_SharedBlockPtr& o) : b_(o.b_) { ++b_->count; }
    ~Tn_SharedBlockPtr() { release(); }

    Tn_SharedBlockPtr& operator=(const Tn_SharedBlockPtr& o) {
        // The copy counts the source up before our old block is let go, so
        // self-assignment never frees the block.
        Tn_SharedBlockPtr held(o);
        std::swap(b_, held.b_);
        return *this;
    }

    T* get() const { return b_->obj; }
    T* operator->() const { return b_->obj; }
    T& operator*() const { return *b_->obj; }
    bool operator!() const { return b_->obj == nullptr; }
    operator Tester*() const {
        static Tester t;
        return b_->obj ? &t : nullptr;
    }
    uint32_t useCount() const { return b_->count; }

    bool operator==(const Tn_SharedBlockPtr& o) const { return get() == o.get(); }
    bool operator!=(const Tn_SharedBlockPtr& o) const { return get() != o.get(); }
    friend bool operator==(const Tn_SharedBlockPtr& a, const T* b) { return a.get() == b; }
    friend bool operator==(const T* a, const Tn_SharedBlockPtr& b) { return a == b.get(); }
    friend bool operator!=(const Tn_SharedBlockPtr& a, const T* b) { return a.get() != b; }
    friend bool operator!=(const T* a, const Tn_SharedBlockPtr& b) { return a != b.get(); }
    friend bool operator==(const Tn_SharedBlockPtr& a, std::nullptr_t) { return !a.get(); }
    friend bool operator==(std::nullptr_t, const Tn_SharedBlockPtr& b) { return !b.get(); }
    friend bool operator!=(const Tn_SharedBlockPtr& a, std::nullptr_t) { return a.get() != nullptr; }
    friend bool operator!=(std::nullptr_t, const Tn_SharedBlockPtr& b) { return b.get() != nullptr; }

private:
    struct Block {
        T* obj;
        uint32_t count;
    };
    void release() {
        if (--b_->count == 0) {
            delete b_->obj;
            delete b_;
        }
        b_ = nullptr;
    }
    Block* b_;
};

#endif
