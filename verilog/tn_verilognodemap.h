// Old node -> new node, as clone, copy and remap record it. Hashed by the
// old node's id; lookup compares the node itself, so ids of different units
// may collide without harm.
#ifndef TARN_TN_VERILOGNODEMAP_H
#define TARN_TN_VERILOGNODEMAP_H

#include <cstddef>
#include <cstdint>
#include <vector>

class Tn_VerilogNode;

class Tn_VerilogNodeMap {
public:
    Tn_VerilogNodeMap();
    void add(const Tn_VerilogNode* oldNode, Tn_VerilogNode* newNode);
    Tn_VerilogNode* find(const Tn_VerilogNode* oldNode) const;
    size_t size() const { return entries_.size(); }
    size_t bucketCount() const { return heads_.size(); }

private:
    struct Entry {
        const Tn_VerilogNode* oldNode;
        Tn_VerilogNode* newNode;
        int32_t next;  // next entry of the bucket, -1 at the end
    };
    size_t bucketOf(const Tn_VerilogNode* n) const;
    void rehash(size_t buckets);
    std::vector<int32_t> heads_;
    std::vector<Entry> entries_;
};

#endif
