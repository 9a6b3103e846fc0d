#include "verilog/tn_verilognode.h"

#include "util/tn_ostream.h"
#include "verilog/tn_verilognodefactory.h"
#include "verilog/tn_verilognodemap.h"
#include "verilog/tn_verilogvector.h"
#include "verilog/tn_verilogvisitor.h"

Tn_VerilogFieldVisitor::~Tn_VerilogFieldVisitor() {}

void Tn_VerilogChildVisitor::childList(const Tn_FieldInfo& f, Tn_RawNodeList& l) {
    for (Tn_VerilogNode*& c : l) eachChild(f, c);
}

void Tn_VerilogChildVisitor::childMap(const Tn_FieldInfo& f, Tn_NodeMapBase& m) {
    for (Tn_NodeMapBase::Entry& e : m.entries()) eachChild(f, e.node);
}

void Tn_VerilogChildVisitor::indexMap(const Tn_FieldInfo& f, Tn_RawNodeIndexMap& m) {
    for (auto& e : m) eachChild(f, e.second);
}

void Tn_NodeMapBase::insert(const Tn_Symbol& key, Tn_VerilogNode* node) {
    if (entries_.size() < kIndexFrom) {
        for (Entry& e : entries_)
            if (e.key == key) {
                e.node = node;
                return;
            }
    } else {
        if (index_.empty())
            for (size_t i = 0; i < entries_.size(); ++i) index_.emplace(entries_[i].key, i);
        auto it = index_.find(key);
        if (it != index_.end()) {
            entries_[it->second].node = node;
            return;
        }
        index_.emplace(key, entries_.size());
    }
    entries_.push_back(Entry{key, node});
}

Tn_VerilogNode* Tn_NodeMapBase::findRaw(const Tn_Symbol& key) const {
    if (index_.empty()) {
        for (const Entry& e : entries_)
            if (e.key == key) return e.node;
        return nullptr;
    }
    auto it = index_.find(key);
    return it == index_.end() ? nullptr : entries_[it->second].node;
}

void Tn_NodeMapBase::clear() {
    entries_.clear();
    index_.clear();
}

namespace {

// Prints fields in the dump format: one line per field at indent + 1, owned
// children as nested dumps, references by id.
class Dumper : public Tn_VerilogFieldVisitor {
public:
    Dumper(Tn_OStream& out, int indent) : out_(out), indent_(indent) {}

    void location(const Tn_FieldInfo& f, Tn_Location& l) override {
        line(Port_String::doFormat("%s = %s:%d", f.label, l.file.c_str(), l.line));
    }
    void child(const Tn_FieldInfo& f, Tn_VerilogNode*& c) override {
        if (c)
            c->dump(out_, f.label, indent_ + 1);
        else
            nil(f);
    }
    void reference(const Tn_FieldInfo& f, Tn_VerilogNode*& r) override {
        if (r)
            line(Port_String::doFormat("%s:%s = %u", f.label, r->typeName(), r->id()));
        else
            nil(f);
    }
    void childList(const Tn_FieldInfo& f, Tn_RawNodeList& l) override {
        for (Tn_VerilogNode*& c : l) child(f, c);
    }
    void refList(const Tn_FieldInfo& f, Tn_RawNodeList& l) override {
        for (Tn_VerilogNode*& r : l) reference(f, r);
    }
    void childMap(const Tn_FieldInfo& f, Tn_NodeMapBase& m) override {
        for (Tn_NodeMapBase::Entry& e : m.entries()) child(f, e.node);
    }
    void indexMap(const Tn_FieldInfo& f, Tn_RawNodeIndexMap& m) override {
        for (auto& e : m) child(f, e.second);
    }
    void string(const Tn_FieldInfo& f, Tn_Symbol& s) override {
        line(Port_String::doFormat("%s:Port_String = \"%s\"", f.label, s.c_str()));
    }
    void boolean(const Tn_FieldInfo& f, bool& b) override {
        line(Port_String::doFormat("%s:bool = %s", f.label, b ? "true" : "false"));
    }
    void int32(const Tn_FieldInfo& f, int32_t& v) override {
        line(Port_String::doFormat("%s:Port::INT32 = %d", f.label, static_cast<int>(v)));
    }
    void uint32(const Tn_FieldInfo& f, uint32_t& v) override {
        line(Port_String::doFormat("%s:Port::UINT32 = %u", f.label, static_cast<unsigned>(v)));
    }
    void int64(const Tn_FieldInfo& f, int64_t& v) override {
        line(Port_String::doFormat("%s:Port::INT64 = %lld", f.label, static_cast<long long>(v)));
    }
    void uint64(const Tn_FieldInfo& f, uint64_t& v) override {
        line(Port_String::doFormat("%s:Port::UINT64 = %llu", f.label, static_cast<unsigned long long>(v)));
    }
    void float64(const Tn_FieldInfo& f, double& v) override {
        line(Port_String::doFormat("%s:Port::FLOAT64 = %.17g", f.label, v));
    }
    void enumeration(const Tn_FieldInfo& f, const Tn_EnumInfo& info, int32_t& v) override {
        line(Port_String::doFormat("%s:%s = %s", f.label, info.qualifiedName, info.name(v)));
    }
    void vector(const Tn_FieldInfo& f, Tn_VerilogVector& v) override {
        line(Port_String::doFormat("%s:VerilogVector = %s", f.label, v.toBaseText().c_str()));
    }

private:
    void nil(const Tn_FieldInfo& f) {
        line(Port_String::doFormat("%s:%s = nil", f.label, Tn_Verilog::nodeClassName(f.nodeType)));
    }
    void line(const Port_String& text) {
        for (int i = 0; i <= indent_; ++i) out_.write("  ");
        out_.write(text.c_str());
        out_.write('\n');
    }
    Tn_OStream& out_;
    int indent_;
};

// Replaces the (still shared) children of a fresh member-wise copy by copies.
class ChildCopier : public Tn_VerilogChildVisitor {
public:
    ChildCopier(Tn_VerilogNodeFactory& f, Tn_VerilogNodeMap& m) : factory_(f), map_(m) {}
    void eachChild(const Tn_FieldInfo&, Tn_VerilogNode*& c) override {
        if (c) c = c->copy(factory_, map_);
    }

private:
    Tn_VerilogNodeFactory& factory_;
    Tn_VerilogNodeMap& map_;
};

class Remapper : public Tn_VerilogChildVisitor {
public:
    explicit Remapper(const Tn_VerilogNodeMap& m) : map_(m) {}
    void eachChild(const Tn_FieldInfo&, Tn_VerilogNode*& c) override {
        if (c) c->remap(map_);
    }
    void reference(const Tn_FieldInfo&, Tn_VerilogNode*& r) override { redirect(r); }
    void refList(const Tn_FieldInfo&, Tn_RawNodeList& l) override {
        for (Tn_VerilogNode*& r : l) redirect(r);
    }

private:
    void redirect(Tn_VerilogNode*& r) {
        if (Tn_VerilogNode* n = map_.find(r)) r = n;
    }
    const Tn_VerilogNodeMap& map_;
};

class Traverser : public Tn_VerilogChildVisitor {
public:
    explicit Traverser(Tn_VerilogVisitor& v) : visitor_(v) {}
    void eachChild(const Tn_FieldInfo&, Tn_VerilogNode*& c) override {
        if (c) c->accept(visitor_);
    }

private:
    Tn_VerilogVisitor& visitor_;
};

}  // namespace

void Tn_VerilogNode::visitFields(Tn_VerilogFieldVisitor& v) {
    v.location(Tn_FieldInfo{"Location", -1, true}, location());
}

void Tn_VerilogNode::dump(Tn_OStream& out, const char* label, int indent) const {
    for (int i = 0; i < indent; ++i) out.write("  ");
    out.write(Port_String::doFormat("%s:%s = %u {\n", label, typeName(), id()).c_str());
    Dumper d(out, indent);
    const_cast<Tn_VerilogNode*>(this)->visitFields(d);
    for (int i = 0; i < indent; ++i) out.write("  ");
    out.write("}\n");
}

Tn_VerilogNode* Tn_VerilogNode::newCopy(Tn_VerilogNodeFactory& factory) const { return factory.copyOf(*this); }

Tn_VerilogNode* Tn_VerilogNode::copy(Tn_VerilogNodeFactory& factory, Tn_VerilogNodeMap& map) const {
    if (Tn_VerilogNode* done = map.find(this)) return done;  // a shared child is copied once
    Tn_VerilogNode* n = newCopy(factory);
    map.add(this, n);
    ChildCopier copier(factory, map);
    n->visitFields(copier);
    return n;
}

void Tn_VerilogNode::remap(const Tn_VerilogNodeMap& map) {
    Remapper r(map);
    visitFields(r);
}

Tn_VerilogNode* Tn_VerilogNode::clone(Tn_VerilogNodeFactory& factory) const {
    Tn_VerilogNodeMap map;
    Tn_VerilogNode* c = copy(factory, map);
    c->remap(map);
    return c;
}

void Tn_VerilogNode::accept(Tn_VerilogVisitor& v) { v.visitNode(this); }

void Tn_VerilogNode::traverse(Tn_VerilogVisitor& v) {
    Traverser t(v);
    visitFields(t);
}
