#include "tests/support/designbuilder.h"

#include <stdexcept>

#include "verilog/tn_verilogfields.h"
#include "verilog/tn_verilogparser.h"

namespace {

Tn_VerilogOptions optionsFor(bool verilog2001) {
    Tn_VerilogOptions o;
    o.setVerilog2001(verilog2001 ? 1 : 0);
    return o;
}

}  // namespace

DesignBuilder::DesignBuilder(bool verilog2001)
    : options_(optionsFor(verilog2001)), unit_("work", "t", options_), location_("t.v", 1) {
    root_ = factory().createRoot(location_);
    unit_.setRoot(root_);
}

template <class T>
T* DesignBuilder::declare(Tn_VerilogScope* parent, const std::string& name) {
    T* d = static_cast<T*>(factory().create(T::TYPE, location_));
    d->Name = Tn_Symbol(name.c_str());
    d->Parent = parent;
    return d;
}

Tn_VerilogModule* DesignBuilder::module(const std::string& name, Tn_VerilogConcurrentRegion* parent) {
    Tn_VerilogModule* m = declare<Tn_VerilogModule>(parent ? parent : root_, name);
    m->DefName = m->Name;
    if (!unit_.node()) unit_.setNode(m);
    return m;
}

Tn_VerilogBlock* DesignBuilder::block(Tn_VerilogRegion* parent, const std::string& name) {
    Tn_VerilogBlock* b = declare<Tn_VerilogBlock>(parent, name);
    parent->Block.push_back(b);
    return b;
}

Tn_VerilogTask* DesignBuilder::task(Tn_VerilogConcurrentRegion* parent, const std::string& name) {
    Tn_VerilogTask* t = declare<Tn_VerilogTask>(parent, name);
    parent->Task.push_back(t);
    return t;
}

Tn_VerilogFunction* DesignBuilder::function(Tn_VerilogConcurrentRegion* parent, const std::string& name,
                                            Tn_VerilogNode* returnType) {
    Tn_VerilogFunction* f = declare<Tn_VerilogFunction>(parent, name);
    f->ReturnType = returnType;
    parent->Function.push_back(f);
    return f;
}

Tn_VerilogGenerate* DesignBuilder::generate(Tn_VerilogConcurrentRegion* parent, const std::string& name) {
    Tn_VerilogGenerate* g = declare<Tn_VerilogGenerate>(parent, name);
    parent->Generate.push_back(g);
    return g;
}

Tn_VerilogModuleInstance* DesignBuilder::instance(Tn_VerilogConcurrentRegion* parent, const std::string& name,
                                                  Tn_VerilogModule* module) {
    Tn_VerilogModuleInstance* inst = declare<Tn_VerilogModuleInstance>(parent, name);
    inst->DefName = module ? module->DefName : inst->Name;
    inst->Module = module;
    // As in an elaborated design: the module copy takes the instance's name.
    if (module) {
        module->Name = inst->Name;
        module->Parent = parent;
        module->Instance = inst;
    }
    parent->ModuleInstance.push_back(inst);
    return inst;
}

Tn_VerilogRange* DesignBuilder::range(const std::string& text) {
    // The colon outside parentheses separates the bounds.
    size_t colon = std::string::npos;
    int depth = 0;
    for (size_t i = 0; i < text.size() && colon == std::string::npos; ++i) {
        if (text[i] == '(') ++depth;
        if (text[i] == ')') --depth;
        if (text[i] == ':' && depth == 0) colon = i;
    }
    if (colon == std::string::npos) throw std::invalid_argument("range without ':': " + text);
    Tn_VerilogRange* r = factory().createRange(location_);
    r->Msb = expr(text.substr(0, colon));
    r->Lsb = expr(text.substr(colon + 1));
    return r;
}

Tn_VerilogReg* DesignBuilder::reg(const std::string& r, bool isSigned) {
    Tn_VerilogReg* t = factory().createReg(location_);
    t->SignedFlag = isSigned;
    if (!r.empty()) t->Range = range(r);
    return t;
}

Tn_VerilogNet* DesignBuilder::wire(const std::string& r, bool isSigned, Tn_Verilog::NetType type) {
    Tn_VerilogNet* t = factory().createNet(location_);
    t->SignedFlag = isSigned;
    t->NetType = type;
    if (!r.empty()) t->Range = range(r);
    return t;
}

Tn_VerilogIntegerVar* DesignBuilder::integer() { return factory().createIntegerVar(location_); }
Tn_VerilogTimeVar* DesignBuilder::time() { return factory().createTimeVar(location_); }
Tn_VerilogRealVar* DesignBuilder::real() { return factory().createRealVar(location_); }
Tn_VerilogEvent* DesignBuilder::event() { return factory().createEvent(location_); }

Tn_VerilogScalarVar* DesignBuilder::var(Tn_VerilogRegion* scope, const std::string& name, Tn_VerilogTypeDef* type,
                                        const std::string& init) {
    Tn_VerilogScalarVar* v = declare<Tn_VerilogScalarVar>(scope, name);
    v->TypeDef = type;
    if (!init.empty()) v->InitExpr = expr(init);
    scope->Variable.insert(v->Name, v);
    return v;
}

Tn_VerilogArrayVar* DesignBuilder::array(Tn_VerilogRegion* scope, const std::string& name, Tn_VerilogTypeDef* type,
                                         const std::vector<std::string>& dimensions) {
    Tn_VerilogArrayVar* a = declare<Tn_VerilogArrayVar>(scope, name);
    a->TypeDef = type;
    for (const std::string& d : dimensions) a->Range.push_back(range(d));
    scope->Variable.insert(a->Name, a);
    arrays_[name] = static_cast<int>(dimensions.size());
    return a;
}

Tn_VerilogParameter* DesignBuilder::param(Tn_VerilogRegion* scope, const std::string& name, const std::string& value,
                                          Tn_Verilog::ParamDeclType declType, const std::string& r, bool local) {
    Tn_VerilogParameter* p = declare<Tn_VerilogParameter>(scope, name);
    p->DeclType = declType;
    p->LocalFlag = local;
    p->SignedFlag = declType == Tn_Verilog::SignedParam || declType == Tn_Verilog::SignedNoRangeParam;
    if (!r.empty()) p->Range = range(r);
    p->Expr = expr(value);
    scope->Parameter.push_back(p);
    return p;
}

Tn_VerilogSpecParam* DesignBuilder::specparam(Tn_VerilogModule* scope, const std::string& name, const std::string& value) {
    Tn_VerilogSpecParam* p = declare<Tn_VerilogSpecParam>(scope, name);
    p->Expr = expr(value);
    scope->SpecParam.push_back(p);
    return p;
}

Tn_VerilogGenVar* DesignBuilder::genvar(Tn_VerilogConcurrentRegion* scope, const std::string& name) {
    Tn_VerilogGenVar* g = declare<Tn_VerilogGenVar>(scope, name);
    scope->GenVar.push_back(g);
    return g;
}

Tn_VerilogIODeclaration* DesignBuilder::port(Tn_VerilogRegion* scope, Tn_Verilog::NodeType kind, const std::string& name,
                                             Tn_VerilogTypeDef* type, const std::string& r, bool isSigned) {
    Tn_VerilogIODeclaration* io = static_cast<Tn_VerilogIODeclaration*>(factory().create(kind, location_));
    io->Name = Tn_Symbol(name.c_str());
    io->Parent = scope;  // the direction is the node type: made by type
    io->TypeDef = type;
    io->SignedFlag = isSigned;
    io->TfFlag = scope->isA(Tn_Verilog::Procedure);
    if (!r.empty()) io->Range = range(r);
    scope->IODeclaration.push_back(io);
    return io;
}

namespace {

// Puts the parsed nodes in the builder's file. The parser reads a select
// of a name it has not seen declared as a bit select; of a name the builder
// declared as an array, the first selects index its words.
class WordSelects : public Tn_VerilogChildVisitor {
public:
    WordSelects(Tn_VerilogNodeFactory& f, const std::map<std::string, int>& arrays, const Tn_Location& l)
        : f_(f), arrays_(arrays), location_(l) {}

    void eachChild(const Tn_FieldInfo&, Tn_VerilogNode*& child) override { rewrite(child); }

    void rewrite(Tn_VerilogNode*& n) {
        if (!n) return;
        n->setLocation(location_);
        n->visitFields(*this);
        Tn_VerilogBitSelect* b = Tn_VerilogNode::cast<Tn_VerilogBitSelect>(n);
        if (!b) return;
        if (Tn_VerilogSimpleName* name = Tn_VerilogNode::cast<Tn_VerilogSimpleName>(b->Operand.get())) {
            if (dimensions(name) == 0) return;
            Tn_VerilogWordSelect* w = f_.createWordSelect(location_);
            w->Operand = name;
            w->Index.push_back(b->Index);
            n = w;
        } else if (Tn_VerilogWordSelect* w = Tn_VerilogNode::cast<Tn_VerilogWordSelect>(b->Operand.get())) {
            Tn_VerilogSimpleName* name = Tn_VerilogNode::cast<Tn_VerilogSimpleName>(w->Operand.get());
            if (!name || w->Index.size() >= dimensions(name)) return;
            w->Index.push_back(b->Index);
            n = w;
        }
    }

private:
    size_t dimensions(Tn_VerilogSimpleName* n) const {
        auto it = arrays_.find(n->Name.str().str());
        return it == arrays_.end() ? 0 : static_cast<size_t>(it->second);
    }

    Tn_VerilogNodeFactory& f_;
    const std::map<std::string, int>& arrays_;
    Tn_Location location_;
};

}  // namespace

Tn_VerilogExpression* DesignBuilder::expr(const std::string& text) {
    Tn_VerilogNode* e = nullptr;
    try {
        e = Tn_VerilogParser::parseExpression(text.c_str(), factory(), options_);
    } catch (const Tn_VerilogExpressionSyntaxError& x) {
        throw std::invalid_argument("test expression '" + text + "': " + x.message().c_str());
    }
    WordSelects(factory(), arrays_, location_).rewrite(e);
    return static_cast<Tn_VerilogExpression*>(e);
}

Tn_VerilogElabContext& DesignBuilder::context(Tn_VerilogScope* scope) {
    ctx_.reset(new Tn_VerilogElabContext(true, &options_, nullptr, &unit_));
    ctx_->pushScope(scope, scope);
    return *ctx_;
}
