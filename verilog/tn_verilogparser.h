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

#include "src/tn_verilogoptions.h"
#include "util/tn_exception.h"
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
    // Widest based literal made (bits): wider sizes are reported (a wider
    // one would take megabytes, and a decimal one quadratic time, to build).
    static const uint32_t kMaxLiteralWidth = 1u << 20;

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
    void skipConfiguration(const Tn_VerilogTok& config) override;
    void beginModule(const Tn_VerilogTok& keyword, const Tn_VerilogTok& id, Tn_VerilogAttributes* a) override;
    void endModule(const Tn_VerilogTok& end) override;
    void modulePort(const Tn_VerilogTok& where, const Tn_VerilogTok& name, Tn_VerilogExpression* e) override;
    Tn_VerilogExpression* portReferenceName(const Tn_VerilogTok& id) override;
    void udpBegin(const Tn_VerilogTok& keyword, const Tn_VerilogTok& id, Tn_VerilogAttributes* a) override;
    void udpPort(const Tn_VerilogTok& id) override;
    void udpInitialStatement(const Tn_VerilogTok& keyword, const Tn_VerilogTok& id, Tn_VerilogExpression* e) override;
    void udpTableBegin(const Tn_VerilogTok& table) override;
    bool udpSequential() override;
    void udpRowBegin(const Tn_VerilogTok& first) override;
    void udpRowSymbol(const Tn_VerilogTok& symbol) override;
    void udpRowEdgeOpen(const Tn_VerilogTok& paren) override;
    void udpRowEdgeClose(const Tn_VerilogTok& paren) override;
    void udpRowColon(const Tn_VerilogTok& colon) override;
    void udpRowEnd(const Tn_VerilogTok& semi) override;
    void udpEnd(const Tn_VerilogTok& end) override;
    Tn_VerilogAttributes* attributesBegin(const Tn_VerilogTok& open) override;
    void attributeAdd(Tn_VerilogAttributes* a, const Tn_VerilogTok& id, Tn_VerilogExpression* e) override;
    void declarePort(Tn_VerilogDeclSpec& s, const Tn_VerilogTok& id, Tn_VerilogExpression* init) override;
    size_t dimensionsBegin() override;
    void dimensionAdd(Tn_VerilogRange* r) override;
    void declareNet(Tn_VerilogDeclSpec& s, const Tn_VerilogTok& id, size_t dims, Tn_VerilogExpression* e) override;
    void declareVariable(Tn_VerilogDeclSpec& s, const Tn_VerilogTok& id, size_t dims, Tn_VerilogExpression* e) override;
    void declareGenvar(const Tn_VerilogTok& id, Tn_VerilogAttributes* a) override;
    void declareParameter(Tn_VerilogParamSpec& s, const Tn_VerilogTok& id, Tn_VerilogExpression* e) override;
    Tn_VerilogExpression* pulseLimits(const Tn_VerilogTok& paren, Tn_VerilogExpression* reject,
                                      Tn_VerilogExpression* error) override;
    void defparam(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* target,
                  Tn_VerilogExpression* value) override;
    Tn_VerilogDriveStrength* driveStrengthBegin(const Tn_VerilogTok& paren) override;
    void driveStrengthAdd(Tn_VerilogDriveStrength* s, int keyword) override;
    Tn_VerilogRange* makeRange(const Tn_VerilogTok& bracket, Tn_VerilogExpression* msb, Tn_VerilogExpression* lsb) override;
    Tn_VerilogDelay* delayBegin(const Tn_VerilogTok& hash) override;
    void delayAdd(Tn_VerilogDelay* d, Tn_VerilogExpression* e) override;
    void contAssign(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogDriveStrength* s, Tn_VerilogDelay* d,
                    Tn_VerilogExpression* target, Tn_VerilogExpression* source) override;
    Tn_VerilogNode* gateBegin(Tn_VerilogInstSpec& s, const Tn_VerilogTok& id, Tn_VerilogRange* r,
                              const Tn_VerilogTok& paren) override;
    void gateTerminal(Tn_VerilogNode* gate, Tn_VerilogExpression* e) override;
    void gateEnd(Tn_VerilogInstSpec& s, Tn_VerilogNode* gate) override;
    size_t parameterValuesBegin() override;
    void paramValue(Tn_VerilogInstSpec& s, const Tn_VerilogTok& name, Tn_VerilogExpression* e) override;
    Tn_VerilogNode* instanceBegin(Tn_VerilogInstSpec& s, const Tn_VerilogTok& id, Tn_VerilogRange* r,
                                  const Tn_VerilogTok& paren) override;
    void connection(Tn_VerilogNode* inst, Tn_VerilogAttributes* a, const Tn_VerilogTok& where, const Tn_VerilogTok& name,
                    Tn_VerilogExpression* e) override;
    void instantiationEnd(Tn_VerilogInstSpec& s) override;
    void process(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogStatement* s) override;
    void taskBegin(const Tn_VerilogTok& keyword, const Tn_VerilogTok& id, Tn_VerilogAttributes* a, bool automatic) override;
    void taskEnd(const Tn_VerilogTok& end) override;
    void functionBegin(const Tn_VerilogTok& keyword, const Tn_VerilogTok& id, Tn_VerilogAttributes* a, bool automatic,
                       Tn_VerilogDeclSpec& result) override;
    void functionEnd(const Tn_VerilogTok& end) override;
    void procedureBody(Tn_VerilogStatement* s) override;
    void generateRegionBegin(const Tn_VerilogTok& keyword) override;
    void generateRegionEnd() override;
    void addGenerateStatement(Tn_VerilogGenerateStatement* g) override;
    Tn_VerilogGenerateStatement* generateBlockBegin(const Tn_VerilogTok& first, const Tn_VerilogTok& name) override;
    void generateBlockEnd(Tn_VerilogGenerateStatement* g) override;
    Tn_VerilogGenerateStatement* generateForBegin(const Tn_VerilogTok& keyword, const Tn_VerilogTok& genvar, const Tn_VerilogTok& id,
                                                  Tn_VerilogExpression* init, Tn_VerilogExpression* condition,
                                                  const Tn_VerilogTok& id2, Tn_VerilogExpression* step) override;
    void generateLoopBodyBegin(Tn_VerilogGenerateStatement* g, const Tn_VerilogTok& first, const Tn_VerilogTok& name) override;
    void generateLoopBodyEnd(Tn_VerilogGenerateStatement* g) override;
    Tn_VerilogGenerateStatement* makeGenerateIf(const Tn_VerilogTok& keyword, Tn_VerilogExpression* c) override;
    void generateIfBranch(Tn_VerilogGenerateStatement* g, Tn_VerilogGenerateStatement* branch, bool then) override;
    Tn_VerilogGenerateStatement* makeGenerateCase(const Tn_VerilogTok& keyword, Tn_VerilogExpression* e) override;
    Tn_VerilogGenerateStatement* generateCaseItemBegin(Tn_VerilogGenerateStatement* g, const Tn_VerilogTok& first) override;
    void generateCaseItemExpression(Tn_VerilogGenerateStatement* item, Tn_VerilogExpression* e) override;
    void generateCaseItemBody(Tn_VerilogGenerateStatement* item, Tn_VerilogGenerateStatement* body) override;
    Tn_VerilogNode* pulseControlBegin(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a) override;
    void pulseControlOutput(Tn_VerilogNode* p, Tn_VerilogExpression* e) override;
    Tn_VerilogNode* pathBegin(const Tn_VerilogTok& first, Tn_VerilogAttributes* a, Tn_VerilogExpression* condition,
                              bool ifnone) override;
    void pathInput(Tn_VerilogNode* p, Tn_VerilogExpression* e, int edge) override;
    void pathPolarity(Tn_VerilogNode* p, int sign, bool data) override;
    void pathType(Tn_VerilogNode* p, int type) override;
    void pathOutput(Tn_VerilogNode* p, Tn_VerilogExpression* e) override;
    void pathData(Tn_VerilogNode* p, Tn_VerilogExpression* e) override;
    void pathDelay(Tn_VerilogNode* p, Tn_VerilogExpression* e) override;
    void pathEnd(Tn_VerilogNode* p, const Tn_VerilogTok& semi) override;
    Tn_VerilogNode* timingCheckBegin(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a) override;
    void timingCheckArg(Tn_VerilogNode* c, const Tn_VerilogTok& where, int edge, unsigned descriptors,
                        Tn_VerilogExpression* e, Tn_VerilogExpression* condition) override;
    void timingCheckEnd(Tn_VerilogNode* c, const Tn_VerilogTok& paren) override;
    void ignoreSpecifyTask(const Tn_VerilogTok& id) override;
    Tn_VerilogStatement* nullStatement(const Tn_VerilogTok& semi, Tn_VerilogAttributes* a) override;
    Tn_VerilogStatement* blockingAssign(const Tn_VerilogTok& first, Tn_VerilogAttributes* a, Tn_VerilogExpression* target,
                                        Tn_VerilogStatement* control, Tn_VerilogExpression* source) override;
    Tn_VerilogStatement* nonBlockingAssign(const Tn_VerilogTok& first, Tn_VerilogAttributes* a, Tn_VerilogExpression* target,
                                           Tn_VerilogStatement* control, Tn_VerilogExpression* source) override;
    Tn_VerilogStatement* taskCall(const Tn_VerilogTok& first, Tn_VerilogAttributes* a, Tn_VerilogExpression* name) override;
    void callArgument(Tn_VerilogNode* call, Tn_VerilogExpression* e) override;
    Tn_VerilogExpression* systemCall(const Tn_VerilogTok& id) override;
    void systemArgument(Tn_VerilogExpression* call, Tn_VerilogExpression* e, const Tn_VerilogTok& where) override;
    Tn_VerilogStatement* systemTask(const Tn_VerilogTok& id, Tn_VerilogAttributes* a, Tn_VerilogExpression* call) override;
    Tn_VerilogStatement* delayControl(const Tn_VerilogTok& hash, Tn_VerilogAttributes* a, Tn_VerilogExpression* d,
                                      Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* repeatControl(const Tn_VerilogTok& keyword, Tn_VerilogExpression* count,
                                       Tn_VerilogStatement* eventControl) override;
    Tn_VerilogStatement* makeEventControl(const Tn_VerilogTok& at, Tn_VerilogAttributes* a,
                                          Tn_VerilogEventExpression* e) override;
    Tn_VerilogStatement* emptyEventControl(const Tn_VerilogTok& at, Tn_VerilogAttributes* a, const Tn_VerilogTok& paren) override;
    void eventControlBody(Tn_VerilogStatement* control, Tn_VerilogStatement* s) override;
    Tn_VerilogEventExpression* eventOr(Tn_VerilogEventExpression* first) override;
    void eventOrAdd(Tn_VerilogEventExpression* o, Tn_VerilogEventExpression* e) override;
    Tn_VerilogEventExpression* edgeEvent(const Tn_VerilogTok& keyword, Tn_VerilogExpression* e) override;
    size_t ifChainBegin() override;
    void ifChainAdd(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* c,
                    Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* ifChainEnd(size_t mark, Tn_VerilogStatement* otherwise) override;
    Tn_VerilogStatement* caseBegin(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a) override;
    void caseSelector(Tn_VerilogStatement* c, Tn_VerilogExpression* e) override;
    Tn_VerilogStatement* caseItemBegin(Tn_VerilogStatement* c, const Tn_VerilogTok& first) override;
    void caseItemExpression(Tn_VerilogStatement* item, Tn_VerilogExpression* e) override;
    void caseItemBody(Tn_VerilogStatement* c, Tn_VerilogStatement* item, Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* forever(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* repeat(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* e,
                                Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* whileLoop(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* e,
                                   Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* forLoop(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogStatement* init,
                                 Tn_VerilogExpression* c, Tn_VerilogStatement* step, Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* blockBegin(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a) override;
    Tn_VerilogStatement* blockName(Tn_VerilogStatement* b, const Tn_VerilogTok& id) override;
    void blockAdd(Tn_VerilogStatement* b, Tn_VerilogStatement* s) override;
    void blockEnd(Tn_VerilogStatement* b) override;
    Tn_VerilogStatement* makeWait(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* e,
                                  Tn_VerilogStatement* s) override;
    Tn_VerilogStatement* disable(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a, Tn_VerilogExpression* n) override;
    Tn_VerilogStatement* makeEventTrigger(const Tn_VerilogTok& arrow, Tn_VerilogAttributes* a,
                                          Tn_VerilogExpression* n) override;
    Tn_VerilogStatement* proceduralAssign(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a,
                                          Tn_VerilogExpression* target, Tn_VerilogExpression* source) override;
    Tn_VerilogStatement* proceduralRelease(const Tn_VerilogTok& keyword, Tn_VerilogAttributes* a,
                                           Tn_VerilogExpression* target) override;
    size_t conditionalBegin() override;
    void conditionalAdd(const Tn_VerilogTok& question, Tn_VerilogAttributes* a, Tn_VerilogExpression* c,
                        Tn_VerilogExpression* t) override;
    Tn_VerilogExpression* conditionalEnd(size_t mark, Tn_VerilogExpression* last) override;
    size_t binaryBegin() override;
    void binaryOperand(Tn_VerilogExpression* e) override;
    void binaryOperator(size_t mark, const Tn_VerilogTok& op, Tn_VerilogAttributes* a) override;
    Tn_VerilogExpression* binaryEnd(size_t mark, Tn_VerilogExpression* last) override;
    size_t unaryBegin() override;
    void unaryOperator(const Tn_VerilogTok& op, Tn_VerilogAttributes* a) override;
    Tn_VerilogExpression* unaryEnd(size_t mark, Tn_VerilogExpression* operand) override;
    Tn_VerilogExpression* minTypMax(const Tn_VerilogTok& colon, Tn_VerilogExpression* min, Tn_VerilogExpression* typ,
                                    Tn_VerilogExpression* max) override;
    Tn_VerilogExpression* makeConcatenation(const Tn_VerilogTok& brace, Tn_VerilogExpression* first) override;
    Tn_VerilogExpression* multipleConcatenation(const Tn_VerilogTok& brace, Tn_VerilogExpression* count) override;
    void concatenationAdd(Tn_VerilogExpression* c, Tn_VerilogExpression* e) override;
    Tn_VerilogExpression* functionCall(const Tn_VerilogTok& paren, Tn_VerilogAttributes* a,
                                       Tn_VerilogExpression* name) override;
    size_t nameBegin() override;
    void nameComponent(const Tn_VerilogTok& id) override;
    void nameSelect(const Tn_VerilogTok& bracket, int kind, Tn_VerilogExpression* e1, Tn_VerilogExpression* e2) override;
    Tn_VerilogExpression* nameEnd(size_t mark) override;
    Tn_VerilogExpression* simpleName(const Tn_VerilogTok& id) override;
    Tn_VerilogExpression* bitSelect(const Tn_VerilogTok& bracket, Tn_VerilogExpression* operand,
                                    Tn_VerilogExpression* index) override;
    Tn_VerilogExpression* partSelect(const Tn_VerilogTok& bracket, Tn_VerilogExpression* operand, Tn_VerilogExpression* msb,
                                     Tn_VerilogExpression* lsb) override;
    Tn_VerilogExpression* stringConstant(const Tn_VerilogTok& s) override;
    Tn_VerilogExpression* integerConstant(const Tn_VerilogTok& digits) override;
    Tn_VerilogExpression* realConstant(const Tn_VerilogTok& r) override;
    Tn_VerilogExpression* basedConstant(const Tn_VerilogTok& size, const Tn_VerilogTok& base, const Tn_VerilogTok& digits) override;

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
