#include "tests/support/parse.h"

#include <sstream>

#include "util/tn_ostream.h"
#include "verilog/tn_verilogcompiler.h"
#include "verilog/tn_verilogdirectivestate.h"
#include "verilog/tn_veriloglexer.h"
#include "verilog/tn_verilogparser.h"
#include "verilog/tn_verilogtokenstreamfilter.h"

Tn_VerilogDesignUnit* ParseResult::unit(const std::string& name) const {
    return static_cast<Tn_VerilogDesignUnit*>(work->find(Port_String(name.c_str())));
}

Tn_VerilogModule* ParseResult::module(const std::string& name) const {
    Tn_VerilogDesignUnit* u = unit(name);
    return u ? Tn_VerilogNode::cast<Tn_VerilogModule>(u->node()) : nullptr;
}

Tn_VerilogUdpDefn* ParseResult::udp(const std::string& name) const {
    Tn_VerilogDesignUnit* u = unit(name);
    return u ? Tn_VerilogNode::cast<Tn_VerilogUdpDefn>(u->node()) : nullptr;
}

std::vector<std::string> ParseResult::tops(bool recursive) const {
    std::vector<std::string> r;
    for (const Port_String& s : Tn_VerilogCompiler::findTopUnits(*work, recursive)) r.push_back(s.c_str());
    return r;
}

ParseResult parseArgs(const std::vector<std::string>& args) {
    Tn_StringList list{Port_String("tarn")};
    for (const std::string& a : args) list.push_back(Port_String(a.c_str()));
    Tn_VerilogOptions options;
    options.parse(list);
    Tn_VerilogDirectiveState directives;
    directives.reset(options.macroDefinitions());
    Tn_VerilogLexer lexer(options, directives);
    Tn_VerilogTokenStreamFilter filter(lexer);
    Tn_VerilogParser parser(options, directives, filter);
    ParseResult r;
    r.libraries.reset(new Tn_TransientLibraryManager);
    r.work = r.libraries->open(options.workLibrary());
    parser.parse(options.sourceFiles(), *r.work, &r.compiled);
    return r;
}

namespace {

void shapeOf(Tn_VerilogNode* n, std::ostringstream& o) {
    if (!n) {
        o << "nil";
        return;
    }
    if (Tn_VerilogBinaryOp* b = Tn_VerilogNode::cast<Tn_VerilogBinaryOp>(n)) {
        o << '(' << Tn_Verilog::BinaryOpTypeInfo.text(b->OpType) << ' ';
        shapeOf(b->LOperand, o);
        o << ' ';
        shapeOf(b->ROperand, o);
        o << ')';
    } else if (Tn_VerilogUnaryOp* u = Tn_VerilogNode::cast<Tn_VerilogUnaryOp>(n)) {
        o << '(' << Tn_Verilog::UnaryOpTypeInfo.text(u->OpType) << ' ';
        shapeOf(u->Operand, o);
        o << ')';
    } else if (Tn_VerilogConditionalOp* c = Tn_VerilogNode::cast<Tn_VerilogConditionalOp>(n)) {
        o << "(?: ";
        shapeOf(c->Condition, o);
        o << ' ';
        shapeOf(c->TrueOperand, o);
        o << ' ';
        shapeOf(c->FalseOperand, o);
        o << ')';
    } else if (Tn_VerilogSimpleName* s = Tn_VerilogNode::cast<Tn_VerilogSimpleName>(n)) {
        o << s->Name.c_str();
    } else if (Tn_VerilogIntegerConst* i = Tn_VerilogNode::cast<Tn_VerilogIntegerConst>(n)) {
        o << i->Value;
    } else if (Tn_VerilogVectorConst* v = Tn_VerilogNode::cast<Tn_VerilogVectorConst>(n)) {
        o << v->Value.describe().c_str();
    } else {
        o << n->typeName();
    }
}

}  // namespace

std::string shape(Tn_VerilogNode* e) {
    std::ostringstream o;
    shapeOf(e, o);
    return o.str();
}

std::string dumpOf(const Tn_VerilogNode* n, const char* label) {
    Tn_OStringStream out;
    n->dump(out, label, 0);
    return out.str().str();
}

ParseResult ParseTest::parse(const std::string& source, const std::vector<std::string>& args) {
    const std::string file = dir.write("t.v", source);
    std::vector<std::string> all{file};
    all.insert(all.end(), args.begin(), args.end());
    sink.clear();
    return parseArgs(all);
}

namespace {

Texts withoutNewlines(const std::vector<std::string>& texts) {
    Texts r;
    for (const std::string& t : texts) r.push_back(t.substr(0, t.size() - (t.empty() || t.back() != '\n' ? 0 : 1)));
    return r;
}

}  // namespace

std::vector<std::string> ParseTest::errors() const { return withoutNewlines(sink.errors()); }
std::vector<std::string> ParseTest::warnings() const { return withoutNewlines(sink.warnings()); }

Tn_VerilogModule* ParseTest::clean(const std::string& source, const std::vector<std::string>& args) {
    result = parse(source, args);
    EXPECT_EQ(errors(), Texts{});
    EXPECT_EQ(warnings(), Texts{});
    if (result.compiled.empty()) return nullptr;
    return result.module(result.compiled.front().c_str());
}
