#include "verilog/tn_veriloglexer.h"

#include "util/tn_message.h"
#include "verilog/tn_verilogflexexception.h"
#include "verilog/tn_verilogtoken.h"

Tn_VerilogLexer::Tn_VerilogLexer(const Tn_VerilogOptions& options, Tn_VerilogDirectiveState& directives)
    : scanner_(options, directives) {}

Tn_VerilogLexer::~Tn_VerilogLexer() {}

void Tn_VerilogLexer::startFiles(const Tn_StringList& files) { scanner_.startFiles(files); }

void Tn_VerilogLexer::startString(const Port_String& text) { scanner_.startString(text); }

int Tn_VerilogLexer::nextType() {
    try {
        return scanner_.scan();
    } catch (Tn_VerilogFlexException& e) {
        scanner_.resetInput();
        throw antlr::TokenStreamRecognitionException(e);
    }
}

antlr::RefToken Tn_VerilogLexer::nextToken() {
    const int type = nextType();
    Tn_VerilogScannerState& s = scanner_.state();
    return antlr::RefToken(new Tn_VerilogToken(type, s.text, s.file, s.line, s.column));
}

void Tn_VerilogLexer::report(const antlr::TokenStreamRecognitionException& e) {
    TN_MSG().issueError("\"%s\" line %d %s\n", e.getFilename().c_str(), e.getLine(), e.getMessage().c_str());
}
