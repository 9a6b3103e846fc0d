#include "access/tn_vpibase.h"

#include "access/tn_vpinullitr.h"
#include "port/port_file.h"
#include "util/tn_ostream.h"
#include "verilog/tn_verilogdesign.h"

namespace {
const size_t kRingCapacity = 16;
}

Tn_Vpi::~Tn_Vpi() {}
Tn_Vpi::s_data::~s_data() {}
Tn_VpiHandle::~Tn_VpiHandle() {}
Tn_VpiIterator::~Tn_VpiIterator() {}

Tn_VpiBase::Tn_VpiBase(std::unique_ptr<Tn_VerilogDesign> design, const Tn_VerilogFileList& files, int32_t errorCount)
    : design_(std::move(design)),
      files_(files),
      errorCount_(errorCount),
      options_(design_ ? &design_->options() : nullptr) {}

Tn_VpiBase::~Tn_VpiBase() {}

template <class R, class F>
R Tn_VpiBase::forward(const Tn_VpiHandlePtr& ref, const char* nullMessage, R neutral, F f) {
    error_.clear();
    if (!ref) {
        error_.set(nullMessage);
        return neutral;
    }
    return f(*ref);
}

Tn_VpiHandlePtr Tn_VpiBase::handle(int32_t type, Tn_VpiHandlePtr ref) {
    return forward(ref, "Tn_Vpi::handle: null handle not allowed", Tn_VpiHandlePtr(),
                   [&](Tn_VpiHandle& h) { return h.handle(type, options_, error_); });
}

Tn_VpiHandlePtr Tn_VpiBase::handle_by_name(const char* name, Tn_VpiHandlePtr ref) {
    return forward(ref, "Tn_Vpi::handle_by_name: null handle not allowed", Tn_VpiHandlePtr(),
                   [&](Tn_VpiHandle& h) { return h.handle_by_name(Port_String(name), options_, error_); });
}

Tn_VpiHandlePtr Tn_VpiBase::handle_by_name(const char*) {
    // Search from the design's root arrives with the design-access layer.
    error_.clear();
    return Tn_VpiHandlePtr();
}

Tn_VpiHandlePtr Tn_VpiBase::handle_by_index(int32_t index, Tn_VpiHandlePtr ref) {
    return forward(ref, "Tn_Vpi::handle_by_index: null handle not allowed", Tn_VpiHandlePtr(),
                   [&](Tn_VpiHandle& h) { return h.handle_by_index(index, options_, error_); });
}

Tn_VpiIteratorPtr Tn_VpiBase::iterate(int32_t type, Tn_VpiHandlePtr ref) {
    return forward(ref, "Tn_Vpi::iterate: refHandle is null", Tn_VpiIteratorPtr(new Tn_VpiNullItr),
                   [&](Tn_VpiHandle& h) { return h.iterate(type, options_, error_); });
}

Tn_VpiIteratorPtr Tn_VpiBase::iterate(int32_t) {
    // Top-level modules and source files arrive with the design-access layer.
    error_.clear();
    return Tn_VpiIteratorPtr(new Tn_VpiNullItr);
}

Tn_VpiHandlePtr Tn_VpiBase::scan(Tn_VpiIteratorPtr iterator) {
    error_.clear();
    return iterator ? iterator->scan() : Tn_VpiHandlePtr();
}

int32_t Tn_VpiBase::get_int(int32_t property, Tn_VpiHandlePtr ref) {
    return forward(ref, "Tn_Vpi::get_int: refHandle must not be null", int32_t(-1),
                   [&](Tn_VpiHandle& h) { return h.get_int(property, options_, error_); });
}

const char* Tn_VpiBase::get_str(int32_t property, Tn_VpiHandlePtr ref) {
    return keep(forward(ref, "Tn_Vpi::get_str: refHandle must not be null", Port_String(),
                        [&](Tn_VpiHandle& h) { return h.get_str(property, options_, error_); }));
}

void Tn_VpiBase::get_value(Tn_VpiHandlePtr ref, p_vpi_value value) {
    forward(ref, "Tn_Vpi::get_value: refHandle must not be null", 0, [&](Tn_VpiHandle& h) {
        h.get_value(value, options_, error_);
        return 0;
    });
}

void Tn_VpiBase::get_sd_value(Tn_VpiHandlePtr ref, p_vpi_value value) {
    forward(ref, "Tn_Vpi::get_sd_value: refHandle must not be null", 0, [&](Tn_VpiHandle& h) {
        h.get_sd_value(value, options_, error_);
        return 0;
    });
}

bool Tn_VpiBase::put_data(Tn_VpiHandlePtr ref, s_data* data) {
    return forward(ref, "Tn_Vpi::put_data: refHandle must not be null", false,
                   [&](Tn_VpiHandle& h) { return h.put_data(data, userData_, options_, error_); });
}

Tn_Vpi::s_data* Tn_VpiBase::get_data(Tn_VpiHandlePtr ref) {
    return forward(ref, "Tn_Vpi::get_data: refHandle must not be null", static_cast<s_data*>(nullptr),
                   [&](Tn_VpiHandle& h) { return h.get_data(userData_, options_, error_); });
}

int32_t Tn_VpiBase::free_object(Tn_VpiIteratorPtr& iterator) {
    iterator = Tn_VpiIteratorPtr();
    return 1;
}

int32_t Tn_VpiBase::free_object(Tn_VpiHandlePtr& handle) {
    handle = Tn_VpiHandlePtr();
    return 1;
}

int32_t Tn_VpiBase::chk_error(p_vpi_error_info info) { return error_.fill(info); }

bool Tn_VpiBase::has_plusarg(const char* text) const { return options_.has_plusarg(Port_String(text)); }

const char* Tn_VpiBase::plusarg_value(const char* text) { return keep(options_.plusarg_value(Port_String(text))); }

void Tn_VpiBase::dump() {
    Tn_OFileStream out(Port::File::getCout(), false);
    dump(out);
}

const char* Tn_VpiBase::keep(const Port_String& s) {
    ring_.push_back(s);
    if (ring_.size() > kRingCapacity) ring_.pop_front();
    return ring_.back().c_str();
}

// The design dumper fills these in; until then a dump writes nothing.
void Tn_VpiDesign::dump(Tn_OStream&) {}
void Tn_VpiDataDesign::dump(Tn_OStream&) {}
