// The Verilog scanner: the rules of verilog/tn_verilogflexlexer.l with the
// compiler directives, include files and macros handled as the text is read.
// scan() returns the next token type and leaves its text in the state.
#ifndef TARN_TN_VERILOGFLEXLEXER_H
#define TARN_TN_VERILOGFLEXLEXER_H

#include <string>

#include "verilog/tn_verilogbaseflexlexer.h"
#include "verilog/tn_verilogscannerstate.h"
#include "verilog/tn_verilogtokentypes.h"

class Tn_VerilogFlexLexer : public Tn_VerilogBaseFlexLexer, public Tn_VerilogTokenTypes {
public:
    // Start conditions, in the order the rules file declares them.
    enum Condition {
        C_INITIAL,
        C_LINE_COMMENT,
        C_BLOCK_COMMENT,
        C_STRING,
        C_ESCAPED_ID,
        C_SKIP_IFDEF,
        C_TRANSLATE_OFF,
        C_DEFINE_BODY,
        C_DEC_DIGITS,
        C_BIN_DIGITS,
        C_OCT_DIGITS,
        C_HEX_DIGITS,
        C_EDGE_LIST,
        C_UDP_TABLE,
        C_MACRO_ARGS
    };
    // Bounds that turn runaway input into a scanner error instead of a hang:
    // nested macro expansions (a macro that expands to itself), the text they
    // hold, all expansion text of a compilation (macros that double at each
    // level: 40 lines can ask for 2^40 tokens), and nested include files.
    static constexpr int kMaxExpansionDepth = 1000;
    static constexpr size_t kMaxExpansionBytes = size_t(16) << 20;
    static constexpr size_t kMinTotalExpansionBytes = size_t(32) << 20;
    static constexpr size_t kExpansionRatio = 16;  // times the bytes read from files
    static constexpr int kMaxIncludeDepth = 200;

    Tn_VerilogFlexLexer(const Tn_VerilogOptions& options, Tn_VerilogDirectiveState& directives);
    ~Tn_VerilogFlexLexer() override;

    // Starts on the source files (the first is opened at once) or on a text
    // scanned as if it were a file. Either resets the scanner.
    void startFiles(const Tn_StringList& files);
    void startString(const Port_String& text);
    // After a scanner error: closes every input; scan() then returns end of input.
    void resetInput();

    // The next token type (EOF_ at the end of the last file); the text is in state().text.
    int scan();

    Tn_VerilogScannerState& state() { return state_; }
    const Tn_VerilogScannerState& state() const { return state_; }

    int yylex() override;

protected:
    int LexerInput(char* buf, int max_size) override;

private:
    void start();
    bool verilog2001() const { return verilog2001_; }
    [[noreturn]] void raise(const char* fmt, ...) __attribute__((format(printf, 2, 3)));
    [[noreturn]] void raiseAt(int line, const char* fmt, ...) __attribute__((format(printf, 3, 4)));

    int condition() const { return (yy_start - 1) / 2; }
    void begin(int c) { yy_start = 1 + 2 * c; }

    // Position bookkeeping. Every lexeme has already advanced the column.
    void newLine();
    void countLines(const char* text, int length);
    void pushState(int condition);
    void popState();
    int topState();

    // Inputs.
    void openSourceFile(const Port_String& path);
    void pushInput(Tn_VerilogScannerState::Input* input, int bufferSize);
    void popInput();
    int endOfInput();

    // Comments and pragma comments.
    void beginComment(int condition);
    int endComment();

    // Directives (each given the matched lexeme in yytext).
    void beginDefine();
    void finishDefine();
    void undef();
    void ifdef(bool negate);
    void elsif();
    void elseDirective();
    void endif();
    void include();
    void timescale();
    void defaultNettype();
    void unconnectedDrive();
    void uselib();
    void lineDirective();
    void unsupportedDirective(const char* name);

    // Macro references.
    void beginMacroArgs();
    void endMacroArgs();
    void macroReference(const Port_String& name, const Port_String& args, bool hasArgs);
    // The text a reference expands to (after its checks and messages).
    std::string expansion(const Port_String& name, const Port_String& args, bool hasArgs);
    Port_String directiveArgument(const char* directive);

    // Tokens.
    int token(int type);
    int identifier();
    int systemIdentifier();
    int number(int type);
    int base(int type, int condition);
    int basedDigits(int type);
    int illegalDigits(int type, const char* base);
    int invalidCharacter(unsigned char c);
    void beginString();
    int endString();

    Tn_VerilogScannerState state_;
    bool verilog2001_ = true;
    bool strict_ = true;
    bool pragmas_ = false;
    bool debug_ = false;
    bool finished_ = true;
    // The comment being scanned is kept for the pragma checks.
    bool collectComment_ = false;
};

#endif
