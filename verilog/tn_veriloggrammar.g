// The Verilog grammar (IEEE 1364-2001 source text, and the 1364-1995 subset
// in Verilog-1995 mode). The rules recognise; every node is made by the
// construction hooks of Tn_VerilogGrammarUtil, which Tn_VerilogParser
// implements. Expressions are read as flat operator sequences and turned into
// trees by operator-precedence parsing in the hooks; lists and else-if chains
// are loops, so only real nesting recurses, and every recursive rule counts
// its depth (Nest).
header "pre_include_hpp" {
#include "verilog/tn_veriloggrammarutil.h"
}

header "post_include_cpp" {
#include "verilog/tn_verilognodes.h"
}

options {
    language = "Cpp";
}

class Tn_VerilogGrammar extends Parser;
options {
    k = 2;
    importVocab = Tn_Verilog;
    defaultErrorHandler = false;
    classHeaderSuffix = "public Tn_VerilogGrammarUtil";
}

{
public:
    // Lookahead from the ring of Tn_VerilogGrammarUtil; final, so that the
    // rules call it directly.
    int LA(unsigned int i) override final {
        if (i > ahead_.count) fillLookahead(i);
        return ahead_.at(i).type;
    }
    ANTLR_USE_NAMESPACE(antlr)RefToken LT(unsigned int i) override final { return lookaheadToken(i); }
    void consume() override final { dropToken(); }
    void match(int t) override final {
        if (LA(1) != t) mismatch(t);
        dropToken();
    }

private:
    [[noreturn]] void mismatch(int t) {
        throw ANTLR_USE_NAMESPACE(antlr)MismatchedTokenException(getTokenNames(), getNumTokens(), LT(1), t, false,
                                                                   getFilename());
    }
}

// ------------------------------------------------------------ source text

sourceText
    : ( description )* EOF
    ;

// A text that is one expression (a -G value).
singleExpression returns [Tn_VerilogExpression* e = 0]
    : e=expression EOF
    ;

description
{ Tn_VerilogTok t; Tn_VerilogAttributes* a = 0; }
    : a=attributeInstances
      ( moduleDeclaration[a]
      | udpDeclaration[a]
      | { t = tok(); } K_CONFIG { skipConfiguration(t); }
      )
    ;

attributeInstances returns [Tn_VerilogAttributes* a = 0]
{ Tn_VerilogTok t; }
    : ( { v2001() }? { t = tok(); } ATTR_OPEN { if (!a) a = attributesBegin(t); }
        attributeSpec[a] ( COMMA attributeSpec[a] )* ATTR_CLOSE
      )*
    ;

attributeSpec[Tn_VerilogAttributes* a]
{ Tn_VerilogTok id; Tn_VerilogExpression* e = 0; }
    : { id = tok(); } IDENTIFIER ( ASSIGN e=constantExpression )? { attributeAdd(a, id, e); }
    ;

// ---------------------------------------------------------------- modules

moduleDeclaration[Tn_VerilogAttributes* a]
{ Tn_VerilogTok id, e; Tn_VerilogTok kw = tok(); }
    : ( K_MODULE | K_MACROMODULE ) { id = tok(); } IDENTIFIER { beginModule(kw, id, a); }
      ( { v2001() }? parameterPortList )?
      ( portList )?
      SEMI
      ( moduleItem )*
      { e = tok(); } K_ENDMODULE { endModule(e); }
    ;

parameterPortList
{ Tn_VerilogParamSpec s; }
    : HASH LPAREN
      { s.first = tok(); } ( parameterKeyword[s] )? parameterType[s] parameterAssignments[s]
      ( COMMA parameterKeyword[s] parameterType[s] parameterAssignments[s] )*
      RPAREN
    ;

parameterKeyword[Tn_VerilogParamSpec& s]
{ Tn_VerilogTok t, u; }
    : { t = tok(); } K_PARAMETER { s = Tn_VerilogParamSpec(); s.first = t; }
    | { u = tok(); } K_LOCALPARAM { s = Tn_VerilogParamSpec(); s.first = u; s.local = true; }
    ;

portList
{ Tn_VerilogTok lp, c; }
    : { lp = tok(); } LPAREN
      ( { v2001() && isAnsiPortStart(LA(1)) }? ansiPortDeclarations
      | { LA(1) == RPAREN }?
      | port[lp] ( { c = tok(); } COMMA port[c] )*
      )
      RPAREN
    ;

port[Tn_VerilogTok where]
{ Tn_VerilogTok id; Tn_VerilogExpression* e = 0; }
    : DOT { id = tok(); } IDENTIFIER LPAREN ( e=portExpression )? RPAREN { modulePort(id, id, e); }
    | ( e=portExpression )? { modulePort(where, Tn_VerilogTok(), e); }
    ;

portExpression returns [Tn_VerilogExpression* e = 0]
{ Tn_VerilogTok t; Tn_VerilogExpression* r = 0; }
    : e=portReference
    | { t = tok(); } LBRACE r=portReference { e = makeConcatenation(t, r); }
      ( COMMA r=portReference { concatenationAdd(e, r); } )* RBRACE
    ;

portReference returns [Tn_VerilogExpression* e = 0]
{ Tn_VerilogTok id, lb; Tn_VerilogExpression* m = 0; Tn_VerilogExpression* l = 0; }
    : { id = tok(); } IDENTIFIER { e = portReferenceName(id); }
      ( { lb = tok(); } LBRACKET m=constantExpression
        ( COLON l=constantExpression { e = partSelect(lb, e, m, l); }
        | { e = bitSelect(lb, e, m); }
        )
        RBRACKET
      )?
    ;

ansiPortDeclarations
{ Tn_VerilogTok id; Tn_VerilogDeclSpec s; Tn_VerilogExpression* e = 0; }
    : ansiPortDeclaration[s]
      ( options { greedy = true; } :
        COMMA
        ( { e = 0; } { id = tok(); } IDENTIFIER ( ASSIGN e=constantExpression )? { declarePort(s, id, e); }
        | ansiPortDeclaration[s]
        )
      )*
    ;

ansiPortDeclaration[Tn_VerilogDeclSpec& s]
{ Tn_VerilogTok id; Tn_VerilogAttributes* a = 0; Tn_VerilogExpression* e = 0; }
    : a=attributeInstances { s = Tn_VerilogDeclSpec(); s.attributes = a; s.ansi = true; }
      portDirection[s] portType[s]
      { id = tok(); } IDENTIFIER ( ASSIGN e=constantExpression )? { declarePort(s, id, e); }
    ;

portDirection[Tn_VerilogDeclSpec& s]
{ s.first = tok(); s.direction = LA(1); }
    : K_INPUT | K_OUTPUT | K_INOUT
    ;

// The type part of a port declaration: an optional net type, reg, or
// variable type, then signed and a range.
portType[Tn_VerilogDeclSpec& s]
{ int t = 0; int v = 0; Tn_VerilogRange* r = 0; }
    : ( t=netTypeKeyword { s.kind = Tn_VerilogDeclSpec::NET; s.netType = t; }
      | K_REG { s.kind = Tn_VerilogDeclSpec::REG; }
      | v=variableTypeKeyword { s.kind = v; }
      )?
      ( K_SIGNED { s.isSigned = true; } )?
      ( r=range { s.range = r; } )?
    ;

netTypeKeyword returns [int t = LA(1)]
    : K_WIRE | K_TRI | K_TRI0 | K_TRI1 | K_WAND | K_TRIAND | K_WOR | K_TRIOR | K_TRIREG | K_SUPPLY0 | K_SUPPLY1
    ;

variableTypeKeyword returns [int t = 0]
    : K_INTEGER { t = Tn_VerilogDeclSpec::INTEGER; }
    | K_TIME { t = Tn_VerilogDeclSpec::TIME; }
    | K_REAL { t = Tn_VerilogDeclSpec::REAL; }
    | K_REALTIME { t = Tn_VerilogDeclSpec::REALTIME; }
    ;

moduleItem
{ Tn_VerilogAttributes* a = 0; }
    : a=attributeInstances
      ( portDeclaration[a]
      | generateRegion
      | specifyBlock
      | specparamDeclaration[a]
      | moduleOrGenerateItem[a]
      )
    ;

moduleOrGenerateItem[Tn_VerilogAttributes* a]
    : netDeclaration[a]
    | variableDeclaration[a]
    | eventDeclaration[a]
    | genvarDeclaration[a]
    | parameterDeclaration[a]
    | defparamDeclaration[a]
    | continuousAssign[a]
    | gateInstantiation[a]
    | instantiation[a]
    | initialConstruct[a]
    | alwaysConstruct[a]
    | taskDeclaration[a]
    | functionDeclaration[a]
    | { v2001() }? generateConstruct[a]
    ;

// ----------------------------------------------------------- declarations

portDeclaration[Tn_VerilogAttributes* a]
{ Tn_VerilogTok id, id2; Tn_VerilogDeclSpec s; Tn_VerilogExpression* e = 0; }
    : { s.attributes = a; } portDirection[s] portType[s]
      { id = tok(); } IDENTIFIER ( ASSIGN e=constantExpression )? { declarePort(s, id, e); }
      ( COMMA { e = 0; } { id2 = tok(); } IDENTIFIER ( ASSIGN e=constantExpression )? { declarePort(s, id2, e); } )*
      SEMI
    ;

netDeclaration[Tn_VerilogAttributes* a]
{ Tn_VerilogDeclSpec s; int t = 0; int c = 0; Tn_VerilogDriveStrength* ds = 0; Tn_VerilogRange* r = 0; Tn_VerilogDelay* d = 0; }
    : { s.attributes = a; s.first = tok(); s.kind = Tn_VerilogDeclSpec::NET; }
      t=netTypeKeyword { s.netType = t; }
      ( { LA(1) == LPAREN && isChargeStrength(LA(2)) }? c=chargeStrength { s.chargeStrength = c; }
      | { LA(1) == LPAREN && isStrength(LA(2)) }? ds=driveStrength { s.strength = ds; }
      )?
      ( K_VECTORED { s.grouping = 0; } | K_SCALARED { s.grouping = 1; } )?
      ( K_SIGNED { s.isSigned = true; } )?
      ( r=range { s.range = r; } )?
      ( d=delay3 { s.delay = d; } )?
      netItem[s] ( COMMA netItem[s] )* SEMI
    ;

netItem[Tn_VerilogDeclSpec& s]
{ Tn_VerilogTok id; Tn_VerilogExpression* e = 0; size_t m = dimensionsBegin(); }
    : { id = tok(); } IDENTIFIER
      ( ASSIGN e=expression { declareNet(s, id, m, e); }
      | dimensions { declareNet(s, id, m, 0); }
      )
    ;

dimensions
{ Tn_VerilogRange* r = 0; }
    : ( r=range { dimensionAdd(r); } )*
    ;

variableDeclaration[Tn_VerilogAttributes* a]
{ Tn_VerilogDeclSpec s; Tn_VerilogRange* r = 0; int v = 0; }
    : { s.attributes = a; s.first = tok(); }
      ( K_REG { s.kind = Tn_VerilogDeclSpec::REG; } ( K_SIGNED { s.isSigned = true; } )? ( r=range { s.range = r; } )?
      | v=variableTypeKeyword { s.kind = v; }
      )
      variableItem[s] ( COMMA variableItem[s] )* SEMI
    ;

variableItem[Tn_VerilogDeclSpec& s]
{ Tn_VerilogTok id; Tn_VerilogExpression* e = 0; size_t m = dimensionsBegin(); }
    : { id = tok(); } IDENTIFIER
      ( { v2001() }? ASSIGN e=constantExpression { declareVariable(s, id, m, e); }
      | dimensions { declareVariable(s, id, m, 0); }
      )
    ;

eventDeclaration[Tn_VerilogAttributes* a]
{ Tn_VerilogTok t; Tn_VerilogDeclSpec s; }
    : { t = tok(); } K_EVENT { s.attributes = a; s.first = t; s.kind = Tn_VerilogDeclSpec::EVENT; }
      eventItem[s] ( COMMA eventItem[s] )* SEMI
    ;

eventItem[Tn_VerilogDeclSpec& s]
{ Tn_VerilogTok id; size_t m = dimensionsBegin(); }
    : { id = tok(); } IDENTIFIER dimensions { declareVariable(s, id, m, 0); }
    ;

genvarDeclaration[Tn_VerilogAttributes* a]
{ Tn_VerilogTok id, id2; }
    : K_GENVAR { id = tok(); } IDENTIFIER { declareGenvar(id, a); } ( COMMA { id2 = tok(); } IDENTIFIER { declareGenvar(id2, a); } )* SEMI
    ;

parameterDeclaration[Tn_VerilogAttributes* a]
{ Tn_VerilogParamSpec s; }
    : parameterKeyword[s] { s.attributes = a; } parameterType[s] parameterAssignments[s] SEMI
    ;

parameterType[Tn_VerilogParamSpec& s]
{ int t = 0; Tn_VerilogRange* r = 0; }
    : ( K_SIGNED { s.isSigned = true; } )? ( r=range { s.range = r; } )?
    | { v2001() }? t=variableTypeKeyword { s.type = t; }
    ;

// A comma-separated list of assignments of an expression to a name: a
// malformed item is reported and skipped, and parsing goes on after it.
parameterAssignments[Tn_VerilogParamSpec& s]
options { defaultErrorHandler = true; }
{ Tn_VerilogTok id, id2; Tn_VerilogExpression* e = 0; }
    : { id = tok(); } IDENTIFIER ASSIGN e=constantExpression { declareParameter(s, id, e); }
      ( options { greedy = true; } :
        { LA(2) == IDENTIFIER }? COMMA { id2 = tok(); } IDENTIFIER ASSIGN e=constantExpression { declareParameter(s, id2, e); }
      )*
    ;

specparamDeclaration[Tn_VerilogAttributes* a]
{ Tn_VerilogTok t; Tn_VerilogParamSpec s; Tn_VerilogRange* r = 0; }
    : { t = tok(); } K_SPECPARAM { s.first = t; s.attributes = a; s.specparam = true; } ( r=range { s.range = r; } )?
      specparamAssignment[s] ( COMMA specparamAssignment[s] )* SEMI
    ;

specparamAssignment[Tn_VerilogParamSpec& s]
{ Tn_VerilogTok id, lp; Tn_VerilogExpression* e = 0; Tn_VerilogExpression* e2 = 0; }
    : { id = tok(); } IDENTIFIER ASSIGN
      ( { isPulseControlName(id) && LA(1) == LPAREN }? { lp = tok(); } LPAREN e=mintypmaxExpression
        ( COMMA e2=mintypmaxExpression { e = pulseLimits(lp, e, e2); } )? RPAREN
      | e=constantExpression
      )
      { declareParameter(s, id, e); }
    ;

defparamDeclaration[Tn_VerilogAttributes* a]
{ Tn_VerilogTok t; }
    : { t = tok(); } K_DEFPARAM defparamAssignment[t, a] ( COMMA defparamAssignment[t, a] )* SEMI
    ;

defparamAssignment[Tn_VerilogTok t, Tn_VerilogAttributes* a]
{ Tn_VerilogExpression* n = 0; Tn_VerilogExpression* e = 0; }
    : n=name ASSIGN e=constantExpression { defparam(t, a, n, e); }
    ;

// ------------------------------------------------- strengths, ranges, delays

driveStrength returns [Tn_VerilogDriveStrength* s = 0]
{ Tn_VerilogTok t; }
    : { t = tok(); } LPAREN { s = driveStrengthBegin(t); }
      { driveStrengthAdd(s, LA(1)); } strengthKeyword
      ( COMMA { driveStrengthAdd(s, LA(1)); } strengthKeyword )?
      RPAREN
    ;

strengthKeyword
    : K_SUPPLY0 | K_STRONG0 | K_PULL0 | K_WEAK0 | K_HIGHZ0
    | K_SUPPLY1 | K_STRONG1 | K_PULL1 | K_WEAK1 | K_HIGHZ1
    ;

chargeStrength returns [int c = -1]
    : LPAREN
      ( K_SMALL { c = 0; } | K_MEDIUM { c = 1; } | K_LARGE { c = 2; } )
      RPAREN
    ;

range returns [Tn_VerilogRange* r = 0]
{ Tn_VerilogTok t; Tn_VerilogExpression* m = 0; Tn_VerilogExpression* l = 0; }
    : { t = tok(); } LBRACKET m=constantExpression COLON l=constantExpression RBRACKET { r = makeRange(t, m, l); }
    ;

delay3 returns [Tn_VerilogDelay* d = 0]
{ Tn_VerilogTok t; Tn_VerilogExpression* e = 0; }
    : { t = tok(); } HASH { d = delayBegin(t); }
      ( e=delayValue { delayAdd(d, e); }
      | LPAREN e=mintypmaxExpression { delayAdd(d, e); }
        ( COMMA e=mintypmaxExpression { delayAdd(d, e); }
          ( COMMA e=mintypmaxExpression { delayAdd(d, e); } )?
        )?
        RPAREN
      )
    ;

delayValue returns [Tn_VerilogExpression* e = 0]
{ Tn_VerilogTok id; }
    : e=number
    | { id = tok(); } IDENTIFIER { e = simpleName(id); }
    ;

// ------------------------------------------------------------- assignments

continuousAssign[Tn_VerilogAttributes* a]
{ Tn_VerilogTok t; Tn_VerilogDriveStrength* s = 0; Tn_VerilogDelay* d = 0; }
    : { t = tok(); } K_ASSIGN
      ( { LA(1) == LPAREN && isStrength(LA(2)) }? s=driveStrength )?
      ( d=delay3 )?
      continuousAssignment[t, a, s, d] ( COMMA continuousAssignment[t, a, s, d] )* SEMI
    ;

continuousAssignment[Tn_VerilogTok t, Tn_VerilogAttributes* a, Tn_VerilogDriveStrength* s, Tn_VerilogDelay* d]
{ Tn_VerilogExpression* l = 0; Tn_VerilogExpression* e = 0; }
    : l=lvalue ASSIGN e=expression { contAssign(t, a, s, d, l, e); }
    ;

// ------------------------------------------------------------- instances

gateInstantiation[Tn_VerilogAttributes* a]
{ Tn_VerilogInstSpec s; Tn_VerilogDriveStrength* ds = 0; Tn_VerilogDelay* d = 0; }
    : { s.first = tok(); s.attributes = a; s.gateType = LA(1); } gateKeyword
      ( { LA(1) == LPAREN && isStrength(LA(2)) }? ds=driveStrength { s.strength = ds; } )?
      ( d=delay3 { s.delay = d; } )?
      gateInstance[s] ( COMMA gateInstance[s] )* SEMI
    ;

gateKeyword
    : K_AND | K_NAND | K_OR | K_NOR | K_XOR | K_XNOR | K_BUF | K_NOT
    | K_BUFIF0 | K_BUFIF1 | K_NOTIF0 | K_NOTIF1
    | K_NMOS | K_PMOS | K_RNMOS | K_RPMOS | K_CMOS | K_RCMOS
    | K_TRAN | K_RTRAN | K_TRANIF0 | K_TRANIF1 | K_RTRANIF0 | K_RTRANIF1
    | K_PULLUP | K_PULLDOWN
    ;

gateInstance[Tn_VerilogInstSpec& s]
{ Tn_VerilogTok id, lp; Tn_VerilogRange* r = 0; Tn_VerilogNode* g = 0; Tn_VerilogExpression* e = 0; }
    : ( { id = tok(); } IDENTIFIER ( r=range )? )?
      { lp = tok(); } LPAREN { g = gateBegin(s, id, r, lp); }
      e=expression { gateTerminal(g, e); } ( COMMA e=expression { gateTerminal(g, e); } )*
      RPAREN { gateEnd(s, g); }
    ;

instantiation[Tn_VerilogAttributes* a]
{ Tn_VerilogTok def; Tn_VerilogInstSpec s; Tn_VerilogDriveStrength* ds = 0; }
    : { def = tok(); } IDENTIFIER { s.first = def; s.attributes = a; s.paramsBegin = parameterValuesBegin(); }
      ( { LA(1) == LPAREN && isStrength(LA(2)) }? ds=driveStrength { s.strength = ds; } )?
      ( parameterValueAssignment[s] )?
      moduleInstance[s] ( COMMA moduleInstance[s] )* SEMI
      { instantiationEnd(s); }
    ;

parameterValueAssignment[Tn_VerilogInstSpec& s]
{ Tn_VerilogTok lp; Tn_VerilogExpression* e = 0; }
    : HASH
      ( e=delayValue { paramValue(s, Tn_VerilogTok(), e); }
      | { lp = tok(); } LPAREN ( parameterValue[s] ( COMMA parameterValue[s] )* )? RPAREN
      )
    ;

parameterValue[Tn_VerilogInstSpec& s]
{ Tn_VerilogExpression* e = 0; }
    : namedParameterValue[s]
    | e=mintypmaxExpression { paramValue(s, Tn_VerilogTok(), e); }
    ;

// A named parameter value assignment: a malformed one is reported and
// skipped, and the instance is still read.
namedParameterValue[Tn_VerilogInstSpec& s]
options { defaultErrorHandler = true; }
{ Tn_VerilogTok id; Tn_VerilogExpression* e = 0; }
    : DOT { id = tok(); } IDENTIFIER LPAREN ( e=mintypmaxExpression )? RPAREN { paramValue(s, id, e); }
    ;

moduleInstance[Tn_VerilogInstSpec& s]
{ Tn_VerilogTok id, lp; Tn_VerilogRange* r = 0; Tn_VerilogNode* inst = 0; }
    : ( { id = tok(); } IDENTIFIER ( r=range )? )?
      { lp = tok(); } LPAREN { inst = instanceBegin(s, id, r, lp); }
      ( { LA(1) != RPAREN }? portConnection[inst] ( COMMA portConnection[inst] )* )?
      RPAREN
    ;

portConnection[Tn_VerilogNode* inst]
{ Tn_VerilogTok id; Tn_VerilogAttributes* a = 0; Tn_VerilogExpression* e = 0; }
    : a=attributeInstances
      ( DOT { id = tok(); } IDENTIFIER LPAREN ( e=expression )? RPAREN { connection(inst, a, id, id, e); }
      | ( e=expression )? { connection(inst, a, tok(), Tn_VerilogTok(), e); }
      )
    ;

// ------------------------------------------------------- processes, tasks

initialConstruct[Tn_VerilogAttributes* a]
{ Tn_VerilogTok t; Tn_VerilogStatement* s = 0; }
    : { t = tok(); } K_INITIAL s=statement { process(t, a, s); }
    ;

alwaysConstruct[Tn_VerilogAttributes* a]
{ Tn_VerilogTok t; Tn_VerilogStatement* s = 0; }
    : { t = tok(); } K_ALWAYS s=statement { process(t, a, s); }
    ;

taskDeclaration[Tn_VerilogAttributes* a]
{ Tn_VerilogTok t, id, e; bool automatic = false; Tn_VerilogStatement* s = 0; }
    : { t = tok(); } K_TASK ( K_AUTOMATIC { automatic = true; } )? { id = tok(); } IDENTIFIER { taskBegin(t, id, a, automatic); }
      ( SEMI ( options { generateAmbigWarnings = false; } : { declarationAhead(true) }? blockDeclaration[true] )*
      | { v2001() }? LPAREN ( tfPortList )? RPAREN SEMI
        ( options { generateAmbigWarnings = false; } : { declarationAhead(false) }? blockDeclaration[false] )*
      )
      ( s=statement { procedureBody(s); } )?
      { e = tok(); } K_ENDTASK { taskEnd(e); }
    ;

functionDeclaration[Tn_VerilogAttributes* a]
{ Tn_VerilogTok t, id, e; Tn_VerilogDeclSpec r; bool automatic = false; Tn_VerilogStatement* s = 0; Tn_VerilogRange* rr = 0; int v = 0; }
    : { t = tok(); } K_FUNCTION ( K_AUTOMATIC { automatic = true; } )?
      { r.first = t; }
      ( K_SIGNED { r.isSigned = true; } )?
      ( rr=range { r.range = rr; } | v=variableTypeKeyword { r.kind = v; } )?
      { id = tok(); } IDENTIFIER { functionBegin(t, id, a, automatic, r); }
      ( SEMI ( options { generateAmbigWarnings = false; } : { declarationAhead(true) }? blockDeclaration[true] )*
      | { v2001() }? LPAREN tfPortList RPAREN SEMI
        ( options { generateAmbigWarnings = false; } : { declarationAhead(false) }? blockDeclaration[false] )*
      )
      s=statement { procedureBody(s); }
      { e = tok(); } K_ENDFUNCTION { functionEnd(e); }
    ;

tfPortList
{ Tn_VerilogTok id, id2, id3; Tn_VerilogDeclSpec s; Tn_VerilogAttributes* a = 0; }
    : a=attributeInstances { s.attributes = a; } tfPortDirection[s]
      { id = tok(); } IDENTIFIER { declarePort(s, id, 0); }
      ( options { greedy = true; } :
        COMMA
        ( { id2 = tok(); } IDENTIFIER { declarePort(s, id2, 0); }
        | a=attributeInstances { s = Tn_VerilogDeclSpec(); s.attributes = a; } tfPortDirection[s]
          { id3 = tok(); } IDENTIFIER { declarePort(s, id3, 0); }
        )
      )*
    ;

tfPortDirection[Tn_VerilogDeclSpec& s]
{ Tn_VerilogRange* r = 0; int v = 0; }
    : portDirection[s]
      ( K_REG { s.kind = Tn_VerilogDeclSpec::REG; } ( K_SIGNED { s.isSigned = true; } )? ( r=range { s.range = r; } )?
      | v=variableTypeKeyword { s.kind = v; }
      | ( K_SIGNED { s.isSigned = true; } )? ( r=range { s.range = r; } )?
      )
    ;

// Declarations of tasks, functions and named blocks; ports only where
// allowed.
blockDeclaration[bool ports]
{ Tn_VerilogTok id, id2; Tn_VerilogAttributes* a = 0; Tn_VerilogDeclSpec s; }
    : a=attributeInstances
      ( { ports }? { s.attributes = a; } tfPortDirection[s]
        { id = tok(); } IDENTIFIER { declarePort(s, id, 0); }
        ( COMMA { id2 = tok(); } IDENTIFIER { declarePort(s, id2, 0); } )* SEMI
      | variableDeclaration[a]
      | eventDeclaration[a]
      | parameterDeclaration[a]
      )
    ;

// ------------------------------------------------------------- generate

generateRegion
{ Tn_VerilogTok t; }
    : { t = tok(); } K_GENERATE { generateRegionBegin(t); } ( generateItem )* K_ENDGENERATE { generateRegionEnd(); }
    ;

generateItem
{ Tn_VerilogAttributes* a = 0; }
    : a=attributeInstances
      ( moduleOrGenerateItem[a]
      | generateNamedBlock
      )
    ;

// A begin-end block standing alone in a generate region or block.
generateNamedBlock
{ Tn_VerilogTok b, id; Nest nest(*this); Tn_VerilogGenerateStatement* g = 0; }
    : { b = tok(); } K_BEGIN ( COLON { id = tok(); } IDENTIFIER )? { g = generateBlockBegin(b, id); }
      ( generateItem )* K_END { generateBlockEnd(g); addGenerateStatement(g); }
    ;

generateConstruct[Tn_VerilogAttributes* a]
{ Tn_VerilogGenerateStatement* g = 0; }
    : ( g=generateFor | g=generateIf | g=generateCase ) { addGenerateStatement(g); }
    ;

generateFor returns [Tn_VerilogGenerateStatement* g = 0]
{ Tn_VerilogTok t, gv, id, id2; Nest nest(*this); Tn_VerilogExpression* i = 0; Tn_VerilogExpression* c = 0; Tn_VerilogExpression* s = 0; }
    : { t = tok(); } K_FOR LPAREN ( { gv = tok(); } K_GENVAR )? { id = tok(); } IDENTIFIER ASSIGN i=constantExpression SEMI
      c=constantExpression SEMI
      { id2 = tok(); } IDENTIFIER ASSIGN s=constantExpression RPAREN
      { g = generateForBegin(t, gv, id, i, c, id2, s); }
      generateLoopBody[g]
    ;

generateLoopBody[Tn_VerilogGenerateStatement* g]
{ Tn_VerilogTok b, id; Tn_VerilogAttributes* a = 0; }
    : ( options { generateAmbigWarnings = false; } :
      { b = tok(); } K_BEGIN ( COLON { id = tok(); } IDENTIFIER )? { generateLoopBodyBegin(g, b, id); }
      ( generateItem )* K_END { generateLoopBodyEnd(g); }
    | { generateLoopBodyBegin(g, tok(), Tn_VerilogTok()); }
      a=attributeInstances moduleOrGenerateItem[a] { generateLoopBodyEnd(g); }
      )
    ;

generateIf returns [Tn_VerilogGenerateStatement* g = 0]
{ Tn_VerilogTok t; Nest nest(*this); Tn_VerilogExpression* c = 0; Tn_VerilogGenerateStatement* b = 0; }
    : { t = tok(); } K_IF LPAREN c=constantExpression RPAREN { g = makeGenerateIf(t, c); }
      b=generateBranch { generateIfBranch(g, b, true); }
      ( options { greedy = true; } : K_ELSE b=generateBranch { generateIfBranch(g, b, false); } )?
    ;

generateCase returns [Tn_VerilogGenerateStatement* g = 0]
{ Tn_VerilogTok t; Nest nest(*this); Tn_VerilogExpression* c = 0; }
    : { t = tok(); } K_CASE LPAREN c=constantExpression RPAREN { g = makeGenerateCase(t, c); }
      ( generateCaseItem[g] )+
      K_ENDCASE
    ;

generateCaseItem[Tn_VerilogGenerateStatement* g]
{ Tn_VerilogTok d; Tn_VerilogGenerateStatement* i = 0; Tn_VerilogGenerateStatement* b = 0; Tn_VerilogExpression* e = 0; }
    : { d = tok(); } K_DEFAULT ( COLON )? { i = generateCaseItemBegin(g, d); } b=generateBranch { generateCaseItemBody(i, b); }
    | { i = generateCaseItemBegin(g, tok()); }
      e=constantExpression { generateCaseItemExpression(i, e); }
      ( COMMA e=constantExpression { generateCaseItemExpression(i, e); } )*
      COLON b=generateBranch { generateCaseItemBody(i, b); }
    ;

// One branch of a generate if or case: nothing, a nested construct, a block
// or a single item.
generateBranch returns [Tn_VerilogGenerateStatement* g = 0]
{ Tn_VerilogTok b, id; Nest nest(*this); Tn_VerilogAttributes* a = 0; }
    : ( options { generateAmbigWarnings = false; } :
        SEMI
      | g=generateIf
      | g=generateCase
      | g=generateFor
      | { b = tok(); } K_BEGIN ( COLON { id = tok(); } IDENTIFIER )? { g = generateBlockBegin(b, id); }
        ( generateItem )* K_END { generateBlockEnd(g); }
      | { g = generateBlockBegin(tok(), Tn_VerilogTok()); } a=attributeInstances moduleOrGenerateItem[a] { generateBlockEnd(g); }
      )
    ;

// --------------------------------------------------------------- UDPs

udpDeclaration[Tn_VerilogAttributes* a]
{ Tn_VerilogTok t, id, p, p2, e; }
    : { t = tok(); } K_PRIMITIVE { id = tok(); } IDENTIFIER { udpBegin(t, id, a); }
      LPAREN
      ( { v2001() && isAnsiPortStart(LA(1)) }? udpAnsiPorts
      | { p = tok(); } IDENTIFIER { udpPort(p); } ( COMMA { p2 = tok(); } IDENTIFIER { udpPort(p2); } )*
      )
      RPAREN SEMI
      ( udpDeclarationItem )*
      ( udpInitial )?
      udpTable
      { e = tok(); } K_ENDPRIMITIVE { udpEnd(e); }
    ;

udpAnsiPorts
{ Tn_VerilogTok id; Tn_VerilogDeclSpec s; }
    : udpAnsiPort[s]
      ( options { greedy = true; } :
        COMMA ( { id = tok(); } IDENTIFIER { udpPort(id); declarePort(s, id, 0); } | udpAnsiPort[s] )
      )*
    ;

udpAnsiPort[Tn_VerilogDeclSpec& s]
{ Tn_VerilogTok o, i, id; Tn_VerilogAttributes* a = 0; Tn_VerilogExpression* e = 0; }
    : a=attributeInstances { s = Tn_VerilogDeclSpec(); s.attributes = a; }
      ( { o = tok(); } K_OUTPUT { s.first = o; s.direction = K_OUTPUT; } ( K_REG { s.kind = Tn_VerilogDeclSpec::REG; } )?
      | { i = tok(); } K_INPUT { s.first = i; s.direction = K_INPUT; }
      )
      { id = tok(); } IDENTIFIER ( ASSIGN e=expression )? { udpPort(id); declarePort(s, id, e); }
    ;

udpDeclarationItem
{ Tn_VerilogTok o, id, i, id2, id3, r, id4; Tn_VerilogAttributes* a = 0; Tn_VerilogDeclSpec s; Tn_VerilogExpression* e = 0; }
    : a=attributeInstances { s.attributes = a; }
      ( { o = tok(); } K_OUTPUT { s.first = o; s.direction = K_OUTPUT; }
        ( K_REG { s.kind = Tn_VerilogDeclSpec::REG; } )?
        { id = tok(); } IDENTIFIER ( ASSIGN e=expression )? { declarePort(s, id, e); } SEMI
      | { i = tok(); } K_INPUT { s.first = i; s.direction = K_INPUT; }
        { id2 = tok(); } IDENTIFIER { declarePort(s, id2, 0); }
        ( COMMA { id3 = tok(); } IDENTIFIER { declarePort(s, id3, 0); } )* SEMI
      | { r = tok(); } K_REG { s.first = r; s.kind = Tn_VerilogDeclSpec::REG; }
        { id4 = tok(); } IDENTIFIER { declareVariable(s, id4, dimensionsBegin(), 0); } SEMI
      )
    ;

udpInitial
{ Tn_VerilogTok t, id; Tn_VerilogExpression* e = 0; }
    : { t = tok(); } K_INITIAL { id = tok(); } IDENTIFIER ASSIGN e=expression SEMI { udpInitialStatement(t, id, e); }
    ;

udpTable
{ Tn_VerilogTok t; }
    : { t = tok(); } K_TABLE { udpTableBegin(t); } ( udpRow )+ K_ENDTABLE
    ;

udpRow
{ Tn_VerilogTok c, c2, e; }
    : { udpRowBegin(tok()); }
      ( udpInputSymbol )+
      { c = tok(); } COLON { udpRowColon(c); }
      ( options { generateAmbigWarnings = false; } :
        { udpSequential() }? udpLevelSymbol { c2 = tok(); } COLON { udpRowColon(c2); } udpOutputSymbol
      | udpOutputSymbol
      )
      { e = tok(); } SEMI { udpRowEnd(e); }
    ;

udpInputSymbol
{ Tn_VerilogTok lp, rp; }
    : udpEdgeSymbol
    | udpLevelSymbol
    | { lp = tok(); } LPAREN { udpRowEdgeOpen(lp); } ( udpAnySymbol )* { rp = tok(); } RPAREN { udpRowEdgeClose(rp); }
    ;

udpLevelSymbol
    : { udpRowSymbol(tok()); } ( UDP_0 | UDP_1 | UDP_X | QUESTION | UDP_B )
    ;

udpEdgeSymbol
    : { udpRowSymbol(tok()); } ( UDP_R | UDP_F | UDP_P | UDP_N | STAR )
    ;

udpOutputSymbol
    : { udpRowSymbol(tok()); } ( UDP_0 | UDP_1 | UDP_X | MINUS )
    ;

udpAnySymbol
    : { udpRowSymbol(tok()); }
      ( UDP_0 | UDP_1 | UDP_X | QUESTION | UDP_B | UDP_R | UDP_F | UDP_P | UDP_N | STAR | MINUS )
    ;

// ------------------------------------------------------------- specify

specifyBlock
    : K_SPECIFY ( specifyItem )* K_ENDSPECIFY
    ;

specifyItem
{ Tn_VerilogAttributes* a = 0; }
    : a=attributeInstances
      ( specparamDeclaration[a]
      | pulseControl[a]
      | pathDeclaration[a]
      | timingCheck[a]
      | invalidSpecifyTask
      )
    ;

pulseControl[Tn_VerilogAttributes* a]
{ Tn_VerilogNode* p = 0; Tn_VerilogExpression* e = 0; }
    : { p = pulseControlBegin(tok(), a); }
      ( K_PULSESTYLE_ONEVENT | K_PULSESTYLE_ONDETECT | K_SHOWCANCELLED | K_NOSHOWCANCELLED )
      e=name { pulseControlOutput(p, e); } ( COMMA e=name { pulseControlOutput(p, e); } )* SEMI
    ;

pathDeclaration[Tn_VerilogAttributes* a]
{ Tn_VerilogTok t, n; Tn_VerilogNode* p = 0; Tn_VerilogExpression* c = 0; }
    : { t = tok(); } K_IF LPAREN c=expression RPAREN { p = pathBegin(t, a, c, false); } pathDescription[p] pathDelays[p]
    | { n = tok(); } K_IFNONE { p = pathBegin(n, a, 0, true); } pathDescription[p] pathDelays[p]
    | { p = pathBegin(tok(), a, 0, false); } pathDescription[p] pathDelays[p]
    ;

pathDescription[Tn_VerilogNode* p]
{ Tn_VerilogExpression* e = 0; int edge = 0; }
    : LPAREN
      ( K_POSEDGE { edge = K_POSEDGE; } | K_NEGEDGE { edge = K_NEGEDGE; } )?
      e=name { pathInput(p, e, edge); } ( COMMA e=name { pathInput(p, e, edge); } )*
      ( PLUS { pathPolarity(p, PLUS, false); } | MINUS { pathPolarity(p, MINUS, false); } )?
      ( PARALLEL_PATH { pathType(p, PARALLEL_PATH); } | FULL_PATH { pathType(p, FULL_PATH); } )
      ( LPAREN e=name { pathOutput(p, e); } ( COMMA e=name { pathOutput(p, e); } )*
        ( PLUS_COLON { pathPolarity(p, PLUS, true); } | MINUS_COLON { pathPolarity(p, MINUS, true); } | COLON )
        e=expression { pathData(p, e); }
        RPAREN
      | e=name { pathOutput(p, e); } ( COMMA e=name { pathOutput(p, e); } )*
      )
      RPAREN
    ;

pathDelays[Tn_VerilogNode* p]
{ Tn_VerilogTok s; Tn_VerilogExpression* e = 0; }
    : ASSIGN
      ( options { generateAmbigWarnings = false; } :
        LPAREN e=mintypmaxExpression { pathDelay(p, e); } ( COMMA e=mintypmaxExpression { pathDelay(p, e); } )* RPAREN
      | e=mintypmaxExpression { pathDelay(p, e); } ( COMMA e=mintypmaxExpression { pathDelay(p, e); } )*
      )
      { s = tok(); } SEMI { pathEnd(p, s); }
    ;

timingCheck[Tn_VerilogAttributes* a]
{ Tn_VerilogTok rp; Tn_VerilogNode* c = 0; }
    : { c = timingCheckBegin(tok(), a); }
      ( S_SETUP | S_HOLD | S_SETUPHOLD | S_RECOVERY | S_REMOVAL | S_RECREM
      | S_SKEW | S_TIMESKEW | S_FULLSKEW | S_PERIOD | S_WIDTH | S_NOCHANGE )
      LPAREN timingCheckArgument[c] ( COMMA timingCheckArgument[c] )* { rp = tok(); } RPAREN SEMI { timingCheckEnd(c, rp); }
    ;

timingCheckArgument[Tn_VerilogNode* c]
{ Tn_VerilogExpression* e = 0; Tn_VerilogExpression* x = 0; int edge = 0; unsigned descriptors = 0; unsigned d = 0;
  Tn_VerilogTok where = tok(); }
    : ( ( K_POSEDGE { edge = K_POSEDGE; } | K_NEGEDGE { edge = K_NEGEDGE; }
        | K_EDGE { edge = K_EDGE; } LBRACKET descriptors=edgeDescriptor
          ( COMMA d=edgeDescriptor { descriptors |= d; } )* RBRACKET
        )?
        e=expression ( TRIPLE_AND x=expression )?
      )?
      { timingCheckArg(c, where, edge, descriptors, e, x); }
    ;

edgeDescriptor returns [unsigned d = 0]
    : { d = edgeDescriptorBit(LA(1)); } ( EDGE_01 | EDGE_0X | EDGE_10 | EDGE_1X | EDGE_X0 | EDGE_X1 )
    ;

// Any other system task is skipped, its arguments unread.
invalidSpecifyTask
{ Tn_VerilogTok id; }
    : { id = tok(); } SYSTEM_IDENTIFIER { ignoreSpecifyTask(id); } SEMI
    ;

// ------------------------------------------------------------- statements

statement returns [Tn_VerilogStatement* s = 0]
{ Nest nest(*this); Tn_VerilogAttributes* a = 0; }
    : a=attributeInstances s=statementBody[a]
    ;

statementBody[Tn_VerilogAttributes* a] returns [Tn_VerilogStatement* s = 0]
{ Tn_VerilogTok t; }
    : s=assignmentOrTaskCall[a]
    | s=systemTaskCall[a]
    | s=ifStatement[a]
    | s=caseStatement[a]
    | s=loopStatement[a]
    | s=block[a]
    | s=delayControlStatement[a]
    | s=eventControlStatement[a]
    | s=waitStatement[a]
    | s=disableStatement[a]
    | s=eventTrigger[a]
    | s=proceduralContinuous[a]
    | { t = tok(); } SEMI { s = nullStatement(t, a); }
    ;

assignmentOrTaskCall[Tn_VerilogAttributes* a] returns [Tn_VerilogStatement* s = 0]
{ Tn_VerilogExpression* l = 0; Tn_VerilogExpression* e = 0; Tn_VerilogStatement* c = 0; Tn_VerilogTok t = tok(); }
    : ( l=name | l=lvalueConcatenation )
      ( ASSIGN ( c=intraAssignmentControl )? e=expression SEMI { s = blockingAssign(t, a, l, c, e); }
      | LE ( c=intraAssignmentControl )? e=expression SEMI { s = nonBlockingAssign(t, a, l, c, e); }
      | { s = taskCall(t, a, l); } ( LPAREN e=expression { callArgument(s, e); }
          ( COMMA e=expression { callArgument(s, e); } )* RPAREN )? SEMI
      )
    ;

systemTaskCall[Tn_VerilogAttributes* a] returns [Tn_VerilogStatement* s = 0]
{ Tn_VerilogTok id; Tn_VerilogExpression* e = 0; }
    : { id = tok(); } SYSTEM_IDENTIFIER { e = systemCall(id); } ( LPAREN systemArguments[e] RPAREN )? SEMI
      { s = systemTask(id, a, e); }
    ;

intraAssignmentControl returns [Tn_VerilogStatement* c = 0]
{ Tn_VerilogTok t, r; Tn_VerilogExpression* e = 0; Tn_VerilogStatement* ec = 0; }
    : { t = tok(); } HASH e=delayControlValue { c = delayControl(t, 0, e, 0); }
    | c=eventControl[0]
    | { r = tok(); } K_REPEAT LPAREN e=expression RPAREN ec=eventControl[0] { c = repeatControl(r, e, ec); }
    ;

ifStatement[Tn_VerilogAttributes* a] returns [Tn_VerilogStatement* s = 0]
{ Tn_VerilogTok i, i2; Tn_VerilogExpression* c = 0; Tn_VerilogStatement* t = 0; Tn_VerilogStatement* f = 0; size_t m = ifChainBegin(); }
    : { i = tok(); } K_IF LPAREN c=expression RPAREN t=statement { ifChainAdd(i, a, c, t); }
      ( options { greedy = true; } :
        { f == 0 }? K_ELSE
        ( options { generateAmbigWarnings = false; } :
          { i2 = tok(); } K_IF LPAREN c=expression RPAREN t=statement { ifChainAdd(i2, 0, c, t); }
        | f=statement
        )
      )*
      { s = ifChainEnd(m, f); }
    ;

caseStatement[Tn_VerilogAttributes* a] returns [Tn_VerilogStatement* s = 0]
{ Tn_VerilogExpression* e = 0; }
    : { s = caseBegin(tok(), a); } ( K_CASE | K_CASEZ | K_CASEX )
      LPAREN e=expression RPAREN { caseSelector(s, e); }
      ( caseItem[s] )+
      K_ENDCASE
    ;

caseItem[Tn_VerilogStatement* c]
{ Tn_VerilogTok d; Tn_VerilogStatement* i = 0; Tn_VerilogExpression* e = 0; Tn_VerilogStatement* s = 0; }
    : { d = tok(); } K_DEFAULT ( COLON )? { i = caseItemBegin(c, d); } s=statement { caseItemBody(c, i, s); }
    | { i = caseItemBegin(c, tok()); }
      e=expression { caseItemExpression(i, e); } ( COMMA e=expression { caseItemExpression(i, e); } )*
      COLON s=statement { caseItemBody(c, i, s); }
    ;

loopStatement[Tn_VerilogAttributes* a] returns [Tn_VerilogStatement* s = 0]
{ Tn_VerilogTok f, r, w, t; Tn_VerilogExpression* e = 0; Tn_VerilogStatement* b = 0; Tn_VerilogStatement* i = 0; Tn_VerilogStatement* n = 0;
  Tn_VerilogExpression* l = 0; Tn_VerilogExpression* v = 0; Tn_VerilogTok at; }
    : { f = tok(); } K_FOREVER b=statement { s = forever(f, a, b); }
    | { r = tok(); } K_REPEAT LPAREN e=expression RPAREN b=statement { s = repeat(r, a, e, b); }
    | { w = tok(); } K_WHILE LPAREN e=expression RPAREN b=statement { s = whileLoop(w, a, e, b); }
    | { t = tok(); } K_FOR LPAREN
      { at = tok(); } l=lvalue ASSIGN v=expression { i = blockingAssign(at, 0, l, 0, v); } SEMI
      e=expression SEMI
      { at = tok(); } l=lvalue ASSIGN v=expression { n = blockingAssign(at, 0, l, 0, v); } RPAREN
      b=statement { s = forLoop(t, a, i, e, n, b); }
    ;

block[Tn_VerilogAttributes* a] returns [Tn_VerilogStatement* s = 0]
    : { s = blockBegin(tok(), a); } K_BEGIN blockContents[s] K_END { blockEnd(s); }
    | { s = blockBegin(tok(), a); } K_FORK blockContents[s] K_JOIN { blockEnd(s); }
    ;

blockContents[Tn_VerilogStatement*& s]
{ Tn_VerilogTok id; Tn_VerilogStatement* b = 0; }
    : ( COLON { id = tok(); } IDENTIFIER { s = blockName(s, id); }
        ( options { generateAmbigWarnings = false; } : { declarationAhead(false) }? blockDeclaration[false] )*
      )?
      ( b=statement { blockAdd(s, b); } )*
    ;

delayControlStatement[Tn_VerilogAttributes* a] returns [Tn_VerilogStatement* s = 0]
{ Tn_VerilogTok t; Tn_VerilogExpression* e = 0; Tn_VerilogStatement* b = 0; }
    : { t = tok(); } HASH e=delayControlValue b=statement { s = delayControl(t, a, e, b); }
    ;

delayControlValue returns [Tn_VerilogExpression* e = 0]
    : e=number
    | e=name
    | LPAREN e=mintypmaxExpression RPAREN
    ;

eventControlStatement[Tn_VerilogAttributes* a] returns [Tn_VerilogStatement* s = 0]
{ Tn_VerilogStatement* b = 0; }
    : s=eventControl[a] b=statement { eventControlBody(s, b); }
    ;

eventControl[Tn_VerilogAttributes* a] returns [Tn_VerilogStatement* s = 0]
{ Tn_VerilogTok t, rp; Tn_VerilogEventExpression* e = 0; Tn_VerilogExpression* n = 0; }
    : { t = tok(); } AT
      ( n=name { s = makeEventControl(t, a, n); }
      | { v2001() }? STAR { s = makeEventControl(t, a, 0); }
      | { v2001() }? ATTR_OPEN RPAREN { s = makeEventControl(t, a, 0); }
      | LPAREN
        ( { v2001() }? STAR RPAREN { s = makeEventControl(t, a, 0); }
        | { rp = tok(); } RPAREN { s = emptyEventControl(t, a, rp); }
        | e=eventExpression RPAREN { s = makeEventControl(t, a, e); }
        )
      )
    ;

eventExpression returns [Tn_VerilogEventExpression* e = 0]
{ Tn_VerilogEventExpression* t = 0; Tn_VerilogEventExpression* o = 0; }
    : e=eventTerm
      ( ( K_OR | { v2001() }? COMMA ) t=eventTerm { if (!o) o = eventOr(e); eventOrAdd(o, t); e = o; } )*
    ;

eventTerm returns [Tn_VerilogEventExpression* e = 0]
{ Tn_VerilogTok p, n; Tn_VerilogExpression* x = 0; }
    : { p = tok(); } K_POSEDGE x=expression { e = edgeEvent(p, x); }
    | { n = tok(); } K_NEGEDGE x=expression { e = edgeEvent(n, x); }
    | x=expression { e = x; }
    ;

waitStatement[Tn_VerilogAttributes* a] returns [Tn_VerilogStatement* s = 0]
{ Tn_VerilogTok t; Tn_VerilogExpression* e = 0; Tn_VerilogStatement* b = 0; }
    : { t = tok(); } K_WAIT LPAREN e=expression RPAREN b=statement { s = makeWait(t, a, e, b); }
    ;

disableStatement[Tn_VerilogAttributes* a] returns [Tn_VerilogStatement* s = 0]
{ Tn_VerilogTok t; Tn_VerilogExpression* n = 0; }
    : { t = tok(); } K_DISABLE n=name SEMI { s = disable(t, a, n); }
    ;

eventTrigger[Tn_VerilogAttributes* a] returns [Tn_VerilogStatement* s = 0]
{ Tn_VerilogTok t; Tn_VerilogExpression* n = 0; }
    : { t = tok(); } EVENT_TRIGGER n=name SEMI { s = makeEventTrigger(t, a, n); }
    ;

proceduralContinuous[Tn_VerilogAttributes* a] returns [Tn_VerilogStatement* s = 0]
{ Tn_VerilogTok t, f, d, r; Tn_VerilogExpression* l = 0; Tn_VerilogExpression* e = 0; }
    : { t = tok(); } K_ASSIGN l=lvalue ASSIGN e=expression SEMI { s = proceduralAssign(t, a, l, e); }
    | { f = tok(); } K_FORCE l=lvalue ASSIGN e=expression SEMI { s = proceduralAssign(f, a, l, e); }
    | { d = tok(); } K_DEASSIGN l=lvalue SEMI { s = proceduralRelease(d, a, l); }
    | { r = tok(); } K_RELEASE l=lvalue SEMI { s = proceduralRelease(r, a, l); }
    ;

// ------------------------------------------------------------ expressions

lvalue returns [Tn_VerilogExpression* e = 0]
    : e=name
    | e=lvalueConcatenation
    ;

lvalueConcatenation returns [Tn_VerilogExpression* e = 0]
{ Tn_VerilogTok t; Nest nest(*this); Tn_VerilogExpression* l = 0; }
    : { t = tok(); } LBRACE l=lvalue { e = makeConcatenation(t, l); } ( COMMA l=lvalue { concatenationAdd(e, l); } )* RBRACE
    ;

constantExpression returns [Tn_VerilogExpression* e = 0]
{ ConstantContext constant(*this); }
    : e=expression
    ;

mintypmaxExpression returns [Tn_VerilogExpression* e = 0]
{ Tn_VerilogTok c; Tn_VerilogExpression* t = 0; Tn_VerilogExpression* m = 0; }
    : e=expression ( { c = tok(); } COLON t=expression COLON m=expression { e = minTypMax(c, e, t, m); } )?
    ;

// Conditional operators to the right of the colon continue the loop, so
// that a chain of them does not recurse.
expression returns [Tn_VerilogExpression* e = 0]
{ Tn_VerilogTok q; Nest nest(*this); Tn_VerilogAttributes* a = 0; Tn_VerilogExpression* t = 0; size_t m = conditionalBegin(); }
    : e=binaryExpression
      ( { q = tok(); } QUESTION a=attributeInstances t=expression COLON { conditionalAdd(q, a, e, t); } e=binaryExpression )*
      { e = conditionalEnd(m, e); }
    ;

binaryExpression returns [Tn_VerilogExpression* e = 0]
{ Tn_VerilogAttributes* a = 0; size_t m = binaryBegin(); Tn_VerilogTok op; }
    : e=unaryExpression
      ( { binaryOperand(e); op = tok(); }
        ( LOGICAL_OR | LOGICAL_AND | BIT_OR | CARET | XNOR | AMPERSAND
        | EQUAL | NOT_EQUAL | CASE_EQUAL | CASE_NOT_EQUAL
        | LESS_THAN | LE | GT | GE | SHIFT_LEFT | SHIFT_RIGHT
        | PLUS | MINUS | STAR | DIV | MOD
        // Arithmetic shifts and the power operator are Verilog-2001.
        | { v2001() }? ( ASHIFT_LEFT | ASHIFT_RIGHT | POWER )
        )
        a=attributeInstances { binaryOperator(m, op, a); }
        e=unaryExpression
      )*
      { e = binaryEnd(m, e); }
    ;

unaryExpression returns [Tn_VerilogExpression* e = 0]
{ Tn_VerilogAttributes* a = 0; size_t m = unaryBegin(); Tn_VerilogTok op; }
    : ( { op = tok(); }
        ( PLUS | MINUS | LOGICAL_NOT | TILDE | AMPERSAND | REDUCE_NAND | CARET | XNOR | BIT_OR | REDUCE_NOR )
        a=attributeInstances { unaryOperator(op, a); }
      )*
      e=primary { e = unaryEnd(m, e); }
    ;

primary returns [Tn_VerilogExpression* e = 0]
{ Tn_VerilogTok s, id; }
    : e=number
    | { s = tok(); } STRING { e = stringConstant(s); }
    | e=concatenation
    | LPAREN e=mintypmaxExpression RPAREN
    | { id = tok(); } SYSTEM_IDENTIFIER { e = systemCall(id); } ( LPAREN systemArguments[e] RPAREN )?
    | e=nameOrCall
    ;

nameOrCall returns [Tn_VerilogExpression* e = 0]
{ Tn_VerilogTok lp; Tn_VerilogAttributes* a = 0; Tn_VerilogExpression* x = 0; }
    : e=name
      ( a=attributeInstances { lp = tok(); } LPAREN { e = functionCall(lp, a, e); }
        ( x=expression { callArgument(e, x); } ( COMMA x=expression { callArgument(e, x); } )* )?
        RPAREN
      )?
    ;

// The arguments of a system task or function; any may be left empty.
systemArguments[Tn_VerilogExpression* c]
{ Tn_VerilogExpression* x = 0; }
    : { LA(1) == RPAREN }?
    | ( x=expression { systemArgument(c, x, tok()); } | { systemArgument(c, 0, tok()); } )
      ( COMMA { x = 0; } ( x=expression )? { systemArgument(c, x, tok()); } )*
    ;

concatenation returns [Tn_VerilogExpression* e = 0]
{ Tn_VerilogTok t; Nest nest(*this); Tn_VerilogExpression* x = 0; }
    : { t = tok(); } LBRACE x=expression
      ( LBRACE { e = multipleConcatenation(t, x); }
        x=expression { concatenationAdd(e, x); } ( COMMA x=expression { concatenationAdd(e, x); } )* RBRACE
      | { e = makeConcatenation(t, x); } ( COMMA x=expression { concatenationAdd(e, x); } )*
      )
      RBRACE
    ;

// A simple or hierarchical name with its selects.
name returns [Tn_VerilogExpression* e = 0]
{ Tn_VerilogTok id, id2; size_t m = nameBegin(); }
    : { id = tok(); } IDENTIFIER { nameComponent(id); }
      ( select )*
      ( DOT { id2 = tok(); } IDENTIFIER { nameComponent(id2); } ( select )* )*
      { e = nameEnd(m); }
    ;

select
{ Tn_VerilogTok t; Tn_VerilogExpression* b = 0; Tn_VerilogExpression* w = 0; }
    : { t = tok(); } LBRACKET b=expression
      ( COLON w=expression { nameSelect(t, COLON, b, w); }
      | { v2001() }? PLUS_COLON w=expression { nameSelect(t, PLUS_COLON, b, w); }
      | { v2001() }? MINUS_COLON w=expression { nameSelect(t, MINUS_COLON, b, w); }
      | { nameSelect(t, 0, b, 0); }
      )
      RBRACKET
    ;

number returns [Tn_VerilogExpression* e = 0]
{ Tn_VerilogTok i, r; }
    : { i = tok(); } INTEGER ( options { generateAmbigWarnings = false; } : e=basedNumber[i] | { e = integerConstant(i); } )
    | e=basedNumber[Tn_VerilogTok()]
    | { r = tok(); } REAL { e = realConstant(r); }
    ;

basedNumber[Tn_VerilogTok size] returns [Tn_VerilogExpression* e = 0]
{ Tn_VerilogTok d, bn, o, h; Tn_VerilogTok b = tok(); }
    : ( BASE_D | { v2001() }? BASE_SD ) { d = tok(); } DECIMAL_NUMBER { e = basedConstant(size, b, d); }
    | ( BASE_B | { v2001() }? BASE_SB ) { bn = tok(); } BINARY_NUMBER { e = basedConstant(size, b, bn); }
    | ( BASE_O | { v2001() }? BASE_SO ) { o = tok(); } OCTAL_NUMBER { e = basedConstant(size, b, o); }
    | ( BASE_H | { v2001() }? BASE_SH ) { h = tok(); } HEX_NUMBER { e = basedConstant(size, b, h); }
    ;
