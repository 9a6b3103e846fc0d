#include "verilog/tn_verilogelabcontext.h"

#include <algorithm>

#include "src/tn_verilogoptions.h"
#include "verilog/tn_veriloglibraryunit.h"
#include "verilog/tn_verilognodes.h"

Tn_VerilogElabContext::Tn_VerilogElabContext(bool recursive, const Tn_VerilogOptions* options,
                                             Tn_DesignUnitLocator* locator, Tn_VerilogLibraryUnit* design)
    : recursive_(recursive), options_(options), locator_(locator), design_(design) {}

Tn_VerilogNodeFactory& Tn_VerilogElabContext::factory() const { return design_->factory(); }

bool Tn_VerilogElabContext::verilog2001() const { return !options_ || options_->verilog2001() != 0; }

void Tn_VerilogElabContext::pushScope(Tn_VerilogScope* newScope, Tn_VerilogScope* sourceScope) {
    scopes_.push_back(ScopePair{newScope, sourceScope});
}

void Tn_VerilogElabContext::popScope() {
    if (!scopes_.empty()) scopes_.pop_back();
}

Tn_VerilogScope* Tn_VerilogElabContext::innermostScope(int32_t nodeType) const {
    for (auto it = scopes_.rbegin(); it != scopes_.rend(); ++it)
        if (it->newScope && it->newScope->nodeType() == nodeType) return it->newScope;
    return nullptr;
}

bool Tn_VerilogElabContext::isActiveGenVar(const Tn_VerilogGenVar* g) const {
    return std::find(genvars_.begin(), genvars_.end(), g) != genvars_.end();
}
