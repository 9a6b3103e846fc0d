// What the generated grammar (Tn_VerilogGrammar) needs besides its rules:
// the construction hooks it calls (implemented by Tn_VerilogParser), the
// small records that carry a declaration or an instantiation across several
// hooks, the depth guard of the recursive rules and token classifications.
#ifndef TARN_TN_VERILOGGRAMMARUTIL_H
#define TARN_TN_VERILOGGRAMMARUTIL_H

#include <antlr/Token.hpp>
#include <antlr/TokenRefCount.hpp>
#include <cstddef>
#include <string>
#include <vector>

#include "library/tn_node.h"
#include "util/tn_rcstring.h"

class Tn_VerilogNode;
class Tn_VerilogExpression;
class Tn_VerilogEventExpression;
class Tn_VerilogStatement;
class Tn_VerilogGenerateStatement;
class Tn_VerilogAttributes;
class Tn_VerilogRange;
class Tn_VerilogDelay;
class Tn_VerilogDriveStrength;
class Tn_VerilogTypeDef;

typedef antlr::RefToken TokenRef;

// A token the grammar keeps for a hook: its type, its text (interned) and
// its place. A plain value: tokens that the rules match and drop never
// become token objects.
struct Tn_VerilogTok {
    int type = 0;
    Tn_Symbol text;
    Tn_Location location;
    int column = 0;
    explicit operator bool() const { return type != 0; }
};

// A declaration being read: the type part written once, shared by every name
// declared with it (the type definition node is made for the first name).
struct Tn_VerilogDeclSpec {
    enum Kind { NONE, NET, REG, INTEGER, TIME, REAL, REALTIME, EVENT };
    Tn_VerilogTok first;                       // where the declaration starts
    Tn_VerilogAttributes* attributes = nullptr;
    int direction = 0;                         // K_INPUT, K_OUTPUT, K_INOUT or 0
    int kind = NONE;
    int netType = 0;                           // the net keyword's token type
    bool isSigned = false;
    bool ansi = false;                         // a port declaration in a module header
    int grouping = -1;                         // 0 vectored, 1 scalared
    int chargeStrength = -1;                   // 0 small, 1 medium, 2 large
    Tn_VerilogDriveStrength* strength = nullptr;
    Tn_VerilogRange* range = nullptr;
    Tn_VerilogDelay* delay = nullptr;
    Tn_VerilogTypeDef* typeDef = nullptr;
};

// A parameter, localparam or specparam declaration being read.
struct Tn_VerilogParamSpec {
    Tn_VerilogTok first;
    Tn_VerilogAttributes* attributes = nullptr;
    bool local = false;
    bool specparam = false;
    int type = 0;                              // Tn_VerilogDeclSpec kind of integer/real/realtime/time, or 0
    bool isSigned = false;
    Tn_VerilogRange* range = nullptr;
};

// A gate or module instantiation being read (one statement, any number of
// instances).
struct Tn_VerilogInstSpec {
    Tn_VerilogTok first;                       // gate keyword or definition name
    Tn_VerilogAttributes* attributes = nullptr;
    int gateType = 0;                          // gate keyword's token type
    Tn_VerilogDriveStrength* strength = nullptr;
    Tn_VerilogDelay* delay = nullptr;
    size_t paramsBegin = 0;                    // parameter values: a range of the parser's list
    int count = 0;                             // instances made so far
};

class Tn_VerilogGrammarUtil {
public:
    // Depth of nested constructs at which parsing stops with an error: far
    // beyond real code, and far within the stack of the recursive rules.
    static const int kMaxNesting = 1000;

    virtual ~Tn_VerilogGrammarUtil();

    // Token classes used by the grammar's lookahead decisions.
    static bool isStrength(int type);
    static bool isChargeStrength(int type);
    static bool isAnsiPortStart(int type);
    static bool isBlockDeclaration(int type, bool ports);
    static bool isPulseControlName(const Tn_VerilogTok& id);
    static unsigned edgeDescriptorBit(int type);
    // Whether tokens of a type have a text of their own (names, numbers,
    // strings, strays); the others' text is their fixed text.
    static bool ownText(int type);

protected:
    // The tokens ahead, straight from the scanner: a ring of slots holding
    // type, text and place. The grammar needs a token object only for the
    // tokens it keeps (names, numbers), so the others never get one.
    struct Slot {
        int type = 0;
        bool hasText = false;
        std::string text;
        Tn_RCStringPtr file;
        int line = 0;
        int column = 0;
        TokenRef token;
    };
    struct Lookahead {
        std::vector<Slot> slots;
        unsigned int head = 0, count = 0, mask = 0;
        Slot& at(unsigned int i) { return slots[(head + i - 1) & mask]; }
    };
    Lookahead ahead_;
    // Reads tokens until i are ahead.
    virtual void fillLookahead(unsigned int i) = 0;
    // The token object of the i-th token ahead (made when first asked for;
    // the runtime's error reports use it).
    TokenRef lookaheadToken(unsigned int i);
    // The next token as a value.
    Tn_VerilogTok tok();
    // The file names of tokens as symbols (one interning per file).
    Tn_RCStringPtr lastFile_;
    Tn_Symbol lastFileSymbol_;
    void dropToken() {
        if (ahead_.count == 0) fillLookahead(1);
        ahead_.slots[ahead_.head].token = TokenRef();
        ahead_.head = (ahead_.head + 1) & ahead_.mask;
        --ahead_.count;
    }
    void clearLookahead();

    // Counts one level of a recursive rule for the lifetime of the rule.
    class Nest {
    public:
        explicit Nest(Tn_VerilogGrammarUtil& g) : g_(g) {
            if (++g_.nesting_ > kMaxNesting) g_.nestingExceeded();
        }
        ~Nest() { --g_.nesting_; }
        Nest(const Nest&) = delete;
        Nest& operator=(const Nest&) = delete;

    private:
        Tn_VerilogGrammarUtil& g_;
    };
    // Marks an expression that must be constant (its function calls are
    // constant function calls).
    class ConstantContext {
    public:
        explicit ConstantContext(Tn_VerilogGrammarUtil& g) : g_(g) { ++g_.constant_; }
        ~ConstantContext() { --g_.constant_; }
        ConstantContext(const ConstantContext&) = delete;
        ConstantContext& operator=(const ConstantContext&) = delete;

    private:
        Tn_VerilogGrammarUtil& g_;
    };

    bool v2001() const { return verilog2001_; }
    bool inConstantExpression() const { return constant_ > 0; }
    // Throws: the nesting went beyond kMaxNesting.
    virtual void nestingExceeded() = 0;
    // Whether a declaration (after any attribute instances) comes next.
    virtual bool declarationAhead(bool ports) = 0;

    // Design units.
    virtual void skipConfiguration(const Tn_VerilogTok& config) = 0;
    virtual void beginModule(const Tn_VerilogTok& keyword, const Tn_VerilogTok& id, Tn_VerilogAttributes* a) = 0;
    virtual void endModule(const Tn_VerilogTok& end) = 0;
    virtual void modulePort(const Tn_VerilogTok& where, const Tn_VerilogTok& name, Tn_VerilogExpression* e) = 0;
    virtual Tn_VerilogExpression* portReferenceName(const Tn_VerilogTok& id) = 0;
    virtual void udpBegin(const Tn_VerilogTok& keyword, const Tn_VerilogTok& id, Tn_VerilogAttributes* a) = 0;
    virtual void udpPort(const Tn_VerilogTok& id) = 0;
    virtual void udpInitialStatement(const Tn_VerilogTok& keyword, const Tn_VerilogTok& id, Tn_VerilogExpression* e) = 0;
    virtual void udpTableBegin(const Tn_VerilogTok& table) = 0;
    virtual bool udpSequential() = 0;
    virtual void udpRowBegin(const Tn_VerilogTok& first) = 0;
    virtual void udpRowSymbol(const Tn_VerilogTok& symbol) = 0;
    virtual void udpRowEdgeOpen(const Tn_VerilogTok& paren) = 0;
    virtual void udpRowEdgeClose(const Tn_VerilogTok& paren) = 0;
    virtual void udpRowColon(const Tn_VerilogTok& colon) = 0;
    virtual void udpRowEnd(const Tn_VerilogTok& semi) = 0;
    virtual void udpEnd(const Tn_VerilogTok& end) = 0;

    // Attributes.
    virtual Tn_VerilogAttributes* attributesBegin(const Tn_VerilogTok& open) = 0;
    virtual void attributeAdd(Tn_VerilogAttributes* a, const Tn_VerilogTok& id, Tn_VerilogExpression* e) = 0;

    // Declarations. Unpacked dimensions are collected between
    // dimensionsBegin() and the declaration that takes them.
    virtual void declarePort(Tn_VerilogDeclSpec& s, const Tn_VerilogTok& id, Tn_VerilogExpression* init) = 0;
    virtual size_t dimensionsBegin() = 0;
    virtual void dimensionAdd(Tn_VerilogRange* r) = 0;
    virtual void declareNet(Tn_VerilogDeclSpec& s, const Tn_VerilogTok& id, size_t dims, Tn_VerilogExpression* e) = 0;
    virtual void declareVariable(Tn_VerilogDeclSpec& s, const Tn_VerilogTok& id, size_t dims, Tn_VerilogExpression* e) = 0;
    virtual void declareGenvar(const Tn_VerilogTok& id, Tn_VerilogAttributes* a) = 0;
    virtual void declareParameter(Tn_VerilogParamSpec& s, const Tn_VerilogTok& id, Tn_VerilogExpression* e) = 0;
    virtual Tn_VerilogExpression* pulseLimits(const Tn_VerilogTok& paren, Tn_VerilogExpression* reject,
                                              Tn_VerilogExpression* error) = 0;
    virtual void defparam(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* target,
                          Tn_VerilogExpression* value) = 0;
    virtual Tn_VerilogDriveStrength* driveStrengthBegin(const Tn_VerilogTok& paren) = 0;
    virtual void driveStrengthAdd(Tn_VerilogDriveStrength* s, int keyword) = 0;
    virtual Tn_VerilogRange* makeRange(const Tn_VerilogTok& bracket, Tn_VerilogExpression* msb, Tn_VerilogExpression* lsb) = 0;
    virtual Tn_VerilogDelay* delayBegin(const Tn_VerilogTok& hash) = 0;
    virtual void delayAdd(Tn_VerilogDelay* d, Tn_VerilogExpression* e) = 0;

    // Module items.
    virtual void contAssign(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogDriveStrength* s,
                            Tn_VerilogDelay* d, Tn_VerilogExpression* target, Tn_VerilogExpression* source) = 0;
    virtual Tn_VerilogNode* gateBegin(Tn_VerilogInstSpec& s, const Tn_VerilogTok& id, Tn_VerilogRange* r,
                                      const Tn_VerilogTok& paren) = 0;
    virtual void gateTerminal(Tn_VerilogNode* gate, Tn_VerilogExpression* e) = 0;
    virtual void gateEnd(Tn_VerilogInstSpec& s, Tn_VerilogNode* gate) = 0;
    virtual size_t parameterValuesBegin() = 0;
    virtual void paramValue(Tn_VerilogInstSpec& s, const Tn_VerilogTok& name, Tn_VerilogExpression* e) = 0;
    virtual Tn_VerilogNode* instanceBegin(Tn_VerilogInstSpec& s, const Tn_VerilogTok& id, Tn_VerilogRange* r,
                                          const Tn_VerilogTok& paren) = 0;
    virtual void connection(Tn_VerilogNode* inst, Tn_VerilogAttributes* a, const Tn_VerilogTok& where,
                            const Tn_VerilogTok& name, Tn_VerilogExpression* e) = 0;
    virtual void instantiationEnd(Tn_VerilogInstSpec& s) = 0;
    virtual void process(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogStatement* s) = 0;
    virtual void taskBegin(const Tn_VerilogTok& keyword, const Tn_VerilogTok& id, Tn_VerilogAttributes* a, bool automatic) = 0;
    virtual void taskEnd(const Tn_VerilogTok& end) = 0;
    virtual void functionBegin(const Tn_VerilogTok& keyword, const Tn_VerilogTok& id, Tn_VerilogAttributes* a, bool automatic,
                               Tn_VerilogDeclSpec& result) = 0;
    virtual void functionEnd(const Tn_VerilogTok& end) = 0;
    virtual void procedureBody(Tn_VerilogStatement* s) = 0;

    // Generate constructs.
    virtual void generateRegionBegin(const Tn_VerilogTok& keyword) = 0;
    virtual void generateRegionEnd() = 0;
    virtual void addGenerateStatement(Tn_VerilogGenerateStatement* g) = 0;
    virtual Tn_VerilogGenerateStatement* generateBlockBegin(const Tn_VerilogTok& first, const Tn_VerilogTok& name) = 0;
    virtual void generateBlockEnd(Tn_VerilogGenerateStatement* g) = 0;
    virtual Tn_VerilogGenerateStatement* generateForBegin(const Tn_VerilogTok& keyword, const Tn_VerilogTok& genvar,
                                                          const Tn_VerilogTok& id, Tn_VerilogExpression* init,
                                                          Tn_VerilogExpression* condition, const Tn_VerilogTok& id2,
                                                          Tn_VerilogExpression* step) = 0;
    virtual void generateLoopBodyBegin(Tn_VerilogGenerateStatement* g, const Tn_VerilogTok& first, const Tn_VerilogTok& name) = 0;
    virtual void generateLoopBodyEnd(Tn_VerilogGenerateStatement* g) = 0;
    virtual Tn_VerilogGenerateStatement* makeGenerateIf(const Tn_VerilogTok& keyword, Tn_VerilogExpression* c) = 0;
    virtual void generateIfBranch(Tn_VerilogGenerateStatement* g, Tn_VerilogGenerateStatement* branch, bool then) = 0;
    virtual Tn_VerilogGenerateStatement* makeGenerateCase(const Tn_VerilogTok& keyword, Tn_VerilogExpression* e) = 0;
    virtual Tn_VerilogGenerateStatement* generateCaseItemBegin(Tn_VerilogGenerateStatement* g,
                                                               const Tn_VerilogTok& first) = 0;
    virtual void generateCaseItemExpression(Tn_VerilogGenerateStatement* item, Tn_VerilogExpression* e) = 0;
    virtual void generateCaseItemBody(Tn_VerilogGenerateStatement* item, Tn_VerilogGenerateStatement* body) = 0;

    // Specify blocks.
    virtual Tn_VerilogNode* pulseControlBegin(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a) = 0;
    virtual void pulseControlOutput(Tn_VerilogNode* p, Tn_VerilogExpression* e) = 0;
    virtual Tn_VerilogNode* pathBegin(const Tn_VerilogTok& first, Tn_VerilogAttributes* a, Tn_VerilogExpression* condition,
                                      bool ifnone) = 0;
    virtual void pathInput(Tn_VerilogNode* p, Tn_VerilogExpression* e, int edge) = 0;
    virtual void pathPolarity(Tn_VerilogNode* p, int sign, bool data) = 0;
    virtual void pathType(Tn_VerilogNode* p, int type) = 0;
    virtual void pathOutput(Tn_VerilogNode* p, Tn_VerilogExpression* e) = 0;
    virtual void pathData(Tn_VerilogNode* p, Tn_VerilogExpression* e) = 0;
    virtual void pathDelay(Tn_VerilogNode* p, Tn_VerilogExpression* e) = 0;
    virtual void pathEnd(Tn_VerilogNode* p, const Tn_VerilogTok& semi) = 0;
    virtual Tn_VerilogNode* timingCheckBegin(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a) = 0;
    virtual void timingCheckArg(Tn_VerilogNode* c, const Tn_VerilogTok& where, int edge, unsigned descriptors,
                                Tn_VerilogExpression* e, Tn_VerilogExpression* condition) = 0;
    virtual void timingCheckEnd(Tn_VerilogNode* c, const Tn_VerilogTok& paren) = 0;
    virtual void ignoreSpecifyTask(const Tn_VerilogTok& id) = 0;

    // Statements.
    virtual Tn_VerilogStatement* nullStatement(const Tn_VerilogTok& semi, Tn_VerilogAttributes* a) = 0;
    virtual Tn_VerilogStatement* blockingAssign(const Tn_VerilogTok& first, Tn_VerilogAttributes* a,
                                                Tn_VerilogExpression* target, Tn_VerilogStatement* control,
                                                Tn_VerilogExpression* source) = 0;
    virtual Tn_VerilogStatement* nonBlockingAssign(const Tn_VerilogTok& first, Tn_VerilogAttributes* a,
                                                   Tn_VerilogExpression* target, Tn_VerilogStatement* control,
                                                   Tn_VerilogExpression* source) = 0;
    virtual Tn_VerilogStatement* taskCall(const Tn_VerilogTok& first, Tn_VerilogAttributes* a, Tn_VerilogExpression* name) = 0;
    virtual void callArgument(Tn_VerilogNode* call, Tn_VerilogExpression* e) = 0;
    virtual Tn_VerilogExpression* systemCall(const Tn_VerilogTok& id) = 0;
    virtual void systemArgument(Tn_VerilogExpression* call, Tn_VerilogExpression* e, const Tn_VerilogTok& where) = 0;
    virtual Tn_VerilogStatement* systemTask(const Tn_VerilogTok& id, Tn_VerilogAttributes* a, Tn_VerilogExpression* call) = 0;
    virtual Tn_VerilogStatement* delayControl(const Tn_VerilogTok& hash, Tn_VerilogAttributes* a, Tn_VerilogExpression* d,
                                              Tn_VerilogStatement* s) = 0;
    virtual Tn_VerilogStatement* repeatControl(const Tn_VerilogTok& keyword, Tn_VerilogExpression* count,
                                               Tn_VerilogStatement* eventControl) = 0;
    virtual Tn_VerilogStatement* makeEventControl(const Tn_VerilogTok& at, Tn_VerilogAttributes* a,
                                                  Tn_VerilogEventExpression* e) = 0;
    virtual Tn_VerilogStatement* emptyEventControl(const Tn_VerilogTok& at, Tn_VerilogAttributes* a,
                                                   const Tn_VerilogTok& paren) = 0;
    virtual void eventControlBody(Tn_VerilogStatement* control, Tn_VerilogStatement* s) = 0;
    virtual Tn_VerilogEventExpression* eventOr(Tn_VerilogEventExpression* first) = 0;
    virtual void eventOrAdd(Tn_VerilogEventExpression* o, Tn_VerilogEventExpression* e) = 0;
    virtual Tn_VerilogEventExpression* edgeEvent(const Tn_VerilogTok& keyword, Tn_VerilogExpression* e) = 0;
    virtual size_t ifChainBegin() = 0;
    virtual void ifChainAdd(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* c,
                            Tn_VerilogStatement* s) = 0;
    virtual Tn_VerilogStatement* ifChainEnd(size_t mark, Tn_VerilogStatement* otherwise) = 0;
    virtual Tn_VerilogStatement* caseBegin(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a) = 0;
    virtual void caseSelector(Tn_VerilogStatement* c, Tn_VerilogExpression* e) = 0;
    virtual Tn_VerilogStatement* caseItemBegin(Tn_VerilogStatement* c, const Tn_VerilogTok& first) = 0;
    virtual void caseItemExpression(Tn_VerilogStatement* item, Tn_VerilogExpression* e) = 0;
    virtual void caseItemBody(Tn_VerilogStatement* c, Tn_VerilogStatement* item, Tn_VerilogStatement* s) = 0;
    virtual Tn_VerilogStatement* forever(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogStatement* s) = 0;
    virtual Tn_VerilogStatement* repeat(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* e,
                                        Tn_VerilogStatement* s) = 0;
    virtual Tn_VerilogStatement* whileLoop(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* e,
                                           Tn_VerilogStatement* s) = 0;
    virtual Tn_VerilogStatement* forLoop(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogStatement* init,
                                         Tn_VerilogExpression* c, Tn_VerilogStatement* step, Tn_VerilogStatement* s) = 0;
    virtual Tn_VerilogStatement* blockBegin(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a) = 0;
    virtual Tn_VerilogStatement* blockName(Tn_VerilogStatement* b, const Tn_VerilogTok& id) = 0;
    virtual void blockAdd(Tn_VerilogStatement* b, Tn_VerilogStatement* s) = 0;
    virtual void blockEnd(Tn_VerilogStatement* b) = 0;
    virtual Tn_VerilogStatement* makeWait(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* e,
                                          Tn_VerilogStatement* s) = 0;
    virtual Tn_VerilogStatement* disable(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* n) = 0;
    virtual Tn_VerilogStatement* makeEventTrigger(const Tn_VerilogTok& arrow, Tn_VerilogAttributes* a,
                                                  Tn_VerilogExpression* n) = 0;
    virtual Tn_VerilogStatement* proceduralAssign(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a,
                                                  Tn_VerilogExpression* target, Tn_VerilogExpression* source) = 0;
    virtual Tn_VerilogStatement* proceduralRelease(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a,
                                                   Tn_VerilogExpression* target) = 0;

    // Expressions.
    virtual size_t conditionalBegin() = 0;
    virtual void conditionalAdd(const Tn_VerilogTok& question, Tn_VerilogAttributes* a, Tn_VerilogExpression* c,
                                Tn_VerilogExpression* t) = 0;
    virtual Tn_VerilogExpression* conditionalEnd(size_t mark, Tn_VerilogExpression* last) = 0;
    virtual size_t binaryBegin() = 0;
    virtual void binaryOperand(Tn_VerilogExpression* e) = 0;
    virtual void binaryOperator(size_t mark, const Tn_VerilogTok& op, Tn_VerilogAttributes* a) = 0;
    virtual Tn_VerilogExpression* binaryEnd(size_t mark, Tn_VerilogExpression* last) = 0;
    virtual size_t unaryBegin() = 0;
    virtual void unaryOperator(const Tn_VerilogTok& op, Tn_VerilogAttributes* a) = 0;
    virtual Tn_VerilogExpression* unaryEnd(size_t mark, Tn_VerilogExpression* operand) = 0;
    virtual Tn_VerilogExpression* minTypMax(const Tn_VerilogTok& colon, Tn_VerilogExpression* min, Tn_VerilogExpression* typ,
                                            Tn_VerilogExpression* max) = 0;
    virtual Tn_VerilogExpression* makeConcatenation(const Tn_VerilogTok& brace, Tn_VerilogExpression* first) = 0;
    virtual Tn_VerilogExpression* multipleConcatenation(const Tn_VerilogTok& brace, Tn_VerilogExpression* count) = 0;
    virtual void concatenationAdd(Tn_VerilogExpression* c, Tn_VerilogExpression* e) = 0;
    virtual Tn_VerilogExpression* functionCall(const Tn_VerilogTok& paren, Tn_VerilogAttributes* a,
                                               Tn_VerilogExpression* name) = 0;
    virtual size_t nameBegin() = 0;
    virtual void nameComponent(const Tn_VerilogTok& id) = 0;
    virtual void nameSelect(const Tn_VerilogTok& bracket, int kind, Tn_VerilogExpression* e1, Tn_VerilogExpression* e2) = 0;
    virtual Tn_VerilogExpression* nameEnd(size_t mark) = 0;
    virtual Tn_VerilogExpression* simpleName(const Tn_VerilogTok& id) = 0;
    virtual Tn_VerilogExpression* bitSelect(const Tn_VerilogTok& bracket, Tn_VerilogExpression* operand,
                                            Tn_VerilogExpression* index) = 0;
    virtual Tn_VerilogExpression* partSelect(const Tn_VerilogTok& bracket, Tn_VerilogExpression* operand,
                                             Tn_VerilogExpression* msb, Tn_VerilogExpression* lsb) = 0;
    virtual Tn_VerilogExpression* stringConstant(const Tn_VerilogTok& s) = 0;
    virtual Tn_VerilogExpression* integerConstant(const Tn_VerilogTok& digits) = 0;
    virtual Tn_VerilogExpression* realConstant(const Tn_VerilogTok& r) = 0;
    virtual Tn_VerilogExpression* basedConstant(const Tn_VerilogTok& size, const Tn_VerilogTok& base, const Tn_VerilogTok& digits) = 0;

    bool verilog2001_ = true;

private:
    int nesting_ = 0;
    int constant_ = 0;
    friend class Nest;
    friend class ConstantContext;

protected:
    void resetNesting() {
        nesting_ = 0;
        constant_ = 0;
    }
};

#endif
