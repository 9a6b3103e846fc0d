// The design-access root: owns the design of a run, the record of the files
// it read and its error count, and forwards every query to the handle given.
#ifndef TARN_TN_VPIBASE_H
#define TARN_TN_VPIBASE_H

#include <deque>
#include <memory>

#include "access/tn_vpierrorrecord.h"
#include "access/tn_vpiuserdatamap.h"
#include "src/tn_vpiverilogoptions.h"
#include "tarn/tn_vpi.h"
#include "verilog/tn_verilogfilelist.h"

class Tn_VerilogDesign;

class Tn_VpiBase : public Tn_Vpi {
public:
    Tn_VpiBase(std::unique_ptr<Tn_VerilogDesign> design, const Tn_VerilogFileList& files, int32_t errorCount);
    ~Tn_VpiBase() override;

    int32_t error_count() const override { return errorCount_; }
    Tn_VpiHandlePtr handle(int32_t type, Tn_VpiHandlePtr ref) override;
    Tn_VpiHandlePtr handle_by_name(const char* name, Tn_VpiHandlePtr ref) override;
    Tn_VpiHandlePtr handle_by_name(const char* name) override;
    Tn_VpiHandlePtr handle_by_index(int32_t index, Tn_VpiHandlePtr ref) override;
    Tn_VpiIteratorPtr iterate(int32_t type, Tn_VpiHandlePtr ref) override;
    Tn_VpiIteratorPtr iterate(int32_t type) override;
    Tn_VpiHandlePtr scan(Tn_VpiIteratorPtr iterator) override;
    int32_t get_int(int32_t property, Tn_VpiHandlePtr ref) override;
    const char* get_str(int32_t property, Tn_VpiHandlePtr ref) override;
    void get_value(Tn_VpiHandlePtr ref, p_vpi_value value) override;
    void get_sd_value(Tn_VpiHandlePtr ref, p_vpi_value value) override;
    bool put_data(Tn_VpiHandlePtr ref, s_data* data) override;
    s_data* get_data(Tn_VpiHandlePtr ref) override;
    int32_t free_object(Tn_VpiIteratorPtr& iterator) override;
    int32_t free_object(Tn_VpiHandlePtr& handle) override;
    int32_t chk_error(p_vpi_error_info info) override;
    bool has_plusarg(const char* text) const override;
    const char* plusarg_value(const char* text) override;
    using Tn_Vpi::dump;
    void dump() override;

    Tn_VerilogDesign* design() const { return design_.get(); }
    const Tn_VerilogFileList& files() const { return files_; }

protected:
    // Keeps a copy of s valid for the next 16 string-returning calls.
    const char* keep(const Port_String& s);

private:
    // Clears the error record; with a null ref records nullMessage and gives
    // neutral, else gives f(*ref).
    template <class R, class F>
    R forward(const Tn_VpiHandlePtr& ref, const char* nullMessage, R neutral, F f);

    std::unique_ptr<Tn_VerilogDesign> design_;
    Tn_VerilogFileList files_;
    int32_t errorCount_;
    Tn_VpiVerilogOptions options_;
    std::deque<Port_String> ring_;
    Tn_VpiUserDataMap userData_;
    Tn_VpiErrorRecord error_;
};

// Root of the Verilog compiler's runs.
class Tn_VpiDesign : public Tn_VpiBase {
public:
    using Tn_VpiBase::Tn_VpiBase;
    using Tn_VpiBase::dump;
    void dump(Tn_OStream& out) override;
};

// Root of the data compiler's runs.
class Tn_VpiDataDesign : public Tn_VpiBase {
public:
    using Tn_VpiBase::Tn_VpiBase;
    using Tn_VpiBase::dump;
    void dump(Tn_OStream& out) override;
};

#endif
