// An immutable, reference-counted string: one copy shared by many holders
// (the file name of every token scanned from one file, for example).
#ifndef TARN_TN_RCSTRING_H
#define TARN_TN_RCSTRING_H

#include <string>

#include "tarn/tn_rcptr.h"

class Tn_RCString : public Tn::RCObject {
public:
    static Tn::RCPtr<Tn_RCString> create(const std::string& s) { return Tn::RCPtr<Tn_RCString>(new Tn_RCString(s)); }
    const std::string& str() const { return s_; }
    const char* c_str() const { return s_.c_str(); }

private:
    explicit Tn_RCString(const std::string& s) : s_(s) {}
    ~Tn_RCString() override {}
    const std::string s_;
};

typedef Tn::RCPtr<Tn_RCString> Tn_RCStringPtr;

#endif
