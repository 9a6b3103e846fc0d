#include "tests/support/exprparser.h"

#include <cctype>
#include <cstdlib>
#include <cstring>

#include "verilog/tn_verilognodes.h"

using namespace Tn_Verilog;

TestExprParser::TestExprParser(Tn_VerilogNodeFactory& factory, const Tn_Location& location,
                               std::function<int(const std::string&)> dimensions)
    : f_(factory), location_(location), dimensions_(std::move(dimensions)) {}

template <class T>
T* TestExprParser::make() {
    return static_cast<T*>(f_.create(T::TYPE, location_));
}

Tn_VerilogExpression* TestExprParser::parse(const std::string& text) {
    text_ = text;
    pos_ = 0;
    error_.clear();
    next();
    Tn_VerilogExpression* e = expression();
    if (e && tok_.kind != Token::End) return fail("junk after the expression: " + tok_.text);
    return e;
}

Tn_VerilogExpression* TestExprParser::fail(const std::string& why) {
    if (error_.empty()) error_ = why;
    return nullptr;
}

bool TestExprParser::accept(const char* op) {
    if (!is(op)) return false;
    next();
    return true;
}

bool TestExprParser::expect(const char* op) {
    if (accept(op)) return true;
    fail(std::string("expected ") + op + " before '" + tok_.text + "'");
    return false;
}

void TestExprParser::next() {
    while (pos_ < text_.size() && std::isspace(static_cast<unsigned char>(text_[pos_]))) ++pos_;
    tok_ = Token();
    if (pos_ >= text_.size()) return;
    const size_t start = pos_;
    const char c = text_[pos_];
    auto isDigitsChar = [](char ch) { return std::isxdigit(static_cast<unsigned char>(ch)) || std::strchr("xXzZ?_", ch); };
    auto based = [&]() {
        // ' [s] base digits
        ++pos_;
        if (pos_ < text_.size() && (text_[pos_] == 's' || text_[pos_] == 'S')) ++pos_;
        if (pos_ < text_.size()) ++pos_;
        while (pos_ < text_.size() && std::isspace(static_cast<unsigned char>(text_[pos_]))) ++pos_;
        while (pos_ < text_.size() && isDigitsChar(text_[pos_])) ++pos_;
    };
    if (std::isdigit(static_cast<unsigned char>(c))) {
        while (pos_ < text_.size() && (std::isdigit(static_cast<unsigned char>(text_[pos_])) || text_[pos_] == '_')) ++pos_;
        size_t after = pos_;
        while (after < text_.size() && text_[after] == ' ') ++after;
        if (after < text_.size() && text_[after] == '\'') {
            pos_ = after;
            based();
            tok_.kind = Token::Number;
        } else if (pos_ < text_.size() && (text_[pos_] == '.' || text_[pos_] == 'e' || text_[pos_] == 'E')) {
            if (text_[pos_] == '.') {
                ++pos_;
                while (pos_ < text_.size() && std::isdigit(static_cast<unsigned char>(text_[pos_]))) ++pos_;
            }
            if (pos_ < text_.size() && (text_[pos_] == 'e' || text_[pos_] == 'E')) {
                ++pos_;
                if (pos_ < text_.size() && (text_[pos_] == '+' || text_[pos_] == '-')) ++pos_;
                while (pos_ < text_.size() && std::isdigit(static_cast<unsigned char>(text_[pos_]))) ++pos_;
            }
            tok_.kind = Token::Real;
        } else {
            tok_.kind = Token::Number;
        }
    } else if (c == '\'') {
        based();
        tok_.kind = Token::Number;
    } else if (c == '"') {
        ++pos_;
        while (pos_ < text_.size() && text_[pos_] != '"') ++pos_;
        tok_.kind = Token::String;
        tok_.text = text_.substr(start + 1, pos_ - start - 1);
        ++pos_;
        return;
    } else if (std::isalpha(static_cast<unsigned char>(c)) || c == '_' || c == '$') {
        ++pos_;
        while (pos_ < text_.size() && (std::isalnum(static_cast<unsigned char>(text_[pos_])) || text_[pos_] == '_' ||
                                       text_[pos_] == '$'))
            ++pos_;
        tok_.kind = c == '$' ? Token::SysIdent : Token::Ident;
    } else {
        static const char* const ops[] = {"<<<", ">>>", "===", "!==", "**", "<<", ">>", "<=", ">=", "==", "!=", "&&",
                                          "||",  "~&",  "~|",  "~^",  "^~", "+:", "-:"};
        tok_.kind = Token::Op;
        for (const char* op : ops)
            if (text_.compare(pos_, std::strlen(op), op) == 0) {
                pos_ += std::strlen(op);
                tok_.text = op;
                return;
            }
        ++pos_;
    }
    tok_.text = text_.substr(start, pos_ - start);
}

Tn_VerilogExpression* TestExprParser::expression() {
    Tn_VerilogExpression* c = binary(0);
    if (!c || !accept("?")) return c;
    Tn_VerilogExpression* t = expression();
    if (!t || !expect(":")) return nullptr;
    Tn_VerilogExpression* e = expression();
    if (!e) return nullptr;
    Tn_VerilogConditionalOp* op = make<Tn_VerilogConditionalOp>();
    op->Condition = c;
    op->TrueOperand = t;
    op->FalseOperand = e;
    return op;
}

namespace {

struct BinaryLevel {
    const char* ops[4];
    BinaryOpType types[4];
};

// Lowest precedence first.
const BinaryLevel kLevels[] = {
    {{"||"}, {LogicalOr}},
    {{"&&"}, {LogicalAnd}},
    {{"|"}, {BitwiseOr}},
    {{"^", "~^", "^~"}, {BitwiseXor, BitwiseXnor, BitwiseXnor}},
    {{"&"}, {BitwiseAnd}},
    {{"==", "!=", "===", "!=="}, {Equal, NotEqual, CaseEqual, CaseNotEqual}},
    {{"<", "<=", ">", ">="}, {LessThan, LessEqual, GreaterThan, GreaterEqual}},
    {{"<<", ">>", "<<<", ">>>"}, {LeftShift, RightShift, ArithLeftShift, ArithRightShift}},
    {{"+", "-"}, {Addition, Subtraction}},
    {{"*", "/", "%"}, {Multiplication, Division, Modulus}},
    {{"**"}, {Exponentiation}},
};
const int kLevelCount = sizeof kLevels / sizeof kLevels[0];

}  // namespace

Tn_VerilogExpression* TestExprParser::binary(int level) {
    if (level == kLevelCount) return unary();
    Tn_VerilogExpression* l = binary(level + 1);
    while (l && tok_.kind == Token::Op) {
        int found = -1;
        for (int i = 0; i < 4 && kLevels[level].ops[i]; ++i)
            if (tok_.text == kLevels[level].ops[i]) found = i;
        if (found < 0) break;
        next();
        Tn_VerilogExpression* r = binary(level + 1);
        if (!r) return nullptr;
        Tn_VerilogBinaryOp* op = make<Tn_VerilogBinaryOp>();
        op->OpType = kLevels[level].types[found];
        op->LOperand = l;
        op->ROperand = r;
        l = op;
    }
    return l;
}

Tn_VerilogExpression* TestExprParser::unary() {
    static const struct {
        const char* text;
        UnaryOpType type;
    } ops[] = {{"+", Identity},     {"-", Negation},      {"!", LogicalNegation}, {"~", BitwiseNegation},
               {"&", ReductionAnd}, {"~&", ReductionNand}, {"|", ReductionOr},    {"~|", ReductionNor},
               {"^", ReductionXor}, {"~^", ReductionXnor}, {"^~", ReductionXnor}};
    if (tok_.kind == Token::Op)
        for (const auto& o : ops)
            if (tok_.text == o.text) {
                next();
                Tn_VerilogExpression* operand = unary();
                if (!operand) return nullptr;
                Tn_VerilogUnaryOp* op = make<Tn_VerilogUnaryOp>();
                op->OpType = o.type;
                op->Operand = operand;
                return op;
            }
    return primary();
}

Tn_VerilogExpression* TestExprParser::number(const std::string& raw) {
    std::string text;
    for (char c : raw)
        if (c != '_' && c != ' ') text += c;
    size_t tick = text.find('\'');
    if (tick == std::string::npos) {
        long long v = std::strtoll(text.c_str(), nullptr, 10);
        if (v <= 0x7fffffffLL) {
            Tn_VerilogIntegerConst* c = make<Tn_VerilogIntegerConst>();
            c->Value = static_cast<int32_t>(v);
            return c;
        }
        Tn_VerilogVectorConst* c = make<Tn_VerilogVectorConst>();
        c->Value = Tn_VerilogVector(Decimal, true, 0, text.c_str());
        return c;
    }
    uint32_t width = tick ? static_cast<uint32_t>(std::strtoul(text.substr(0, tick).c_str(), nullptr, 10)) : 0;
    size_t p = tick + 1;
    bool isSigned = p < text.size() && (text[p] == 's' || text[p] == 'S');
    if (isSigned) ++p;
    if (p >= text.size()) return fail("bad number " + raw);
    const char b = static_cast<char>(std::tolower(static_cast<unsigned char>(text[p])));
    BaseType base = b == 'd' ? Decimal : b == 'o' ? Octal : b == 'h' ? Hex : b == 'b' ? Binary : String;
    if (base == String) return fail("bad base in " + raw);
    std::string digits = text.substr(p + 1);
    if (digits.empty()) return fail("no digits in " + raw);
    Tn_VerilogVectorConst* c = make<Tn_VerilogVectorConst>();
    c->Value = Tn_VerilogVector(base, isSigned, width, digits.c_str());
    return c;
}

Tn_VerilogExpression* TestExprParser::primary() {
    Token t = tok_;
    switch (t.kind) {
    case Token::Number: next(); return number(t.text);
    case Token::Real: {
        next();
        std::string text;
        for (char c : t.text)
            if (c != '_') text += c;
        Tn_VerilogRealConst* c = make<Tn_VerilogRealConst>();
        c->Value = std::strtod(text.c_str(), nullptr);
        return c;
    }
    case Token::String: {
        next();
        Tn_VerilogVectorConst* c = make<Tn_VerilogVectorConst>();
        c->Value = Tn_VerilogVector(String, false, 0, t.text.c_str());
        return c;
    }
    case Token::Ident:
    case Token::SysIdent: return nameOrCall();
    case Token::Op:
        if (accept("(")) {
            Tn_VerilogExpression* e = expression();
            if (!e) return nullptr;
            if (accept(":")) {
                Tn_VerilogExpression* typ = expression();
                if (!typ || !expect(":")) return nullptr;
                Tn_VerilogExpression* max = expression();
                if (!max) return nullptr;
                Tn_VerilogMinTypMaxOp* op = make<Tn_VerilogMinTypMaxOp>();
                op->MinOperand = e;
                op->TypOperand = typ;
                op->MaxOperand = max;
                e = op;
            }
            return expect(")") ? e : nullptr;
        }
        if (accept("{")) return braces();
        return fail("unexpected '" + t.text + "'");
    default: return fail("unexpected end");
    }
}

// After "{": a concatenation, or a replication when the first expression is
// followed by another "{".
Tn_VerilogExpression* TestExprParser::braces() {
    Tn_VerilogExpression* first = expression();
    if (!first) return nullptr;
    if (accept("{")) {
        Tn_VerilogMultipleConcatOp* op = make<Tn_VerilogMultipleConcatOp>();
        op->Count = first;
        do {
            Tn_VerilogExpression* e = expression();
            if (!e) return nullptr;
            op->Operand.push_back(e);
        } while (accept(","));
        return expect("}") && expect("}") ? op : nullptr;
    }
    Tn_VerilogConcatOp* op = make<Tn_VerilogConcatOp>();
    op->Operand.push_back(first);
    while (accept(",")) {
        Tn_VerilogExpression* e = expression();
        if (!e) return nullptr;
        op->Operand.push_back(e);
    }
    return expect("}") ? op : nullptr;
}

Tn_VerilogExpression* TestExprParser::nameOrCall() {
    const Token t = tok_;
    next();
    if (t.kind == Token::SysIdent) {
        Tn_VerilogSystemFunctionCall* call = make<Tn_VerilogSystemFunctionCall>();
        call->Name = Tn_Symbol(t.text.c_str());
        if (accept("(") && !accept(")")) {
            do {
                // An empty argument is an empty operation.
                if (is(",") || is(")")) {
                    call->Param.push_back(make<Tn_VerilogNullOp>());
                    continue;
                }
                Tn_VerilogExpression* e = expression();
                if (!e) return nullptr;
                call->Param.push_back(e);
            } while (accept(","));
            if (!expect(")")) return nullptr;
        }
        return call;
    }
    // identifier { [index] . identifier } : a hierarchical name when a dot follows.
    Tn_VerilogHierarchicalName* prefix = nullptr;
    std::string last = t.text;
    for (;;) {
        const size_t mark = pos_;
        const Token saved = tok_;
        Tn_VerilogExpression* index = nullptr;
        if (is("[")) {
            next();
            index = expression();
            if (!index || !accept("]") || !is(".")) {
                // Not an indexed scope: a select, read again below.
                pos_ = mark;
                tok_ = saved;
                index = nullptr;
                error_.clear();
            }
        }
        if (!is(".")) break;
        next();
        Tn_VerilogHierarchicalName* here;
        if (!prefix) {
            Tn_VerilogScopeName* s = make<Tn_VerilogScopeName>();
            s->Name = Tn_Symbol(last.c_str());
            here = s;
        } else {
            Tn_VerilogSelectedName* s = make<Tn_VerilogSelectedName>();
            s->Prefix = prefix;
            s->Suffix = Tn_Symbol(last.c_str());
            here = s;
        }
        if (index) {
            Tn_VerilogIndexedName* in = make<Tn_VerilogIndexedName>();
            in->Prefix = here;
            in->Index = index;
            here = in;
        }
        prefix = here;
        if (tok_.kind != Token::Ident) return fail("expected a name after '.'");
        last = tok_.text;
        next();
    }
    Tn_VerilogName* name;
    if (prefix) {
        Tn_VerilogSelectedName* s = make<Tn_VerilogSelectedName>();
        s->Prefix = prefix;
        s->Suffix = Tn_Symbol(last.c_str());
        name = s;
    } else {
        Tn_VerilogSimpleName* s = make<Tn_VerilogSimpleName>();
        s->Name = Tn_Symbol(last.c_str());
        name = s;
    }
    if (accept("(")) {
        Tn_VerilogUserFunctionCall* call = make<Tn_VerilogUserFunctionCall>();
        call->Name = name;
        if (!accept(")")) {
            do {
                Tn_VerilogExpression* e = expression();
                if (!e) return nullptr;
                call->Param.push_back(e);
            } while (accept(","));
            if (!expect(")")) return nullptr;
        }
        return call;
    }
    return selects(name, dimensions_ && !prefix ? dimensions_(last) : 0);
}

Tn_VerilogExpression* TestExprParser::selects(Tn_VerilogExpression* operand, int dimensions) {
    if (dimensions > 0 && is("[")) {
        Tn_VerilogWordSelect* w = make<Tn_VerilogWordSelect>();
        w->Operand = static_cast<Tn_VerilogName*>(operand);
        for (int i = 0; i < dimensions && accept("["); ++i) {
            Tn_VerilogExpression* e = expression();
            if (!e || !expect("]")) return nullptr;
            w->Index.push_back(e);
        }
        operand = w;
    }
    if (!accept("[")) return operand;
    Tn_VerilogExpression* first = expression();
    if (!first) return nullptr;
    Tn_VerilogOperand* o = static_cast<Tn_VerilogOperand*>(operand);
    Tn_VerilogExpression* result;
    if (accept(":")) {
        Tn_VerilogPartSelect* p = make<Tn_VerilogPartSelect>();
        p->Operand = o;
        p->Msb = first;
        if (!(p->Lsb = expression())) return nullptr;
        result = p;
    } else if (is("+:") || is("-:")) {
        Tn_VerilogIndexedPartSelect* p = make<Tn_VerilogIndexedPartSelect>();
        p->NegativeFlag = is("-:");
        next();
        p->Operand = o;
        p->Base = first;
        if (!(p->Width = expression())) return nullptr;
        result = p;
    } else {
        Tn_VerilogBitSelect* b = make<Tn_VerilogBitSelect>();
        b->Operand = o;
        b->Index = first;
        result = b;
    }
    return expect("]") ? result : nullptr;
}
