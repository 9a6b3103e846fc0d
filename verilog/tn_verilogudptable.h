// The rows of one UDP table as they are read: each row's symbols are
// collected, checked (column count, one edge at most, well-formed edges) and
// compared with the earlier rows for an overlap that gives another output.
#ifndef TARN_TN_VERILOGUDPTABLE_H
#define TARN_TN_VERILOGUDPTABLE_H

#include <cstddef>
#include <cstdint>
#include <string>
#include <unordered_map>
#include <vector>

class Tn_VerilogUdpTable {
public:
    enum Problem {
        OK,
        COLUMN_COUNT,     // not as many input columns as inputs
        MULTIPLE_EDGES,   // more than one edge in the row
        INVALID_EDGE,     // a parenthesised edge that is not two level symbols
        EDGE_IN_COMBINATIONAL,
        NO_CHANGE_IN_COMBINATIONAL
    };

    // A new table for a UDP of that many inputs.
    void reset(size_t inputs, bool sequential);

    // Building one row: symbols as the scanner gives them ("0", "1", "X",
    // "?", "B", "R", "F", "P", "N", "*", "-"); an edge is opened, given its
    // symbols and closed; colons separate the inputs, the current state and
    // the output.
    void beginRow();
    void symbol(char c);
    void openEdge();
    void closeEdge();
    void colon() { ++part_; }

    // Ends the row: its problem (reported by the caller), its text (inputs,
    // then ":state" for a sequential UDP, then ":output") and whether it holds
    // an edge. When the row is well formed and overlaps an earlier row with
    // another output, conflict is that row's number (from 0), else -1.
    Problem endRow(std::string& text, bool& edge, long& conflict);

    // Pairs of rows compared so far (the comparison stops at a budget, so a
    // table of absurd size cannot make the check quadratic forever).

private:
    // A column: a set of values (bit 0: 0, bit 1: 1, bit 2: x) for a level,
    // or a set of changes (bit 3 * from + to, from != to) for an edge.
    struct Column {
        uint16_t set = 0;
        bool edge = false;
    };
    struct Row {
        std::vector<Column> inputs;
        uint8_t state = 0;
        char output = 0;
        int edgeColumn = -1;
        size_t number = 0;
    };
    static uint16_t levelSet(char c);
    static uint16_t edgeSet(char c);
    static uint16_t changes(uint16_t from, uint16_t to);
    bool overlap(const Row& a, const Row& b) const;
    bool differ(const Row& a, const Row& b) const;

    size_t inputs_ = 0;
    bool sequential_ = false;
    // The row being read.
    int part_ = 0;
    bool inEdge_ = false;
    std::string edgeText_;
    std::string text_[3];
    Row row_;
    int edges_ = 0;
    bool invalidEdge_ = false;
    // Well-formed rows read so far; rows with the same inputs and state are
    // found by their text at once.
    std::vector<Row> rows_;
    std::unordered_map<std::string, size_t> byInputs_;
    size_t rowCount_ = 0;
    size_t comparisons_ = 0;
    static const size_t kComparisonBudget = size_t(50) << 20;
};

#endif
