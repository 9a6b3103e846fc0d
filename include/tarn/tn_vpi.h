// The design-access root: what every compiler operation returns.
#ifndef TARN_TN_VPI_H
#define TARN_TN_VPI_H

#include <cstdint>

#include "tarn/tn_sharedblockptr.h"
#include "tarn/port_stringbase.h"
#include "tarn/tn_vpiuser.h"

class Tn_OStream;
class Tn_VpiHandlePtr;
class Tn_VpiIteratorPtr;

class Tn_Vpi {
public:
    // Base of caller data attached to objects with put_data.
    struct s_data {
        s_data() {}
        s_data(const s_data&) {}
        s_data& operator=(const s_data&) { return *this; }
        virtual ~s_data();
    };

    virtual ~Tn_Vpi() = 0;
    virtual int32_t error_count() const = 0;
    virtual Tn_VpiHandlePtr handle(int32_t type, Tn_VpiHandlePtr ref) = 0;
    virtual Tn_VpiHandlePtr handle_by_name(const char* name, Tn_VpiHandlePtr ref) = 0;
    virtual Tn_VpiHandlePtr handle_by_name(const char* name) = 0;
    virtual Tn_VpiHandlePtr handle_by_index(int32_t index, Tn_VpiHandlePtr ref) = 0;
    virtual Tn_VpiIteratorPtr iterate(int32_t type, Tn_VpiHandlePtr ref) = 0;
    virtual Tn_VpiIteratorPtr iterate(int32_t type) = 0;
    virtual Tn_VpiHandlePtr scan(Tn_VpiIteratorPtr iterator) = 0;
    virtual int32_t get_int(int32_t property, Tn_VpiHandlePtr ref) = 0;
    virtual const char* get_str(int32_t property, Tn_VpiHandlePtr ref) = 0;
    virtual void get_value(Tn_VpiHandlePtr ref, p_vpi_value value) = 0;
    virtual void get_sd_value(Tn_VpiHandlePtr ref, p_vpi_value value) = 0;
    virtual bool put_data(Tn_VpiHandlePtr ref, s_data* data) = 0;
    virtual s_data* get_data(Tn_VpiHandlePtr ref) = 0;
    virtual int32_t free_object(Tn_VpiIteratorPtr& iterator) = 0;
    virtual int32_t free_object(Tn_VpiHandlePtr& handle) = 0;
    virtual int32_t chk_error(p_vpi_error_info info) = 0;
    virtual bool has_plusarg(const char* text) const = 0;
    virtual const char* plusarg_value(const char* text) = 0;
    virtual void dump(Tn_OStream& out) = 0;
    virtual void dump() = 0;

protected:
    Tn_Vpi() {}
};

class Tn_VpiPtr : public Tn_SharedBlockPtr<Tn_Vpi> {
public:
    Tn_VpiPtr() {}
    explicit Tn_VpiPtr(Tn_Vpi* p) : Tn_SharedBlockPtr<Tn_Vpi>(p) {}
};

// Handles and iterators need Tn_Vpi::s_data, so they follow it.
#include "tarn/tn_vpihandle.h"

#endif
