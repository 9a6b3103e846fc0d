#include "verilog/tn_verilognodemap.h"

#include "verilog/tn_verilognode.h"

Tn_VerilogNodeMap::Tn_VerilogNodeMap() : heads_(100, -1) {}

size_t Tn_VerilogNodeMap::bucketOf(const Tn_VerilogNode* n) const { return n->id() % heads_.size(); }

void Tn_VerilogNodeMap::add(const Tn_VerilogNode* oldNode, Tn_VerilogNode* newNode) {
    if (entries_.size() >= heads_.size()) rehash(heads_.size() * 2);
    const size_t b = bucketOf(oldNode);
    entries_.push_back(Entry{oldNode, newNode, heads_[b]});
    heads_[b] = static_cast<int32_t>(entries_.size() - 1);
}

Tn_VerilogNode* Tn_VerilogNodeMap::find(const Tn_VerilogNode* oldNode) const {
    if (!oldNode) return nullptr;
    for (int32_t i = heads_[bucketOf(oldNode)]; i >= 0; i = entries_[static_cast<size_t>(i)].next)
        if (entries_[static_cast<size_t>(i)].oldNode == oldNode) return entries_[static_cast<size_t>(i)].newNode;
    return nullptr;
}

void Tn_VerilogNodeMap::rehash(size_t buckets) {
    heads_.assign(buckets, -1);
    for (size_t i = 0; i < entries_.size(); ++i) {
        const size_t b = bucketOf(entries_[i].oldNode);
        entries_[i].next = heads_[b];
        heads_[b] = static_cast<int32_t>(i);
    }
}
