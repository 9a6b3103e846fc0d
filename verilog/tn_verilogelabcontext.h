// The context every elaboration pass and every check receives: the run's
// options, the design that elaborated nodes are created in, and where in the
// hierarchy the work stands (the scope stack). Elaboration adds its queues
// and the instance and generate stacks here as it needs them.
#ifndef TARN_TN_VERILOGELABCONTEXT_H
#define TARN_TN_VERILOGELABCONTEXT_H

#include <cstdint>
#include <unordered_set>
#include <vector>

class Tn_DesignUnitLocator;
class Tn_VerilogGenVar;
class Tn_VerilogLibraryUnit;
class Tn_VerilogNode;
class Tn_VerilogNodeFactory;
class Tn_VerilogOptions;
class Tn_VerilogScope;

class Tn_VerilogElabContext {
public:
    // One entry of the scope stack: the elaborated scope being filled and the
    // parsed scope it is copied from (null where there is none).
    struct ScopePair {
        Tn_VerilogScope* newScope;
        Tn_VerilogScope* sourceScope;
    };

    Tn_VerilogElabContext(bool recursive, const Tn_VerilogOptions* options, Tn_DesignUnitLocator* locator,
                          Tn_VerilogLibraryUnit* design);
    Tn_VerilogElabContext(const Tn_VerilogElabContext&) = delete;
    Tn_VerilogElabContext& operator=(const Tn_VerilogElabContext&) = delete;

    bool recursive() const { return recursive_; }
    const Tn_VerilogOptions* options() const { return options_; }
    Tn_DesignUnitLocator* locator() const { return locator_; }
    Tn_VerilogLibraryUnit* design() const { return design_; }
    // The factory of the design: elaborated copies are made there.
    Tn_VerilogNodeFactory& factory() const;
    // Verilog-2001 rules (the default without options).
    bool verilog2001() const;

    void pushScope(Tn_VerilogScope* newScope, Tn_VerilogScope* sourceScope = nullptr);
    void popScope();
    bool hasScope() const { return !scopes_.empty(); }
    const ScopePair& top() const { return scopes_.back(); }
    // The innermost new scope: where names are looked up from; null when the
    // stack is empty.
    Tn_VerilogScope* scope() const { return scopes_.empty() ? nullptr : scopes_.back().newScope; }
    // The innermost new scope of a node kind (Module 7, Root 6, Primitive 14).
    Tn_VerilogScope* innermostScope(int32_t nodeType) const;

    // Genvars of the generate loops being unrolled, innermost last; a genvar
    // may be referred to only while it is active.
    std::vector<Tn_VerilogGenVar*>& activeGenVars() { return genvars_; }
    bool isActiveGenVar(const Tn_VerilogGenVar* g) const;

    // True the first time a node is offered: shared children (one type
    // definition for every object of a declaration) are checked once.
    bool firstCheck(const Tn_VerilogNode* node) { return checked_.insert(node).second; }

private:
    bool recursive_;
    const Tn_VerilogOptions* options_;
    Tn_DesignUnitLocator* locator_;
    Tn_VerilogLibraryUnit* design_;
    std::vector<ScopePair> scopes_;
    std::vector<Tn_VerilogGenVar*> genvars_;
    std::unordered_set<const Tn_VerilogNode*> checked_;
};

#endif
