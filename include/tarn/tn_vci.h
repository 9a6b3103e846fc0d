// The compiler objects: create one, call compile, parse or elaborate with a
// command line, and read the design through the returned root.
#ifndef TARN_TN_VCI_H
#define TARN_TN_VCI_H

#include <vector>

#include "tarn/port_stringbase.h"
#include "tarn/tn_sharedblockptr.h"
#include "tarn/tn_vpi.h"

class Tn_VciPtr;

class Tn_Vci {
public:
    typedef std::vector<Port_String> ArgList;  // element 0: the program name

    virtual ~Tn_Vci() = 0;
    virtual Tn_VpiPtr compile(const ArgList& args) = 0;
    virtual Tn_VpiPtr compile(int argc, const char* const* argv) = 0;
    virtual Tn_VpiPtr parse(const ArgList& args) = 0;
    virtual Tn_VpiPtr parse(int argc, const char* const* argv) = 0;
    virtual Tn_VpiPtr elaborate(const ArgList& args) = 0;
    virtual Tn_VpiPtr elaborate(int argc, const char* const* argv) = 0;

    static Tn_VciPtr create_compiler();
    static Tn_VciPtr create_data_compiler();

    // All argc entries (the program name included); empty for argc <= 0.
    static ArgList argList(int argc, const char* const* argv);

protected:
    Tn_Vci() {}
};

class Tn_VciPtr : public Tn_SharedBlockPtr<Tn_Vci> {
public:
    Tn_VciPtr() {}
    explicit Tn_VciPtr(Tn_Vci* p) : Tn_SharedBlockPtr<Tn_Vci>(p) {}
};

#endif
