// Storage of node fields and the visitor that walks them. Each node class
// declares its fields once (tn_verilognodes.def); dump, copy, remap,
// traverse and the binary library format are field visitors.
#ifndef TARN_TN_VERILOGFIELDS_H
#define TARN_TN_VERILOGFIELDS_H

#include <cstdint>
#include <map>
#include <unordered_map>
#include <vector>

#include "library/tn_node.h"
#include "util/tn_symbol.h"
#include "verilog/tn_verilogenums.h"

class Tn_VerilogNode;
class Tn_VerilogVector;

// A node pointer field typed as T; stored as a plain node pointer so that
// generic code reaches every such field the same way.
template <class T>
class Tn_NodePtr {
public:
    Tn_NodePtr() {}
    Tn_NodePtr(T* p) : p_(p) {}
    Tn_NodePtr& operator=(T* p) {
        p_ = p;
        return *this;
    }
    T* get() const { return static_cast<T*>(p_); }
    operator T*() const { return get(); }
    T* operator->() const { return get(); }
    Tn_VerilogNode*& raw() { return p_; }

private:
    Tn_VerilogNode* p_ = nullptr;
};

typedef std::vector<Tn_VerilogNode*> Tn_RawNodeList;

// An ordered list of nodes of class T.
template <class T>
class Tn_NodeList {
public:
    class const_iterator {
    public:
        explicit const_iterator(Tn_RawNodeList::const_iterator it) : it_(it) {}
        T* operator*() const { return static_cast<T*>(*it_); }
        const_iterator& operator++() {
            ++it_;
            return *this;
        }
        bool operator!=(const const_iterator& o) const { return it_ != o.it_; }
        bool operator==(const const_iterator& o) const { return it_ == o.it_; }

    private:
        Tn_RawNodeList::const_iterator it_;
    };

    size_t size() const { return v_.size(); }
    bool empty() const { return v_.empty(); }
    T* operator[](size_t i) const { return static_cast<T*>(v_[i]); }
    T* front() const { return static_cast<T*>(v_.front()); }
    T* back() const { return static_cast<T*>(v_.back()); }
    void push_back(T* p) { v_.push_back(p); }
    void clear() { v_.clear(); }
    const_iterator begin() const { return const_iterator(v_.begin()); }
    const_iterator end() const { return const_iterator(v_.end()); }
    Tn_RawNodeList& raw() { return v_; }
    const Tn_RawNodeList& raw() const { return v_; }

private:
    Tn_RawNodeList v_;
};

// Nodes by name, in insertion order (the order dumps and binary libraries use).
class Tn_NodeMapBase {
public:
    struct Entry {
        Tn_Symbol key;
        Tn_VerilogNode* node;
    };
    // Adds key or replaces the node it had (keeping its position).
    void insert(const Tn_Symbol& key, Tn_VerilogNode* node);
    Tn_VerilogNode* findRaw(const Tn_Symbol& key) const;
    size_t size() const { return entries_.size(); }
    bool empty() const { return entries_.empty(); }
    void clear();
    std::vector<Entry>& entries() { return entries_; }
    const std::vector<Entry>& entries() const { return entries_; }

private:
    // Small maps are searched linearly; larger ones keep a hash index.
    static const size_t kIndexFrom = 8;
    std::vector<Entry> entries_;
    std::unordered_map<Tn_Symbol, size_t> index_;
};

template <class T>
class Tn_NodeMap : public Tn_NodeMapBase {
public:
    void insert(const Tn_Symbol& key, T* node) { Tn_NodeMapBase::insert(key, node); }
    T* find(const Tn_Symbol& key) const { return static_cast<T*>(findRaw(key)); }
};

typedef std::map<int32_t, Tn_VerilogNode*> Tn_RawNodeIndexMap;

// Nodes by 32-bit index, in index order.
template <class T>
class Tn_NodeIndexMap {
public:
    void insert(int32_t key, T* node) { m_[key] = node; }
    T* find(int32_t key) const {
        auto it = m_.find(key);
        return it == m_.end() ? nullptr : static_cast<T*>(it->second);
    }
    size_t size() const { return m_.size(); }
    Tn_RawNodeIndexMap& raw() { return m_; }
    const Tn_RawNodeIndexMap& raw() const { return m_; }

private:
    Tn_RawNodeIndexMap m_;
};

// An enumeration field: kept as its 32-bit number, so values read from a
// library file that are out of range survive (and print as such).
template <class E>
class Tn_EnumField {
public:
    Tn_EnumField() {}
    Tn_EnumField(E e) : v_(e) {}
    Tn_EnumField& operator=(E e) {
        v_ = e;
        return *this;
    }
    operator E() const { return static_cast<E>(v_); }
    int32_t& raw() { return v_; }

private:
    int32_t v_ = 0;
};

// What a field visitor learns of a field besides its storage.
struct Tn_FieldInfo {
    const char* label;
    int32_t nodeType;  // declared node type for node fields, else -1
    bool persistent;
};

// One operation per field kind. The defaults do nothing, so a visitor
// overrides only the kinds it cares about.
class Tn_VerilogFieldVisitor {
public:
    virtual ~Tn_VerilogFieldVisitor();
    virtual void location(const Tn_FieldInfo&, Tn_Location&) {}
    virtual void child(const Tn_FieldInfo&, Tn_VerilogNode*&) {}
    virtual void reference(const Tn_FieldInfo&, Tn_VerilogNode*&) {}
    virtual void childList(const Tn_FieldInfo&, Tn_RawNodeList&) {}
    virtual void refList(const Tn_FieldInfo&, Tn_RawNodeList&) {}
    virtual void childMap(const Tn_FieldInfo&, Tn_NodeMapBase&) {}
    virtual void indexMap(const Tn_FieldInfo&, Tn_RawNodeIndexMap&) {}
    virtual void string(const Tn_FieldInfo&, Tn_Symbol&) {}
    virtual void boolean(const Tn_FieldInfo&, bool&) {}
    virtual void int32(const Tn_FieldInfo&, int32_t&) {}
    virtual void uint32(const Tn_FieldInfo&, uint32_t&) {}
    virtual void int64(const Tn_FieldInfo&, int64_t&) {}
    virtual void uint64(const Tn_FieldInfo&, uint64_t&) {}
    virtual void float64(const Tn_FieldInfo&, double&) {}
    virtual void enumeration(const Tn_FieldInfo&, const Tn_EnumInfo&, int32_t&) {}
    virtual void vector(const Tn_FieldInfo&, Tn_VerilogVector&) {}
};

// A field visitor that sees every owned child the same way, whether it
// stands alone, in a list or in a map.
class Tn_VerilogChildVisitor : public Tn_VerilogFieldVisitor {
public:
    virtual void eachChild(const Tn_FieldInfo& f, Tn_VerilogNode*& child) = 0;
    void child(const Tn_FieldInfo& f, Tn_VerilogNode*& c) override { eachChild(f, c); }
    void childList(const Tn_FieldInfo& f, Tn_RawNodeList& l) override;
    void childMap(const Tn_FieldInfo& f, Tn_NodeMapBase& m) override;
    void indexMap(const Tn_FieldInfo& f, Tn_RawNodeIndexMap& m) override;
};

#endif
