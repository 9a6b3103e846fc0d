// The Verilog parser: the generated grammar with its construction hooks.
// It builds each module or UDP as a design unit (nodes made through the
// unit's factory, token texts interned, locations of each construct's first
// token), keeps the scope stack, enforces the declaration rules and reports
// syntax errors. One parser lives as long as its driver and parses one
// compilation per call.
#ifndef TARN_TN_VERILOGPARSER_H
#define TARN_TN_VERILOGPARSER_H

#include <memory>
#include <string>
#include <unordered_map>
#include <unordered_set>
#include <vector>

#include "library/tn_node.h"
#include "src/tn_verilogoptions.h"
#include "util/tn_exception.h"
#include "util/tn_rcstring.h"
#include "verilog/Tn_VerilogGrammar.hpp"
#include "verilog/tn_verilogenums.h"

class Tn_Library;
class Tn_VerilogDirectiveState;
class Tn_VerilogTokenStreamFilter;
class Tn_VerilogDesignUnit;
class Tn_VerilogNodeFactory;
class Tn_VerilogScope;
class Tn_VerilogRegion;
class Tn_VerilogConcurrentRegion;
class Tn_VerilogDeclaration;
class Tn_VerilogIODeclaration;
class Tn_VerilogModule;
class Tn_VerilogUdpDefn;
class Tn_VerilogFunction;
class Tn_VerilogName;

// A text that is not one expression (the message of the syntax error).
class Tn_VerilogExpressionSyntaxError : public Tn_Exception {
public:
    explicit Tn_VerilogExpressionSyntaxError(const Port_String& message);
    const Port_String& message() const { return message_; }

private:
    Port_String message_;
};

class Tn_VerilogParser : public Tn_VerilogGrammar {
public:
    // Beyond this depth a node tree (an operator chain, an else-if chain) is
    // refused: later recursive walkers of the tree must not run out of stack.
    static const int kMaxTreeDepth = 10000;
    // Widest based literal made (bits); wider sizes are reported.
    static const uint32_t kMaxLiteralWidth = 1u << 24;

    Tn_VerilogParser(const Tn_VerilogOptions& options, Tn_VerilogDirectiveState& directives,
                     Tn_VerilogTokenStreamFilter& filter);
    ~Tn_VerilogParser() override;
    Tn_VerilogParser(const Tn_VerilogParser&) = delete;
    Tn_VerilogParser& operator=(const Tn_VerilogParser&) = delete;

    // Scans the source files and parses them into library; the names of the
    // units parsed are appended to compiled (when given), also after an error.
    void parse(const Tn_StringList& files, Tn_Library& library, Tn_StringList* compiled);

    // One expression read from text (a -G value, say), its nodes made by
    // factory. Macros of directives (when given) are expanded. Throws
    // Tn_VerilogExpressionSyntaxError when the text is not exactly one
    // expression; messages about the text (illegal digits, numbers) are issued.
    static Tn_VerilogExpression* parseExpression(const Port_String& text, Tn_VerilogNodeFactory& factory,
                                                 const Tn_VerilogOptions& options,
                                                 Tn_VerilogDirectiveState* directives = nullptr);

    // Reporting, framed as the front end frames every syntax error.
    void reportError(const antlr::RecognitionException& ex) override;
    void reportError(const std::string& s) override;
    void reportWarning(const std::string& s) override;
    // The file of the current lookahead token.
    std::string getFilename() const override;


protected:
    // Construction hooks (tn_veriloggrammarutil.h).
    void nestingExceeded() override;
    bool declarationAhead(bool ports) override;
    void skipConfiguration(const TokenRef& config) override;
    void beginModule(const TokenRef& keyword, const TokenRef& id, Tn_VerilogAttributes* a) override;
    void endModule(const TokenRef& end) override;
    void modulePort(const TokenRef& where, const TokenRef& name, Tn_VerilogExpression* e) override;
    Tn_VerilogExpression* portReferenceName(const TokenRef& id) override;
    void udpBegin(const TokenRef& keyword, const TokenRef& id, Tn_VerilogAttributes* a) override;
    void udpPort(const TokenRef& id) override;
    void udpInitialStatement(const TokenRef& keyword, const TokenRef& id, Tn_VerilogExpression* e) override;
    void udpTableBegin(const TokenRef& table) override;
    bool udpSequential() override;
    void udpRowBegin(const TokenRef& first) override;
    void udpRowSymbol(const TokenRef& symbol) override;
    void udpRowEdgeOpen(const TokenRef& paren) override;
    void udpRowEdgeClose(const TokenRef& paren) override;
    void udpRowColon(const TokenRef& colon) override;
    void udpRowEnd(const TokenRef& semi) override;
    void udpEnd(const TokenRef& end) override;
    Tn_VerilogAttributes* attributesBegin(const TokenRef& open) override;
    void attributeAdd(Tn_VerilogAttributes* a, const TokenRef& id, Tn_VerilogExpression* e) override;
    void declarePort(Tn_VerilogDeclSpec& s, const TokenRef& id, Tn_VerilogExpression* init) override;
    size_t dimensionsBegin() override;
    void dimensionAdd(Tn_VerilogRange* r) override;
    void declareNet(Tn_VerilogDeclSpec& s, const TokenRef& id, size_t dims, Tn_VerilogExpression* e) override;
    void declareVariable(Tn_VerilogDeclSpec& s, const TokenRef& id, size_t dims, Tn_VerilogExpression* e) override;
    void declareGenvar(const TokenRef& id, Tn_VerilogAttributes* a) override;
    void declareParameter(Tn_VerilogParamSpec& s, const TokenRef& id, Tn_VerilogExpression* e) override;
    Tn_VerilogExpression* pulseLimits(const TokenRef& paren, Tn_VerilogExpression* reject,
                                      Tn_VerilogExpression* error) override;
    void defparam(const TokenRef& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* target,
                  Tn_VerilogExpression* value) override;
    Tn_VerilogDriveStrength* driveStrengthBegin(const TokenRef& paren) override;
    void driveStrengthAdd(Tn_VerilogDriveStrength* s, int keyword) override;
    Tn_VerilogRange* makeRange(const TokenRef& bracket, Tn_VerilogExpression* msb, Tn_VerilogExpression* lsb) override;
    Tn_VerilogDelay* delayBegin(const TokenRef& hash) override;
    void delayAdd(Tn_VerilogDelay* d, Tn_VerilogExpression* e) override;
    void contAssign(const TokenRef& keyword, Tn_VerilogAttributes* a, Tn_VerilogDriveStrength* s, Tn_VerilogDelay* d,
                    Tn_VerilogExpression* target, Tn_VerilogExpression* source) override;
    Tn_VerilogNode* gateBegin(Tn_VerilogInstSpec& s, const TokenRef& id, Tn_VerilogRange* r,
                              const TokenRef& paren) override;
    void gateTerminal(Tn_VerilogNode* gate, Tn_VerilogExpression* e) override;
    void gateEnd(Tn_VerilogInstSpec& s, Tn_VerilogNode* gate) override;
    size_t parameterValuesBegin() override;
    void paramValue(Tn_VerilogInstSpec& s, const TokenRef& name, Tn_VerilogExpression* e) override;
    Tn_VerilogNode* instanceBegin(Tn_VerilogInstSpec& s, const TokenRef& id, Tn_VerilogRange* r,
                                  const TokenRef& paren) override;
    void connection(Tn_VerilogNode* inst, Tn_VerilogAttributes* a, const TokenRef& where, const TokenRef& name,
                    Tn_VerilogExpression* e) override;
    void instantiationEnd(Tn_VerilogInstSpec& s) override;
    void process(const TokenRef& keyword, Tn_VerilogAttributes* a, Tn_VerilogStatement* s) override;
    void taskBegin(const TokenRef& keyword, const TokenRef& id, Tn_VerilogAttributes* a, bool automatic) override;
    void taskEnd(const TokenRef& end) override;
    void functionBegin(const TokenRef& keyword, const TokenRef& id, Tn_VerilogAttributes* a, bool automatic,
                       Tn_VerilogDeclSpec& result) override;
    void functionEnd(const TokenRef& end) override;
    void procedureBody(Tn_VerilogStatement* s) override;
    void generateRegionBegin(const TokenRef& keyword) override;
    void generateRegionEnd() override;
    void addGenerateStatement(Tn_VerilogGenerateStatement* g) override;
    Tn_VerilogGenerateStatement* generateBlockBegin(const TokenRef& first, const TokenRef& name) override;
    void generateBlockEnd(Tn_VerilogGenerateStatement* g) override;
    Tn_VerilogGenerateStatement* generateForBegin(const TokenRef& keyword, const TokenRef& genvar, const TokenRef& id,
                                                  Tn_VerilogExpression* init, Tn_VerilogExpression* condition,
                                                  const TokenRef& id2, Tn_VerilogExpression* step) override;
    void generateLoopBodyBegin(Tn_VerilogGenerateStatement* g, const TokenRef& first, const TokenRef& name) override;
    void generateLoopBodyEnd(Tn_VerilogGenerateStatement* g) override;
    Tn_VerilogGenerateStatement* makeGenerateIf(const TokenRef& keyword, Tn_VerilogExpression* c) override;
    void generateIfBranch(Tn_VerilogGenerateStatement* g, Tn_VerilogGenerateStatement* branch, bool then) override;
    Tn_VerilogGenerateStatement* makeGenerateCase(const TokenRef& keyword, Tn_VerilogExpression* e) override;
    Tn_VerilogGenerateStatement* generateCaseItemBegin(Tn_VerilogGenerateStatement* g, const TokenRef& first) override;
    void generateCaseItemExpression(Tn_VerilogGenerateStatement* item, Tn_VerilogExpression* e) override;
    void generateCaseItemBody(Tn_VerilogGenerateStatement* item, Tn_VerilogGenerateStatement* body) override;
    Tn_VerilogNode* pulseControlBegin(const TokenRef& keyword, Tn_VerilogAttributes* a) override;
    void pulseControlOutput(Tn_VerilogNode* p, Tn_VerilogExpression* e) override;
    Tn_VerilogNode* pathBegin(const TokenRef& first, Tn_VerilogAttributes* a, Tn_VerilogExpression* condition,
                              bool ifnone) override;
    void pathEdge(Tn_VerilogNode* p, int edge) override;
    void pathInput(Tn_VerilogNode* p, Tn_VerilogExpression* e) override;
    void pathPolarity(Tn_VerilogNode* p, int sign, bool data) override;
    void pathType(Tn_VerilogNode* p, int type) override;
    void pathOutput(Tn_VerilogNode* p, Tn_VerilogExpression* e) override;
    void pathData(Tn_VerilogNode* p, Tn_VerilogExpression* e) override;
    void pathDelay(Tn_VerilogNode* p, Tn_VerilogExpression* e) override;
    void pathEnd(Tn_VerilogNode* p, const TokenRef& semi) override;
    Tn_VerilogNode* timingCheckBegin(const TokenRef& keyword, Tn_VerilogAttributes* a) override;
    void timingCheckArg(Tn_VerilogNode* c, const TokenRef& where, int edge, unsigned descriptors,
                        Tn_VerilogExpression* e, Tn_VerilogExpression* condition) override;
    void timingCheckEnd(Tn_VerilogNode* c, const TokenRef& paren) override;
    void ignoreSpecifyTask(const TokenRef& id) override;
    Tn_VerilogStatement* nullStatement(const TokenRef& semi, Tn_VerilogAttributes* a) override;
    Tn_VerilogStatement* blockingAssign(const TokenRef& first, Tn_VerilogAttributes* a, Tn_VerilogExpression* target,
                                        Tn_VerilogStatement* control, Tn_VerilogExpression* source) override;
    Tn_VerilogStatement* nonBlockingAssign(const TokenRef& first, Tn_VerilogAttributes* a, Tn_VerilogExpression* target,
                                           Tn_VerilogStatement* control, Tn_VerilogExpression* source) override;
    Tn_VerilogStatement* taskCall(const TokenRef& first, Tn_VerilogAttributes* a, Tn_VerilogExpression* name) override;
    void callArgument(Tn_VerilogNode* call, Tn_VerilogExpression* e) override;
    Tn_VerilogExpression* systemCall(const TokenRef& id) override;
    void systemArgument(Tn_VerilogExpression* call, Tn_VerilogExpression* e, const TokenRef& where) override;
    Tn_VerilogStatement* systemTask(const TokenRef& id, Tn_VerilogAttributes* a, Tn_VerilogExpression* call) override;
    Tn_VerilogStatement* delayControl(const TokenRef& hash, Tn_VerilogAttributes* a, Tn_VerilogExpression* d,
                                      Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* repeatControl(const TokenRef& keyword, Tn_VerilogExpression* count,
                                       Tn_VerilogStatement* eventControl) override;
    Tn_VerilogStatement* makeEventControl(const TokenRef& at, Tn_VerilogAttributes* a,
                                          Tn_VerilogEventExpression* e) override;
    Tn_VerilogStatement* emptyEventControl(const TokenRef& at, Tn_VerilogAttributes* a, const TokenRef& paren) override;
    void eventControlBody(Tn_VerilogStatement* control, Tn_VerilogStatement* s) override;
    Tn_VerilogEventExpression* eventOr(Tn_VerilogEventExpression* first) override;
    void eventOrAdd(Tn_VerilogEventExpression* o, Tn_VerilogEventExpression* e) override;
    Tn_VerilogEventExpression* edgeEvent(const TokenRef& keyword, Tn_VerilogExpression* e) override;
    size_t ifChainBegin() override;
    void ifChainAdd(const TokenRef& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* c,
                    Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* ifChainEnd(size_t mark, Tn_VerilogStatement* otherwise) override;
    Tn_VerilogStatement* caseBegin(const TokenRef& keyword, Tn_VerilogAttributes* a) override;
    void caseSelector(Tn_VerilogStatement* c, Tn_VerilogExpression* e) override;
    Tn_VerilogStatement* caseItemBegin(Tn_VerilogStatement* c, const TokenRef& first) override;
    void caseItemExpression(Tn_VerilogStatement* item, Tn_VerilogExpression* e) override;
    void caseItemBody(Tn_VerilogStatement* item, Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* forever(const TokenRef& keyword, Tn_VerilogAttributes* a, Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* repeat(const TokenRef& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* e,
                                Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* whileLoop(const TokenRef& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* e,
                                   Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* forLoop(const TokenRef& keyword, Tn_VerilogAttributes* a, Tn_VerilogStatement* init,
                                 Tn_VerilogExpression* c, Tn_VerilogStatement* step, Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* blockBegin(const TokenRef& keyword, Tn_VerilogAttributes* a) override;
    Tn_VerilogStatement* blockName(Tn_VerilogStatement* b, const TokenRef& id) override;
    void blockAdd(Tn_VerilogStatement* b, Tn_VerilogStatement* s) override;
    void blockEnd(Tn_VerilogStatement* b) override;
    Tn_VerilogStatement* makeWait(const TokenRef& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* e,
                                  Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* disable(const TokenRef& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* n) override;
    Tn_VerilogStatement* makeEventTrigger(const TokenRef& arrow, Tn_VerilogAttributes* a,
                                          Tn_VerilogExpression* n) override;
    Tn_VerilogStatement* proceduralAssign(const TokenRef& keyword, Tn_VerilogAttributes* a,
                                          Tn_VerilogExpression* target, Tn_VerilogExpression* source) override;
    Tn_VerilogStatement* proceduralRelease(const TokenRef& keyword, Tn_VerilogAttributes* a,
                                           Tn_VerilogExpression* target) override;
    size_t conditionalBegin() override;
    void conditionalAdd(const TokenRef& question, Tn_VerilogAttributes* a, Tn_VerilogExpression* c,
                        Tn_VerilogExpression* t) override;
    Tn_VerilogExpression* conditionalEnd(size_t mark, Tn_VerilogExpression* last) override;
    size_t binaryBegin() override;
    void binaryOperand(Tn_VerilogExpression* e) override;
    void binaryOperator(const TokenRef& op, Tn_VerilogAttributes* a) override;
    Tn_VerilogExpression* binaryEnd(size_t mark, Tn_VerilogExpression* last) override;
    size_t unaryBegin() override;
    void unaryOperator(const TokenRef& op, Tn_VerilogAttributes* a) override;
    Tn_VerilogExpression* unaryEnd(size_t mark, Tn_VerilogExpression* operand) override;
    Tn_VerilogExpression* minTypMax(const TokenRef& colon, Tn_VerilogExpression* min, Tn_VerilogExpression* typ,
                                    Tn_VerilogExpression* max) override;
    Tn_VerilogExpression* makeConcatenation(const TokenRef& brace, Tn_VerilogExpression* first) override;
    Tn_VerilogExpression* multipleConcatenation(const TokenRef& brace, Tn_VerilogExpression* count) override;
    void concatenationAdd(Tn_VerilogExpression* c, Tn_VerilogExpression* e) override;
    Tn_VerilogExpression* functionCall(const TokenRef& paren, Tn_VerilogAttributes* a,
                                       Tn_VerilogExpression* name) override;
    size_t nameBegin() override;
    void nameComponent(const TokenRef& id) override;
    void nameSelect(const TokenRef& bracket, int kind, Tn_VerilogExpression* e1, Tn_VerilogExpression* e2) override;
    Tn_VerilogExpression* nameEnd(size_t mark) override;
    Tn_VerilogExpression* simpleName(const TokenRef& id) override;
    Tn_VerilogExpression* bitSelect(const TokenRef& bracket, Tn_VerilogExpression* operand,
                                    Tn_VerilogExpression* index) override;
    Tn_VerilogExpression* partSelect(const TokenRef& bracket, Tn_VerilogExpression* operand, Tn_VerilogExpression* msb,
                                     Tn_VerilogExpression* lsb) override;
    Tn_VerilogExpression* stringConstant(const TokenRef& s) override;
    Tn_VerilogExpression* integerConstant(const TokenRef& digits) override;
    Tn_VerilogExpression* realConstant(const TokenRef& r) override;
    Tn_VerilogExpression* basedConstant(const TokenRef& size, const TokenRef& base, const TokenRef& digits) override;

public:
    // The parser's state (tn_verilogparser.cpp).
    struct Impl;

private:
    // The one expression of a token stream started on a text.
    Tn_VerilogExpression* readExpression(Tn_VerilogNodeFactory& factory);
    void fillLookahead(unsigned int i) override;

    std::unique_ptr<Impl> d_;
};

#endif
