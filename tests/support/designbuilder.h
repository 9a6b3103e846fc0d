// Small designs made by hand for checking tests: modules, blocks, tasks and
// functions, declarations and expressions (from text), all through the node
// factory of one design unit, and the elaboration context to check them in.
#ifndef TARN_TESTS_DESIGNBUILDER_H
#define TARN_TESTS_DESIGNBUILDER_H

#include <memory>
#include <map>
#include <string>
#include <vector>

#include "src/tn_verilogoptions.h"
#include "verilog/tn_verilogdesignunit.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

class DesignBuilder {
public:
    explicit DesignBuilder(bool verilog2001 = true);

    Tn_VerilogNodeFactory& factory() { return unit_.factory(); }
    Tn_VerilogRoot* root() { return root_; }
    // Location of the nodes made from now on: "t.v" and this line.
    void at(int line) { location_ = Tn_Location("t.v", line); }

    // Scopes, each declared in its parent.
    Tn_VerilogModule* module(const std::string& name, Tn_VerilogConcurrentRegion* parent = nullptr);
    Tn_VerilogBlock* block(Tn_VerilogRegion* parent, const std::string& name);
    Tn_VerilogTask* task(Tn_VerilogConcurrentRegion* parent, const std::string& name);
    Tn_VerilogFunction* function(Tn_VerilogConcurrentRegion* parent, const std::string& name,
                                 Tn_VerilogNode* returnType = nullptr);
    Tn_VerilogGenerate* generate(Tn_VerilogConcurrentRegion* parent, const std::string& name);
    Tn_VerilogModuleInstance* instance(Tn_VerilogConcurrentRegion* parent, const std::string& name,
                                       Tn_VerilogModule* module);

    // Type definitions; range is "7:0" style or empty.
    Tn_VerilogReg* reg(const std::string& range = "", bool isSigned = false);
    Tn_VerilogNet* wire(const std::string& range = "", bool isSigned = false,
                        Tn_Verilog::NetType type = Tn_Verilog::Wire);
    Tn_VerilogIntegerVar* integer();
    Tn_VerilogTimeVar* time();
    Tn_VerilogRealVar* real();
    Tn_VerilogEvent* event();
    Tn_VerilogRange* range(const std::string& text);

    // Declarations, entered in their scope.
    Tn_VerilogScalarVar* var(Tn_VerilogRegion* scope, const std::string& name, Tn_VerilogTypeDef* type,
                             const std::string& init = "");
    Tn_VerilogArrayVar* array(Tn_VerilogRegion* scope, const std::string& name, Tn_VerilogTypeDef* type,
                              const std::vector<std::string>& dimensions);
    Tn_VerilogParameter* param(Tn_VerilogRegion* scope, const std::string& name, const std::string& value,
                               Tn_Verilog::ParamDeclType declType = Tn_Verilog::NoTypeNoRangeParam,
                               const std::string& range = "", bool local = false);
    Tn_VerilogSpecParam* specparam(Tn_VerilogModule* scope, const std::string& name, const std::string& value);
    Tn_VerilogGenVar* genvar(Tn_VerilogConcurrentRegion* scope, const std::string& name);
    // A port or argument declaration (kind Input, Inout or Output) with its
    // own range; type is the type definition that completes it.
    Tn_VerilogIODeclaration* port(Tn_VerilogRegion* scope, Tn_Verilog::NodeType kind, const std::string& name,
                                  Tn_VerilogTypeDef* type, const std::string& range = "", bool isSigned = false);

    // An expression from text; array names declared so far make word-selects.
    Tn_VerilogExpression* expr(const std::string& text);

    // A context for checking with scope on top of the scope stack.
    Tn_VerilogElabContext& context(Tn_VerilogScope* scope);

private:
    // A declaration named name in parent (not yet entered in its lists).
    template <class T>
    T* declare(Tn_VerilogScope* parent, const std::string& name);

    Tn_VerilogOptions options_;
    Tn_VerilogDesignUnit unit_;
    Tn_VerilogRoot* root_;
    Tn_Location location_;
    std::map<std::string, int> arrays_;  // array names and their dimensions
    std::unique_ptr<Tn_VerilogElabContext> ctx_;
};

#endif
