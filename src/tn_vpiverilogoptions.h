// Plus-argument queries over a run's Tn_VerilogOptions (not owned).
#ifndef TARN_TN_VPIVERILOGOPTIONS_H
#define TARN_TN_VPIVERILOGOPTIONS_H

#include "tarn/tn_vpioptions.h"

class Tn_VerilogOptions;

class Tn_VpiVerilogOptions : public Tn_VpiOptions {
public:
    explicit Tn_VpiVerilogOptions(const Tn_VerilogOptions* options) : options_(options) {}
    bool has_plusarg(const Port_String& prefix) const override;
    Port_String plusarg_value(const Port_String& prefix) const override;
    // Null when the run produced no design to hold the options.
    const Tn_VerilogOptions* options() const { return options_; }

private:
    const Tn_VerilogOptions* options_;
};

#endif
