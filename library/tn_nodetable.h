// The nodes a library unit owns, in creation order; a node's id is its index
// here. The table deletes its nodes when destroyed.
#ifndef TARN_TN_NODETABLE_H
#define TARN_TN_NODETABLE_H

#include <cstdint>
#include <functional>
#include <vector>

class Tn_Node;

class Tn_NodeTable {
public:
    Tn_NodeTable() {}
    ~Tn_NodeTable();
    Tn_NodeTable(const Tn_NodeTable&) = delete;
    Tn_NodeTable& operator=(const Tn_NodeTable&) = delete;

    // Takes ownership; the node's id becomes its index.
    void add(Tn_Node* node);
    size_t size() const { return nodes_.size(); }
    // The node with that id, or null (destroyed, or out of range).
    Tn_Node* at(uint32_t id) const { return id < nodes_.size() ? nodes_[id] : nullptr; }
    const std::vector<Tn_Node*>& nodes() const { return nodes_; }

    // Destroys a node and leaves a null entry (ids of the others stay).
    void destroy(uint32_t id);
    // Removes null entries and renumbers the rest 0, 1, 2... in table order.
    void compact();
    // Destroys every node keep() rejects; the rest keep their order and are
    // renumbered densely.
    void sweep(const std::function<bool(const Tn_Node*)>& keep);

private:
    std::vector<Tn_Node*> nodes_;
};

#endif
