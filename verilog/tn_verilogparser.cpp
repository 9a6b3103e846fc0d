#include "verilog/tn_verilogparser.h"

#include <antlr/MismatchedTokenException.hpp>
#include <antlr/NoViableAltException.hpp>
#include <antlr/TokenStreamRecognitionException.hpp>
#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <cstring>
#include <unordered_map>
#include <unordered_set>

#include "library/tn_library.h"
#include "port/port_file.h"
#include "util/tn_message.h"
#include "util/tn_ostream.h"
#include "verilog/tn_verilogdesignunit.h"
#include "verilog/tn_verilogdirectivestate.h"
#include "verilog/tn_veriloglexer.h"
#include "verilog/tn_verilognodes.h"
#include "verilog/tn_verilogtoken.h"
#include "verilog/tn_verilogtokenstreamfilter.h"
#include "verilog/tn_verilogudptable.h"

namespace V = Tn_Verilog;

namespace {

const std::string& textOf(const Tn_VerilogTok& t) { return t.text.str().str(); }

// Nesting or a node tree deeper than the parser allows: ends the parse like
// a syntax error, at the token where it was found.
class NestingException : public antlr::ANTLRException {
public:
    NestingException(const std::string& message, const std::string& file, int line)
        : antlr::ANTLRException(message), file(file), line(line) {}
    ~NestingException() throw() override {}
    std::string file;
    int line;
};

// A syntax error found by a hook: a recognition exception at a token.
antlr::RecognitionException syntaxError(const Tn_VerilogTok& t, const std::string& message) {
    return antlr::RecognitionException(message, t.location.file.c_str(), t.location.line, t.column);
}

struct BinaryOperator {
    V::BinaryOpType type;
    int precedence;
};

// Binary operator codes and precedences (every operator is left
// associative; the code order is the precedence order).
bool binaryOperator(int token, BinaryOperator& op) {
    typedef Tn_VerilogTokenTypes T;
    switch (token) {
    case T::LOGICAL_OR: op = {V::LogicalOr, 1}; return true;
    case T::LOGICAL_AND: op = {V::LogicalAnd, 2}; return true;
    case T::BIT_OR: op = {V::BitwiseOr, 3}; return true;
    case T::CARET: op = {V::BitwiseXor, 4}; return true;
    case T::XNOR: op = {V::BitwiseXnor, 4}; return true;
    case T::AMPERSAND: op = {V::BitwiseAnd, 5}; return true;
    case T::EQUAL: op = {V::Equal, 6}; return true;
    case T::NOT_EQUAL: op = {V::NotEqual, 6}; return true;
    case T::CASE_EQUAL: op = {V::CaseEqual, 6}; return true;
    case T::CASE_NOT_EQUAL: op = {V::CaseNotEqual, 6}; return true;
    case T::LESS_THAN: op = {V::LessThan, 7}; return true;
    case T::LE: op = {V::LessEqual, 7}; return true;
    case T::GT: op = {V::GreaterThan, 7}; return true;
    case T::GE: op = {V::GreaterEqual, 7}; return true;
    case T::SHIFT_LEFT: op = {V::LeftShift, 8}; return true;
    case T::SHIFT_RIGHT: op = {V::RightShift, 8}; return true;
    case T::ASHIFT_LEFT: op = {V::ArithLeftShift, 8}; return true;
    case T::ASHIFT_RIGHT: op = {V::ArithRightShift, 8}; return true;
    case T::PLUS: op = {V::Addition, 9}; return true;
    case T::MINUS: op = {V::Subtraction, 9}; return true;
    case T::STAR: op = {V::Multiplication, 10}; return true;
    case T::DIV: op = {V::Division, 10}; return true;
    case T::MOD: op = {V::Modulus, 10}; return true;
    case T::POWER: op = {V::Exponentiation, 11}; return true;
    default: return false;
    }
}

V::UnaryOpType unaryOperator(int token) {
    typedef Tn_VerilogTokenTypes T;
    switch (token) {
    case T::PLUS: return V::Identity;
    case T::MINUS: return V::Negation;
    case T::LOGICAL_NOT: return V::LogicalNegation;
    case T::TILDE: return V::BitwiseNegation;
    case T::AMPERSAND: return V::ReductionAnd;
    case T::REDUCE_NAND: return V::ReductionNand;
    case T::CARET: return V::ReductionXor;
    case T::XNOR: return V::ReductionXnor;
    case T::BIT_OR: return V::ReductionOr;
    default: return V::ReductionNor;
    }
}

V::NetType netType(int token) {
    typedef Tn_VerilogTokenTypes T;
    switch (token) {
    case T::K_SUPPLY0: return V::Supply0;
    case T::K_SUPPLY1: return V::Supply1;
    case T::K_TRI: return V::Tri;
    case T::K_TRIAND: return V::TriAnd;
    case T::K_TRIOR: return V::TriOr;
    case T::K_TRI0: return V::Tri0;
    case T::K_TRI1: return V::Tri1;
    case T::K_WAND: return V::Wand;
    case T::K_WOR: return V::Wor;
    case T::K_TRIREG: return V::Trireg;
    default: return V::Wire;
    }
}

// The default net type of the directive state as a net type; "none" makes
// no net (the caller reports the undeclared name).
bool defaultNetType(const Port_String& text, V::NetType& type) {
    static const struct {
        const char* text;
        V::NetType type;
    } types[] = {{"wire", V::Wire}, {"tri", V::Tri},     {"tri0", V::Tri0},   {"tri1", V::Tri1},   {"wand", V::Wand},
                 {"triand", V::TriAnd}, {"wor", V::Wor}, {"trior", V::TriOr}, {"trireg", V::Trireg}};
    for (const auto& t : types)
        if (text == t.text) {
            type = t.type;
            return true;
        }
    return false;
}

struct GateInfo {
    V::PrimitiveType type;
    int minimum;  // terminals
    int maximum;  // terminals, -1 for any number
};

GateInfo gateInfo(int token) {
    typedef Tn_VerilogTokenTypes T;
    switch (token) {
    case T::K_AND: return {V::And, 2, -1};
    case T::K_NAND: return {V::Nand, 2, -1};
    case T::K_OR: return {V::Or, 2, -1};
    case T::K_NOR: return {V::Nor, 2, -1};
    case T::K_XOR: return {V::Xor, 2, -1};
    case T::K_XNOR: return {V::Xnor, 2, -1};
    case T::K_BUF: return {V::Buf, 2, -1};
    case T::K_NOT: return {V::Not, 2, -1};
    case T::K_BUFIF0: return {V::Bufif0, 3, 3};
    case T::K_BUFIF1: return {V::Bufif1, 3, 3};
    case T::K_NOTIF0: return {V::Notif0, 3, 3};
    case T::K_NOTIF1: return {V::Notif1, 3, 3};
    case T::K_PULLDOWN: return {V::Pulldown, 1, 1};
    case T::K_PULLUP: return {V::Pullup, 1, 1};
    case T::K_CMOS: return {V::Cmos, 4, 4};
    case T::K_RCMOS: return {V::Rcmos, 4, 4};
    case T::K_NMOS: return {V::Nmos, 3, 3};
    case T::K_PMOS: return {V::Pmos, 3, 3};
    case T::K_RNMOS: return {V::Rnmos, 3, 3};
    case T::K_RPMOS: return {V::Rpmos, 3, 3};
    case T::K_TRAN: return {V::Tran, 2, 2};
    case T::K_RTRAN: return {V::Rtran, 2, 2};
    case T::K_TRANIF0: return {V::Tranif0, 3, 3};
    case T::K_TRANIF1: return {V::Tranif1, 3, 3};
    case T::K_RTRANIF0: return {V::Rtranif0, 3, 3};
    default: return {V::Rtranif1, 3, 3};
    }
}

// The direction of terminal i of a gate: outputs first (all but the last
// of buf and not), inout for the two sides of a switch, inputs else.
V::PortDirectionType terminalDirection(V::PrimitiveType type, int32_t i, bool last) {
    switch (type) {
    case V::Buf:
    case V::Not: return last ? V::InputPort : V::OutputPort;
    case V::Tran:
    case V::Rtran:
    case V::Tranif0:
    case V::Tranif1:
    case V::Rtranif0:
    case V::Rtranif1: return i < 2 ? V::InoutPort : V::InputPort;
    case V::Pullup:
    case V::Pulldown: return V::OutputPort;
    default: return i == 0 ? V::OutputPort : V::InputPort;
    }
}

V::TchkType timingCheckType(int token) {
    typedef Tn_VerilogTokenTypes T;
    switch (token) {
    case T::S_SETUP: return V::Setup;
    case T::S_HOLD: return V::Hold;
    case T::S_SETUPHOLD: return V::SetupHold;
    case T::S_RECOVERY: return V::Recovery;
    case T::S_REMOVAL: return V::Removal;
    case T::S_RECREM: return V::Recrem;
    case T::S_SKEW: return V::Skew;
    case T::S_TIMESKEW: return V::Timeskew;
    case T::S_FULLSKEW: return V::Fullskew;
    case T::S_PERIOD: return V::Period;
    case T::S_WIDTH: return V::Width;
    default: return V::NoChange;
    }
}

// The argument layout of a timing check: its events (1 or 2, the first
// being the data event for $setup), its limits, and how many arguments may
// follow them (the notifier first, except for $width, whose threshold comes
// before it).
struct TimingCheckShape {
    int events;
    int limits;
    int extras;
    bool dataFirst;
};

TimingCheckShape timingCheckShape(V::TchkType type) {
    switch (type) {
    case V::Setup: return {2, 1, 1, true};
    case V::SetupHold:
    case V::Recrem: return {2, 2, 5, false};
    case V::Fullskew: return {2, 2, 3, false};
    case V::Timeskew: return {2, 1, 3, false};
    case V::NoChange: return {2, 2, 1, false};
    case V::Period: return {1, 1, 1, false};
    case V::Width: return {1, 1, 2, false};
    default: return {2, 1, 1, false};
    }
}

bool iequals(const std::string& a, const char* b) {
    size_t n = std::strlen(b);
    if (a.size() != n) return false;
    for (size_t i = 0; i < n; ++i)
        if (std::tolower(static_cast<unsigned char>(a[i])) != b[i]) return false;
    return true;
}

}  // namespace

Tn_VerilogExpressionSyntaxError::Tn_VerilogExpressionSyntaxError(const Port_String& message)
    : Tn_Exception(__FILE__, TN_REVISION, __LINE__), message_(message) {
    setDescription("%s", message.c_str());
}

// ------------------------------------------------------------------- state

struct Tn_VerilogParser::Impl {
    enum ScopeKind { MODULE, UDP, TASK, FUNCTION, BLOCK, GENERATE };

    // What a name stands for in one scope: its declaration, and the port
    // direction declared for it (which may come with a net or variable).
    struct Entry {
        Tn_VerilogDeclaration* declaration = nullptr;
        Tn_VerilogIODeclaration* io = nullptr;
    };
    // Entries by name: open addressing on the interned text's address, so a
    // lookup touches one slot (scopes of big netlists hold millions).
    class EntryMap {
    public:
        Entry* find(const Tn_Symbol& name) {
            if (slots_.empty()) return nullptr;
            const void* key = &name.str();
            for (size_t i = hash(key) & mask_;; i = (i + 1) & mask_) {
                if (slots_[i].key == key) return &slots_[i].entry;
                if (!slots_[i].key) return nullptr;
            }
        }
        Entry& operator[](const Tn_Symbol& name) {
            if ((used_ + 1) * 2 > slots_.size()) grow();
            const void* key = &name.str();
            size_t i = hash(key) & mask_;
            while (slots_[i].key && slots_[i].key != key) i = (i + 1) & mask_;
            if (!slots_[i].key) {
                slots_[i].key = key;
                ++used_;
            }
            return slots_[i].entry;
        }

    private:
        struct Slot {
            const void* key = nullptr;
            Entry entry;
        };
        static size_t hash(const void* key) {
            return static_cast<size_t>((reinterpret_cast<uintptr_t>(key) >> 4) * 0x9E3779B97F4A7C15ull >> 20);
        }
        void grow() {
            std::vector<Slot> old(slots_.empty() ? 16 : slots_.size() * 2);
            old.swap(slots_);
            mask_ = slots_.size() - 1;
            for (const Slot& s : old) {
                if (!s.key) continue;
                size_t i = hash(s.key) & mask_;
                while (slots_[i].key) i = (i + 1) & mask_;
                slots_[i] = s;
            }
        }
        std::vector<Slot> slots_;
        size_t mask_ = 0;
        size_t used_ = 0;
    };
    // The names of one scope; parent is the enclosing scope (null at a
    // module or UDP). A generate region shares its module's names.
    struct Names {
        EntryMap map;
        Names* parent = nullptr;
        Tn_VerilogRegion* region = nullptr;
        const Entry* find(const Tn_Symbol& name) {
            for (Names* n = this; n; n = n->parent)
                if (const Entry* e = n->map.find(name)) return e;
            return nullptr;
        }
    };
    struct Scope {
        ScopeKind kind;
        Tn_VerilogRegion* region;
        Tn_VerilogConcurrentRegion* concurrent;  // null for tasks, functions, blocks
        Names* names;
    };
    struct PortReference {
        Tn_Symbol name;
        Tn_Location location;
        bool declared;
    };
    // A name used where Verilog declares a net implicitly, found undeclared
    // when it was read; decided at the end of the module.
    struct ImplicitNet {
        Names* names;
        Tn_Symbol name;
        Tn_Location location;
        Port_String netType;
    };
    struct Operator {
        Tn_VerilogTok token;
        Tn_VerilogAttributes* attributes;
        BinaryOperator op;
    };
    struct UnaryItem {
        Tn_VerilogTok token;
        Tn_VerilogAttributes* attributes;
    };
    // One link of a chain read by a loop (an else-if chain, a chain of
    // conditional operators): its condition and what it chooses.
    struct ChainItem {
        Tn_VerilogTok token;
        Tn_VerilogAttributes* attributes;
        Tn_VerilogExpression* condition;
        Tn_VerilogNode* value;
    };
    struct NamePart {
        Tn_VerilogTok id;
        size_t selects;  // first select of this component
    };
    struct Select {
        Tn_VerilogTok bracket;
        int kind;  // 0, COLON, PLUS_COLON, MINUS_COLON
        Tn_VerilogExpression* e1;
        Tn_VerilogExpression* e2;
    };
    struct TimingArgument {
        Tn_VerilogTok where;
        int edge;
        unsigned descriptors;
        Tn_VerilogExpression* e;
        Tn_VerilogExpression* condition;
    };
    struct UdpPort {
        Tn_Symbol name;
        Tn_Location location;
    };

    Impl(const Tn_VerilogOptions& o, Tn_VerilogDirectiveState& d, Tn_VerilogTokenStreamFilter& f)
        : options(o), directives(d), filter(f) {}

    const Tn_VerilogOptions& options;
    Tn_VerilogDirectiveState& directives;
    Tn_VerilogTokenStreamFilter& filter;

    // One parse.
    Tn_Library* library = nullptr;
    Tn_StringList* compiled = nullptr;
    std::unordered_map<Port_String, std::unordered_set<Port_String>> parsed;  // by library name
    bool dump = false;
    bool pragmas = false;
    Tn_VerilogNodeFactory* factory = nullptr;
    // Nodes read outside any unit (attributes before a module) go here and
    // are copied into the unit that follows.
    std::unique_ptr<Tn_VerilogDesignUnit> scratch;

    // The unit being read.
    std::unique_ptr<Tn_VerilogDesignUnit> unit;
    Tn_VerilogModule* module = nullptr;
    Tn_VerilogUdpDefn* udp = nullptr;
    std::vector<Scope> scopes;
    std::vector<std::unique_ptr<Names>> namesArena;
    std::vector<PortReference> portReferences;
    std::unordered_map<Tn_Symbol, size_t> portIndex;
    std::vector<ImplicitNet> implicitNets;
    std::vector<Tn_Symbol> constantCalls;
    std::unordered_set<Tn_Symbol> constantCallSet;
    std::vector<std::pair<Tn_VerilogFunction*, Tn_Symbol>> callsInFunctions;
    int functionDepth = 0;

    // UDPs.
    std::vector<UdpPort> udpPorts;
    bool udpHasInitial = false;
    Tn_VerilogUdpTable table;
    Tn_VerilogTok rowStart;

    // Working stacks of the iterative rules (shared by nested rules through
    // the marks they return).
    std::vector<Tn_VerilogRange*> dimensions;
    std::vector<Tn_VerilogParamAssignment*> parameterValues;
    std::vector<Tn_VerilogExpression*> operands;
    std::vector<Operator> operators;
    std::vector<UnaryItem> unaries;
    std::vector<ChainItem> chain;
    std::vector<NamePart> nameParts;
    std::vector<Select> selects;
    std::vector<TimingArgument> timingArguments;
    // Depth of each expression and statement node built, by node id.
    std::vector<uint16_t> depths;

    Tn_VerilogNodeFactory& f() { return *factory; }
    Scope& scope() { return scopes.back(); }
    bool inUnit() const { return !scopes.empty(); }
    V::NetType defaultNet() const {
        V::NetType t = V::Wire;
        defaultNetType(directives.defaultNetType(), t);
        return t;
    }

    uint16_t depthOf(const Tn_VerilogNode* n) const {
        return n && n->id() < depths.size() ? depths[n->id()] : 0;
    }
    // Node ids are numbered per unit, and so are the depths kept by id.
    void useFactory(Tn_VerilogNodeFactory* f) {
        factory = f;
        depths.clear();
    }
};

// ----------------------------------------------------------- construction

Tn_VerilogParser::Tn_VerilogParser(const Tn_VerilogOptions& options, Tn_VerilogDirectiveState& directives,
                                   Tn_VerilogTokenStreamFilter& filter)
    : Tn_VerilogGrammar(filter), d_(new Impl(options, directives, filter)) {}

Tn_VerilogParser::~Tn_VerilogParser() {}

void Tn_VerilogParser::fillLookahead(unsigned int i) {
    Lookahead& a = ahead_;
    if (i > a.mask + 1 || a.slots.empty()) {
        // Grow (a power of two), keeping the tokens ahead in order.
        size_t size = a.slots.empty() ? 8 : a.slots.size();
        while (size < i) size *= 2;
        std::vector<Slot> slots(size);
        for (unsigned int k = 0; k < a.count; ++k) std::swap(slots[k], a.slots[(a.head + k) & a.mask]);
        a.slots.swap(slots);
        a.head = 0;
        a.mask = static_cast<unsigned int>(size - 1);
    }
    // Meta comments are skipped, as the token filter would hide them.
    Tn_VerilogLexer& lexer = d_->filter.lexer();
    Tn_VerilogScannerState& state = lexer.state();
    while (a.count < i) {
        int type;
        do type = lexer.nextType();
        while (type == METACOMMENT);
        Slot& s = a.slots[(a.head + a.count) & a.mask];
        s.type = type;
        // Only names, numbers, strings and strays have a text of their own.
        s.hasText = Tn_VerilogGrammarUtil::ownText(type);
        if (s.hasText) s.text.assign(state.text);
        if (s.file.get() != state.file.get()) s.file = state.file;
        s.line = state.line;
        s.column = state.column;
        ++a.count;
    }
}


void Tn_VerilogParser::parse(const Tn_StringList& files, Tn_Library& library, Tn_StringList* compiled) {
    Impl& d = *d_;
    d.library = &library;
    d.compiled = compiled;
    d.dump = d.options.hasPlusArg("tarn+parser+dump");
    d.pragmas = d.options.hasPlusArg("pls_client");
    verilog2001_ = d.options.verilog2001() != 0;
    resetNesting();
    d.filter.lexer().startFiles(files);
    clearLookahead();
    d.scratch.reset(new Tn_VerilogDesignUnit(library.name(), Port_String(), d.options));
    d.useFactory(&d.scratch->factory());
    try {
        sourceText();
    } catch (const antlr::TokenStreamRecognitionException& e) {
        Tn_VerilogLexer::report(e);
    } catch (const NestingException& e) {
        TN_MSG().issueError("\"%s\" line %d %s\n", e.file.c_str(), e.line, e.getMessage().c_str());
    } catch (const antlr::RecognitionException& e) {
        reportError(e);
    } catch (const antlr::ANTLRException& e) {
        reportError(e.getMessage());
    }
    // A unit cut short by the error is dropped; the ones before it stay.
    clearLookahead();
    d.unit.reset();
    d.scopes.clear();
    d.namesArena.clear();
    d.scratch.reset();
    d.useFactory(nullptr);
    d.parsed.clear();
    d.library = nullptr;
    d.compiled = nullptr;
}

Tn_VerilogExpression* Tn_VerilogParser::parseExpression(const Port_String& text, Tn_VerilogNodeFactory& factory,
                                                       const Tn_VerilogOptions& options,
                                                       Tn_VerilogDirectiveState* directives) {
    Tn_VerilogDirectiveState own;
    Tn_VerilogDirectiveState& state = directives ? *directives : own;
    Tn_VerilogLexer lexer(options, state);
    Tn_VerilogTokenStreamFilter filter(lexer);
    Tn_VerilogParser parser(options, state, filter);
    lexer.startString(text);
    return parser.readExpression(factory);
}

Tn_VerilogExpression* Tn_VerilogParser::readExpression(Tn_VerilogNodeFactory& factory) {
    Impl& d = *d_;
    verilog2001_ = d.options.verilog2001() != 0;
    resetNesting();
    d.useFactory(&factory);
    std::string message;
    try {
        return singleExpression();
    } catch (const antlr::TokenStreamRecognitionException& e) {
        message = e.getMessage();
    } catch (const NestingException& e) {
        message = e.getMessage();
    } catch (const antlr::ANTLRException& e) {
        message = e.getMessage();
    }
    throw Tn_VerilogExpressionSyntaxError(Port_String(message.c_str()));
}

// ---------------------------------------------------------------- reports

void Tn_VerilogParser::reportError(const antlr::RecognitionException& ex) {
    TN_MSG().issueError("\"%s\" line %d %s\n", ex.getFilename().c_str(), ex.getLine(), ex.getMessage().c_str());
}

namespace {

// The location prefix of the current lookahead token ("" when even that
// cannot be read).
std::string lookaheadPrefixFile(antlr::Parser& p) {
    try {
        TokenRef t = p.LT(1);
        if (t) return t->getFilename();
    } catch (const antlr::ANTLRException&) {
    }
    return std::string();
}

std::string lookaheadPrefix(antlr::Parser& p) {
    try {
        TokenRef t = p.LT(1);
        if (t) return Tn_Location(Tn_Symbol(t->getFilename().c_str()), t->getLine()).text().c_str();
    } catch (const antlr::ANTLRException&) {
    }
    return std::string();
}

}  // namespace

std::string Tn_VerilogParser::getFilename() const {
    // Errors are located in the file of the token they are about.
    return lookaheadPrefixFile(const_cast<Tn_VerilogParser&>(*this));
}

void Tn_VerilogParser::reportError(const std::string& s) {
    TN_MSG().issueError("%s %s\n", lookaheadPrefix(*this).c_str(), s.c_str());
}

void Tn_VerilogParser::reportWarning(const std::string& s) {
    TN_MSG().issueWarning("%s %s\n", lookaheadPrefix(*this).c_str(), s.c_str());
}

void Tn_VerilogParser::nestingExceeded() {
    TokenRef t = LT(1);
    throw NestingException(
        "Constructs nested more than " + std::to_string(kMaxNesting) + " levels deep", t->getFilename(), t->getLine());
}

bool Tn_VerilogParser::declarationAhead(bool ports) {
    unsigned i = 1;
    while (LA(i) == ATTR_OPEN) {
        do {
            ++i;
            if (LA(i) == antlr::Token::EOF_TYPE) return false;
        } while (LA(i) != ATTR_CLOSE);
        ++i;
    }
    return isBlockDeclaration(LA(i), ports);
}

void Tn_VerilogParser::skipConfiguration(const Tn_VerilogTok&) {
    // Configurations are read past, not built: nothing in Tarn uses them.
    while (LA(1) != K_ENDCONFIG) {
        if (LA(1) == antlr::Token::EOF_TYPE)
            throw antlr::MismatchedTokenException(getTokenNames(), getNumTokens(), LT(1), K_ENDCONFIG, false,
                                                  LT(1)->getFilename());
        consume();
    }
    consume();
}

// ------------------------------------------------------------- units, names

namespace {

typedef Tn_VerilogParser::Impl Impl;

void error(const Tn_Location& l, const char* fmt, const char* a = "", const char* b = "") {
    TN_MSG().issueError(fmt, l.text().c_str(), a, b);
}

void warning(const Tn_Location& l, const char* fmt, const char* a = "") {
    TN_MSG().issueWarning(fmt, l.text().c_str(), a);
}

// The node, with its depth: one more than its deepest child. Beyond
// kMaxTreeDepth the parse ends.
template <class T>
T* deep(Impl& d, T* node, std::initializer_list<const Tn_VerilogNode*> children) {
    unsigned depth = 0;
    for (const Tn_VerilogNode* c : children) depth = std::max<unsigned>(depth, d.depthOf(c));
    ++depth;
    if (depth > static_cast<unsigned>(Tn_VerilogParser::kMaxTreeDepth)) {
        const Tn_Location& l = node->location();
        throw NestingException("Expression or statement more than " + std::to_string(Tn_VerilogParser::kMaxTreeDepth) +
                                   " levels deep",
                               l.file.c_str(), l.line);
    }
    const uint32_t id = node->id();
    if (id >= d.depths.size()) d.depths.resize(id + 1 + d.depths.size() / 2, 0);
    d.depths[id] = static_cast<uint16_t>(depth);
    return node;
}

// Raises the depth of a list node as an item joins it.
void deepen(Impl& d, Tn_VerilogNode* list, const Tn_VerilogNode* item) {
    if (d.depthOf(item) + 1u > d.depthOf(list)) deep(d, list, {item});
}

void pushScope(Impl& d, Impl::ScopeKind kind, Tn_VerilogRegion* region, Tn_VerilogConcurrentRegion* concurrent,
               bool ownNames) {
    Impl::Names* names;
    if (ownNames) {
        d.namesArena.emplace_back(new Impl::Names());
        names = d.namesArena.back().get();
        names->parent = d.scopes.empty() ? nullptr : d.scope().names;
        names->region = region;
    } else {
        names = d.scope().names;
    }
    d.scopes.push_back(Impl::Scope{kind, region, concurrent, names});
}

// Enters a declaration in the current scope; false (after the error) when
// the name is declared there already.
bool declareName(Impl& d, Tn_VerilogDeclaration* decl, const Tn_Symbol& name, const Tn_Location& loc) {
    Impl::Entry& e = d.scope().names->map[name];
    if (e.declaration) {
        error(loc, "%sIllegal redeclaration of '%s'\n", name.c_str());
        return false;
    }
    e.declaration = decl;
    return true;
}

template <class T>
T* named(T* decl, const Tn_Symbol& name, Tn_VerilogScope* parent) {
    decl->Name = name;
    decl->Parent = parent;
    return decl;
}

// Names a port expression or connection refers to: simple names, also
// inside selects and concatenations.
void namesIn(Tn_VerilogNode* e, std::vector<Tn_VerilogSimpleName*>& out) {
    if (!e) return;
    if (Tn_VerilogSimpleName* n = Tn_VerilogNode::cast<Tn_VerilogSimpleName>(e)) {
        out.push_back(n);
    } else if (Tn_VerilogConcatOp* c = Tn_VerilogNode::cast<Tn_VerilogConcatOp>(e)) {
        for (Tn_VerilogExpression* o : c->Operand) namesIn(o, out);
    } else if (Tn_VerilogBitSelect* b = Tn_VerilogNode::cast<Tn_VerilogBitSelect>(e)) {
        namesIn(b->Operand, out);
    } else if (Tn_VerilogPartSelect* p = Tn_VerilogNode::cast<Tn_VerilogPartSelect>(e)) {
        namesIn(p->Operand, out);
    }
}

// Where Verilog declares a net implicitly (a connection, a terminal, the
// target of a continuous assignment): a simple name, alone or in a
// concatenation, not declared yet, is remembered for the end of the module.
void implicitNets(Impl& d, Tn_VerilogExpression* e) {
    if (!d.inUnit() || !e) return;
    if (Tn_VerilogSimpleName* n = Tn_VerilogNode::cast<Tn_VerilogSimpleName>(e)) {
        if (!d.scope().names->find(n->Name))
            d.implicitNets.push_back(Impl::ImplicitNet{d.scope().names, n->Name, n->location(), d.directives.defaultNetType()});
    } else if (Tn_VerilogConcatOp* c = Tn_VerilogNode::cast<Tn_VerilogConcatOp>(e)) {
        for (Tn_VerilogExpression* o : c->Operand) implicitNets(d, o);
    }
}

// The type definition of a declaration, made once for all its names.
Tn_VerilogTypeDef* typeDefOf(Impl& d, Tn_VerilogDeclSpec& s) {
    if (s.typeDef) return s.typeDef;
    const Tn_Location loc = (s.first).location;
    switch (s.kind) {
    case Tn_VerilogDeclSpec::NET: {
        Tn_VerilogNet* n = d.f().createNet(loc);
        n->NetType = s.netType ? netType(s.netType) : d.defaultNet();
        n->Grouping.raw() = s.grouping;
        n->ChargeStrength.raw() = s.chargeStrength < 0 && n->NetType == V::Trireg ? 1 : s.chargeStrength;
        n->SignedFlag = s.isSigned;
        n->Range = s.range;
        n->Delay = s.delay;
        s.typeDef = n;
        break;
    }
    case Tn_VerilogDeclSpec::INTEGER: s.typeDef = d.f().createIntegerVar(loc); break;
    case Tn_VerilogDeclSpec::TIME: s.typeDef = d.f().createTimeVar(loc); break;
    case Tn_VerilogDeclSpec::REAL:
    case Tn_VerilogDeclSpec::REALTIME: s.typeDef = d.f().createRealVar(loc); break;
    case Tn_VerilogDeclSpec::EVENT: s.typeDef = d.f().createEvent(loc); break;
    default: {
        Tn_VerilogReg* r = d.f().createReg(loc);
        r->SignedFlag = s.isSigned;
        r->Range = s.range;
        s.typeDef = r;
        break;
    }
    }
    return s.typeDef;
}

// A scalar or array variable of the current scope (nets, regs, integers,
// events...), with the unpacked dimensions collected since dims.
Tn_VerilogVariable* declareObject(Impl& d, Tn_VerilogDeclSpec& s, const Tn_VerilogTok& id, size_t dims) {
    const Tn_Symbol name = id.text;
    const Tn_Location loc = (id).location;
    Tn_VerilogTypeDef* type = typeDefOf(d, s);
    Tn_VerilogVariable* v;
    if (dims < d.dimensions.size()) {
        Tn_VerilogArrayVar* a = d.f().createArrayVar(loc);
        for (size_t i = dims; i < d.dimensions.size(); ++i) a->Range.push_back(d.dimensions[i]);
        d.dimensions.resize(dims);
        v = a;
    } else {
        v = d.f().createScalarVar(loc);
    }
    named(v, name, d.scope().region);
    v->TypeDef = type;
    v->Attributes = s.attributes;
    if (declareName(d, v, name, loc)) d.scope().region->Variable.insert(name, v);
    return v;
}

V::PortDirectionType directionOf(const Tn_VerilogIODeclaration* io) {
    if (io->isA(V::Input)) return V::InputPort;
    if (io->isA(V::Output)) return V::OutputPort;
    return V::InoutPort;
}

Tn_VerilogIODeclaration* makeIO(Impl& d, Tn_VerilogDeclSpec& s, const Tn_VerilogTok& id, bool tf) {
    const Tn_Symbol name = id.text;
    const Tn_Location loc = (id).location;
    Tn_VerilogIODeclaration* io;
    if (s.direction == Tn_VerilogTokenTypes::K_INPUT)
        io = d.f().createInput(loc);
    else if (s.direction == Tn_VerilogTokenTypes::K_OUTPUT)
        io = d.f().createOutput(loc);
    else
        io = d.f().createInout(loc);
    named(io, name, d.scope().region);
    io->TfFlag = tf;
    io->SignedFlag = s.isSigned;
    io->Range = s.range;
    io->Attributes = s.attributes;
    Impl::Entry& e = d.scope().names->map[name];
    if (e.io) {
        error(loc, "%sIllegal redeclaration of '%s'\n", name.c_str());
    } else {
        e.io = io;
        d.scope().region->IODeclaration.push_back(io);
    }
    return io;
}

}  // namespace

namespace {

void checkUnitName(Impl& d, const Tn_Symbol& name, const Tn_Location& loc) {
    auto it = d.parsed.find(d.library->name());
    if (it != d.parsed.end() && it->second.count(name)) error(loc, "%sIllegal redeclaration of '%s'\n", name.c_str());
}

void startUnit(Impl& d, const Tn_Symbol& name, int32_t kind) {
    d.unit.reset(new Tn_VerilogDesignUnit(d.library->name(), name, d.options, kind));
    d.useFactory(&d.unit->factory());
    d.unit->setRoot(d.f().createRoot());
    d.scopes.clear();
    d.namesArena.clear();
    d.portReferences.clear();
    d.portIndex.clear();
    d.implicitNets.clear();
    d.constantCalls.clear();
    d.constantCallSet.clear();
    d.callsInFunctions.clear();
    d.functionDepth = 0;
    d.udpPorts.clear();
    d.udpHasInitial = false;
}

// Attributes read before a unit began (in the scratch unit), copied into it.
Tn_VerilogAttributes* adopt(Impl& d, Tn_VerilogAttributes* a) {
    if (!a) return nullptr;
    Tn_VerilogAttributes* c = static_cast<Tn_VerilogAttributes*>(a->clone(d.f()));
    for (Tn_VerilogAttribute* at : c->Attribute) at->OnDefinitionFlag = true;
    d.scratch.reset(new Tn_VerilogDesignUnit(d.library->name(), Port_String(), d.options));
    return c;
}

void finishUnit(Impl& d, const char* status) {
    const Port_String name = d.unit->name();
    d.scopes.clear();
    d.namesArena.clear();
    TN_MSG().issueStatus(status, name.c_str());
    if (d.dump) {
        Tn_OFileStream out(Port::File::getCout(), false);
        d.unit->print(out);
    }
    d.library->add(std::move(d.unit));
    if (d.parsed[d.library->name()].insert(name).second && d.compiled) d.compiled->push_back(name);
    d.module = nullptr;
    d.udp = nullptr;
    d.useFactory(&d.scratch->factory());
}

// Attribute pragma comments (+pls_client) for the module: each names an
// attribute, an object of the module and a value.
void applyPragma(Impl& d, const std::string& text) {
    std::vector<std::pair<size_t, size_t>> words;  // begin, end
    for (size_t i = 0; i < text.size();) {
        while (i < text.size() && (text[i] == ' ' || text[i] == '\t')) ++i;
        size_t b = i;
        while (i < text.size() && text[i] != ' ' && text[i] != '\t') ++i;
        if (i > b) words.emplace_back(b, i);
    }
    auto word = [&](size_t k) { return text.substr(words[k].first, words[k].second - words[k].first); };
    std::string lowered(text);
    for (char& c : lowered) c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
    size_t k = 0;
    while (k < words.size() && !iequals(word(k), "attribute")) ++k;
    std::string object, attribute;
    size_t valueFrom;
    if (lowered.find("exemplar") != std::string::npos) {
        if (k + 2 >= words.size()) return;
        object = word(k + 1);
        attribute = word(k + 2);
        valueFrom = words[k + 2].second;
    } else {
        if (k + 1 >= words.size()) return;
        attribute = word(k + 1);
        size_t o = k + 2;
        if (o < words.size() && word(o) == "of") ++o;
        if (o >= words.size()) return;
        object = word(o);
        valueFrom = o + 1 < words.size() && word(o + 1) == "is" ? words[o + 1].second : words[o].second;
    }
    std::string value = text.substr(valueFrom);
    auto trim = [&](const char* set) {
        size_t b = value.find_first_not_of(set), e = value.find_last_not_of(set);
        value = b == std::string::npos ? std::string() : value.substr(b, e - b + 1);
    };
    trim(";");
    trim(" \t\r\n\f");
    trim("\"");

    Tn_VerilogModule* m = d.module;
    const Tn_Symbol name(object.c_str());
    Tn_VerilogAttributedNode* target = nullptr;
    if (const Impl::Entry* e = d.scopes.front().names->map.find(name))
        target = e->declaration ? static_cast<Tn_VerilogAttributedNode*>(e->declaration) : e->io;
    else if (name == m->Name)
        target = m;
    if (!target) return;
    const Tn_Location& loc = m->location();
    if (!target->Attributes) target->Attributes = d.f().createAttributes(loc);
    Tn_VerilogAttribute* a = d.f().createAttribute(loc);
    a->Name = Tn_Symbol(attribute.c_str());
    if (value.empty()) {
        Tn_VerilogIntegerConst* one = d.f().createIntegerConst(loc);
        one->Value = 1;
        a->Expr = one;
    } else {
        Tn_VerilogVectorConst* s = d.f().createVectorConst(loc);
        s->Value = Tn_VerilogVector(V::String, false, 0, value.data(), value.size());
        a->Expr = s;
    }
    target->Attributes->Attribute.push_back(a);
}

void applyPragmas(Impl& d) {
    if (!d.pragmas || !d.module) return;
    std::vector<Port_String>& texts = d.filter.lexer().pragmaComments();
    for (const Port_String& t : texts) applyPragma(d, t.str());
    texts.clear();
}

// A port with a direction but no net or variable gets a net of the default
// net type (a wire when the default is none); the direction declaration
// takes the type of its net or variable.
void completePorts(Impl& d, Tn_VerilogModule* m) {
    Impl::Names* names = d.scopes.front().names;
    for (Tn_VerilogIODeclaration* io : m->IODeclaration) {
        Impl::Entry& e = names->map[io->Name];
        Tn_VerilogVariable* v = Tn_VerilogNode::cast<Tn_VerilogVariable>(e.declaration);
        if (!v && !e.declaration) {
            Tn_VerilogNet* net = d.f().createNet(io->location());
            net->NetType = d.defaultNet();
            net->Grouping.raw() = -1;
            net->ChargeStrength.raw() = net->NetType == V::Trireg ? 1 : -1;
            net->SignedFlag = io->SignedFlag;
            net->Range = io->Range;
            v = named(d.f().createScalarVar(io->location()), io->Name, m);
            v->TypeDef = net;
            m->Variable.insert(io->Name, v);
            e.declaration = v;
        }
        if (v) io->TypeDef = v->TypeDef;
    }
}

void declareImplicitNets(Impl& d) {
    for (const Impl::ImplicitNet& n : d.implicitNets) {
        if (n.names->find(n.name)) continue;  // declared after its use, or made for an earlier use
        V::NetType type;
        if (!defaultNetType(n.netType, type)) {
            error(n.location, "%s'%s' has not been declared\n", n.name.c_str());
            n.names->map[n.name];  // reported once
            continue;
        }
        Tn_VerilogNet* net = d.f().createNet(n.location);
        net->NetType = type;
        net->Grouping.raw() = -1;
        net->ChargeStrength.raw() = type == V::Trireg ? 1 : -1;
        Tn_VerilogScalarVar* v = named(d.f().createScalarVar(n.location), n.name, n.names->region);
        v->TypeDef = net;
        n.names->region->Variable.insert(n.name, v);
        n.names->map[n.name].declaration = v;
    }
}

void portDirections(Impl& d, Tn_VerilogModule* m) {
    Impl::Names* names = d.scopes.front().names;
    std::vector<Tn_VerilogSimpleName*> refs;
    for (Tn_VerilogPort* p : m->Port) {
        refs.clear();
        namesIn(p->LoConn, refs);
        int direction = -1;
        for (Tn_VerilogSimpleName* n : refs) {
            const Impl::Entry* e = names->map.find(n->Name);
            if (!e || !e->io) continue;
            const int here = directionOf(e->io);
            direction = direction < 0 || direction == here ? here : V::MixedIOPort;
        }
        if (direction >= 0) p->Direction = static_cast<V::PortDirectionType>(direction);
    }
}

// Functions called from constant expressions, and the functions those call
// in turn, are constant functions; their names are kept on the module.
void constantFunctions(Impl& d, Tn_VerilogModule* m) {
    if (d.constantCalls.empty()) return;
    std::unordered_map<Tn_Symbol, Tn_VerilogFunction*> functions;
    for (Tn_VerilogFunction* fn : m->Function) functions.emplace(fn->Name, fn);
    std::unordered_multimap<Tn_VerilogFunction*, Tn_Symbol> calls(d.callsInFunctions.begin(), d.callsInFunctions.end());
    std::vector<Tn_Symbol>& names = d.constantCalls;
    for (size_t i = 0; i < names.size(); ++i) {
        auto fn = functions.find(names[i]);
        if (fn == functions.end() || fn->second->ConstantFlag) continue;
        fn->second->ConstantFlag = true;
        auto range = calls.equal_range(fn->second);
        for (auto c = range.first; c != range.second; ++c)
            if (d.constantCallSet.insert(c->second).second) names.push_back(c->second);
    }
    for (const Tn_Symbol& name : names) {
        Tn_VerilogSimpleName* n = d.f().createSimpleName(m->location());
        n->Name = name;
        m->ConstFuncCall.push_back(n);
    }
}

}  // namespace

void Tn_VerilogParser::beginModule(const Tn_VerilogTok& keyword, const Tn_VerilogTok& id, Tn_VerilogAttributes* a) {
    Impl& d = *d_;
    const Tn_Symbol name = id.text;
    const Tn_Location loc = (keyword).location;
    checkUnitName(d, name, (id).location);
    startUnit(d, name, Tn_LibraryUnit::VERILOG_DESIGN_UNIT);
    Tn_VerilogModule* m = named(d.f().createModule(loc), name, d.unit->root());
    m->DefName = name;
    m->DefLocation = loc;
    m->Attributes = adopt(d, a);
    m->CellFlag = d.directives.cellDefine();
    m->HasTimescale = d.directives.timescaleGiven();
    m->TimeUnit = d.directives.timeUnit();
    m->TimePrecision = d.directives.timePrecision();
    const Port_String& drive = d.directives.unconnectedDrive();
    m->UnconnectedDrive = drive == "pull0"   ? V::UnconnectedPull0
                          : drive == "pull1" ? V::UnconnectedPull1
                                             : V::UnconnectedNone;
    d.unit->setNode(m);
    d.module = m;
    pushScope(d, Impl::MODULE, m, m, true);
    applyPragmas(d);
}

void Tn_VerilogParser::endModule(const Tn_VerilogTok&) {
    Impl& d = *d_;
    Tn_VerilogModule* m = d.module;
    for (const Impl::PortReference& p : d.portReferences)
        if (!p.declared)
            error(p.location, "%sPort reference '%s' was not declared as input, inout or output\n", p.name.c_str());
    completePorts(d, m);
    declareImplicitNets(d);
    portDirections(d, m);
    constantFunctions(d, m);
    applyPragmas(d);
    m->Weight = static_cast<int32_t>(d.unit->nodes().size());
    finishUnit(d, "Module <%s> compiled\n");
}

void Tn_VerilogParser::modulePort(const Tn_VerilogTok& where, const Tn_VerilogTok& name, Tn_VerilogExpression* e) {
    Impl& d = *d_;
    Tn_VerilogModule* m = d.module;
    Tn_Location loc = name ? (name).location : e ? e->location() : tok().location;
    Tn_VerilogPort* p = d.f().createPort(loc);
    p->Parent = m;
    if (name)
        p->EffectiveName = name.text;
    else if (Tn_VerilogSimpleName* n = Tn_VerilogNode::cast<Tn_VerilogSimpleName>(e))
        p->EffectiveName = n->Name;
    p->Name = p->EffectiveName;
    p->Index = static_cast<int32_t>(m->Port.size());
    p->LoConn = e;
    p->NamedPortConnectionFlag = bool(name);
    m->Port.push_back(p);
    (void)where;
}

Tn_VerilogExpression* Tn_VerilogParser::portReferenceName(const Tn_VerilogTok& id) {
    Impl& d = *d_;
    Tn_VerilogExpression* n = simpleName(id);
    const Tn_Symbol name = id.text;
    if (d.portIndex.emplace(name, d.portReferences.size()).second)
        d.portReferences.push_back(Impl::PortReference{name, (id).location, false});
    return n;
}

void Tn_VerilogParser::udpBegin(const Tn_VerilogTok& keyword, const Tn_VerilogTok& id, Tn_VerilogAttributes* a) {
    Impl& d = *d_;
    const Tn_Symbol name = id.text;
    const Tn_Location loc = (keyword).location;
    checkUnitName(d, name, (id).location);
    startUnit(d, name, Tn_LibraryUnit::VERILOG_DESIGN_UNIT_2);
    Tn_VerilogUdpDefn* u = named(d.f().createUdpDefn(loc), name, d.unit->root());
    u->DefName = name;
    u->DefLocation = loc;
    u->PrimitiveType = V::Comb;
    u->Attributes = adopt(d, a);
    d.unit->setNode(u);
    d.udp = u;
    pushScope(d, Impl::UDP, u, nullptr, true);
}

void Tn_VerilogParser::udpPort(const Tn_VerilogTok& id) {
    Impl& d = *d_;
    d.udpPorts.push_back(Impl::UdpPort{id.text, (id).location});
}

namespace {

// The initial value of a sequential UDP's output (from an initial statement
// or from the output's declaration): a single bit.
void udpInitialValue(Impl& d, const Tn_Location& loc, const Tn_Symbol& target, const Tn_Location& targetLoc,
                     Tn_VerilogExpression* e) {
    if (d.udpHasInitial) {
        error(loc, "%sUDP output already has initial value.\n");
        return;
    }
    d.udpHasInitial = true;
    bool number = false, single = false;
    if (Tn_VerilogIntegerConst* c = Tn_VerilogNode::cast<Tn_VerilogIntegerConst>(e)) {
        number = true;
        single = c->Value == 0 || c->Value == 1;
    } else if (Tn_VerilogVectorConst* v = Tn_VerilogNode::cast<Tn_VerilogVectorConst>(e)) {
        number = v->Value.base() != V::String;
        single = number && !v->Value.isUnsized() && v->Value.width() == 1;
    }
    if (!number) {
        warning(loc, "%sNo initializer found.  Defaulting to X.\n");
        Tn_VerilogVectorConst* x = d.f().createVectorConst(loc);
        x->Value = Tn_VerilogVector(V::Binary, false, 1, "x", 1);
        e = x;
    } else if (!single) {
        error(loc, "%sUDP must be initialized to a single bit value.\n");
    }
    Tn_VerilogSimpleName* n = d.f().createSimpleName(targetLoc);
    n->Name = target;
    Tn_VerilogBlockingAssign* assign = d.f().createBlockingAssign(loc);
    assign->Target = n;
    assign->Source = e;
    Tn_VerilogInitial* initial = d.f().createInitial(loc);
    initial->Statement = assign;
    d.udp->Initial = initial;
}

}  // namespace

void Tn_VerilogParser::udpInitialStatement(const Tn_VerilogTok& keyword, const Tn_VerilogTok& id, Tn_VerilogExpression* e) {
    Impl& d = *d_;
    udpInitialValue(d, (keyword).location, id.text, (id).location, e);
}

void Tn_VerilogParser::udpTableBegin(const Tn_VerilogTok&) {
    Impl& d = *d_;
    Impl::Names* names = d.scope().names;
    for (size_t i = 0; i < d.udpPorts.size(); ++i) {
        const Impl::UdpPort& p = d.udpPorts[i];
        const Impl::Entry* e = names->map.find(p.name);
        Tn_VerilogIODeclaration* io = e ? e->io : nullptr;
        if (!io)
            error(p.location, "%sUDP identifier '%s' must be declared with a port mode.\n", p.name.c_str());
        else if (i == 0 && !io->isA(V::Output))
            error(p.location, "%sFirst UDP port, '%s', must be an output.\n", p.name.c_str());
        else if (i > 0 && !io->isA(V::Input))
            error(p.location, "%sUDP port '%s' must be an input.\n", p.name.c_str());
    }
    bool sequential = false;
    if (!d.udpPorts.empty()) {
        if (const Impl::Entry* e = names->map.find(d.udpPorts.front().name))
            if (Tn_VerilogVariable* v = Tn_VerilogNode::cast<Tn_VerilogVariable>(e->declaration))
                sequential = v->TypeDef && v->TypeDef->isA(V::Reg);
    }
    d.udp->PrimitiveType = sequential ? V::Seq : V::Comb;
    d.table.reset(d.udpPorts.empty() ? 0 : d.udpPorts.size() - 1, sequential);
}

bool Tn_VerilogParser::udpSequential() { return d_->udp && d_->udp->PrimitiveType == V::Seq; }

void Tn_VerilogParser::udpRowBegin(const Tn_VerilogTok& first) {
    d_->rowStart = first;
    d_->table.beginRow();
}

void Tn_VerilogParser::udpRowSymbol(const Tn_VerilogTok& symbol) { d_->table.symbol(textOf(symbol)[0]); }
void Tn_VerilogParser::udpRowEdgeOpen(const Tn_VerilogTok&) { d_->table.openEdge(); }
void Tn_VerilogParser::udpRowEdgeClose(const Tn_VerilogTok&) { d_->table.closeEdge(); }
void Tn_VerilogParser::udpRowColon(const Tn_VerilogTok&) { d_->table.colon(); }

void Tn_VerilogParser::udpRowEnd(const Tn_VerilogTok& semi) {
    Impl& d = *d_;
    std::string text;
    bool edge = false;
    long conflict = -1;
    const Tn_VerilogUdpTable::Problem problem = d.table.endRow(text, edge, conflict);
    const bool sequential = udpSequential();
    if (sequential && std::count(text.begin(), text.end(), ':') != 2)
        throw syntaxError(semi, "expecting \":\", found ';'");
    const Tn_Location loc = (d.rowStart).location;
    switch (problem) {
    case Tn_VerilogUdpTable::COLUMN_COUNT:
        error(loc, "%sNumber of input columns in table must match number of inputs.\n");
        break;
    case Tn_VerilogUdpTable::MULTIPLE_EDGES: error(loc, "%sMultiple edge symbols not allowed in single table row.\n"); break;
    case Tn_VerilogUdpTable::INVALID_EDGE: error(loc, "%sInvalid edge specification.\n"); break;
    case Tn_VerilogUdpTable::EDGE_IN_COMBINATIONAL:
        error(loc, "%sEdge symbols are not allowed in a combinational UDP table.\n");
        break;
    case Tn_VerilogUdpTable::NO_CHANGE_IN_COMBINATIONAL:
        error(loc, "%sOutput '-' is not allowed in a combinational UDP table.\n");
        break;
    case Tn_VerilogUdpTable::OK: break;
    }
    if (conflict >= 0 && static_cast<size_t>(conflict) < d.udp->TableEntry.size())
        error(loc, "%sUDP table entry conflicts with earlier entry at %s.\n",
              d.udp->TableEntry[static_cast<size_t>(conflict)]->location().text().c_str());
    Tn_VerilogTableEntry* entry = d.f().createTableEntry(loc);
    entry->TableRow = Tn_Symbol(text.data(), text.size());
    entry->RowType = !sequential ? V::CombinationalRow : edge ? V::EdgeRow : V::LevelRow;
    d.udp->TableEntry.push_back(entry);
}

void Tn_VerilogParser::udpEnd(const Tn_VerilogTok&) { finishUnit(*d_, "UDP <%s> compiled\n"); }

// ----------------------------------------------------------- declarations

Tn_VerilogAttributes* Tn_VerilogParser::attributesBegin(const Tn_VerilogTok& open) {
    return d_->f().createAttributes((open).location);
}

void Tn_VerilogParser::attributeAdd(Tn_VerilogAttributes* a, const Tn_VerilogTok& id, Tn_VerilogExpression* e) {
    Impl& d = *d_;
    Tn_VerilogAttribute* at = d.f().createAttribute((id).location);
    at->Name = id.text;
    at->Expr = e;
    a->Attribute.push_back(at);
}

namespace {

// An initial value written in a variable declaration: kept on the variable
// and, in a module, performed by an initial process.
void variableInit(Impl& d, Tn_VerilogVariable* v, Tn_VerilogExpression* e) {
    Tn_VerilogScalarVar* s = Tn_VerilogNode::cast<Tn_VerilogScalarVar>(v);
    if (!s) return;
    s->InitExpr = e;
    Tn_VerilogConcurrentRegion* region = d.scope().concurrent;
    if (!region) return;
    Tn_VerilogSimpleName* n = d.f().createSimpleName(v->location());
    n->Name = v->Name;
    Tn_VerilogBlockingAssign* assign = d.f().createBlockingAssign(v->location());
    assign->Target = n;
    assign->Source = static_cast<Tn_VerilogExpression*>(e->clone(d.f()));
    Tn_VerilogInitial* initial = d.f().createInitial(v->location());
    initial->Statement = assign;
    region->Process.push_back(initial);
}

bool inUdpPortList(const Impl& d, const Tn_Symbol& name) {
    for (const Impl::UdpPort& p : d.udpPorts)
        if (p.name == name) return true;
    return false;
}

}  // namespace

void Tn_VerilogParser::declarePort(Tn_VerilogDeclSpec& s, const Tn_VerilogTok& id, Tn_VerilogExpression* init) {
    Impl& d = *d_;
    const Tn_Symbol name = id.text;
    switch (d.scope().kind) {
    case Impl::UDP:
        if (!inUdpPortList(d, name))
            error((id).location, "%sUDP declaration '%s' does not appear in the port list.\n", name.c_str());
        makeIO(d, s, id, false);
        if (s.kind == Tn_VerilogDeclSpec::REG) declareObject(d, s, id, d.dimensions.size());
        if (init) udpInitialValue(d, (id).location, name, (id).location, init);
        break;
    case Impl::TASK:
    case Impl::FUNCTION: makeIO(d, s, id, true)->TypeDef = typeDefOf(d, s); break;
    default: {
        if (!s.ansi) {
            auto it = d.portIndex.find(name);
            if (it == d.portIndex.end())
                error((id).location, "%sSignal '%s' is not referenced in the module port list\n", name.c_str());
            else
                d.portReferences[it->second].declared = true;
        }
        Tn_VerilogIODeclaration* io = makeIO(d, s, id, false);
        if (s.ansi && s.kind == Tn_VerilogDeclSpec::NONE) s.kind = Tn_VerilogDeclSpec::NET;
        if (s.kind != Tn_VerilogDeclSpec::NONE) {
            Tn_VerilogVariable* v = declareObject(d, s, id, d.dimensions.size());
            io->TypeDef = v->TypeDef;
            if (init) variableInit(d, v, init);
        }
        if (s.ansi) {
            Tn_VerilogPort* p = named(d.f().createPort((id).location), name, d.module);
            p->EffectiveName = name;
            p->Index = static_cast<int32_t>(d.module->Port.size());
            p->Direction = directionOf(io);
            p->LoConn = simpleName(id);
            d.module->Port.push_back(p);
        }
        break;
    }
    }
}

size_t Tn_VerilogParser::dimensionsBegin() { return d_->dimensions.size(); }

void Tn_VerilogParser::dimensionAdd(Tn_VerilogRange* r) { d_->dimensions.push_back(r); }

void Tn_VerilogParser::declareNet(Tn_VerilogDeclSpec& s, const Tn_VerilogTok& id, size_t dims, Tn_VerilogExpression* e) {
    Impl& d = *d_;
    declareObject(d, s, id, dims);
    if (!e) return;
    Tn_VerilogContAssign* a = d.f().createContAssign((id).location);
    a->Target = simpleName(id);
    a->Source = e;
    a->DriveStrength = s.strength;
    d.scope().concurrent->ContAssign.push_back(a);
}

void Tn_VerilogParser::declareVariable(Tn_VerilogDeclSpec& s, const Tn_VerilogTok& id, size_t dims,
                                       Tn_VerilogExpression* e) {
    Impl& d = *d_;
    if (d.scope().kind == Impl::UDP && !inUdpPortList(d, id.text))
        error((id).location, "%sUDP declaration '%s' does not appear in the port list.\n", id.text.c_str());
    Tn_VerilogVariable* v = declareObject(d, s, id, dims);
    if (e) variableInit(d, v, e);
}

void Tn_VerilogParser::declareGenvar(const Tn_VerilogTok& id, Tn_VerilogAttributes* a) {
    Impl& d = *d_;
    const Tn_Symbol name = id.text;
    Tn_VerilogGenVar* g = named(d.f().createGenVar((id).location), name, d.scope().region);
    g->Attributes = a;
    if (declareName(d, g, name, (id).location)) d.scope().concurrent->GenVar.push_back(g);
}

void Tn_VerilogParser::declareParameter(Tn_VerilogParamSpec& s, const Tn_VerilogTok& id, Tn_VerilogExpression* e) {
    Impl& d = *d_;
    const Tn_Symbol name = id.text;
    const Tn_Location loc = (id).location;
    if (s.specparam) {
        Tn_VerilogSpecParam* p = named(d.f().createSpecParam(loc), name, d.scope().region);
        p->DeclType = s.range ? V::UnsignedParam : V::NoTypeNoRangeParam;
        p->Range = s.range;
        p->Expr = e;
        p->Attributes = s.attributes;
        if (declareName(d, p, name, loc)) d.module->SpecParam.push_back(p);
        return;
    }
    if (!v2001() && s.range) {
        warning((s.first ? s.first : id).location, "%sRange specification in parameter declaration ignored\n");
        s.range = nullptr;
    }
    Tn_VerilogParameter* p = named(d.f().createParameter(loc), name, d.scope().region);
    p->LocalFlag = s.local;
    switch (s.type) {
    case Tn_VerilogDeclSpec::INTEGER: p->DeclType = V::IntegerParam; break;
    case Tn_VerilogDeclSpec::REAL:
    case Tn_VerilogDeclSpec::REALTIME: p->DeclType = V::RealParam; break;
    case Tn_VerilogDeclSpec::TIME: p->DeclType = V::TimeParam; break;
    default:
        p->DeclType = s.range ? (s.isSigned ? V::SignedParam : V::UnsignedParam)
                              : (s.isSigned ? V::SignedNoRangeParam : V::NoTypeNoRangeParam);
    }
    p->SignedFlag = s.isSigned;
    p->Range = s.range;
    p->Expr = e;
    p->Attributes = s.attributes;
    if (declareName(d, p, name, loc)) d.scope().region->Parameter.push_back(p);
}

Tn_VerilogExpression* Tn_VerilogParser::pulseLimits(const Tn_VerilogTok& paren, Tn_VerilogExpression* reject,
                                                   Tn_VerilogExpression* err) {
    Impl& d = *d_;
    Tn_VerilogListOp* l = d.f().createListOp((paren).location);
    l->Operand.push_back(reject);
    l->Operand.push_back(err);
    return deep(d, l, {reject, err});
}

void Tn_VerilogParser::defparam(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* target,
                                Tn_VerilogExpression* value) {
    Impl& d = *d_;
    Tn_VerilogName* n = Tn_VerilogNode::cast<Tn_VerilogName>(target);
    if (!n) throw syntaxError(keyword, "the target of a defparam must be a parameter name");
    Tn_VerilogDefParam* p = d.f().createDefParam(target->location());
    p->Scope = d.scope().region;
    p->Target = n;
    p->Source = value;
    p->Attributes = a;
    d.scope().concurrent->DefParam.push_back(p);
}

Tn_VerilogDriveStrength* Tn_VerilogParser::driveStrengthBegin(const Tn_VerilogTok& paren) {
    Tn_VerilogDriveStrength* s = d_->f().createDriveStrength((paren).location);
    s->DriveStrength0 = V::Strong;
    s->DriveStrength1 = V::Strong;
    return s;
}

void Tn_VerilogParser::driveStrengthAdd(Tn_VerilogDriveStrength* s, int keyword) {
    switch (keyword) {
    case K_SUPPLY0: s->DriveStrength0 = V::Supply; break;
    case K_STRONG0: s->DriveStrength0 = V::Strong; break;
    case K_PULL0: s->DriveStrength0 = V::Pull; break;
    case K_WEAK0: s->DriveStrength0 = V::Weak; break;
    case K_HIGHZ0: s->DriveStrength0 = V::HighZ; break;
    case K_SUPPLY1: s->DriveStrength1 = V::Supply; break;
    case K_STRONG1: s->DriveStrength1 = V::Strong; break;
    case K_PULL1: s->DriveStrength1 = V::Pull; break;
    case K_WEAK1: s->DriveStrength1 = V::Weak; break;
    default: s->DriveStrength1 = V::HighZ; break;
    }
}

Tn_VerilogRange* Tn_VerilogParser::makeRange(const Tn_VerilogTok& bracket, Tn_VerilogExpression* msb,
                                             Tn_VerilogExpression* lsb) {
    Impl& d = *d_;
    Tn_VerilogRange* r = d.f().createRange((bracket).location);
    r->Msb = msb;
    r->Lsb = lsb;
    return deep(d, r, {msb, lsb});
}

Tn_VerilogDelay* Tn_VerilogParser::delayBegin(const Tn_VerilogTok& hash) { return d_->f().createDelay((hash).location); }

void Tn_VerilogParser::delayAdd(Tn_VerilogDelay* dl, Tn_VerilogExpression* e) {
    if (!dl->Delay1)
        dl->Delay1 = e;
    else if (!dl->Delay2)
        dl->Delay2 = e;
    else
        dl->Delay3 = e;
    deepen(*d_, dl, e);
}

// ------------------------------------------------------------ module items

void Tn_VerilogParser::contAssign(const Tn_VerilogTok&, Tn_VerilogAttributes* a, Tn_VerilogDriveStrength* s,
                                  Tn_VerilogDelay* dl, Tn_VerilogExpression* target, Tn_VerilogExpression* source) {
    Impl& d = *d_;
    Tn_VerilogContAssign* c = d.f().createContAssign(target->location());
    c->Attributes = a;
    c->DriveStrength = s;
    c->Delay = dl;
    c->Target = target;
    c->Source = source;
    d.scope().concurrent->ContAssign.push_back(c);
    if (v2001()) implicitNets(d, target);
}

namespace {

// A gate or an instance joins the current region alone or, with a range, as
// the one element of an array that repeats it (so its definition is seen).
template <class Item, class Array>
Tn_VerilogNode* place(Impl& d, Item* item, Tn_VerilogRange* r, Tn_VerilogAttributes* attributes,
                      Array* (Tn_VerilogNodeFactory::*createArray)(const Tn_Location&),
                      Tn_NodeList<Item> Tn_VerilogConcurrentRegion::*items,
                      Tn_NodeList<Array> Tn_VerilogConcurrentRegion::*arrays, Tn_NodeList<Item> Array::*elements) {
    Tn_VerilogConcurrentRegion* region = d.scope().concurrent;
    const Tn_Symbol name = item->Name;
    const Tn_Location& loc = item->location();
    if (r) {
        Array* a = named((d.f().*createArray)(loc), name, region);
        a->Range = r;
        a->Attributes = attributes;
        item->Parent = a;
        (a->*elements).push_back(item);
        if (declareName(d, a, name, loc)) (region->*arrays).push_back(a);
        return a;
    }
    if (name.IsEmpty() || declareName(d, item, name, loc)) (region->*items).push_back(item);
    return item;
}

}  // namespace

Tn_VerilogNode* Tn_VerilogParser::gateBegin(Tn_VerilogInstSpec& s, const Tn_VerilogTok& id, Tn_VerilogRange* r,
                                            const Tn_VerilogTok& paren) {
    Impl& d = *d_;
    const Tn_Location loc = (s.count == 0 ? s.first : id ? id : paren).location;
    const Tn_Symbol name = id ? id.text : Tn_Symbol();
    Tn_VerilogConcurrentRegion* region = d.scope().concurrent;
    ++s.count;
    Tn_VerilogPrimitive* p = named(d.f().createPrimitive(loc), name, region);
    p->PrimitiveType = gateInfo(s.gateType).type;
    p->Delay = s.delay;
    p->DriveStrength = s.strength;
    p->Attributes = s.attributes;
    return place(d, p, r, s.attributes, &Tn_VerilogNodeFactory::createPrimitiveArray,
                 &Tn_VerilogConcurrentRegion::Primitive, &Tn_VerilogConcurrentRegion::PrimitiveArray,
                 &Tn_VerilogPrimitiveArray::Primitive);
}

void Tn_VerilogParser::gateTerminal(Tn_VerilogNode* gate, Tn_VerilogExpression* e) {
    Impl& d = *d_;
    Tn_NodeList<Tn_VerilogTermConnection>& terminals =
        gate->isA(V::PrimitiveArray) ? static_cast<Tn_VerilogPrimitiveArray*>(gate)->Terminal
                                     : static_cast<Tn_VerilogPrimitive*>(gate)->Terminal;
    Tn_VerilogTermConnection* t = d.f().createTermConnection(e->location());
    t->Index = static_cast<int32_t>(terminals.size());
    t->Value = e;
    terminals.push_back(t);
    implicitNets(d, e);
}

void Tn_VerilogParser::gateEnd(Tn_VerilogInstSpec& s, Tn_VerilogNode* gate) {
    const bool array = gate->isA(V::PrimitiveArray);
    Tn_NodeList<Tn_VerilogTermConnection>& terminals = array ? static_cast<Tn_VerilogPrimitiveArray*>(gate)->Terminal
                                                              : static_cast<Tn_VerilogPrimitive*>(gate)->Terminal;
    const GateInfo g = gateInfo(s.gateType);
    const int n = static_cast<int>(terminals.size());
    for (Tn_VerilogTermConnection* t : terminals) t->Direction = terminalDirection(g.type, t->Index, t->Index == n - 1);
    if (n >= g.minimum && (g.maximum < 0 || n <= g.maximum)) return;
    const std::string keyword = textOf(s.first);
    const Port_String where = gate->location().text();
    if (g.maximum < 0)
        TN_MSG().issueError("%s%s primitive requires at least %d connections\n", where.c_str(), keyword.c_str(), g.minimum);
    else if (g.minimum == 1)
        TN_MSG().issueError("%s%s primitive requires 1 connection\n", where.c_str(), keyword.c_str());
    else
        TN_MSG().issueError("%s%s primitive requires %d connections\n", where.c_str(), keyword.c_str(), g.minimum);
}

size_t Tn_VerilogParser::parameterValuesBegin() { return d_->parameterValues.size(); }

void Tn_VerilogParser::paramValue(Tn_VerilogInstSpec&, const Tn_VerilogTok& name, Tn_VerilogExpression* e) {
    Impl& d = *d_;
    Tn_VerilogParamAssignment* p =
        d.f().createParamAssignment(name ? (name).location : e ? e->location() : tok().location);
    if (name) p->Name = name.text;
    p->Value = e;
    p->NamedParamAssignmentFlag = bool(name);
    d.parameterValues.push_back(p);
}

namespace {

// The `uselib entries in force, for an instance.
void uselib(Impl& d, Tn_VerilogModuleInstance* inst) {
    static const struct {
        const char* prefix;
        V::UselibRefType type;
    } kinds[] = {{"lib=", V::UselibLib}, {"libext=", V::UselibLibext}, {"file=", V::UselibFile}, {"dir=", V::UselibDir}};
    for (const Port_String& entry : d.directives.uselib()) {
        bool known = false;
        for (const auto& k : kinds) {
            const size_t n = std::strlen(k.prefix);
            if (std::strncmp(entry.c_str(), k.prefix, n) != 0) continue;
            Tn_VerilogUselibRef* r = d.f().createUselibRef(inst->location());
            r->Value = Tn_Symbol(entry.c_str() + n);
            r->RefType = k.type;
            inst->CurrentUseLib.push_back(r);
            known = true;
            break;
        }
        if (!known)
            TN_MSG().issueInternal(
                "Detected a `uselib argument not of type lib, libext, file, or dir in an internal data structure\n");
    }
}

}  // namespace

Tn_VerilogNode* Tn_VerilogParser::instanceBegin(Tn_VerilogInstSpec& s, const Tn_VerilogTok& id, Tn_VerilogRange* r,
                                                const Tn_VerilogTok& paren) {
    Impl& d = *d_;
    const Tn_Location loc = (s.count == 0 ? s.first : id ? id : paren).location;
    const Tn_Symbol name = id ? id.text : Tn_Symbol();
    Tn_VerilogConcurrentRegion* region = d.scope().concurrent;
    Tn_VerilogModuleInstance* inst = named(d.f().createModuleInstance(loc), name, region);
    inst->DefName = s.first.text;
    inst->Attributes = s.attributes;
    // Every instance of the statement has the values written once; the
    // first takes the nodes, the others copies.
    for (size_t i = s.paramsBegin; i < d.parameterValues.size(); ++i) {
        Tn_VerilogParamAssignment* p = d.parameterValues[i];
        inst->ParamAssignment.push_back(s.count == 0 ? p : static_cast<Tn_VerilogParamAssignment*>(p->clone(d.f())));
    }
    if (s.strength)
        inst->DriveStrength =
            s.count == 0 ? s.strength : static_cast<Tn_VerilogDriveStrength*>(s.strength->clone(d.f()));
    if (!d.directives.uselib().empty()) uselib(d, inst);
    ++s.count;
    return place(d, inst, r, s.attributes, &Tn_VerilogNodeFactory::createModuleArray,
                 &Tn_VerilogConcurrentRegion::ModuleInstance, &Tn_VerilogConcurrentRegion::ModuleArray,
                 &Tn_VerilogModuleArray::ModuleInstance);
}

void Tn_VerilogParser::connection(Tn_VerilogNode* inst, Tn_VerilogAttributes* a, const Tn_VerilogTok& where,
                                  const Tn_VerilogTok& name, Tn_VerilogExpression* e) {
    Impl& d = *d_;
    Tn_VerilogPortConnection* c =
        d.f().createPortConnection(name ? (name).location : e ? e->location() : (where).location);
    if (name) c->Name = name.text;
    c->Value = e;
    c->NamedPortConnectionFlag = bool(name);
    c->Attributes = a;
    if (inst->isA(V::ModuleArray))
        static_cast<Tn_VerilogModuleArray*>(inst)->PortConnection.push_back(c);
    else
        static_cast<Tn_VerilogModuleInstance*>(inst)->PortConnection.push_back(c);
    implicitNets(d, e);
}

void Tn_VerilogParser::instantiationEnd(Tn_VerilogInstSpec& s) { d_->parameterValues.resize(s.paramsBegin); }

void Tn_VerilogParser::process(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogStatement* s) {
    Impl& d = *d_;
    Tn_VerilogProcess* p;
    if (keyword.type == K_INITIAL)
        p = d.f().createInitial((keyword).location);
    else
        p = d.f().createAlways((keyword).location);
    p->Attributes = a;
    p->Statement = s;
    d.scope().concurrent->Process.push_back(p);
}

void Tn_VerilogParser::taskBegin(const Tn_VerilogTok& keyword, const Tn_VerilogTok& id, Tn_VerilogAttributes* a,
                                 bool automatic) {
    Impl& d = *d_;
    const Tn_Symbol name = id.text;
    Tn_VerilogTask* t = named(d.f().createTask((keyword).location), name, d.scope().region);
    t->AutomaticFlag = automatic;
    t->Attributes = a;
    if (declareName(d, t, name, (id).location)) d.scope().concurrent->Task.push_back(t);
    pushScope(d, Impl::TASK, t, nullptr, true);
}

void Tn_VerilogParser::taskEnd(const Tn_VerilogTok&) { d_->scopes.pop_back(); }

void Tn_VerilogParser::functionBegin(const Tn_VerilogTok& keyword, const Tn_VerilogTok& id, Tn_VerilogAttributes* a,
                                     bool automatic, Tn_VerilogDeclSpec& result) {
    Impl& d = *d_;
    const Tn_Symbol name = id.text;
    Tn_VerilogFunction* fn = named(d.f().createFunction((keyword).location), name, d.scope().region);
    fn->AutomaticFlag = automatic;
    fn->Attributes = a;
    if (result.kind != Tn_VerilogDeclSpec::NONE || result.range || result.isSigned) {
        if (result.kind == Tn_VerilogDeclSpec::NONE) result.kind = Tn_VerilogDeclSpec::REG;
        fn->ReturnType = typeDefOf(d, result);
    }
    if (declareName(d, fn, name, (id).location)) d.scope().concurrent->Function.push_back(fn);
    pushScope(d, Impl::FUNCTION, fn, nullptr, true);
    // The function's name is its result variable inside it.
    d.scope().names->map[name].declaration = fn;
    ++d.functionDepth;
}

void Tn_VerilogParser::functionEnd(const Tn_VerilogTok& end) {
    Impl& d = *d_;
    Tn_VerilogFunction* fn = static_cast<Tn_VerilogFunction*>(d.scope().region);
    bool input = false;
    for (Tn_VerilogIODeclaration* io : fn->IODeclaration) input = input || io->isA(V::Input);
    if (!input)
        error((end).location, "%sFunction '%s' must contain at least one input declaration\n", fn->Name.c_str());
    d.scopes.pop_back();
    --d.functionDepth;
}

void Tn_VerilogParser::procedureBody(Tn_VerilogStatement* s) {
    static_cast<Tn_VerilogProcedure*>(d_->scope().region)->Statement = s;
}

// --------------------------------------------------------------- generate

void Tn_VerilogParser::generateRegionBegin(const Tn_VerilogTok& keyword) {
    Impl& d = *d_;
    Tn_VerilogGenerate* g = named(d.f().createGenerate((keyword).location), Tn_Symbol(), d.scope().region);
    d.scope().concurrent->Generate.push_back(g);
    // A generate region is no scope of its own: its names are the module's.
    pushScope(d, Impl::GENERATE, g, g, false);
}

void Tn_VerilogParser::generateRegionEnd() { d_->scopes.pop_back(); }

void Tn_VerilogParser::addGenerateStatement(Tn_VerilogGenerateStatement* g) {
    if (g) d_->scope().concurrent->GenerateStatement.push_back(g);
}

Tn_VerilogGenerateStatement* Tn_VerilogParser::generateBlockBegin(const Tn_VerilogTok& first, const Tn_VerilogTok& name) {
    Impl& d = *d_;
    const Tn_Location loc = (first).location;
    Tn_VerilogGenerateBlock* b = d.f().createGenerateBlock(loc);
    Tn_VerilogGenerate* g = named(d.f().createGenerate(loc), name ? name.text : Tn_Symbol(), d.scope().region);
    b->Generate = g;
    pushScope(d, Impl::GENERATE, g, g, true);
    return b;
}

void Tn_VerilogParser::generateBlockEnd(Tn_VerilogGenerateStatement*) { d_->scopes.pop_back(); }

Tn_VerilogGenerateStatement* Tn_VerilogParser::generateForBegin(const Tn_VerilogTok& keyword, const Tn_VerilogTok& genvar,
                                                                const Tn_VerilogTok& id, Tn_VerilogExpression* init,
                                                                Tn_VerilogExpression* condition, const Tn_VerilogTok& id2,
                                                                Tn_VerilogExpression* step) {
    Impl& d = *d_;
    if (genvar) declareGenvar(id, nullptr);
    if (id2.text != id.text)
        error((id2).location, "%sGenerate for increment must update '%s'\n", id.text.c_str());
    Tn_VerilogGenerateFor* g = d.f().createGenerateFor((keyword).location);
    g->Index = simpleName(id);
    g->Initializer = blockingAssign(id, nullptr, simpleName(id), nullptr, init);
    g->Condition = condition;
    g->Incrementor = blockingAssign(id2, nullptr, simpleName(id2), nullptr, step);
    return g;
}

void Tn_VerilogParser::generateLoopBodyBegin(Tn_VerilogGenerateStatement* g, const Tn_VerilogTok& first,
                                             const Tn_VerilogTok& name) {
    Impl& d = *d_;
    const Tn_Location loc = (first).location;
    const int type = first.type;
    if (type == K_IF || type == K_CASE)
        error(loc, "%sConditionally generated items must appear with a named begin-end block\n");
    else if (type != K_BEGIN || !name)
        error(loc, "%sGenerated begin-end blocks must be named\n");
    const Tn_Symbol label = name ? name.text : Tn_Symbol();
    // The loop's block is the template of the elements of its array.
    Tn_VerilogGenerateArray* a = named(d.f().createGenerateArray(loc), label, d.scope().region);
    if (name) declareName(d, a, label, (name).location);
    static_cast<Tn_VerilogGenerateFor*>(g)->GenerateArray = a;
    Tn_VerilogGenerate* body = named(d.f().createGenerate(loc), label, a);
    a->Generate.insert(0, body);
    pushScope(d, Impl::GENERATE, body, body, true);
}

void Tn_VerilogParser::generateLoopBodyEnd(Tn_VerilogGenerateStatement*) { d_->scopes.pop_back(); }

Tn_VerilogGenerateStatement* Tn_VerilogParser::makeGenerateIf(const Tn_VerilogTok& keyword, Tn_VerilogExpression* c) {
    Tn_VerilogGenerateIf* g = d_->f().createGenerateIf((keyword).location);
    g->Condition = c;
    return g;
}

void Tn_VerilogParser::generateIfBranch(Tn_VerilogGenerateStatement* g, Tn_VerilogGenerateStatement* branch,
                                        bool then) {
    Tn_VerilogGenerateIf* i = static_cast<Tn_VerilogGenerateIf*>(g);
    if (then)
        i->TrueStatement = branch;
    else
        i->FalseStatement = branch;
}

Tn_VerilogGenerateStatement* Tn_VerilogParser::makeGenerateCase(const Tn_VerilogTok& keyword, Tn_VerilogExpression* e) {
    Tn_VerilogGenerateCase* g = d_->f().createGenerateCase((keyword).location);
    g->Selector = e;
    return g;
}

Tn_VerilogGenerateStatement* Tn_VerilogParser::generateCaseItemBegin(Tn_VerilogGenerateStatement* g,
                                                                     const Tn_VerilogTok& first) {
    Tn_VerilogGenerateCaseItem* i = d_->f().createGenerateCaseItem((first).location);
    static_cast<Tn_VerilogGenerateCase*>(g)->CaseItem.push_back(i);
    return i;
}

void Tn_VerilogParser::generateCaseItemExpression(Tn_VerilogGenerateStatement* item, Tn_VerilogExpression* e) {
    static_cast<Tn_VerilogGenerateCaseItem*>(item)->Expression.push_back(e);
}

void Tn_VerilogParser::generateCaseItemBody(Tn_VerilogGenerateStatement* item, Tn_VerilogGenerateStatement* body) {
    static_cast<Tn_VerilogGenerateCaseItem*>(item)->Statement = body;
}

// ---------------------------------------------------------------- specify

namespace {

Tn_VerilogPathTerm* pathTerm(Impl& d, Tn_VerilogExpression* e, V::PortDirectionType direction, V::EdgeType edge) {
    Tn_VerilogPathTerm* t = d.f().createPathTerm(e->location());
    t->Direction = direction;
    t->Edge = edge;
    t->Expression = e;
    return t;
}

V::EdgeType edgeType(int token) {
    switch (token) {
    case Tn_VerilogTokenTypes::K_POSEDGE: return V::Posedge;
    case Tn_VerilogTokenTypes::K_NEGEDGE: return V::Negedge;
    case Tn_VerilogTokenTypes::K_EDGE: return V::Edge;
    default: return V::NoEdge;
    }
}

}  // namespace

Tn_VerilogNode* Tn_VerilogParser::pulseControlBegin(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a) {
    Impl& d = *d_;
    Tn_VerilogPulseControl* p = d.f().createPulseControl((keyword).location);
    switch (keyword.type) {
    case K_PULSESTYLE_ONEVENT: p->PulseControlType = V::PulseStyleOnEvent; break;
    case K_PULSESTYLE_ONDETECT: p->PulseControlType = V::PulseStyleOnDetect; break;
    case K_SHOWCANCELLED: p->PulseControlType = V::ShowCancelled; break;
    default: p->PulseControlType = V::NoShowCancelled; break;
    }
    p->Attributes = a;
    d.module->PulseControl.push_back(p);
    return p;
}

void Tn_VerilogParser::pulseControlOutput(Tn_VerilogNode* p, Tn_VerilogExpression* e) {
    static_cast<Tn_VerilogPulseControl*>(p)->Output.push_back(pathTerm(*d_, e, V::OutputPort, V::NoEdge));
}

Tn_VerilogNode* Tn_VerilogParser::pathBegin(const Tn_VerilogTok& first, Tn_VerilogAttributes* a,
                                            Tn_VerilogExpression* condition, bool ifnone) {
    Impl& d = *d_;
    Tn_VerilogPath* p = d.f().createPath((first).location);
    p->Attributes = a;
    p->Condition = condition;
    p->IfNoneFlag = ifnone;
    p->Polarity = V::NoPolarity;
    p->DataPolarity = V::NoPolarity;
    d.module->Path.push_back(p);
    return p;
}

void Tn_VerilogParser::pathInput(Tn_VerilogNode* p, Tn_VerilogExpression* e, int edge) {
    static_cast<Tn_VerilogPath*>(p)->Input.push_back(pathTerm(*d_, e, V::InputPort, edgeType(edge)));
}

void Tn_VerilogParser::pathPolarity(Tn_VerilogNode* p, int sign, bool data) {
    const V::PolarityType polarity = sign == PLUS ? V::PositivePolarity : V::NegativePolarity;
    Tn_VerilogPath* path = static_cast<Tn_VerilogPath*>(p);
    if (data)
        path->DataPolarity = polarity;
    else
        path->Polarity = polarity;
}

void Tn_VerilogParser::pathType(Tn_VerilogNode* p, int type) {
    static_cast<Tn_VerilogPath*>(p)->PathType = type == FULL_PATH ? V::FullPath : V::ParallelPath;
}

void Tn_VerilogParser::pathOutput(Tn_VerilogNode* p, Tn_VerilogExpression* e) {
    static_cast<Tn_VerilogPath*>(p)->Output.push_back(pathTerm(*d_, e, V::OutputPort, V::NoEdge));
}

void Tn_VerilogParser::pathData(Tn_VerilogNode* p, Tn_VerilogExpression* e) {
    static_cast<Tn_VerilogPath*>(p)->Data = pathTerm(*d_, e, V::InputPort, V::NoEdge);
}

void Tn_VerilogParser::pathDelay(Tn_VerilogNode* p, Tn_VerilogExpression* e) {
    Impl& d = *d_;
    Tn_VerilogPath* path = static_cast<Tn_VerilogPath*>(p);
    if (!path->Delay) path->Delay = d.f().createListOp(e->location());
    static_cast<Tn_VerilogListOp*>(path->Delay.get())->Operand.push_back(e);
}

void Tn_VerilogParser::pathEnd(Tn_VerilogNode* p, const Tn_VerilogTok&) {
    Tn_VerilogPath* path = static_cast<Tn_VerilogPath*>(p);
    const size_t n = static_cast<Tn_VerilogListOp*>(path->Delay.get())->Operand.size();
    if (n != 1 && n != 2 && n != 3 && n != 6 && n != 12)
        TN_MSG().issueError("%sFound %d path delay values, must have 1, 2, 3, 6 or 12 values\n",
                            path->location().text().c_str(), static_cast<int>(n));
}

Tn_VerilogNode* Tn_VerilogParser::timingCheckBegin(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a) {
    Impl& d = *d_;
    Tn_VerilogTchk* c = d.f().createTchk((keyword).location);
    c->TchkType = timingCheckType(keyword.type);
    c->Attributes = a;
    d.module->Tchk.push_back(c);
    d.timingArguments.clear();
    return c;
}

void Tn_VerilogParser::timingCheckArg(Tn_VerilogNode*, const Tn_VerilogTok& where, int edge, unsigned descriptors,
                                      Tn_VerilogExpression* e, Tn_VerilogExpression* condition) {
    d_->timingArguments.push_back(Impl::TimingArgument{where, edge, descriptors, e, condition});
}

void Tn_VerilogParser::timingCheckEnd(Tn_VerilogNode* node, const Tn_VerilogTok& paren) {
    Impl& d = *d_;
    Tn_VerilogTchk* c = static_cast<Tn_VerilogTchk*>(node);
    const TimingCheckShape shape = timingCheckShape(c->TchkType);
    const std::vector<Impl::TimingArgument>& args = d.timingArguments;
    const size_t fixed = static_cast<size_t>(shape.events + shape.limits);
    const std::string keyword = V::TchkTypeInfo.text(c->TchkType);
    if (args.size() < fixed || args.size() > fixed + static_cast<size_t>(shape.extras))
        throw syntaxError(paren, "wrong number of arguments to " + keyword);
    for (size_t i = 0; i < args.size(); ++i) {
        const Impl::TimingArgument& a = args[i];
        if (i < fixed && !a.e) throw syntaxError(a.where, "missing argument " + std::to_string(i + 1) + " of " + keyword);
        if (i >= static_cast<size_t>(shape.events) && (a.edge || a.condition))
            throw syntaxError(a.where, "argument " + std::to_string(i + 1) + " of " + keyword + " is not a timing check event");
    }
    for (int i = 0; i < shape.events; ++i) {
        const Impl::TimingArgument& a = args[static_cast<size_t>(i)];
        Tn_VerilogTchkTerm* t = d.f().createTchkTerm(a.e->location());
        t->Edge = edgeType(a.edge);
        t->EdgeDescriptors = a.descriptors;
        t->Expression = a.e;
        t->Condition = a.condition;
        if ((i == 0) == shape.dataFirst && shape.events == 2)
            c->Data = t;
        else
            c->Reference = t;
    }
    Tn_VerilogListOp* limits = d.f().createListOp(args[static_cast<size_t>(shape.events)].e->location());
    for (size_t i = static_cast<size_t>(shape.events); i < fixed; ++i) limits->Operand.push_back(args[i].e);
    c->Delay = limits;
    // $width has its threshold before the notifier.
    size_t notifier = c->TchkType == V::Width ? fixed + 1 : fixed;
    size_t last = args.size();
    while (last > fixed && !args[last - 1].e) --last;
    for (size_t i = fixed; i < last; ++i) {
        if (i == notifier) {
            c->Notifier = args[i].e;
            continue;
        }
        c->Expression.push_back(args[i].e ? args[i].e : d.f().createNullOp((args[i].where).location));
    }
}

void Tn_VerilogParser::ignoreSpecifyTask(const Tn_VerilogTok& id) {
    warning((id).location, "%sIgnoring invalid system-task inside specify block\n");
    if (LA(1) != LPAREN) return;
    for (int depth = 0;;) {
        const int type = LA(1);
        if (type == antlr::Token::EOF_TYPE) return;
        consume();
        if (type == LPAREN) ++depth;
        if (type == RPAREN && --depth == 0) return;
    }
}

// ------------------------------------------------------------- statements

namespace {

// Statements that a function body cannot hold are reported where they stand.
void notInFunction(Impl& d, const Tn_Location& loc, const char* message) {
    if (d.functionDepth > 0) error(loc, message);
}

template <class T>
T* attributed(T* n, Tn_VerilogAttributes* a) {
    n->Attributes = a;
    return n;
}

}  // namespace

Tn_VerilogStatement* Tn_VerilogParser::nullStatement(const Tn_VerilogTok& semi, Tn_VerilogAttributes* a) {
    return attributed(d_->f().createNullStatement((semi).location), a);
}

Tn_VerilogStatement* Tn_VerilogParser::blockingAssign(const Tn_VerilogTok& first, Tn_VerilogAttributes* a,
                                                      Tn_VerilogExpression* target, Tn_VerilogStatement* control,
                                                      Tn_VerilogExpression* source) {
    Impl& d = *d_;
    Tn_VerilogBlockingAssign* s = attributed(d.f().createBlockingAssign((first).location), a);
    s->Target = target;
    s->Source = source;
    s->TimingControl = static_cast<Tn_VerilogTimingControl*>(control);
    return deep(d, s, {target, source, control});
}

Tn_VerilogStatement* Tn_VerilogParser::nonBlockingAssign(const Tn_VerilogTok& first, Tn_VerilogAttributes* a,
                                                         Tn_VerilogExpression* target, Tn_VerilogStatement* control,
                                                         Tn_VerilogExpression* source) {
    Impl& d = *d_;
    Tn_VerilogNonBlockingAssign* s = attributed(d.f().createNonBlockingAssign((first).location), a);
    s->Target = target;
    s->Source = source;
    s->TimingControl = static_cast<Tn_VerilogTimingControl*>(control);
    notInFunction(d, s->location(), "%sIllegal nonblocking assignment within function\n");
    return deep(d, s, {target, source, control});
}

Tn_VerilogStatement* Tn_VerilogParser::taskCall(const Tn_VerilogTok& first, Tn_VerilogAttributes* a,
                                                Tn_VerilogExpression* name) {
    Impl& d = *d_;
    Tn_VerilogName* n = Tn_VerilogNode::cast<Tn_VerilogName>(name);
    if (!n) throw syntaxError(tok(), "unexpected token: " + textOf(tok()));
    Tn_VerilogUserTaskCall* s = attributed(d.f().createUserTaskCall((first).location), a);
    s->Name = n;
    notInFunction(d, s->location(), "%sIllegal task call within function\n");
    return s;
}

void Tn_VerilogParser::callArgument(Tn_VerilogNode* call, Tn_VerilogExpression* e) {
    if (Tn_VerilogUserTaskCall* t = Tn_VerilogNode::cast<Tn_VerilogUserTaskCall>(call))
        t->Param.push_back(e);
    else
        static_cast<Tn_VerilogFunctionCall*>(call)->Param.push_back(e);
    deepen(*d_, call, e);
}

Tn_VerilogExpression* Tn_VerilogParser::systemCall(const Tn_VerilogTok& id) {
    Tn_VerilogSystemFunctionCall* c = d_->f().createSystemFunctionCall((id).location);
    c->Name = id.text;
    return c;
}

void Tn_VerilogParser::systemArgument(Tn_VerilogExpression* call, Tn_VerilogExpression* e, const Tn_VerilogTok& where) {
    Impl& d = *d_;
    if (!e) e = d.f().createNullOp((where).location);
    static_cast<Tn_VerilogFunctionCall*>(call)->Param.push_back(e);
    deepen(d, call, e);
}

Tn_VerilogStatement* Tn_VerilogParser::systemTask(const Tn_VerilogTok& id, Tn_VerilogAttributes* a,
                                                  Tn_VerilogExpression* call) {
    Impl& d = *d_;
    Tn_VerilogSystemTaskCall* s = attributed(d.f().createSystemTaskCall((id).location), a);
    s->Name = id.text;
    s->Param.raw().swap(static_cast<Tn_VerilogFunctionCall*>(call)->Param.raw());
    return deep(d, s, {call});
}

Tn_VerilogStatement* Tn_VerilogParser::delayControl(const Tn_VerilogTok& hash, Tn_VerilogAttributes* a,
                                                    Tn_VerilogExpression* dl, Tn_VerilogStatement* s) {
    Impl& d = *d_;
    Tn_VerilogDelayControl* c = attributed(d.f().createDelayControl((hash).location), a);
    c->Delay = dl;
    c->Statement = s;
    notInFunction(d, c->location(), "%sIllegal delay control statement within function\n");
    return deep(d, c, {dl, s});
}

Tn_VerilogStatement* Tn_VerilogParser::repeatControl(const Tn_VerilogTok& keyword, Tn_VerilogExpression* count,
                                                     Tn_VerilogStatement* eventControl) {
    Impl& d = *d_;
    Tn_VerilogRepeatControl* c = d.f().createRepeatControl((keyword).location);
    c->Count = count;
    c->Event = static_cast<Tn_VerilogEventControl*>(eventControl)->Event;
    return deep(d, c, {count, eventControl});
}

Tn_VerilogStatement* Tn_VerilogParser::makeEventControl(const Tn_VerilogTok& at, Tn_VerilogAttributes* a,
                                                        Tn_VerilogEventExpression* e) {
    Impl& d = *d_;
    // An event control written with a star has no event expression.
    Tn_VerilogEventControl* c = attributed(d.f().createEventControl((at).location), a);
    c->Event = e;
    notInFunction(d, c->location(), "%sIllegal event control statement within function\n");
    return deep(d, c, {e});
}

Tn_VerilogStatement* Tn_VerilogParser::emptyEventControl(const Tn_VerilogTok& at, Tn_VerilogAttributes* a,
                                                         const Tn_VerilogTok& paren) {
    Impl& d = *d_;
    error((at).location, "%sEmpty sensitivity list\n");
    return makeEventControl(at, a, d.f().createNullOp((paren).location));
}

void Tn_VerilogParser::eventControlBody(Tn_VerilogStatement* control, Tn_VerilogStatement* s) {
    static_cast<Tn_VerilogEventControl*>(control)->Statement = s;
    deepen(*d_, control, s);
}

Tn_VerilogEventExpression* Tn_VerilogParser::eventOr(Tn_VerilogEventExpression* first) {
    Tn_VerilogEventOrOp* o = d_->f().createEventOrOp(first->location());
    o->Operand.push_back(first);
    return deep(*d_, o, {first});
}

void Tn_VerilogParser::eventOrAdd(Tn_VerilogEventExpression* o, Tn_VerilogEventExpression* e) {
    static_cast<Tn_VerilogEventOrOp*>(o)->Operand.push_back(e);
    deepen(*d_, o, e);
}

Tn_VerilogEventExpression* Tn_VerilogParser::edgeEvent(const Tn_VerilogTok& keyword, Tn_VerilogExpression* e) {
    Tn_VerilogUnaryEventOp* u = d_->f().createUnaryEventOp((keyword).location);
    u->OpType = keyword.type == K_POSEDGE ? V::PosedgeOp : V::NegedgeOp;
    u->Operand = e;
    return deep(*d_, u, {e});
}

size_t Tn_VerilogParser::ifChainBegin() { return d_->chain.size(); }

void Tn_VerilogParser::ifChainAdd(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* c,
                                  Tn_VerilogStatement* s) {
    d_->chain.push_back(Impl::ChainItem{keyword, a, c, s});
}

namespace {

// A chain read by a loop is built from its last alternative upwards, each
// link by make(link, what follows it).
template <class T, class Make>
T* endChain(Impl& d, size_t mark, T* last, Make make) {
    for (size_t i = d.chain.size(); i-- > mark;) last = make(d.chain[i], last);
    d.chain.resize(mark);
    return last;
}

}  // namespace

Tn_VerilogStatement* Tn_VerilogParser::ifChainEnd(size_t mark, Tn_VerilogStatement* otherwise) {
    Impl& d = *d_;
    return endChain(d, mark, otherwise, [&](const Impl::ChainItem& item, Tn_VerilogStatement* rest) {
        Tn_VerilogIf* n = attributed(d.f().createIf(item.token.location), item.attributes);
        n->Condition = item.condition;
        n->TrueStatement = static_cast<Tn_VerilogStatement*>(item.value);
        n->FalseStatement = rest;
        return deep(d, n, {item.condition, item.value, rest});
    });
}

Tn_VerilogStatement* Tn_VerilogParser::caseBegin(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a) {
    Tn_VerilogCase* c = attributed(d_->f().createCase((keyword).location), a);
    const int type = keyword.type;
    c->CaseType = type == K_CASEZ ? V::CaseZ : type == K_CASEX ? V::CaseX : V::PlainCase;
    return c;
}

void Tn_VerilogParser::caseSelector(Tn_VerilogStatement* c, Tn_VerilogExpression* e) {
    static_cast<Tn_VerilogCase*>(c)->Selector = e;
    deepen(*d_, c, e);
}

Tn_VerilogStatement* Tn_VerilogParser::caseItemBegin(Tn_VerilogStatement* c, const Tn_VerilogTok& first) {
    Tn_VerilogCaseItem* i = d_->f().createCaseItem((first).location);
    static_cast<Tn_VerilogCase*>(c)->CaseItem.push_back(i);
    return i;
}

void Tn_VerilogParser::caseItemExpression(Tn_VerilogStatement* item, Tn_VerilogExpression* e) {
    static_cast<Tn_VerilogCaseItem*>(item)->Expression.push_back(e);
    deepen(*d_, item, e);
}

void Tn_VerilogParser::caseItemBody(Tn_VerilogStatement* c, Tn_VerilogStatement* item, Tn_VerilogStatement* s) {
    Impl& d = *d_;
    static_cast<Tn_VerilogCaseItem*>(item)->Statement = s;
    deepen(d, item, s);
    deepen(d, c, item);
}

Tn_VerilogStatement* Tn_VerilogParser::forever(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a,
                                               Tn_VerilogStatement* s) {
    Tn_VerilogForever* l = attributed(d_->f().createForever((keyword).location), a);
    l->Statement = s;
    return deep(*d_, l, {s});
}

Tn_VerilogStatement* Tn_VerilogParser::repeat(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a,
                                              Tn_VerilogExpression* e, Tn_VerilogStatement* s) {
    Tn_VerilogRepeat* l = attributed(d_->f().createRepeat((keyword).location), a);
    l->Condition = e;
    l->Statement = s;
    return deep(*d_, l, {e, s});
}

Tn_VerilogStatement* Tn_VerilogParser::whileLoop(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a,
                                                 Tn_VerilogExpression* e, Tn_VerilogStatement* s) {
    Tn_VerilogWhile* l = attributed(d_->f().createWhile((keyword).location), a);
    l->Condition = e;
    l->Statement = s;
    return deep(*d_, l, {e, s});
}

Tn_VerilogStatement* Tn_VerilogParser::forLoop(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a,
                                               Tn_VerilogStatement* init, Tn_VerilogExpression* c,
                                               Tn_VerilogStatement* step, Tn_VerilogStatement* s) {
    Tn_VerilogFor* l = attributed(d_->f().createFor((keyword).location), a);
    l->Initializer = init;
    l->Condition = c;
    l->Incrementor = step;
    l->Statement = s;
    return deep(*d_, l, {init, c, step, s});
}

Tn_VerilogStatement* Tn_VerilogParser::blockBegin(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a) {
    Tn_VerilogBlockStatement* b = attributed(d_->f().createBlockStatement((keyword).location), a);
    b->BlockType = keyword.type == K_FORK ? V::ParallelBlock : V::SequentialBlock;
    return b;
}

// A named block is a scope of its own, declared where it stands; the
// statement refers to it.
Tn_VerilogStatement* Tn_VerilogParser::blockName(Tn_VerilogStatement* b, const Tn_VerilogTok& id) {
    Impl& d = *d_;
    Tn_VerilogBlockStatement* plain = static_cast<Tn_VerilogBlockStatement*>(b);
    const Tn_Symbol name = id.text;
    Tn_VerilogBlock* block = named(d.f().createBlock(b->location()), name, d.scope().region);
    block->BlockType = plain->BlockType;
    if (declareName(d, block, name, (id).location)) d.scope().region->Block.push_back(block);
    Tn_VerilogNamedBlockStatement* s = attributed(d.f().createNamedBlockStatement(b->location()), b->Attributes.get());
    s->Name = name;
    s->Block = block;
    pushScope(d, Impl::BLOCK, block, nullptr, true);
    return s;
}

void Tn_VerilogParser::blockAdd(Tn_VerilogStatement* b, Tn_VerilogStatement* s) {
    if (Tn_VerilogNamedBlockStatement* n = Tn_VerilogNode::cast<Tn_VerilogNamedBlockStatement>(b))
        n->Block->Statement.push_back(s);
    else
        static_cast<Tn_VerilogBlockStatement*>(b)->Statement.push_back(s);
    deepen(*d_, b, s);
}

void Tn_VerilogParser::blockEnd(Tn_VerilogStatement* b) {
    if (b->isA(V::NamedBlockStatement)) d_->scopes.pop_back();
}

Tn_VerilogStatement* Tn_VerilogParser::makeWait(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a,
                                                Tn_VerilogExpression* e, Tn_VerilogStatement* s) {
    Impl& d = *d_;
    Tn_VerilogWait* w = attributed(d.f().createWait((keyword).location), a);
    w->Condition = e;
    w->Statement = s;
    notInFunction(d, w->location(), "%sIllegal wait statement within function\n");
    return deep(d, w, {e, s});
}

Tn_VerilogStatement* Tn_VerilogParser::disable(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a,
                                               Tn_VerilogExpression* n) {
    Tn_VerilogName* name = Tn_VerilogNode::cast<Tn_VerilogName>(n);
    if (!name) throw syntaxError(keyword, "the operand of disable must be a task or block name");
    Tn_VerilogDisable* s = attributed(d_->f().createDisable((keyword).location), a);
    s->Name = name;
    return s;
}

Tn_VerilogStatement* Tn_VerilogParser::makeEventTrigger(const Tn_VerilogTok& arrow, Tn_VerilogAttributes* a,
                                                        Tn_VerilogExpression* n) {
    Impl& d = *d_;
    Tn_VerilogEventTrigger* s = attributed(d.f().createEventTrigger((arrow).location), a);
    s->Operand = n;
    notInFunction(d, s->location(), "%sIllegal event trigger within function\n");
    return deep(d, s, {n});
}

Tn_VerilogStatement* Tn_VerilogParser::proceduralAssign(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a,
                                                        Tn_VerilogExpression* target, Tn_VerilogExpression* source) {
    Impl& d = *d_;
    Tn_VerilogSourcedAssign* s;
    if (keyword.type == K_FORCE)
        s = d.f().createForce((keyword).location);
    else
        s = d.f().createAssign((keyword).location);
    s->Attributes = a;
    s->Target = target;
    s->Source = source;
    return deep(d, s, {target, source});
}

Tn_VerilogStatement* Tn_VerilogParser::proceduralRelease(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a,
                                                         Tn_VerilogExpression* target) {
    Impl& d = *d_;
    Tn_VerilogAssignment* s;
    if (keyword.type == K_RELEASE)
        s = d.f().createRelease((keyword).location);
    else
        s = d.f().createDeassign((keyword).location);
    s->Attributes = a;
    s->Target = target;
    return deep(d, s, {target});
}

// ------------------------------------------------------------ expressions

size_t Tn_VerilogParser::conditionalBegin() { return d_->chain.size(); }

void Tn_VerilogParser::conditionalAdd(const Tn_VerilogTok& question, Tn_VerilogAttributes* a, Tn_VerilogExpression* c,
                                      Tn_VerilogExpression* t) {
    d_->chain.push_back(Impl::ChainItem{question, a, c, t});
}

// The conditional operator is right associative.
Tn_VerilogExpression* Tn_VerilogParser::conditionalEnd(size_t mark, Tn_VerilogExpression* last) {
    Impl& d = *d_;
    return endChain(d, mark, last, [&](const Impl::ChainItem& item, Tn_VerilogExpression* rest) {
        Tn_VerilogConditionalOp* op = attributed(d.f().createConditionalOp(item.condition->location()), item.attributes);
        op->Condition = item.condition;
        op->TrueOperand = static_cast<Tn_VerilogExpression*>(item.value);
        op->FalseOperand = rest;
        return deep(d, op, {item.condition, item.value, rest});
    });
}

namespace {

// Operator precedence parsing: the top operator and its two operands
// become one node.
void reduce(Impl& d) {
    Tn_VerilogExpression* r = d.operands.back();
    d.operands.pop_back();
    Tn_VerilogExpression* l = d.operands.back();
    const Impl::Operator& o = d.operators.back();
    Tn_VerilogBinaryOp* op = attributed(d.f().createBinaryOp(l->location()), o.attributes);
    op->OpType = o.op.type;
    op->LOperand = l;
    op->ROperand = r;
    d.operators.pop_back();
    d.operands.back() = deep(d, op, {l, r});
}

}  // namespace

// The mark of an expression is the operator stack's size at its start:
// operators below it belong to enclosing expressions.
size_t Tn_VerilogParser::binaryBegin() { return d_->operators.size(); }

void Tn_VerilogParser::binaryOperand(Tn_VerilogExpression* e) { d_->operands.push_back(e); }

void Tn_VerilogParser::binaryOperator(size_t base, const Tn_VerilogTok& op, Tn_VerilogAttributes* a) {
    Impl& d = *d_;
    BinaryOperator b{V::LogicalOr, 0};
    ::binaryOperator(op.type, b);
    while (d.operators.size() > base && d.operators.back().op.precedence >= b.precedence) reduce(d);
    d.operators.push_back(Impl::Operator{op, a, b});
}

Tn_VerilogExpression* Tn_VerilogParser::binaryEnd(size_t base, Tn_VerilogExpression* last) {
    Impl& d = *d_;
    if (d.operators.size() == base) return last;
    d.operands.push_back(last);
    while (d.operators.size() > base) reduce(d);
    Tn_VerilogExpression* e = d.operands.back();
    d.operands.pop_back();
    return e;
}

size_t Tn_VerilogParser::unaryBegin() { return d_->unaries.size(); }

void Tn_VerilogParser::unaryOperator(const Tn_VerilogTok& op, Tn_VerilogAttributes* a) {
    d_->unaries.push_back(Impl::UnaryItem{op, a});
}

Tn_VerilogExpression* Tn_VerilogParser::unaryEnd(size_t mark, Tn_VerilogExpression* operand) {
    Impl& d = *d_;
    Tn_VerilogExpression* e = operand;
    for (size_t i = d.unaries.size(); i-- > mark;) {
        const Impl::UnaryItem& item = d.unaries[i];
        Tn_VerilogUnaryOp* op = attributed(d.f().createUnaryOp((item.token).location), item.attributes);
        op->OpType = ::unaryOperator(item.token.type);
        op->Operand = e;
        e = deep(d, op, {e});
    }
    d.unaries.resize(mark);
    return e;
}

Tn_VerilogExpression* Tn_VerilogParser::minTypMax(const Tn_VerilogTok&, Tn_VerilogExpression* min,
                                                  Tn_VerilogExpression* typ, Tn_VerilogExpression* max) {
    Tn_VerilogMinTypMaxOp* op = d_->f().createMinTypMaxOp(min->location());
    op->MinOperand = min;
    op->TypOperand = typ;
    op->MaxOperand = max;
    return deep(*d_, op, {min, typ, max});
}

Tn_VerilogExpression* Tn_VerilogParser::makeConcatenation(const Tn_VerilogTok& brace, Tn_VerilogExpression* first) {
    Tn_VerilogConcatOp* c = d_->f().createConcatOp((brace).location);
    c->Operand.push_back(first);
    return deep(*d_, c, {first});
}

Tn_VerilogExpression* Tn_VerilogParser::multipleConcatenation(const Tn_VerilogTok& brace, Tn_VerilogExpression* count) {
    Tn_VerilogMultipleConcatOp* c = d_->f().createMultipleConcatOp((brace).location);
    c->Count = count;
    return deep(*d_, c, {count});
}

void Tn_VerilogParser::concatenationAdd(Tn_VerilogExpression* c, Tn_VerilogExpression* e) {
    if (Tn_VerilogConcatOp* o = Tn_VerilogNode::cast<Tn_VerilogConcatOp>(c))
        o->Operand.push_back(e);
    else
        static_cast<Tn_VerilogMultipleConcatOp*>(c)->Operand.push_back(e);
    deepen(*d_, c, e);
}

Tn_VerilogExpression* Tn_VerilogParser::functionCall(const Tn_VerilogTok& paren, Tn_VerilogAttributes* a,
                                                     Tn_VerilogExpression* name) {
    Impl& d = *d_;
    Tn_VerilogName* n = Tn_VerilogNode::cast<Tn_VerilogName>(name);
    if (!n) throw syntaxError(paren, "unexpected token: (");
    Tn_VerilogUserFunctionCall* call = attributed(d.f().createUserFunctionCall(name->location()), a);
    call->Name = n;
    Tn_VerilogSimpleName* simple = Tn_VerilogNode::cast<Tn_VerilogSimpleName>(n);
    if (simple && d.module) {
        // Constant functions: those called from constant expressions, and
        // (at the end of the module) those that these call.
        if (inConstantExpression() && d.constantCallSet.insert(simple->Name).second)
            d.constantCalls.push_back(simple->Name);
        if (d.functionDepth > 0)
            for (size_t i = d.scopes.size(); i-- > 0;)
                if (d.scopes[i].kind == Impl::FUNCTION) {
                    d.callsInFunctions.emplace_back(static_cast<Tn_VerilogFunction*>(d.scopes[i].region), simple->Name);
                    break;
                }
    }
    return deep(d, call, {name});
}

size_t Tn_VerilogParser::nameBegin() { return d_->nameParts.size(); }

void Tn_VerilogParser::nameComponent(const Tn_VerilogTok& id) {
    d_->nameParts.push_back(Impl::NamePart{id, d_->selects.size()});
}

void Tn_VerilogParser::nameSelect(const Tn_VerilogTok& bracket, int kind, Tn_VerilogExpression* e1,
                                  Tn_VerilogExpression* e2) {
    d_->selects.push_back(Impl::Select{bracket, kind, e1, e2});
}

namespace {

// The unpacked dimensions of a name declared as an array so far.
size_t arrayDimensions(Impl& d, const Tn_Symbol& name) {
    if (!d.inUnit()) return 0;
    const Impl::Entry* e = d.scope().names->find(name);
    if (!e) return 0;
    Tn_VerilogArrayVar* a = Tn_VerilogNode::cast<Tn_VerilogArrayVar>(e->declaration);
    return a ? a->Range.size() : 0;
}

}  // namespace

// A name and its selects: scope prefixes (indexed where a scope array is
// meant) before the last component; on the last, the word selects of an
// array and then one bit, part or indexed part select.
Tn_VerilogExpression* Tn_VerilogParser::nameEnd(size_t mark) {
    Impl& d = *d_;
    const size_t parts = d.nameParts.size() - mark;
    auto selectsEnd = [&](size_t i) { return i + 1 < parts ? d.nameParts[mark + i + 1].selects : d.selects.size(); };
    const Impl::NamePart& first = d.nameParts[mark];
    const Tn_Location loc = (first.id).location;
    Tn_VerilogExpression* e;
    if (parts == 1) {
        e = simpleName(first.id);
    } else {
        Tn_VerilogScopeName* s = d.f().createScopeName(loc);
        s->Name = first.id.text;
        Tn_VerilogHierarchicalName* prefix = s;
        for (size_t i = 0; i + 1 < parts; ++i) {
            const Impl::NamePart& p = d.nameParts[mark + i];
            if (i > 0) {
                Tn_VerilogSelectedName* n = d.f().createSelectedName(loc);
                n->Prefix = prefix;
                n->Suffix = p.id.text;
                prefix = deep(d, n, {prefix});
            }
            const size_t count = selectsEnd(i) - p.selects;
            if (count == 0) continue;
            const Impl::Select& sel = d.selects[p.selects];
            if (count > 1 || sel.kind != 0) throw syntaxError(sel.bracket, "a scope name takes one index");
            Tn_VerilogIndexedName* n = d.f().createIndexedName(loc);
            n->Prefix = prefix;
            n->Index = sel.e1;
            prefix = deep(d, n, {prefix, sel.e1});
        }
        Tn_VerilogSelectedName* n = d.f().createSelectedName(loc);
        n->Prefix = prefix;
        n->Suffix = d.nameParts.back().id.text;
        e = deep(d, n, {prefix});
    }
    const size_t begin = d.nameParts.back().selects, end = d.selects.size();
    const size_t count = end - begin;
    if (count > 0) {
        // Word selects: as many as the array has dimensions, or, for a name
        // not declared yet, all but the last select.
        size_t words = parts == 1 ? arrayDimensions(d, static_cast<Tn_VerilogSimpleName*>(e)->Name) : 0;
        words = words ? std::min(words, count) : count - 1;
        if (words > 0) {
            Tn_VerilogWordSelect* w = d.f().createWordSelect(loc);
            w->Operand = static_cast<Tn_VerilogName*>(e);
            for (size_t i = begin; i < begin + words; ++i) {
                const Impl::Select& sel = d.selects[i];
                if (sel.kind != 0) throw syntaxError(sel.bracket, "only the last select may be a part-select");
                w->Index.push_back(sel.e1);
            }
            e = deep(d, w, {e});
            for (size_t i = begin; i < begin + words; ++i) deepen(d, w, d.selects[i].e1);
        }
        if (begin + words + 1 < end) throw syntaxError(d.selects[begin + words + 1].bracket, "too many selects");
        if (begin + words < end) {
            const Impl::Select& sel = d.selects[begin + words];
            Tn_VerilogOperand* operand = static_cast<Tn_VerilogOperand*>(e);
            if (sel.kind == 0) {
                e = bitSelect(sel.bracket, operand, sel.e1);
            } else if (sel.kind == COLON) {
                e = partSelect(sel.bracket, operand, sel.e1, sel.e2);
            } else {
                Tn_VerilogIndexedPartSelect* p = d.f().createIndexedPartSelect(loc);
                p->NegativeFlag = sel.kind == MINUS_COLON;
                p->Operand = operand;
                p->Base = sel.e1;
                p->Width = sel.e2;
                e = deep(d, p, {operand, sel.e1, sel.e2});
            }
        }
    }
    d.selects.resize(first.selects);
    d.nameParts.resize(mark);
    return e;
}

Tn_VerilogExpression* Tn_VerilogParser::simpleName(const Tn_VerilogTok& id) {
    Tn_VerilogSimpleName* n = d_->f().createSimpleName((id).location);
    n->Name = id.text;
    return n;
}

Tn_VerilogExpression* Tn_VerilogParser::bitSelect(const Tn_VerilogTok&, Tn_VerilogExpression* operand,
                                                  Tn_VerilogExpression* index) {
    Tn_VerilogBitSelect* b = d_->f().createBitSelect(operand->location());
    b->Operand = static_cast<Tn_VerilogOperand*>(operand);
    b->Index = index;
    return deep(*d_, b, {operand, index});
}

Tn_VerilogExpression* Tn_VerilogParser::partSelect(const Tn_VerilogTok&, Tn_VerilogExpression* operand,
                                                   Tn_VerilogExpression* msb, Tn_VerilogExpression* lsb) {
    Tn_VerilogPartSelect* p = d_->f().createPartSelect(operand->location());
    p->Operand = static_cast<Tn_VerilogOperand*>(operand);
    p->Msb = msb;
    p->Lsb = lsb;
    return deep(*d_, p, {operand, msb, lsb});
}

// ---------------------------------------------------------------- numbers

Tn_VerilogExpression* Tn_VerilogParser::stringConstant(const Tn_VerilogTok& s) {
    const std::string& text = textOf(s);
    Tn_VerilogVectorConst* c = d_->f().createVectorConst((s).location);
    c->Value = Tn_VerilogVector(V::String, false, 0, text.data(), text.size());
    return c;
}

Tn_VerilogExpression* Tn_VerilogParser::integerConstant(const Tn_VerilogTok& digits) {
    Impl& d = *d_;
    const std::string& text = textOf(digits);
    const Tn_Location loc = (digits).location;
    uint64_t value = 0;
    bool wide = false;
    for (char c : text) {
        value = value * 10 + static_cast<uint64_t>(c - '0');
        if (value > 0xFFFFFFFFull) {
            wide = true;
            break;
        }
    }
    if (!wide && value <= 0x7FFFFFFFull) {
        Tn_VerilogIntegerConst* c = d.f().createIntegerConst(loc);
        c->Value = static_cast<int32_t>(value);
        return c;
    }
    // Unsized decimal numbers are 32 bits: a larger one keeps its low bits.
    if (wide) warning(loc, "%sInteger constant '%s' is too large to represent in 32 bits\n", text.c_str());
    Tn_VerilogVectorConst* c = d.f().createVectorConst(loc);
    c->Value = Tn_VerilogVector(V::Decimal, true, 0, text.data(), text.size());
    return c;
}

Tn_VerilogExpression* Tn_VerilogParser::realConstant(const Tn_VerilogTok& r) {
    Tn_VerilogRealConst* c = d_->f().createRealConst((r).location);
    c->Value = std::strtod(textOf(r).c_str(), nullptr);
    return c;
}

Tn_VerilogExpression* Tn_VerilogParser::basedConstant(const Tn_VerilogTok& size, const Tn_VerilogTok& base,
                                                      const Tn_VerilogTok& digits) {
    Impl& d = *d_;
    const Tn_Location loc = (size ? size : base).location;
    const int type = base.type;
    const bool isSigned = type == BASE_SD || type == BASE_SB || type == BASE_SO || type == BASE_SH;
    V::BaseType radix;
    const char* word;
    switch (type) {
    case BASE_B:
    case BASE_SB: radix = V::Binary, word = "binary"; break;
    case BASE_O:
    case BASE_SO: radix = V::Octal, word = "octal"; break;
    case BASE_H:
    case BASE_SH: radix = V::Hex, word = "hex"; break;
    default: radix = V::Decimal, word = "decimal"; break;
    }
    const std::string& text = textOf(digits);
    Tn_VerilogVectorConst* c = d.f().createVectorConst(loc);
    uint32_t width = 0;
    if (size) {
        uint64_t w = 0;
        for (char ch : textOf(size)) {
            w = w * 10 + static_cast<uint64_t>(ch - '0');
            if (w > 0xFFFFFFFFull) break;
        }
        if (w == 0) {
            warning(loc, "%sZero width on based number ignored\n");
        } else if (w > 0xFFFFFFFFull || w > kMaxLiteralWidth) {
            if (w > 0xFFFFFFFFull)
                TN_MSG().issueError("%sWidth on based number exceeds maximum of %u bits\n", loc.text().c_str(), 0xFFFFFFFFu);
            else
                TN_MSG().issueError("%sWidth on based number exceeds the supported maximum of %u bits\n",
                                    loc.text().c_str(), kMaxLiteralWidth);
            c->Value = Tn_VerilogVector(V::Binary, false, 1, "x", 1);
            return c;
        } else {
            width = static_cast<uint32_t>(w);
        }
    }
    if (width) {
        // The decimal limit is the number of digits of the largest value
        // the width holds (3 for 8 bits: 8'd255 is fine).
        double limit;
        switch (radix) {
        case V::Binary: limit = width; break;
        case V::Octal: limit = (width + 2) / 3; break;
        case V::Hex: limit = (width + 3) / 4; break;
        default: limit = std::floor(width * 0.30102999566398120) + 1; break;
        }
        if (static_cast<double>(text.size()) > limit)
            warning(loc, "%sToo many digits specified in %s constant\n", word);
    }
    c->Value = Tn_VerilogVector(radix, isSigned, width, text.data(), text.size());
    return c;
}
