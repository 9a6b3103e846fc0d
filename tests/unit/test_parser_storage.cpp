// The storage the parser leans on: interned symbols and pooled node storage.
#include <gtest/gtest.h>

#include <set>
#include <string>
#include <vector>

#include "library/tn_nodetable.h"
#include "util/tn_symbol.h"
#include "verilog/tn_verilognodefactory.h"
#include "verilog/tn_verilognodes.h"

namespace {

TEST(Symbols, EqualTextsAreOneSymbol) {
    const Tn_Symbol a("net_a"), b(std::string("net_a").c_str()), c("net_b");
    EXPECT_EQ(a, b);
    EXPECT_EQ(&a.str(), &b.str());
    EXPECT_NE(a, c);
    EXPECT_EQ(Tn_Symbol(), Tn_Symbol(""));
    EXPECT_TRUE(Tn_Symbol().IsEmpty());
    // Lengths count, not terminators.
    const char text[] = {'a', 'b', 'c'};
    EXPECT_EQ(Tn_Symbol(text, 2), Tn_Symbol("ab"));
    EXPECT_NE(Tn_Symbol(text, 2), Tn_Symbol(text, 3));
}

TEST(Symbols, ManySymbolsStayDistinctAndStable) {
    // Enough texts to grow the table several times.
    std::vector<Tn_Symbol> symbols;
    std::vector<const Port_String*> addresses;
    for (int i = 0; i < 50000; ++i) {
        symbols.push_back(Tn_Symbol(("sym_" + std::to_string(i)).c_str()));
        addresses.push_back(&symbols.back().str());
    }
    std::set<const Port_String*> distinct(addresses.begin(), addresses.end());
    EXPECT_EQ(distinct.size(), symbols.size());
    for (int i = 0; i < 50000; i += 997) {
        const Tn_Symbol again(("sym_" + std::to_string(i)).c_str());
        EXPECT_EQ(&again.str(), addresses[static_cast<size_t>(i)]);
        EXPECT_EQ(again.str().str(), "sym_" + std::to_string(i));
    }
    EXPECT_LT(Tn_Symbol("sym_1"), Tn_Symbol("sym_2"));
}

TEST(NodeStorage, DestroyedNodesAreReusedAndNodesKeepTheirFields) {
    Tn_NodeTable table;
    Tn_VerilogNodeFactory f(table);
    std::vector<Tn_VerilogNode*> nodes;
    for (int i = 0; i < 1000; ++i) {
        Tn_VerilogSimpleName* n = f.createSimpleName(Tn_Location(Tn_Symbol("f.v"), i));
        n->Name = Tn_Symbol("x");
        nodes.push_back(n);
        nodes.push_back(f.createModule());  // another size class
        nodes.push_back(f.createBinaryOp());
    }
    for (size_t i = 0; i < nodes.size(); i += 2) table.destroy(nodes[i]->id());
    table.compact();
    // New nodes take freed storage; all live ones are intact.
    for (int i = 0; i < 1000; ++i) f.createSimpleName()->Name = Tn_Symbol("y");
    size_t names = 0;
    for (Tn_Node* n : table.nodes())
        if (Tn_VerilogSimpleName* s = Tn_VerilogNode::cast<Tn_VerilogSimpleName>(static_cast<Tn_VerilogNode*>(n))) {
            ++names;
            EXPECT_TRUE(s->Name == Tn_Symbol("x") || s->Name == Tn_Symbol("y"));
        }
    EXPECT_EQ(names, 1500u);
}

}  // namespace
