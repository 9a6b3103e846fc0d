#include "library/tn_nodetable.h"

#include "library/tn_node.h"

Tn_NodeTable::~Tn_NodeTable() {
    for (Tn_Node* n : nodes_) delete n;
}

void Tn_NodeTable::add(Tn_Node* node) {
    node->setId(static_cast<uint32_t>(nodes_.size()));
    nodes_.push_back(node);
}

void Tn_NodeTable::destroy(uint32_t id) {
    if (id >= nodes_.size()) return;
    delete nodes_[id];
    nodes_[id] = nullptr;
}

void Tn_NodeTable::compact() {
    sweep([](const Tn_Node*) { return true; });
}

void Tn_NodeTable::sweep(const std::function<bool(const Tn_Node*)>& keep) {
    size_t out = 0;
    for (Tn_Node* n : nodes_) {
        if (!n) continue;
        if (!keep(n)) {
            delete n;
            continue;
        }
        n->setId(static_cast<uint32_t>(out));
        nodes_[out++] = n;
    }
    nodes_.resize(out);
}
