// Handles and iterators of the design-access interface. Callers hold them
// only through Tn_VpiHandlePtr and Tn_VpiIteratorPtr.
#ifndef TARN_TN_VPIHANDLE_H
#define TARN_TN_VPIHANDLE_H

#include <cstdint>

#include "tarn/port_stringbase.h"
#include "tarn/tn_rcptr.h"
#include "tarn/tn_vpi.h"
#include "tarn/tn_vpiuser.h"

class Tn_VpiVerilogOptions;
class Tn_VpiErrorRecord;
class Tn_VpiUserDataMap;

class Tn_VpiHandle : public Tn::RCObject {
public:
    typedef Tn_VpiVerilogOptions Options;
    typedef Tn_VpiErrorRecord Error;

    ~Tn_VpiHandle() override;
    virtual Tn_VpiHandlePtr handle(int32_t type, const Options& o, Error& e) = 0;
    virtual Tn_VpiHandlePtr handle_by_name(const Port_String& name, const Options& o, Error& e) = 0;
    virtual Tn_VpiHandlePtr handle_by_index(int32_t index, const Options& o, Error& e) = 0;
    virtual Tn_VpiIteratorPtr iterate(int32_t type, const Options& o, Error& e) = 0;
    virtual int32_t get_int(int32_t property, const Options& o, Error& e) = 0;
    virtual Port_String get_str(int32_t property, const Options& o, Error& e) = 0;
    virtual void get_value(p_vpi_value value, const Options& o, Error& e) = 0;
    virtual void get_sd_value(p_vpi_value value, const Options& o, Error& e) = 0;
    virtual bool put_data(Tn_Vpi::s_data* data, Tn_VpiUserDataMap& map, const Options& o, Error& e) = 0;
    virtual Tn_Vpi::s_data* get_data(Tn_VpiUserDataMap& map, const Options& o, Error& e) = 0;
};

class Tn_VpiIterator : public Tn::RCObject {
public:
    ~Tn_VpiIterator() override;
    // The next element; null when exhausted.
    virtual Tn_VpiHandlePtr scan() = 0;
};

class Tn_VpiHandlePtr : public Tn::RCPtr<Tn_VpiHandle> {
public:
    using Tn::RCPtr<Tn_VpiHandle>::RCPtr;
    Tn_VpiHandlePtr() {}
};

class Tn_VpiIteratorPtr : public Tn::RCPtr<Tn_VpiIterator> {
public:
    using Tn::RCPtr<Tn_VpiIterator>::RCPtr;
    Tn_VpiIteratorPtr() {}
};

#endif
