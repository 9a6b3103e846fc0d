// Hand-written members of the node classes: checking, typing, sizing,
// constant evaluation, elaborated copies, name resolution and scope lookup.
// tn_verilognodes.h includes this before it generates the classes; each
// TN_MEMBERS_<Name> is pasted into the public part of Tn_Verilog<Name>, and
// the members are implemented in the class's (or its family's) .cpp file.
// No member may be pure: every class, abstract ones too, gets a generated
// copy operation that instantiates it.
#ifndef TARN_TN_VERILOGNODEMEMBERS_H
#define TARN_TN_VERILOGNODEMEMBERS_H

#include <cstdint>
#include <vector>

#include "tarn/port_stringbase.h"
#include "verilog/tn_verilogenums.h"
#include "verilog/tn_verilogevalcontext.h"
#include "verilog/tn_verilogtype.h"
#include "verilog/tn_verilogvalue.h"

class Tn_VerilogElabContext;
class Tn_VerilogDeclaration;
class Tn_VerilogExpression;
class Tn_VerilogFunction;
class Tn_VerilogIODeclaration;
class Tn_VerilogRange;
class Tn_VerilogScope;
class Tn_VerilogTask;

// How an expression is copied into an elaborated unit: plainly, or as (part
// of) a parameter or specparam value, where names must denote parameters
// (specparams) and system function calls may not appear.
enum Tn_VerilogCopyMode { TN_COPY_PLAIN, TN_COPY_PARAMETER, TN_COPY_SPECPARAM };

// What a parameter keeps while values are computed: the guard against a
// parameter defined through itself, and its value as computed in the
// outermost evaluation still running. Widths, signs and values of the names
// in a parameter's expression each ask for the value of the parameter they
// name; without the memo a chain of n parameters would cost 3^n evaluations.
// A copied node starts afresh.
struct Tn_VerilogParamValueState {
    Tn_VerilogParamValueState() {}
    Tn_VerilogParamValueState(const Tn_VerilogParamValueState&) {}
    Tn_VerilogParamValueState& operator=(const Tn_VerilogParamValueState&) { return *this; }
    bool evaluating = false;
    uint32_t session = 0;
    Tn_VerilogValuePtr value;
};

// The properties of a type definition, which a declaration answers for its
// own (1, unsigned, ... unless a class says otherwise).
#define TN_TYPE_PROPERTIES                                                                            \
    virtual uint32_t width() const { return 1; }                                                      \
    virtual bool isSigned() const { return false; }                                                   \
    virtual bool isReal() const { return false; }                                                     \
    virtual bool hasFixedSize() const { return true; }                                                \
    virtual bool isNet() const { return false; }                                                      \
    virtual bool isVariable() const { return false; }

// ---------------------------------------------------------------- attributed

#define TN_HAS_MEMBERS_AttributedNode TN_PROBE
#define TN_MEMBERS_AttributedNode                                                                     \
    /* Reports semantic errors; an expression's type as a value, else void */                        \
    /* or the error type after a message. Every class checks its attributes first. */                \
    virtual Tn_VerilogTypePtr check(Tn_VerilogElabContext& ctx);                                      \
    /* False when the attribute list reported. */                                                    \
    bool checkAttributes(Tn_VerilogElabContext& ctx);

// --------------------------------------------------------------- declarations

#define TN_HAS_MEMBERS_Declaration TN_PROBE
#define TN_MEMBERS_Declaration                                                                        \
    Port_String name() const { return Name.str(); }                                                   \
    /* The name under the nearest enclosing generate scope or scope array. */                         \
    virtual Port_String localPath() const;                                                            \
    /* Dotted path from the root's children down. */                                                 \
    virtual Port_String fullPath() const;                                                             \
    /* Text for messages: "parameter 'p'", "vector reg 'r'", "task 't'". */                          \
    virtual Port_String describe() const;                                                             \
    /* The type a name denoting this declaration has. */                                            \
    virtual Tn_VerilogTypePtr type() const;                                                           \
    /* Parameters, specparams and genvars. */                                                         \
    virtual bool isConstant() const { return false; }                                                 \
    /* Constant value (declared bounds kept); null when not a constant or not computable. */        \
    virtual Tn_VerilogValuePtr value() const;                                                         \
    /* Properties of the type definition (1, unsigned, ... for others). */                           \
    TN_TYPE_PROPERTIES                                                                                \
    /* Whether a plain reference may be assigned as a net / a variable. */                           \
    virtual bool isNetLValue() const { return false; }                                                \
    virtual bool isVarLValue() const { return false; }                                                \
    /* Declared bit bounds for selects; false when there are none known. */                          \
    virtual bool bounds(int32_t& msb, int32_t& lsb) const;                                            \
    /* The scope the declaration stands for in a hierarchical name (a module */                      \
    /* instance: its module); null when it is none. */                                               \
    virtual Tn_VerilogScope* denotedScope() { return nullptr; }

#define TN_HAS_MEMBERS_Scope TN_PROBE
#define TN_MEMBERS_Scope                                                                              \
    Tn_VerilogTypePtr type() const override;                                                          \
    Tn_VerilogScope* denotedScope() override { return this; }                                        \
    virtual bool isRoot() const { return false; }                                                     \
    virtual bool isExpandedScope() const { return false; }                                            \
    /* A declaration made directly in this scope: objects, then contained scopes. */                 \
    virtual Tn_VerilogDeclaration* findDeclaration(const Tn_Symbol& name) const;                      \
    /* A directly contained scope or instance. */                                                     \
    virtual Tn_VerilogDeclaration* findScope(const Tn_Symbol& name) const;                            \
    virtual Tn_VerilogDeclaration* findTask(const Tn_Symbol&) const { return nullptr; }               \
    virtual Tn_VerilogDeclaration* findFunction(const Tn_Symbol&) const { return nullptr; }           \
    virtual Tn_VerilogDeclaration* findBlock(const Tn_Symbol&) const { return nullptr; }              \
    virtual Tn_VerilogDeclaration* findModuleInstance(const Tn_Symbol&) const { return nullptr; }     \
    virtual Tn_VerilogDeclaration* findModuleArray(const Tn_Symbol&) const { return nullptr; }        \
    virtual Tn_VerilogDeclaration* findPrimitive(const Tn_Symbol&) const { return nullptr; }          \
    virtual Tn_VerilogDeclaration* findPrimitiveArray(const Tn_Symbol&) const { return nullptr; }     \
    virtual Tn_VerilogDeclaration* findGenerate(const Tn_Symbol&) const { return nullptr; }           \
    virtual Tn_VerilogDeclaration* findGenerateArray(const Tn_Symbol&) const { return nullptr; }      \
    /* The element of an instance or generate scope array of that index. */                          \
    virtual Tn_VerilogDeclaration* element(int32_t) const { return nullptr; }                         \
    /* Upward search: here, then outward (not beyond a module); where, when */                       \
    /* given, receives the scope that held the declaration. */                                        \
    virtual Tn_VerilogDeclaration* lookup(const Tn_Symbol& name, const Tn_VerilogScope** where = nullptr) const; \
    /* Upward search for a scope, through the whole hierarchy. */                                     \
    virtual Tn_VerilogDeclaration* lookupScope(const Tn_Symbol& name) const;                          \
    Tn_VerilogDeclaration* lookupTask(const Tn_Symbol& name) const;                                   \
    Tn_VerilogDeclaration* lookupFunction(const Tn_Symbol& name) const;                               \
    /* Whether name is the scope's own (module: its name or definition name). */                    \
    virtual bool hasOwnName(const Tn_Symbol& name) const { return Name == name; }

#define TN_SCOPE_REGION_MEMBERS                                                                       \
    Tn_VerilogDeclaration* findDeclaration(const Tn_Symbol& name) const override;                     \
    Tn_VerilogDeclaration* findScope(const Tn_Symbol& name) const override;                           \
    /* The object lists only (ports, parameters, variables, genvars, specparams). */                 \
    virtual Tn_VerilogDeclaration* findObject(const Tn_Symbol& name) const;

#define TN_HAS_MEMBERS_Region TN_PROBE
#define TN_MEMBERS_Region TN_SCOPE_REGION_MEMBERS Tn_VerilogDeclaration* findBlock(const Tn_Symbol& name) const override;

#define TN_HAS_MEMBERS_ConcurrentRegion TN_PROBE
#define TN_MEMBERS_ConcurrentRegion                                                                   \
    Tn_VerilogDeclaration* findObject(const Tn_Symbol& name) const override;                          \
    Tn_VerilogDeclaration* findScope(const Tn_Symbol& name) const override;                           \
    Tn_VerilogDeclaration* findTask(const Tn_Symbol& name) const override;                            \
    Tn_VerilogDeclaration* findFunction(const Tn_Symbol& name) const override;                        \
    Tn_VerilogDeclaration* findModuleInstance(const Tn_Symbol& name) const override;                  \
    Tn_VerilogDeclaration* findModuleArray(const Tn_Symbol& name) const override;                     \
    Tn_VerilogDeclaration* findPrimitive(const Tn_Symbol& name) const override;                       \
    Tn_VerilogDeclaration* findPrimitiveArray(const Tn_Symbol& name) const override;                  \
    Tn_VerilogDeclaration* findGenerate(const Tn_Symbol& name) const override;                        \
    Tn_VerilogDeclaration* findGenerateArray(const Tn_Symbol& name) const override;

#define TN_HAS_MEMBERS_Root TN_PROBE
#define TN_MEMBERS_Root                                                                               \
    bool isRoot() const override { return true; }                                                     \
    Tn_VerilogDeclaration* lookup(const Tn_Symbol& name, const Tn_VerilogScope** where = nullptr) const override; \
    Tn_VerilogDeclaration* lookupScope(const Tn_Symbol& name) const override;

#define TN_HAS_MEMBERS_Module TN_PROBE
#define TN_MEMBERS_Module                                                                             \
    Port_String describe() const override;                                                            \
    Tn_VerilogDeclaration* findObject(const Tn_Symbol& name) const override;                          \
    Tn_VerilogDeclaration* lookup(const Tn_Symbol& name, const Tn_VerilogScope** where = nullptr) const override; \
    Tn_VerilogDeclaration* lookupScope(const Tn_Symbol& name) const override;                         \
    bool hasOwnName(const Tn_Symbol& name) const override { return Name == name || DefName == name; }

#define TN_HAS_MEMBERS_Generate TN_PROBE
#define TN_MEMBERS_Generate                                                                           \
    Port_String describe() const override;                                                            \
    bool isExpandedScope() const override { return true; }                                            \
    Tn_VerilogDeclaration* findObject(const Tn_Symbol& name) const override;

#define TN_HAS_MEMBERS_Task TN_PROBE
#define TN_MEMBERS_Task                                                                               \
    Port_String describe() const override;                                                            \
    Tn_VerilogTypePtr type() const override;

#define TN_HAS_MEMBERS_Function TN_PROBE
#define TN_MEMBERS_Function                                                                           \
    Port_String describe() const override;                                                            \
    Tn_VerilogTypePtr type() const override;                                                          \
    /* Inside the function its name stands for the result variable: the */                          \
    /* function declares itself, and sizes like its result. */                                       \
    Tn_VerilogDeclaration* findObject(const Tn_Symbol& name) const override;                          \
    uint32_t width() const override;                                                                  \
    bool isSigned() const override;                                                                   \
    bool isReal() const override;                                                                     \
    bool bounds(int32_t& msb, int32_t& lsb) const override;                                           \
    /* The result's type definition (a reg, integer, real ...) or range, as written. */              \
    Tn_VerilogTypePtr resultType() const;                                                             \
    /* The value a call with constant arguments returns; null until constant */                      \
    /* functions can be run. */                                                                       \
    Tn_VerilogValuePtr evaluateConstantCall(const std::vector<Tn_VerilogValuePtr>& arguments,         \
                                            const Tn_VerilogEvalContext& ctx) const;

#define TN_HAS_MEMBERS_Block TN_PROBE
#define TN_MEMBERS_Block Port_String describe() const override;

#define TN_HAS_MEMBERS_ScopeArray TN_PROBE
#define TN_MEMBERS_ScopeArray bool isExpandedScope() const override { return true; }

#define TN_HAS_MEMBERS_InstanceArray TN_PROBE
#define TN_MEMBERS_InstanceArray Tn_VerilogDeclaration* findDeclaration(const Tn_Symbol& name) const override;

#define TN_SCOPE_ARRAY_MEMBERS                                                                        \
    Port_String describe() const override;                                                            \
    Tn_VerilogDeclaration* element(int32_t index) const override;
#define TN_HAS_MEMBERS_ModuleArray TN_PROBE
#define TN_MEMBERS_ModuleArray TN_SCOPE_ARRAY_MEMBERS
#define TN_HAS_MEMBERS_PrimitiveArray TN_PROBE
#define TN_MEMBERS_PrimitiveArray TN_SCOPE_ARRAY_MEMBERS
#define TN_HAS_MEMBERS_GenerateArray TN_PROBE
#define TN_MEMBERS_GenerateArray TN_SCOPE_ARRAY_MEMBERS

#define TN_HAS_MEMBERS_ModuleInstance TN_PROBE
#define TN_MEMBERS_ModuleInstance                                                                     \
    Port_String describe() const override;                                                            \
    Tn_VerilogTypePtr type() const override;                                                          \
    Tn_VerilogScope* denotedScope() override;

// Objects forward their properties to their type definition.
#define TN_HAS_MEMBERS_Object TN_PROBE
#define TN_MEMBERS_Object                                                                             \
    /* The type definition in force (a port's is its redeclaration's). */                            \
    virtual Tn_VerilogTypeDef* typeDef() const { return TypeDef; }                                    \
    Tn_VerilogTypePtr check(Tn_VerilogElabContext& ctx) override;                                     \
    Port_String describe() const override;                                                            \
    Tn_VerilogTypePtr type() const override;                                                          \
    uint32_t width() const override;                                                                  \
    bool isSigned() const override;                                                                   \
    bool isReal() const override;                                                                     \
    bool hasFixedSize() const override;                                                               \
    bool isNet() const override;                                                                      \
    bool isVariable() const override;                                                                 \
    bool isNetLValue() const override { return isNet(); }                                             \
    bool isVarLValue() const override { return isVariable(); }                                        \
    bool bounds(int32_t& msb, int32_t& lsb) const override;                                           \
    /* Resolves the names of the type definition's range from the scope. */                         \
    void prepare() const;

#define TN_HAS_MEMBERS_GenVar TN_PROBE
#define TN_MEMBERS_GenVar                                                                             \
    Port_String describe() const override;                                                            \
    Tn_VerilogTypePtr type() const override;                                                          \
    bool isConstant() const override { return true; }                                                 \
    /* The current value while the genvar is valid (its loop runs), else null. */                    \
    Tn_VerilogValuePtr value() const override;                                                        \
    uint32_t width() const override { return 32; }                                                    \
    bool isSigned() const override { return true; }                                                   \
    bool isReal() const override { return false; }                                                    \
    bool hasFixedSize() const override { return true; }                                               \
    bool isNet() const override { return false; }                                                     \
    bool isVariable() const override { return false; }                                                \
    bool isNetLValue() const override { return false; }                                               \
    bool isVarLValue() const override { return false; }                                               \
    bool bounds(int32_t& msb, int32_t& lsb) const override;

// Parameters and specparams: typed by their declaration, sized by their value
// when they have neither type nor range.
#define TN_PARAMETER_MEMBERS                                                                          \
    Tn_VerilogTypePtr check(Tn_VerilogElabContext& ctx) override;                                     \
    Port_String describe() const override;                                                            \
    Tn_VerilogTypePtr type() const override;                                                          \
    bool isConstant() const override { return true; }                                                 \
    Tn_VerilogValuePtr value() const override;                                                        \
    uint32_t width() const override;                                                                  \
    bool isSigned() const override;                                                                   \
    bool isReal() const override;                                                                     \
    bool hasFixedSize() const override;                                                               \
    bool isNet() const override { return false; }                                                     \
    bool isVariable() const override { return false; }                                                \
    bool isNetLValue() const override { return false; }                                               \
    bool isVarLValue() const override { return false; }                                               \
    bool bounds(int32_t& msb, int32_t& lsb) const override;                                           \
    /* The expression in force: the override when there is one. */                                   \
    Tn_VerilogExpression* valueExpression() const;                                                    \
                                                                                                      \
private:                                                                                              \
    mutable Tn_VerilogParamValueState valueState_;                                                    \
                                                                                                      \
public:

#define TN_HAS_MEMBERS_Parameter TN_PROBE
#define TN_MEMBERS_Parameter TN_PARAMETER_MEMBERS
#define TN_HAS_MEMBERS_SpecParam TN_PROBE
#define TN_MEMBERS_SpecParam TN_PARAMETER_MEMBERS

#define TN_HAS_MEMBERS_ScalarVar TN_PROBE
#define TN_MEMBERS_ScalarVar Tn_VerilogTypePtr check(Tn_VerilogElabContext& ctx) override;

#define TN_HAS_MEMBERS_ArrayVar TN_PROBE
#define TN_MEMBERS_ArrayVar                                                                           \
    Tn_VerilogTypePtr check(Tn_VerilogElabContext& ctx) override;                                     \
    Port_String describe() const override;                                                            \
    Tn_VerilogTypePtr type() const override;                                                          \
    bool isNetLValue() const override { return false; }                                               \
    bool isVarLValue() const override { return false; }

#define TN_HAS_MEMBERS_IODeclaration TN_PROBE
#define TN_MEMBERS_IODeclaration                                                                      \
    Tn_VerilogTypeDef* typeDef() const override;                                                      \
    /* The net or variable declaration of the same name in the scope, or null. */                    \
    Tn_VerilogVariable* redeclaration() const;                                                        \
    Tn_VerilogTypePtr check(Tn_VerilogElabContext& ctx) override;                                     \
    Port_String describe() const override;                                                            \
    Tn_VerilogTypePtr type() const override;                                                          \
    uint32_t width() const override;                                                                  \
    bool isSigned() const override;                                                                   \
    bool bounds(int32_t& msb, int32_t& lsb) const override;                                           \
    /* "input", "inout", "output". */                                                                 \
    virtual const char* directionWord() const { return ""; }                                                    \
    /* The range in force: the redeclaration's when it has one. */                                   \
    Tn_VerilogRange* effectiveRange() const;

#define TN_HAS_MEMBERS_Input TN_PROBE
#define TN_MEMBERS_Input const char* directionWord() const override { return "input"; }
#define TN_HAS_MEMBERS_Inout TN_PROBE
#define TN_MEMBERS_Inout const char* directionWord() const override { return "inout"; }
#define TN_HAS_MEMBERS_Output TN_PROBE
#define TN_MEMBERS_Output const char* directionWord() const override { return "output"; }

#define TN_HAS_MEMBERS_Port TN_PROBE
#define TN_MEMBERS_Port Port_String describe() const override;

// ---------------------------------------------------------------- expressions

#define TN_HAS_MEMBERS_EventExpression TN_PROBE
#define TN_MEMBERS_EventExpression                                                                    \
    /* The type the expression has for a use (Value, LValue, NetLValue, */                          \
    /* VarLValue, PortLValue); the error type after a message. */                                     \
    virtual Tn_VerilogTypePtr typeAs(Tn_VerilogElabContext& ctx, Tn_Verilog::ValueType use);          \
    Tn_VerilogTypePtr check(Tn_VerilogElabContext& ctx) override;

#define TN_HAS_MEMBERS_UnaryEventOp TN_PROBE
#define TN_MEMBERS_UnaryEventOp Tn_VerilogTypePtr typeAs(Tn_VerilogElabContext& ctx, Tn_Verilog::ValueType use) override;
#define TN_HAS_MEMBERS_EventOrOp TN_PROBE
#define TN_MEMBERS_EventOrOp Tn_VerilogTypePtr typeAs(Tn_VerilogElabContext& ctx, Tn_Verilog::ValueType use) override;

#define TN_HAS_MEMBERS_Expression TN_PROBE
#define TN_MEMBERS_Expression                                                                         \
    /* An elaborated copy (slots 12, 17 to 19); null after a parameter or */                         \
    /* specparam copy reported what may not appear there. */                                         \
    Tn_VerilogExpression* elaborate(Tn_VerilogElabContext& ctx) { return elaborateCopy(ctx); }        \
    Tn_VerilogTypePtr checkLValue(Tn_VerilogElabContext& ctx) { return typeAs(ctx, Tn_Verilog::LValue); } \
    Tn_VerilogTypePtr checkNetLValue(Tn_VerilogElabContext& ctx) { return typeAs(ctx, Tn_Verilog::NetLValue); } \
    Tn_VerilogTypePtr checkVarLValue(Tn_VerilogElabContext& ctx) { return typeAs(ctx, Tn_Verilog::VarLValue); } \
    /* An operand's type for a use; the error type, silently, for a missing one. */                  \
    static Tn_VerilogTypePtr typeOf(Tn_VerilogExpression* e, Tn_VerilogElabContext& ctx,               \
                                    Tn_Verilog::ValueType use = Tn_Verilog::Value) {                   \
        return e ? e->typeAs(ctx, use) : Tn_VerilogType::createError();                               \
    }                                                                                                 \
    Tn_VerilogExpression* elaborateCopy(Tn_VerilogElabContext& ctx) { return copyAs(ctx, TN_COPY_PLAIN); } \
    Tn_VerilogExpression* elaborateInParameter(Tn_VerilogElabContext& ctx) { return copyAs(ctx, TN_COPY_PARAMETER); } \
    Tn_VerilogExpression* elaborateInSpecparam(Tn_VerilogElabContext& ctx) { return copyAs(ctx, TN_COPY_SPECPARAM); } \
    /* Accepts a value; expressions ignore it. */                                                    \
    virtual void setValue(const Tn_VerilogValuePtr&) {}                                               \
    /* The declaration a plain reference denotes; null for everything else. */                       \
    virtual Tn_VerilogDeclaration* object() const { return nullptr; }                                 \
    /* Constant value fitted to the context; null when not constant. */                              \
    virtual Tn_VerilogValuePtr evaluate(const Tn_VerilogEvalContext& ctx) const;                      \
    /* Self-determined constant value. */                                                             \
    Tn_VerilogValuePtr value() const { return evaluate(Tn_VerilogEvalContext()); }                    \
    /* Width when the context requires at least width bits. */                                       \
    virtual uint32_t contextWidth(uint32_t width) const;                                              \
    virtual bool isReal() const { return false; }                                                     \
    /* Signed in a context of the given signedness. */                                                \
    virtual bool isSigned(bool contextSigned) const;                                                  \
    virtual bool isLiteral() const { return false; }                                                  \
    virtual bool isConstant() const { return false; }                                                 \
    virtual bool isLValue() const { return isNetLValue() || isVarLValue(); }                          \
    virtual bool isNetLValue() const { return false; }                                                \
    virtual bool isVarLValue() const { return false; }                                                \
    /* The copy of the three copy operations: operands by the same mode. */                          \
    virtual Tn_VerilogExpression* copyAs(Tn_VerilogElabContext& ctx, Tn_VerilogCopyMode mode);        \
    /* The context of a context-determined operand: own width and sign, */                          \
    /* unless the context is sized already. */                                                        \
    Tn_VerilogEvalContext operandContext(const Tn_VerilogEvalContext& ctx) const {                    \
        return ctx.sizeItself ? ctx.sized(isSigned(ctx.isSigned), contextWidth(ctx.width)) : ctx;       \
    }                                                                                                 \
                                                                                                      \
    /* The bounds of a value: a vector's declared ones, else [width-1:0]; */                         \
    /* false for null and real values. */                                                             \
    static bool boundsOf(const Tn_VerilogValuePtr& v, int32_t& msb, int32_t& lsb);                    \
    /* Resolves every name in the expression that is not resolved yet, from */                       \
    /* scope (for constants evaluated before anything checked them). */                               \
    void resolveNames(const Tn_VerilogScope* scope);                                                  \
    /* How the operand child is copied when this is copied by mode. */                              \
    virtual Tn_VerilogCopyMode operandCopyMode(const Tn_VerilogNode*, Tn_VerilogCopyMode mode) const { return mode; } \
                                                                                                      \
protected:                                                                                            \
    /* A member-wise copy made in ctx's unit whose expression children are */                        \
    /* copied by operandCopyMode; null when any of them failed. */                                   \
    Tn_VerilogExpression* copyWithOperands(Tn_VerilogElabContext& ctx, Tn_VerilogCopyMode mode);     \
    /* Whether test holds for every expression child that is present. */                             \
    bool allOperands(bool (*test)(const Tn_VerilogExpression&)) const;                                \
                                                                                                      \
public:

#define TN_HAS_MEMBERS_Operand TN_PROBE
#define TN_MEMBERS_Operand                                                                            \
    /* Text for messages: "integer constant '1'", "name 'a'", "call to '$time'". */                  \
    virtual Port_String describe() const;                                                             \
    /* Declared bounds as values (an integer constant: 31 and 0); null when unknown. */             \
    Tn_VerilogValuePtr msb() const;                                                                   \
    Tn_VerilogValuePtr lsb() const;                                                                   \
    /* Declared bit bounds; false when unknown. */                                                    \
    virtual bool bounds(int32_t& msb, int32_t& lsb) const;

// Constants share everything but where their value comes from.
#define TN_HAS_MEMBERS_Constant TN_PROBE
#define TN_MEMBERS_Constant                                                                           \
    virtual Tn_VerilogValuePtr constantValue() const;                                                 \
    /* Width, sign and realness, known without making the value. */                                  \
    struct Shape {                                                                                    \
        uint32_t width;                                                                               \
        bool isSigned, isReal;                                                                        \
    };                                                                                                \
    virtual Shape shape() const { return Shape{32, true, false}; }                                   \
    Tn_VerilogTypePtr typeAs(Tn_VerilogElabContext& ctx, Tn_Verilog::ValueType use) override;         \
    Tn_VerilogValuePtr evaluate(const Tn_VerilogEvalContext& ctx) const override;                     \
    uint32_t contextWidth(uint32_t width) const override;                                             \
    bool isReal() const override;                                                                     \
    bool isSigned(bool contextSigned) const override;                                                 \
    bool isLiteral() const override { return true; }                                                  \
    bool isConstant() const override { return true; }                                                 \
    Port_String describe() const override;                                                            \
    bool bounds(int32_t& msb, int32_t& lsb) const override;

#define TN_HAS_MEMBERS_IntegerConst TN_PROBE
#define TN_MEMBERS_IntegerConst Tn_VerilogValuePtr constantValue() const override;
#define TN_HAS_MEMBERS_VectorConst TN_PROBE
#define TN_MEMBERS_VectorConst                                                                        \
    Tn_VerilogValuePtr constantValue() const override;                                                \
    Shape shape() const override { return Shape{Value.width(), Value.isSigned(), false}; }           \
    bool bounds(int32_t& msb, int32_t& lsb) const override;
#define TN_HAS_MEMBERS_RealConst TN_PROBE
#define TN_MEMBERS_RealConst                                                                          \
    Tn_VerilogValuePtr constantValue() const override;                                                \
    Shape shape() const override { return Shape{64, true, true}; }

// Names: resolution and the properties of what they denote.
#define TN_HAS_MEMBERS_Name TN_PROBE
#define TN_MEMBERS_Name                                                                               \
    Tn_VerilogTypePtr typeAs(Tn_VerilogElabContext& ctx, Tn_Verilog::ValueType use) override;         \
    Tn_VerilogExpression* copyAs(Tn_VerilogElabContext& ctx, Tn_VerilogCopyMode mode) override;       \
    Tn_VerilogDeclaration* object() const override { return declaration(); }                          \
    Tn_VerilogValuePtr evaluate(const Tn_VerilogEvalContext& ctx) const override;                     \
    uint32_t contextWidth(uint32_t width) const override;                                             \
    bool isReal() const override;                                                                     \
    bool isSigned(bool contextSigned) const override;                                                 \
    bool isConstant() const override;                                                                 \
    bool isNetLValue() const override;                                                                \
    bool isVarLValue() const override;                                                                \
    Port_String describe() const override;                                                            \
    bool bounds(int32_t& msb, int32_t& lsb) const override;                                           \
    /* Resolves from start (an upward search) and records the result. */                              \
    virtual Tn_VerilogDeclaration* resolve(const Tn_VerilogScope* start);                             \
    /* The resolved declaration; null when unresolved. */                                            \
    virtual Tn_VerilogDeclaration* declaration() const { return nullptr; }                            \
    /* The declaration as one kind (Tn_VerilogTask, Tn_VerilogParameter ...), or null. */            \
    template <class T>                                                                                \
    T* declarationAs() const {                                                                        \
        return Tn_VerilogNode::cast<T>(declaration());                                                \
    }                                                                                                 \
    /* The name as written ("a", "top.u1.w", "g[2].x"). */                                           \
    virtual Port_String nameText() const { return Port_String(); }                                    \
    /* Whether the name stands for the result variable of the function d */                          \
    /* (d's own name used inside d). */                                                               \
    virtual bool isFunctionResult(const Tn_VerilogDeclaration*) const { return false; }

#define TN_HAS_MEMBERS_SimpleName TN_PROBE
#define TN_MEMBERS_SimpleName                                                                         \
    Tn_VerilogDeclaration* resolve(const Tn_VerilogScope* start) override;                            \
    bool isFunctionResult(const Tn_VerilogDeclaration* d) const override {                            \
        return d && Scope.get() == d && d->isA(Tn_Verilog::Function);                                  \
    }                                                                                                 \
    Tn_VerilogDeclaration* declaration() const override;                                              \
    Port_String nameText() const override { return Name.str(); }

#define TN_HAS_MEMBERS_HierarchicalName TN_PROBE
#define TN_MEMBERS_HierarchicalName                                                                   \
    /* A prefix is copied plainly: it names a scope, not a value. */                                 \
    Tn_VerilogCopyMode operandCopyMode(const Tn_VerilogNode* child, Tn_VerilogCopyMode mode) const override; \
    /* The scope the name denotes, resolved relative to start; recorded. */                          \
    virtual Tn_VerilogScope* resolveScope(const Tn_VerilogScope* start);                              \
    /* The scope the (resolved) name denotes. */                                                      \
    virtual Tn_VerilogScope* scope() const;

#define TN_HAS_MEMBERS_ScopeName TN_PROBE
#define TN_MEMBERS_ScopeName                                                                          \
    Tn_VerilogDeclaration* resolve(const Tn_VerilogScope* start) override;                            \
    Tn_VerilogDeclaration* declaration() const override;                                              \
    Tn_VerilogScope* resolveScope(const Tn_VerilogScope* start) override;                             \
    Tn_VerilogScope* scope() const override { return Scope; }                                         \
    Port_String nameText() const override { return Name.str(); }

#define TN_HAS_MEMBERS_SelectedName TN_PROBE
#define TN_MEMBERS_SelectedName                                                                       \
    Tn_VerilogDeclaration* resolve(const Tn_VerilogScope* start) override;                            \
    Tn_VerilogDeclaration* declaration() const override;                                              \
    Port_String nameText() const override;

#define TN_HAS_MEMBERS_IndexedName TN_PROBE
#define TN_MEMBERS_IndexedName                                                                        \
    Tn_VerilogDeclaration* resolve(const Tn_VerilogScope* start) override;                            \
    Tn_VerilogDeclaration* declaration() const override;                                              \
    Port_String nameText() const override;                                                            \
    /* The element the constant index selects, or null. */                                           \
    Tn_VerilogDeclaration* elementOf(const Tn_VerilogScope* array) const;

// Selects: one operand; bit, part and indexed part-selects are unsigned.
#define TN_SELECT_MEMBERS                                                                             \
    Tn_VerilogTypePtr typeAs(Tn_VerilogElabContext& ctx, Tn_Verilog::ValueType use) override;         \
    Tn_VerilogValuePtr evaluate(const Tn_VerilogEvalContext& ctx) const override;                     \
    uint32_t contextWidth(uint32_t width) const override;                                             \
    bool isConstant() const override;                                                                 \
    bool isNetLValue() const override;                                                                \
    bool isVarLValue() const override;                                                                \
    Port_String describe() const override;
#define TN_BITS_SELECT_MEMBERS TN_SELECT_MEMBERS bool isSigned(bool) const override { return false; }

#define TN_HAS_MEMBERS_BitSelect TN_PROBE
#define TN_MEMBERS_BitSelect TN_BITS_SELECT_MEMBERS
#define TN_HAS_MEMBERS_PartSelect TN_PROBE
#define TN_MEMBERS_PartSelect TN_BITS_SELECT_MEMBERS
#define TN_HAS_MEMBERS_IndexedPartSelect TN_PROBE
#define TN_MEMBERS_IndexedPartSelect TN_BITS_SELECT_MEMBERS
#define TN_HAS_MEMBERS_WordSelect TN_PROBE
#define TN_MEMBERS_WordSelect                                                                         \
    TN_SELECT_MEMBERS                                                                                 \
    bool isSigned(bool contextSigned) const override;                                                 \
    bool isReal() const override;                                                                     \
    bool bounds(int32_t& msb, int32_t& lsb) const override;

#define TN_HAS_MEMBERS_FunctionCall TN_PROBE
#define TN_MEMBERS_FunctionCall                                                                       \
    bool isConstant() const override;                                                                 \
    /* The name called, for messages. */                                                             \
    virtual Port_String calleeName() const { return Port_String(); }                                                       \
    Port_String describe() const override;

#define TN_HAS_MEMBERS_SystemFunctionCall TN_PROBE
#define TN_MEMBERS_SystemFunctionCall                                                                 \
    Tn_VerilogTypePtr typeAs(Tn_VerilogElabContext& ctx, Tn_Verilog::ValueType use) override;         \
    Tn_VerilogExpression* copyAs(Tn_VerilogElabContext& ctx, Tn_VerilogCopyMode mode) override;       \
    uint32_t contextWidth(uint32_t width) const override;                                             \
    bool isReal() const override { return resultKind() == 1; }                                        \
    bool isSigned(bool contextSigned) const override;                                                 \
    bool isConstant() const override { return false; }                                                \
    Port_String calleeName() const override { return Name.str(); }                                    \
    /* 1 real, 2 64-bit integral, 0 32-bit integral. */                                              \
    int32_t resultKind() const;

#define TN_HAS_MEMBERS_UserFunctionCall TN_PROBE
#define TN_MEMBERS_UserFunctionCall                                                                   \
    Tn_VerilogTypePtr typeAs(Tn_VerilogElabContext& ctx, Tn_Verilog::ValueType use) override;         \
    Tn_VerilogCopyMode operandCopyMode(const Tn_VerilogNode* child, Tn_VerilogCopyMode mode) const override; \
    Tn_VerilogValuePtr evaluate(const Tn_VerilogEvalContext& ctx) const override;                     \
    uint32_t contextWidth(uint32_t width) const override;                                             \
    bool isReal() const override;                                                                     \
    bool isSigned(bool contextSigned) const override;                                                 \
    Port_String calleeName() const override;                                                          \
    /* The function called (resolved through the name), or null. */                                  \
    Tn_VerilogFunction* function() const;

// Operations: the sizing group decides width, sign and realness.
#define TN_HAS_MEMBERS_Operation TN_PROBE
#define TN_MEMBERS_Operation                                                                          \
    bool isLiteral() const override;                                                                  \
    bool isConstant() const override;

#define TN_HAS_MEMBERS_NullOp TN_PROBE
#define TN_MEMBERS_NullOp                                                                             \
    Tn_VerilogTypePtr typeAs(Tn_VerilogElabContext& ctx, Tn_Verilog::ValueType use) override;

#define TN_OPERATOR_MEMBERS                                                                           \
    Tn_VerilogTypePtr typeAs(Tn_VerilogElabContext& ctx, Tn_Verilog::ValueType use) override;         \
    Tn_VerilogValuePtr evaluate(const Tn_VerilogEvalContext& ctx) const override;                     \
    uint32_t contextWidth(uint32_t width) const override;                                             \
    bool isReal() const override;                                                                     \
    bool isSigned(bool contextSigned) const override;

#define TN_HAS_MEMBERS_UnaryOp TN_PROBE
#define TN_MEMBERS_UnaryOp                                                                            \
    TN_OPERATOR_MEMBERS                                                                               \
    /* Logical negation and the reductions: operand self-determined, one unsigned bit. */           \
    bool isBitResult() const;
#define TN_HAS_MEMBERS_BinaryOp TN_PROBE
#define TN_MEMBERS_BinaryOp TN_OPERATOR_MEMBERS
#define TN_HAS_MEMBERS_ConditionalOp TN_PROBE
#define TN_MEMBERS_ConditionalOp TN_OPERATOR_MEMBERS

#define TN_CONCAT_MEMBERS                                                                             \
    TN_OPERATOR_MEMBERS                                                                               \
    bool isNetLValue() const override;                                                                \
    bool isVarLValue() const override;
#define TN_HAS_MEMBERS_ConcatOp TN_PROBE
#define TN_MEMBERS_ConcatOp TN_CONCAT_MEMBERS
#define TN_HAS_MEMBERS_MultipleConcatOp TN_PROBE
#define TN_MEMBERS_MultipleConcatOp                                                                   \
    TN_CONCAT_MEMBERS                                                                                 \
    /* The evaluated count, or -1 when it is not a usable constant. */                               \
    int64_t countValue() const;

#define TN_HAS_MEMBERS_MinTypMaxOp TN_PROBE
#define TN_MEMBERS_MinTypMaxOp TN_OPERATOR_MEMBERS
#define TN_HAS_MEMBERS_ListOp TN_PROBE
#define TN_MEMBERS_ListOp TN_OPERATOR_MEMBERS

// --------------------------------------------------------- type definitions

#define TN_HAS_MEMBERS_TypeDef TN_PROBE
#define TN_MEMBERS_TypeDef                                                                            \
    /* Checks the range and delay; void, or the error type after a message. */                       \
    virtual Tn_VerilogTypePtr check(Tn_VerilogElabContext& ctx);                                      \
    TN_TYPE_PROPERTIES                                                                                \
    /* "wire", "vector reg", "integer variable", "event". */                                         \
    virtual Port_String describe() const { return Port_String(); }                                    \
    virtual Tn_VerilogTypePtr type() const { return Tn_VerilogType::createUnknown(); }                                                       \
    /* The vector range, or null. */                                                                 \
    virtual Tn_VerilogRange* range() const { return nullptr; }                                        \
    /* Declared bounds; false without a range that evaluates. */                                     \
    virtual bool bounds(int32_t& msb, int32_t& lsb) const;                                            \
    /* What a port redeclared by this type definition becomes, for messages. */                     \
    enum RedeclarationKind { AsNet, AsReg, AsInteger, AsTime, AsReal, AsEvent };                      \
    virtual RedeclarationKind redeclarationKind() const { return AsNet; }                                          \
    /* The port redeclaration checks, one per direction; false after a message. */                  \
    bool checkOutputRedeclaration(Tn_VerilogIODeclaration& port, bool asArray);                       \
    bool checkInoutRedeclaration(Tn_VerilogIODeclaration& port, bool asArray);                        \
    bool checkInputRedeclaration(Tn_VerilogIODeclaration& port, bool asArray);

#define TN_HAS_MEMBERS_Signal TN_PROBE
#define TN_MEMBERS_Signal                                                                             \
    Tn_VerilogTypePtr check(Tn_VerilogElabContext& ctx) override;                                     \
    uint32_t width() const override;                                                                  \
    bool isSigned() const override { return SignedFlag; }                                             \
    bool hasFixedSize() const override;                                                               \
    Tn_VerilogTypePtr type() const override;                                                          \
    bool bounds(int32_t& msb, int32_t& lsb) const override;                                           \
    Tn_VerilogRange* range() const override { return Range; }

#define TN_HAS_MEMBERS_Net TN_PROBE
#define TN_MEMBERS_Net                                                                                \
    Tn_VerilogTypePtr check(Tn_VerilogElabContext& ctx) override;                                     \
    bool isNet() const override { return true; }                                                      \
    Port_String describe() const override;                                                            \
    RedeclarationKind redeclarationKind() const override { return AsNet; }

#define TN_HAS_MEMBERS_Reg TN_PROBE
#define TN_MEMBERS_Reg                                                                                \
    bool isVariable() const override { return true; }                                                 \
    Port_String describe() const override;                                                            \
    RedeclarationKind redeclarationKind() const override { return AsReg; }

#define TN_HAS_MEMBERS_VarType TN_PROBE
#define TN_MEMBERS_VarType                                                                            \
    bool isVariable() const override { return true; }                                                 \
    Tn_VerilogTypePtr type() const override;                                                          \
    bool bounds(int32_t& msb, int32_t& lsb) const override;

#define TN_HAS_MEMBERS_IntegerVar TN_PROBE
#define TN_MEMBERS_IntegerVar                                                                         \
    uint32_t width() const override { return 32; }                                                    \
    bool isSigned() const override { return true; }                                                   \
    Port_String describe() const override { return "integer variable"; }                              \
    RedeclarationKind redeclarationKind() const override { return AsInteger; }

#define TN_HAS_MEMBERS_TimeVar TN_PROBE
#define TN_MEMBERS_TimeVar                                                                            \
    uint32_t width() const override { return 64; }                                                    \
    Port_String describe() const override { return "time variable"; }                                 \
    RedeclarationKind redeclarationKind() const override { return AsTime; }

#define TN_HAS_MEMBERS_RealVar TN_PROBE
#define TN_MEMBERS_RealVar                                                                            \
    uint32_t width() const override { return 64; }                                                    \
    bool isSigned() const override { return true; }                                                   \
    bool isReal() const override { return true; }                                                     \
    Port_String describe() const override { return "real variable"; }                                 \
    RedeclarationKind redeclarationKind() const override { return AsReal; }

#define TN_HAS_MEMBERS_Event TN_PROBE
#define TN_MEMBERS_Event                                                                              \
    Port_String describe() const override { return "event"; }                                         \
    Tn_VerilogTypePtr type() const override { return Tn_VerilogType::createEvent(); }                 \
    RedeclarationKind redeclarationKind() const override { return AsEvent; }

// ---------------------------------------------------------------- small nodes

#define TN_HAS_MEMBERS_Range TN_PROBE
#define TN_MEMBERS_Range                                                                              \
    /* Both bounds integral and defined; void or the error type. */                                  \
    Tn_VerilogTypePtr check(Tn_VerilogElabContext& ctx);                                              \
    /* The evaluated bounds; false when either is not a defined integral value. */                   \
    bool bounds(int32_t& msb, int32_t& lsb) const;                                                    \
    /* |msb - lsb| + 1, or 1 when the bounds do not evaluate. */                                     \
    uint32_t width() const;                                                                           \
    bool isLiteral() const;                                                                           \
    /* Ranges are asked for their bounds before anything checked them: */                            \
    /* the names of the bounds resolve from the declaration's scope. */                               \
    void resolveNames(const Tn_VerilogScope* scope);

#define TN_HAS_MEMBERS_Delay TN_PROBE
#define TN_MEMBERS_Delay Tn_VerilogTypePtr check(Tn_VerilogElabContext& ctx);

#define TN_HAS_MEMBERS_Attributes TN_PROBE
#define TN_MEMBERS_Attributes Tn_VerilogTypePtr check(Tn_VerilogElabContext& ctx);

#define TN_HAS_MEMBERS_Attribute TN_PROBE
#define TN_MEMBERS_Attribute Tn_VerilogTypePtr check(Tn_VerilogElabContext& ctx);

#endif
