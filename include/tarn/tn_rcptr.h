// Holder of a Tn::RCObject subclass: counts the pointee up while held.
#ifndef TARN_TN_RCPTR_H
#define TARN_TN_RCPTR_H

#include <cstddef>

#include "tarn/tn_rcobject.h"

namespace Tn {

template <class T>
class RCPtr {
public:
    // Target of the truth-value conversion; its address means "not null".
    class Tester {
        void operator delete(void*);
    };

    RCPtr() : p_(nullptr) {}
    RCPtr(T* p) : p_(p) { acquire(); }
    RCPtr(const RCPtr& o) : p_(o.p_) { acquire(); }
    template <class U>
    RCPtr(const RCPtr<U>& o) : p_(o.get()) { acquire(); }
    RCPtr(RCPtr&& o) noexcept : p_(o.p_) { o.p_ = nullptr; }
    ~RCPtr() { release(); }

    // The source is counted up before our own pointee is let go, so assigning
    // a pointer to itself (or to a copy reachable only through us) is safe.
    RCPtr& operator=(const RCPtr& o) {
        T* p = o.p_;
        if (p) p->addReference();
        release();
        p_ = p;
        return *this;
    }
    RCPtr& operator=(RCPtr&& o) noexcept {
        if (this != &o) {
            release();
            p_ = o.p_;
            o.p_ = nullptr;
        }
        return *this;
    }
    RCPtr& operator=(T* p) { return *this = RCPtr(p); }

    T* get() const { return p_; }
    T* operator->() const { return p_; }
    T& operator*() const { return *p_; }
    bool operator!() const { return p_ == nullptr; }
    operator Tester*() const {
        static Tester t;
        return p_ ? &t : nullptr;
    }

    template <class U>
    bool operator==(const RCPtr<U>& o) const { return p_ == o.get(); }
    template <class U>
    bool operator!=(const RCPtr<U>& o) const { return p_ != o.get(); }
    friend bool operator==(const RCPtr& a, const T* b) { return a.p_ == b; }
    friend bool operator==(const T* a, const RCPtr& b) { return a == b.p_; }
    friend bool operator!=(const RCPtr& a, const T* b) { return a.p_ != b; }
    friend bool operator!=(const T* a, const RCPtr& b) { return a != b.p_; }
    friend bool operator==(const RCPtr& a, std::nullptr_t) { return a.p_ == nullptr; }
    friend bool operator==(std::nullptr_t, const RCPtr& b) { return b.p_ == nullptr; }
    friend bool operator!=(const RCPtr& a, std::nullptr_t) { return a.p_ != nullptr; }
    friend bool operator!=(std::nullptr_t, const RCPtr& b) { return b.p_ != nullptr; }

private:
    void acquire() {
        if (p_) p_->addReference();
    }
    void release() {
        T* p = p_;
        p_ = nullptr;
        if (p) p->removeReference();
    }
    T* p_;
};

}  // namespace Tn

#endif
