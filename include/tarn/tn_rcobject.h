// Intrusive reference counting for shared objects (types, values, handles,
// iterators, counters). Counting is plain arithmetic: one thread per object.
#ifndef TARN_TN_RCOBJECT_H
#define TARN_TN_RCOBJECT_H

#include <cstdint>

namespace Tn {

class RCObject {
public:
    void addReference() { ++refCount_; }
    // Drops one reference; the holder that drops the last one deletes the object.
    void removeReference() {
        if (--refCount_ == 0) delete this;
    }
    uint32_t refCount() const { return refCount_; }

protected:
    RCObject() : refCount_(0) {}
    // A copy is a new object: it starts unshared.
    RCObject(const RCObject&) : refCount_(0) {}
    RCObject& operator=(const RCObject&) { return *this; }
    virtual ~RCObject() {}

private:
    uint32_t refCount_;
};

}  // namespace Tn

#endif
