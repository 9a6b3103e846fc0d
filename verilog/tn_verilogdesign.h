// An elaborated (or unelaborated) design: the container every flow hands to
// the design-access root. It keeps its own copy of the run's options.
#ifndef TARN_TN_VERILOGDESIGN_H
#define TARN_TN_VERILOGDESIGN_H

#include "src/tn_verilogoptions.h"
#include "tarn/port_stringbase.h"

class Tn_VerilogDesign {
public:
    Tn_VerilogDesign(const Port_String& name, const Port_String& secondaryKey, const Tn_VerilogOptions& options);
    virtual ~Tn_VerilogDesign();
    Tn_VerilogDesign(const Tn_VerilogDesign&) = delete;
    Tn_VerilogDesign& operator=(const Tn_VerilogDesign&) = delete;

    const Port_String& name() const { return name_; }
    const Port_String& secondaryKey() const { return secondaryKey_; }
    const Tn_VerilogOptions& options() const { return options_; }

private:
    Port_String name_;
    Port_String secondaryKey_;
    Tn_VerilogOptions options_;
};

#endif
