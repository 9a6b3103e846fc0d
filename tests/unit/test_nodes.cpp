// The node classes of the design model: class tree, fields, visitor, factory,
// dump, copy and remap, and the library units that own nodes.
#include <gtest/gtest.h>

#include <map>
#include <set>
#include <sstream>

#include "tests/support/capturesink.h"
#include "tests/support/parse.h"
#include "util/tn_ostream.h"
#include "verilog/tn_verilogdesign.h"
#include "verilog/tn_verilogdesignunit.h"
#include "verilog/tn_verilognodemap.h"
#include "verilog/tn_verilognodes.h"

namespace {

struct TreeRow {
    int type;
    const char* name;
    const char* base;
};
struct RecordRow {
    int type;
    const char* fields;
};
#include "tests/unit/nodetable_data.inc"

const std::set<int> kAbstract = {0,  1,  2,  3,  4,  5,  9,  15, 16, 21, 25, 28, 33, 34, 37,  38,  39, 43,
                                 45, 53, 56, 66, 70, 71, 72, 73, 84, 85, 93, 98, 109, 119, 120, 123};

using namespace Tn_Verilog;

int typeNamed(const std::string& name) {
    for (const TreeRow& r : kTree)
        if (name == r.name) return r.type;
    return -1;
}

// A unit to own the nodes a test makes.
struct Unit {
    Tn_VerilogOptions options;
    Tn_VerilogDesignUnit unit{"work", "u", options};
    Tn_VerilogNodeFactory& f = unit.factory();
};


}  // namespace

TEST(NodeTypes, NumbersNamesAndBasesFollowTheClassTree) {
    ASSERT_EQ(NodeTypeCount, 132);
    for (const TreeRow& r : kTree) {
        SCOPED_TRACE(r.name);
        EXPECT_STREQ(nodeTypeName(r.type), r.name);
        EXPECT_EQ(std::string(nodeClassName(r.type)), std::string("Tn_Verilog") + r.name);
        EXPECT_EQ(nodeBaseType(r.type), typeNamed(r.base));
        EXPECT_EQ(isConcreteNodeType(r.type), kAbstract.count(r.type) == 0);
    }
    EXPECT_STREQ(nodeTypeName(132), "NoNodeType");
    EXPECT_STREQ(nodeTypeName(-1), "NoNodeType");
}

TEST(NodeTypes, IsAHoldsExactlyForTheClassAndItsAncestors) {
    Unit u;
    for (const TreeRow& r : kTree) {
        Tn_VerilogNode* n = u.f.create(r.type);
        if (kAbstract.count(r.type)) {
            EXPECT_EQ(n, nullptr) << r.name;
            continue;
        }
        ASSERT_NE(n, nullptr) << r.name;
        EXPECT_EQ(n->nodeType(), r.type);
        std::set<int> ancestors;
        for (int t = r.type;; t = typeNamed(kTree[t].base)) {
            ancestors.insert(t);
            if (t == 0) break;
        }
        for (int t = -1; t <= 132; ++t) EXPECT_EQ(n->isA(t), ancestors.count(t) == 1) << r.name << " isA " << t;
        EXPECT_GT(n->objectSize(), 0u);
    }
    Tn_VerilogNode* c = u.f.createIntegerConst();
    std::vector<int> yes;
    for (int t = 0; t < NodeTypeCount; ++t)
        if (c->isA(t)) yes.push_back(t);
    EXPECT_EQ(yes, (std::vector<int>{0, 1, 33, 37, 38, 39, 40}));
}

namespace {

// The persistent fields of a node as label:encoding, in visit order.
class RecordLister : public Tn_VerilogFieldVisitor {
public:
    std::vector<std::string> fields;
    void location(const Tn_FieldInfo& f, Tn_Location&) override { add(f, "location"); }
    void child(const Tn_FieldInfo& f, Tn_VerilogNode*&) override { add(f, "node"); }
    void reference(const Tn_FieldInfo& f, Tn_VerilogNode*&) override { add(f, "node"); }
    void childList(const Tn_FieldInfo& f, Tn_RawNodeList&) override { add(f, "list"); }
    void refList(const Tn_FieldInfo& f, Tn_RawNodeList&) override { add(f, "list"); }
    void childMap(const Tn_FieldInfo& f, Tn_NodeMapBase&) override { add(f, "namedmap"); }
    void indexMap(const Tn_FieldInfo& f, Tn_RawNodeIndexMap&) override { add(f, "indexmap"); }
    void string(const Tn_FieldInfo& f, Tn_Symbol&) override { add(f, "string"); }
    void boolean(const Tn_FieldInfo& f, bool&) override { add(f, "bool"); }
    void int32(const Tn_FieldInfo& f, int32_t&) override { add(f, "word"); }
    void uint32(const Tn_FieldInfo& f, uint32_t&) override { add(f, "word"); }
    void int64(const Tn_FieldInfo& f, int64_t&) override { add(f, "double"); }
    void uint64(const Tn_FieldInfo& f, uint64_t&) override { add(f, "double"); }
    void float64(const Tn_FieldInfo& f, double&) override { add(f, "double"); }
    void enumeration(const Tn_FieldInfo& f, const Tn_EnumInfo&, int32_t&) override { add(f, "word"); }
    void vector(const Tn_FieldInfo& f, Tn_VerilogVector&) override { add(f, "vector"); }

private:
    void add(const Tn_FieldInfo& f, const char* enc) {
        if (f.persistent) fields.push_back(std::string(f.label) + ":" + enc);
    }
};

std::vector<std::string> words(const char* text) {
    std::istringstream in(text);
    std::vector<std::string> r;
    for (std::string w; in >> w;) r.push_back(w);
    return r;
}

}  // namespace

TEST(NodeFields, PersistentFieldsMatchTheRecordTableClassByClass) {
    std::map<int, const char*> own;
    for (const RecordRow& r : kRecords) own[r.type] = r.fields;
    Unit u;
    for (const TreeRow& r : kTree) {
        if (kAbstract.count(r.type)) continue;
        SCOPED_TRACE(r.name);
        std::vector<int> chain;
        for (int t = r.type;; t = typeNamed(kTree[t].base)) {
            chain.insert(chain.begin(), t);
            if (t == 0) break;
        }
        std::vector<std::string> expected;
        for (int t : chain)
            if (own.count(t))
                for (const std::string& w : words(own[t])) expected.push_back(w);
        RecordLister lister;
        u.f.create(r.type)->visitFields(lister);
        ASSERT_EQ(lister.fields.size(), expected.size());
        for (size_t i = 0; i < expected.size(); ++i) {
            // The second location of modules and UDPs may carry any label.
            if (expected[i] == "(second-location):location")
                EXPECT_EQ(lister.fields[i].substr(lister.fields[i].find(':')), ":location");
            else
                EXPECT_EQ(lister.fields[i], expected[i]) << "field " << i;
        }
    }
}

TEST(NodeFields, TransientFieldsStayOutOfTheRecord) {
    Unit u;
    RecordLister lister;
    Tn_VerilogParamAssignment* p = u.f.createParamAssignment();
    p->CmdLineParamAssignmentFlag = true;
    p->visitFields(lister);
    EXPECT_EQ(lister.fields, (std::vector<std::string>{"Location:location", "Name:string", "Value:node",
                                                       "NamedParamAssignmentFlag:bool"}));
}

namespace {

class ExpressionCounter : public Tn_VerilogVisitor {
public:
    std::vector<int> seen;
    void visitExpression(Tn_VerilogExpression* n) override { seen.push_back(n->nodeType()); }
};

class Silent : public Tn_VerilogVisitor {};

}  // namespace

TEST(Visitor, OverridingExpressionReceivesEveryExpressionClass) {
    Unit u;
    ExpressionCounter v;
    for (int t = 0; t < NodeTypeCount; ++t)
        if (Tn_VerilogNode* n = u.f.create(t)) n->accept(v);
    std::vector<int> expected;
    for (int t = 37; t <= 64; ++t)
        if (!kAbstract.count(t)) expected.push_back(t);
    EXPECT_EQ(v.seen, expected);
    // The abstract classes' defaults lead there too.
    v.seen.clear();
    Tn_VerilogBinaryOp* b = u.f.createBinaryOp();
    v.visitOperation(b);
    v.visitOperand(u.f.createSimpleName());
    v.visitEventExpression(b);  // above Expression: not seen
    v.visitStatement(u.f.createNullStatement());
    EXPECT_EQ(v.seen, (std::vector<int>{BinaryOp, SimpleName}));
}

TEST(Visitor, OverridingNothingVisitsNothingAndTraverseVisitsChildrenOnly) {
    Unit u;
    Silent silent;
    for (int t = 0; t < NodeTypeCount; ++t)
        if (Tn_VerilogNode* n = u.f.create(t)) n->accept(silent);

    struct Recorder : Tn_VerilogVisitor {
        std::vector<Tn_VerilogNode*> seen;
        void visitNode(Tn_VerilogNode* n) override { seen.push_back(n); }
    } rec;
    Tn_VerilogBinaryOp* b = u.f.createBinaryOp();
    b->Attributes = u.f.createAttributes();
    b->LOperand = u.f.createIntegerConst();
    b->ROperand = u.f.createRealConst();
    b->traverse(rec);
    EXPECT_EQ(rec.seen, (std::vector<Tn_VerilogNode*>{b->Attributes, b->LOperand, b->ROperand}));
}

TEST(NodeDump, SmallTreePrintsInTheDumpFormat) {
    Unit u;
    const Tn_Location at(Tn_Symbol("a.v"), 3);
    Tn_VerilogModule* m = u.f.createModule(at);              // 0
    Tn_VerilogContAssign* ca = u.f.createContAssign(at);     // 1
    Tn_VerilogSimpleName* y = u.f.createSimpleName(at);      // 2
    Tn_VerilogBinaryOp* add = u.f.createBinaryOp(at);        // 3
    Tn_VerilogIntegerConst* one = u.f.createIntegerConst();  // 4
    Tn_VerilogUnaryOp* neg = u.f.createUnaryOp(Tn_Location(Tn_Symbol("b.v"), 0));  // 5
    Tn_VerilogRealConst* half = u.f.createRealConst();       // 6
    Tn_VerilogAttributes* attrs = u.f.createAttributes();    // 7
    Tn_VerilogAttribute* keep = u.f.createAttribute();       // 8
    m->Name = "top";
    ca->Target = y;
    ca->Source = add;
    ca->Attributes = attrs;
    attrs->Attribute.push_back(keep);
    keep->Name = "keep";
    keep->OnDefinitionFlag = true;
    y->Name = "y";
    y->Scope = m;
    add->OpType = Addition;
    add->LOperand = one;
    add->ROperand = neg;
    one->Value = -7;
    neg->OpType = static_cast<UnaryOpType>(42);
    neg->Operand = half;
    half->Value = 0.5;
    EXPECT_EQ(dumpOf(ca, "ContAssign"),
              "ContAssign:Tn_VerilogContAssign = 1 {\n"
              "  Location = a.v:3\n"
              "  Attributes:Tn_VerilogAttributes = 7 {\n"
              "    Location = :0\n"
              "    Attribute:Tn_VerilogAttribute = 8 {\n"
              "      Location = :0\n"
              "      OnDefinitionFlag:bool = true\n"
              "      Name:Port_String = \"keep\"\n"
              "      Expr:Tn_VerilogExpression = nil\n"
              "    }\n"
              "  }\n"
              "  DriveStrength:Tn_VerilogDriveStrength = nil\n"
              "  Delay:Tn_VerilogDelay = nil\n"
              "  Target:Tn_VerilogSimpleName = 2 {\n"
              "    Location = a.v:3\n"
              "    Attributes:Tn_VerilogAttributes = nil\n"
              "    Name:Port_String = \"y\"\n"
              "    Scope:Tn_VerilogModule = 0\n"
              "  }\n"
              "  Source:Tn_VerilogBinaryOp = 3 {\n"
              "    Location = a.v:3\n"
              "    Attributes:Tn_VerilogAttributes = nil\n"
              "    OpType:Tn_Verilog::BinaryOpType = Addition\n"
              "    LOperand:Tn_VerilogIntegerConst = 4 {\n"
              "      Location = :0\n"
              "      Attributes:Tn_VerilogAttributes = nil\n"
              "      Value:Port::INT32 = -7\n"
              "    }\n"
              "    ROperand:Tn_VerilogUnaryOp = 5 {\n"
              "      Location = b.v:0\n"
              "      Attributes:Tn_VerilogAttributes = nil\n"
              "      OpType:Tn_Verilog::UnaryOpType = NoUnaryOpType\n"
              "      Operand:Tn_VerilogRealConst = 6 {\n"
              "        Location = :0\n"
              "        Attributes:Tn_VerilogAttributes = nil\n"
              "        Value:Port::FLOAT64 = 0.5\n"
              "      }\n"
              "    }\n"
              "  }\n"
              "}\n");
}

TEST(NodeDump, ListsMapsAndReferencesPrintPerEntry) {
    Unit u;
    Tn_VerilogPort* p = u.f.createPort();
    p->Name = "a";
    p->Index = 2;
    p->Direction = OutputPort;
    p->NamedPortConnectionFlag = true;
    Tn_VerilogGenerateArray* ga = u.f.createGenerateArray();
    ga->Generate.insert(5, u.f.createGenerate());
    ga->Generate.insert(-1, u.f.createGenerate());
    const std::string port = dumpOf(p, "Port");
    EXPECT_NE(port.find("\n  Index:Port::INT32 = 2\n  Direction:Tn_Verilog::PortDirectionType = OutputPort\n"
                        "  HiConn:Tn_VerilogExpression = nil\n  LoConn:Tn_VerilogExpression = nil\n"
                        "  NamedPortConnectionFlag:bool = true\n}\n"),
              std::string::npos)
        << port;
    const std::string arr = dumpOf(ga, "GenerateArray");
    // Elements in index order, each under the map's label.
    EXPECT_NE(arr.find("  Generate:Tn_VerilogGenerate = 3 {"), std::string::npos);
    EXPECT_LT(arr.find("Generate:Tn_VerilogGenerate = 3"), arr.find("Generate:Tn_VerilogGenerate = 2"));
}

TEST(Location, TextFormsAndEmptyLocation) {
    EXPECT_EQ(Tn_Location(Tn_Symbol("a.v"), 12).text().str(), "\"a.v\" line 12 ");
    EXPECT_EQ(Tn_Location(Tn_Symbol("a.v"), 0).text().str(), "\"a.v\" ");
    EXPECT_EQ(Tn_Location(Tn_Symbol(""), 4).text().str(), "line 4 ");
    EXPECT_EQ(Tn_Location().text().str(), "");
    Unit u;
    EXPECT_EQ(u.f.createNullOp()->locationText().str(), "");
}

TEST(NodeCopy, CloneRemapsInternalReferencesAndKeepsExternalOnes) {
    Unit src, dst;
    Tn_VerilogModule* outside = src.f.createModule();
    Tn_VerilogModule* m = src.f.createModule();
    Tn_VerilogFunction* fn = src.f.createFunction();
    fn->Name = "f";
    fn->Parent = m;
    m->Function.push_back(fn);
    Tn_VerilogReg* shared = src.f.createReg();  // one type definition for two objects
    Tn_VerilogScalarVar* a = src.f.createScalarVar();
    Tn_VerilogScalarVar* b = src.f.createScalarVar();
    a->Name = "a";
    b->Name = "b";
    a->TypeDef = shared;
    b->TypeDef = shared;
    m->Variable.insert(a->Name, a);
    m->Variable.insert(b->Name, b);
    Tn_VerilogSimpleName* inside = src.f.createSimpleName();
    inside->Scope = m;
    Tn_VerilogSimpleName* out = src.f.createSimpleName();
    out->Scope = outside;
    Tn_VerilogContAssign* ca = src.f.createContAssign();
    ca->Target = inside;
    ca->Source = out;
    m->ContAssign.push_back(ca);
    const size_t before = src.unit.nodes().size();

    Tn_VerilogModule* copy = static_cast<Tn_VerilogModule*>(m->clone(dst.f));
    EXPECT_EQ(src.unit.nodes().size(), before);  // the source unit is untouched
    ASSERT_NE(copy, m);
    ASSERT_EQ(copy->Function.size(), 1u);
    EXPECT_NE(copy->Function[0], fn);
    EXPECT_EQ(copy->Function[0]->Parent.get(), copy);  // internal reference follows the copy
    Tn_VerilogContAssign* cca = copy->ContAssign[0];
    EXPECT_EQ(static_cast<Tn_VerilogSimpleName*>(cca->Target.get())->Scope.get(), copy);
    EXPECT_EQ(static_cast<Tn_VerilogSimpleName*>(cca->Source.get())->Scope.get(), outside);  // external kept
    Tn_VerilogVariable* ca2 = copy->Variable.find(Tn_Symbol("a"));
    Tn_VerilogVariable* cb2 = copy->Variable.find(Tn_Symbol("b"));
    ASSERT_TRUE(ca2 && cb2);
    EXPECT_NE(ca2->TypeDef.get(), shared);
    EXPECT_EQ(ca2->TypeDef.get(), cb2->TypeDef.get());  // sharing survives the copy
    // Every copied node belongs to the target unit, ids dense.
    EXPECT_EQ(dst.unit.nodes().size(), before - 1);  // all but the outside module
    for (size_t i = 0; i < dst.unit.nodes().size(); ++i) EXPECT_EQ(dst.unit.nodes().nodes()[i]->id(), i);
    EXPECT_EQ(Tn_VerilogNode::clone(nullptr, dst.f), nullptr);
    // Clones are marked fresh.
    EXPECT_FALSE(copy->isMarked());
}

TEST(NodeCopy, ValuesAreCopiedMemberwise) {
    Unit u;
    Tn_VerilogTableEntry* t = u.f.createTableEntry(Tn_Location(Tn_Symbol("u.v"), 9));
    t->TableRow = "0 1 : 1";
    t->RowType = LevelRow;
    Tn_VerilogTableEntry* c = static_cast<Tn_VerilogTableEntry*>(t->clone(u.f));
    EXPECT_EQ(c->TableRow.str().str(), "0 1 : 1");
    EXPECT_EQ(static_cast<TableRowType>(c->RowType), LevelRow);
    EXPECT_EQ(c->location().line, 9);
    EXPECT_EQ(dumpOf(c, "X").substr(dumpOf(c, "X").find('\n')), dumpOf(t, "X").substr(dumpOf(t, "X").find('\n')));
}

TEST(NodeMap, GrowsAndComparesNodesNotIds) {
    Unit a, b;
    Tn_VerilogNodeMap map;
    EXPECT_EQ(map.bucketCount(), 100u);
    std::vector<Tn_VerilogNode*> olds, news;
    for (int i = 0; i < 250; ++i) {
        olds.push_back(a.f.createNullOp());
        olds.push_back(b.f.createNullOp());  // same ids as a's nodes
        news.push_back(a.f.createNullStatement());
        news.push_back(b.f.createNullStatement());
    }
    for (size_t i = 0; i < olds.size(); ++i) map.add(olds[i], news[i]);
    EXPECT_GE(map.bucketCount(), map.size());
    for (size_t i = 0; i < olds.size(); ++i) EXPECT_EQ(map.find(olds[i]), news[i]);
    EXPECT_EQ(map.find(news[0]), nullptr);
    EXPECT_EQ(map.find(nullptr), nullptr);
}

TEST(NodeTable, CompactionRenumbersDensely) {
    Unit u;
    std::vector<Tn_VerilogNode*> n;
    for (int i = 0; i < 6; ++i) n.push_back(u.f.createNullOp());
    u.unit.nodes().destroy(1);
    u.unit.nodes().destroy(4);
    u.unit.nodes().destroy(99);  // out of range: nothing
    EXPECT_EQ(u.unit.nodes().at(1), nullptr);
    u.unit.nodes().compact();
    ASSERT_EQ(u.unit.nodes().size(), 4u);
    const std::vector<Tn_VerilogNode*> kept{n[0], n[2], n[3], n[5]};
    for (uint32_t i = 0; i < 4; ++i) {
        EXPECT_EQ(u.unit.nodes().at(i), kept[i]);
        EXPECT_EQ(kept[i]->id(), i);
    }
}

TEST(NodeTable, MarkAndSweepDestroyExactlyTheUnreachable) {
    Unit u;
    Tn_VerilogRoot* root = u.f.createRoot();
    Tn_VerilogNullOp* orphan1 = u.f.createNullOp();
    Tn_VerilogModule* m = u.f.createModule();
    Tn_VerilogNullOp* orphan2 = u.f.createNullOp();
    Tn_VerilogModuleInstance* inst = u.f.createModuleInstance();
    Tn_VerilogSimpleName* referencedOnly = u.f.createSimpleName();  // reached by reference only
    Tn_VerilogPort* port = u.f.createPort();
    root->ModuleInstance.push_back(inst);
    inst->Module = m;
    m->Instance = inst;
    m->Port.push_back(port);
    port->HiConn = referencedOnly;
    u.unit.setRoot(root);
    (void)orphan1;
    (void)orphan2;
    u.unit.mark();
    u.unit.sweep();
    const std::vector<Tn_Node*> expected{root, m, inst, port};
    EXPECT_EQ(u.unit.nodes().nodes(), expected);
    for (uint32_t i = 0; i < expected.size(); ++i) EXPECT_EQ(expected[i]->id(), i);
    // A second run keeps everything.
    u.unit.mark();
    u.unit.sweep();
    EXPECT_EQ(u.unit.nodes().nodes(), expected);
}

TEST(NodeTable, MarkingHandlesDeepTrees) {
    Unit u;
    Tn_VerilogRoot* root = u.f.createRoot();
    Tn_VerilogContAssign* ca = u.f.createContAssign();
    root->ContAssign.push_back(ca);
    Tn_VerilogExpression* e = u.f.createIntegerConst();
    for (int i = 0; i < 200000; ++i) {
        Tn_VerilogUnaryOp* op = u.f.createUnaryOp();
        op->Operand = e;
        e = op;
    }
    ca->Source = e;
    u.f.createNullOp();  // unreachable
    u.unit.setRoot(root);
    u.unit.mark();
    u.unit.sweep();
    EXPECT_EQ(u.unit.nodes().size(), 200003u);
}

TEST(LibraryUnits, DesignPrintsBetweenDottedLines) {
    Tn_VerilogOptions options;
    Tn_VerilogDesign d("work", "DESIGN", options);
    EXPECT_EQ(d.unitKind(), 2);
    EXPECT_EQ(d.name().str(), "DESIGN");
    EXPECT_EQ(d.libraryName().str(), "work");
    d.setRoot(d.factory().createRoot());
    d.root()->Name = "";
    Tn_OStringStream out;
    d.print(out);
    const std::string dots(39, '.');
    const std::string text = out.str().str();
    EXPECT_EQ(text.substr(0, 41), dots + "\n\n");
    EXPECT_EQ(text.substr(41, 31), "Root:Tn_VerilogRoot = 0 {\n  Loc");
    EXPECT_EQ(text.substr(text.size() - 43), "}\n\n" + dots + "\n");
}

TEST(LibraryUnits, MemoryReportCountsNodesPerType) {
    CaptureSink sink;
    Tn_VerilogOptions options;
    Tn_VerilogDesignUnit unit("work", "alu", options);
    unit.factory().createModule();
    unit.factory().createNullOp();
    unit.factory().createNullOp();
    unit.memoryReport();
    const std::vector<std::string> lines = sink.statuses();
    ASSERT_EQ(lines.size(), 9u);
    EXPECT_EQ(lines[0], "\n");
    EXPECT_EQ(lines[1], "Unit:alu Memory Report\n");
    EXPECT_EQ(lines[2], "\n");
    EXPECT_EQ(lines[3], "NodeType                             Size     Number     Memory\n");
    EXPECT_EQ(lines[4], std::string(63, '-') + "\n");
    const unsigned msize = Tn_VerilogNodeFactory(unit.nodes()).createModule()->objectSize();
    char row[128];
    std::snprintf(row, sizeof row, "%-30s %10u %10u %10u\n", "Module", msize, 1u, msize);
    EXPECT_EQ(lines[5], row);
    EXPECT_EQ(lines[6].substr(0, 30), std::string("NullOp") + std::string(24, ' '));
    EXPECT_EQ(lines[7], std::string(63, '-') + "\n");
    EXPECT_EQ(lines[8].substr(0, 52), "Totals" + std::string(36, ' ') + std::string(10, ' ').replace(9, 1, "3"));
}

TEST(Enums, NamesTextsAndOutOfRange) {
    EXPECT_STREQ(BinaryOpTypeInfo.name(Exponentiation), "Exponentiation");
    EXPECT_STREQ(BinaryOpTypeInfo.text(Exponentiation), "**");
    EXPECT_STREQ(BinaryOpTypeInfo.name(24), "NoBinaryOpType");
    EXPECT_STREQ(BinaryOpTypeInfo.text(-1), "<UnknownBinaryOp>");
    EXPECT_STREQ(UnaryOpTypeInfo.text(ReductionNor), "~|");
    EXPECT_STREQ(UnaryEventOpTypeInfo.text(NegedgeOp), "negedge");
    EXPECT_STREQ(UnaryEventOpTypeInfo.text(2), "<UnknownUnaryEventOp>");
    EXPECT_STREQ(PrimitiveTypeInfo.name(Udp), "Udp");
    EXPECT_EQ(static_cast<int>(Udp), 28);
    EXPECT_STREQ(PrimitiveTypeInfo.text(Rtranif1), "rtranif1 primitive");
    EXPECT_STREQ(PrimitiveTypeInfo.text(Seq), "primitive");
    EXPECT_STREQ(PrimitiveTypeInfo.name(29), "NoPrimitiveType");
    EXPECT_STREQ(TchkTypeInfo.name(Timeskew), "$Timeskew");
    EXPECT_EQ(static_cast<int>(Timeskew), 11);
    EXPECT_STREQ(TchkTypeInfo.name(12), "NoTchkType");
    EXPECT_STREQ(NetTypeInfo.text(Trireg), "trireg");
    EXPECT_STREQ(NetTypeInfo.text(11), "net");
    EXPECT_STREQ(ParamDeclTypeInfo.name(TimeParam), "TimeParam");
    EXPECT_STREQ(PortDirectionTypeInfo.name(4), "NoPortDirectionType");
    EXPECT_STREQ(DriveStrengthTypeInfo.name(Weak), "Weak");
    EXPECT_STREQ(ChargeStrengthTypeInfo.name(3), "NoChargeStrengthType");
    EXPECT_STREQ(GroupingTypeInfo.name(Scalared), "Scalared");
    EXPECT_STREQ(PulseControlTypeInfo.name(NoShowCancelled), "NoShowCancelled");
    EXPECT_STREQ(Tn_EnumInfoOf<BinaryOpType>::get().qualifiedName, "Tn_Verilog::BinaryOpType");
}
