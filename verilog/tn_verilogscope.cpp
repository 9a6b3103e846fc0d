// Scopes: what each declares directly, the element lookups of arrays, and the
// upward searches names resolve by.
#include "verilog/tn_verilognodes.h"

namespace {

// Unnamed items (gate instances may have no name) are never found.
template <class T>
Tn_VerilogDeclaration* findIn(const Tn_NodeList<T>& list, const Tn_Symbol& name) {
    if (name.IsEmpty()) return nullptr;
    for (T* d : list)
        if (d && d->Name == name) return d;
    return nullptr;
}

// The element of a range-indexed array: elements are kept in range order,
// from the left bound towards the right one.
template <class T>
Tn_VerilogDeclaration* elementAt(const Tn_VerilogRange* range, const Tn_NodeList<T>& elements, int32_t index) {
    int32_t left, right;
    if (!range || !range->bounds(left, right)) return nullptr;
    int64_t k = left <= right ? static_cast<int64_t>(index) - left : static_cast<int64_t>(left) - index;
    const int64_t span = left <= right ? static_cast<int64_t>(right) - left : static_cast<int64_t>(left) - right;
    if (k < 0 || k > span || k >= static_cast<int64_t>(elements.size())) return nullptr;
    return elements[static_cast<size_t>(k)];
}

// Up from a scope through the enclosing scopes inside its module, asking find.
Tn_VerilogDeclaration* upWithinModule(const Tn_VerilogScope* s, const Tn_Symbol& name,
                                      Tn_VerilogDeclaration* (Tn_VerilogScope::*find)(const Tn_Symbol&) const) {
    for (; s; s = s->Parent) {
        if (Tn_VerilogDeclaration* d = (s->*find)(name)) return d;
        if (s->isRoot() || s->isA(Tn_Verilog::Module)) break;
    }
    return nullptr;
}

}  // namespace

// ----------------------------------------------------------------- any scope

Tn_VerilogTypePtr Tn_VerilogScope::type() const { return Tn_VerilogType::createBlock(); }

Tn_VerilogDeclaration* Tn_VerilogScope::findDeclaration(const Tn_Symbol&) const { return nullptr; }

Tn_VerilogDeclaration* Tn_VerilogScope::findScope(const Tn_Symbol&) const { return nullptr; }

Tn_VerilogDeclaration* Tn_VerilogScope::lookup(const Tn_Symbol& name, const Tn_VerilogScope** where) const {
    if (Tn_VerilogDeclaration* d = findDeclaration(name)) {
        if (where) *where = this;
        return d;
    }
    return Parent ? Parent->lookup(name, where) : nullptr;
}

Tn_VerilogDeclaration* Tn_VerilogScope::lookupScope(const Tn_Symbol& name) const {
    if (Tn_VerilogDeclaration* d = findScope(name)) return d;
    return Parent ? Parent->lookupScope(name) : nullptr;
}

Tn_VerilogDeclaration* Tn_VerilogScope::lookupTask(const Tn_Symbol& name) const {
    return upWithinModule(this, name, &Tn_VerilogScope::findTask);
}

Tn_VerilogDeclaration* Tn_VerilogScope::lookupFunction(const Tn_Symbol& name) const {
    return upWithinModule(this, name, &Tn_VerilogScope::findFunction);
}

// ------------------------------------------------------------------- regions

Tn_VerilogDeclaration* Tn_VerilogRegion::findObject(const Tn_Symbol& name) const {
    if (Tn_VerilogDeclaration* d = findIn(IODeclaration, name)) return d;
    if (Tn_VerilogDeclaration* d = findIn(Parameter, name)) return d;
    return Variable.find(name);
}

Tn_VerilogDeclaration* Tn_VerilogRegion::findDeclaration(const Tn_Symbol& name) const {
    if (Tn_VerilogDeclaration* d = findObject(name)) return d;
    return findScope(name);
}

Tn_VerilogDeclaration* Tn_VerilogRegion::findScope(const Tn_Symbol& name) const { return findBlock(name); }

Tn_VerilogDeclaration* Tn_VerilogRegion::findBlock(const Tn_Symbol& name) const { return findIn(Block, name); }

Tn_VerilogDeclaration* Tn_VerilogConcurrentRegion::findObject(const Tn_Symbol& name) const {
    if (Tn_VerilogDeclaration* d = Tn_VerilogRegion::findObject(name)) return d;
    return findIn(GenVar, name);
}

Tn_VerilogDeclaration* Tn_VerilogConcurrentRegion::findScope(const Tn_Symbol& name) const {
    typedef Tn_VerilogDeclaration* (Tn_VerilogScope::*Find)(const Tn_Symbol&) const;
    static const Find finds[] = {&Tn_VerilogScope::findBlock,     &Tn_VerilogScope::findTask,
                                 &Tn_VerilogScope::findFunction,  &Tn_VerilogScope::findModuleInstance,
                                 &Tn_VerilogScope::findModuleArray, &Tn_VerilogScope::findPrimitive,
                                 &Tn_VerilogScope::findPrimitiveArray, &Tn_VerilogScope::findGenerate,
                                 &Tn_VerilogScope::findGenerateArray};
    for (Find find : finds)
        if (Tn_VerilogDeclaration* d = (this->*find)(name)) return d;
    return nullptr;
}

// Each restricted lookup searches the list of its name.
#define TN_FIND_IN(List)                                                                         \
    Tn_VerilogDeclaration* Tn_VerilogConcurrentRegion::find##List(const Tn_Symbol& name) const { \
        return findIn(List, name);                                                               \
    }
TN_FIND_IN(Task)
TN_FIND_IN(Function)
TN_FIND_IN(ModuleInstance)
TN_FIND_IN(ModuleArray)
TN_FIND_IN(Primitive)
TN_FIND_IN(PrimitiveArray)
TN_FIND_IN(Generate)
TN_FIND_IN(GenerateArray)
#undef TN_FIND_IN

// The root sees its own declarations only.
Tn_VerilogDeclaration* Tn_VerilogRoot::lookup(const Tn_Symbol& name, const Tn_VerilogScope** where) const {
    Tn_VerilogDeclaration* d = findDeclaration(name);
    if (d && where) *where = this;
    return d;
}

Tn_VerilogDeclaration* Tn_VerilogRoot::lookupScope(const Tn_Symbol& name) const { return findScope(name); }

Port_String Tn_VerilogModule::describe() const { return Port_String::doFormat("module '%s'", Name.c_str()); }

Tn_VerilogDeclaration* Tn_VerilogModule::findObject(const Tn_Symbol& name) const {
    if (Tn_VerilogDeclaration* d = Tn_VerilogConcurrentRegion::findObject(name)) return d;
    return findIn(SpecParam, name);
}

// Simple names stop at the module, which answers its own name; scope names
// go on through the whole hierarchy.
Tn_VerilogDeclaration* Tn_VerilogModule::lookup(const Tn_Symbol& name, const Tn_VerilogScope** where) const {
    Tn_VerilogDeclaration* d = findDeclaration(name);
    if (!d && hasOwnName(name)) d = const_cast<Tn_VerilogModule*>(this);
    if (d && where) *where = this;
    return d;
}

Tn_VerilogDeclaration* Tn_VerilogModule::lookupScope(const Tn_Symbol& name) const {
    if (Tn_VerilogDeclaration* d = findScope(name)) return d;
    if (hasOwnName(name)) return const_cast<Tn_VerilogModule*>(this);
    return Parent ? Parent->lookupScope(name) : nullptr;
}

Port_String Tn_VerilogGenerate::describe() const { return Port_String::doFormat("generate scope '%s'", Name.c_str()); }

// An element of a generate loop also declares its own copy of the genvar.
Tn_VerilogDeclaration* Tn_VerilogGenerate::findObject(const Tn_Symbol& name) const {
    if (Tn_VerilogDeclaration* d = Tn_VerilogConcurrentRegion::findObject(name)) return d;
    return GenVar && GenVar->Name == name ? GenVar.get() : nullptr;
}

Port_String Tn_VerilogBlock::describe() const { return Port_String::doFormat("named block '%s'", Name.c_str()); }

// -------------------------------------------------------------------- arrays

Tn_VerilogDeclaration* Tn_VerilogInstanceArray::findDeclaration(const Tn_Symbol& name) const { return Variable.find(name); }

Port_String Tn_VerilogModuleArray::describe() const { return Port_String::doFormat("module array '%s'", Name.c_str()); }

Tn_VerilogDeclaration* Tn_VerilogModuleArray::element(int32_t index) const {
    return elementAt(Range, ModuleInstance, index);
}

Port_String Tn_VerilogPrimitiveArray::describe() const {
    return Port_String::doFormat("primitive array '%s'", Name.c_str());
}

Tn_VerilogDeclaration* Tn_VerilogPrimitiveArray::element(int32_t index) const {
    return elementAt(Range, Primitive, index);
}

Port_String Tn_VerilogGenerateArray::describe() const {
    return Port_String::doFormat("generate scope array '%s'", Name.c_str());
}

Tn_VerilogDeclaration* Tn_VerilogGenerateArray::element(int32_t index) const { return Generate.find(index); }

// ----------------------------------------------------------------- instances

Port_String Tn_VerilogModuleInstance::describe() const {
    return Port_String::doFormat("module instance '%s'", Name.c_str());
}

Tn_VerilogTypePtr Tn_VerilogModuleInstance::type() const { return Tn_VerilogType::createBlock(); }

Tn_VerilogScope* Tn_VerilogModuleInstance::denotedScope() { return Module; }
