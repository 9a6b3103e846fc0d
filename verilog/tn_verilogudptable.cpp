#include "verilog/tn_verilogudptable.h"

namespace {

const uint16_t kAnyLevel = 7;

char lower(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; }

}  // namespace

void Tn_VerilogUdpTable::reset(size_t inputs, bool sequential) {
    inputs_ = inputs;
    sequential_ = sequential;
    rows_.clear();
    byInputs_.clear();
    rowCount_ = 0;
    comparisons_ = 0;
}

void Tn_VerilogUdpTable::beginRow() {
    part_ = 0;
    inEdge_ = false;
    for (std::string& t : text_) t.clear();
    row_ = Row();
    edges_ = 0;
    invalidEdge_ = false;
}

// Values a level symbol stands for: 0, 1, x, ? (any) and b (0 or 1).
uint16_t Tn_VerilogUdpTable::levelSet(char c) {
    switch (c) {
    case '0': return 1;
    case '1': return 2;
    case 'x': return 4;
    case '?': return kAnyLevel;
    case 'b': return 3;
    default: return 0;
    }
}

// Changes between two sets of values, without the non-changes.
uint16_t Tn_VerilogUdpTable::changes(uint16_t from, uint16_t to) {
    uint16_t set = 0;
    for (int f = 0; f < 3; ++f)
        for (int t = 0; t < 3; ++t)
            if (f != t && (from >> f & 1) && (to >> t & 1)) set |= static_cast<uint16_t>(1u << (3 * f + t));
    return set;
}

// The changes of the edge abbreviations: r (01), f (10), p (01, 0x, x1),
// n (10, 1x, x0) and * (any change).
uint16_t Tn_VerilogUdpTable::edgeSet(char c) {
    switch (c) {
    case 'r': return changes(1, 2);
    case 'f': return changes(2, 1);
    case 'p': return changes(1, 2) | changes(1, 4) | changes(4, 2);
    case 'n': return changes(2, 1) | changes(2, 4) | changes(4, 1);
    case '*': return changes(kAnyLevel, kAnyLevel);
    default: return 0;
    }
}

void Tn_VerilogUdpTable::symbol(char c) {
    c = lower(c);
    if (inEdge_) {
        edgeText_ += c;
        return;
    }
    if (part_ > 0) {
        text_[part_] += c;
        if (part_ == 1 && sequential_)
            row_.state = static_cast<uint8_t>(levelSet(c));
        else
            row_.output = c;
        return;
    }
    text_[0] += c;
    Column col;
    if (uint16_t e = edgeSet(c)) {
        col.set = e;
        col.edge = true;
        ++edges_;
        row_.edgeColumn = static_cast<int>(row_.inputs.size());
    } else {
        col.set = levelSet(c);
    }
    row_.inputs.push_back(col);
}

void Tn_VerilogUdpTable::openEdge() {
    inEdge_ = true;
    edgeText_.clear();
}

void Tn_VerilogUdpTable::closeEdge() {
    inEdge_ = false;
    text_[0] += '(' + edgeText_ + ')';
    Column col;
    col.edge = true;
    if (edgeText_.size() == 2 && levelSet(edgeText_[0]) && levelSet(edgeText_[1]))
        col.set = changes(levelSet(edgeText_[0]), levelSet(edgeText_[1]));
    else
        invalidEdge_ = true;
    ++edges_;
    row_.edgeColumn = static_cast<int>(row_.inputs.size());
    row_.inputs.push_back(col);
}

bool Tn_VerilogUdpTable::overlap(const Row& a, const Row& b) const {
    // An edge row matches one input changing; it meets another row only
    // when that row has its edge in the same column. Level rows meet level
    // rows.
    if (a.edgeColumn != b.edgeColumn) return false;
    if (sequential_ && !(a.state & b.state)) return false;
    for (size_t i = 0; i < a.inputs.size(); ++i)
        if (!(a.inputs[i].set & b.inputs[i].set)) return false;
    return true;
}

// Outputs that differ for some input both rows match: "-" keeps the current
// state, so it agrees with an output that the shared states all have.
bool Tn_VerilogUdpTable::differ(const Row& a, const Row& b) const {
    if (a.output == b.output) return false;
    if (a.output != '-' && b.output != '-') return true;
    const char value = a.output == '-' ? b.output : a.output;
    const uint16_t shared = static_cast<uint16_t>(a.state & b.state);
    return (shared & ~levelSet(value)) != 0;
}

Tn_VerilogUdpTable::Problem Tn_VerilogUdpTable::endRow(std::string& text, bool& edge, long& conflict) {
    const size_t number = rowCount_++;
    text = text_[0];
    for (int p = 1; p <= part_ && p < 3; ++p) text += ':' + text_[p];
    edge = edges_ > 0;
    conflict = -1;
    if (row_.inputs.size() != inputs_) return COLUMN_COUNT;
    if (edges_ > 1) return MULTIPLE_EDGES;
    if (invalidEdge_) return INVALID_EDGE;
    if (!sequential_ && edges_ > 0) return EDGE_IN_COMBINATIONAL;
    if (!sequential_ && row_.output == '-') return NO_CHANGE_IN_COMBINATIONAL;
    row_.number = number;
    if (!sequential_) row_.state = kAnyLevel;
    // The same inputs and state written again: only the output can differ.
    const std::string key = sequential_ ? text_[0] + ':' + text_[1] : text_[0];
    auto same = byInputs_.find(key);
    if (same != byInputs_.end()) {
        if (differ(rows_[same->second], row_)) conflict = static_cast<long>(rows_[same->second].number);
        return OK;
    }
    for (const Row& r : rows_) {
        if (comparisons_ >= kComparisonBudget) break;
        ++comparisons_;
        if (overlap(r, row_) && differ(r, row_)) {
            conflict = static_cast<long>(r.number);
            break;
        }
    }
    byInputs_.emplace(key, rows_.size());
    rows_.push_back(row_);
    return OK;
}
