// The scanner as the parser's token stream: runs the flex scanner once per
// token and wraps what it found in a Tn_VerilogToken. A scanner error comes
// out as antlr::TokenStreamRecognitionException; the stream then ends.
#ifndef TARN_TN_VERILOGLEXER_H
#define TARN_TN_VERILOGLEXER_H

#include <antlr/RecognitionException.hpp>
#include <antlr/TokenStream.hpp>
#include <antlr/TokenStreamRecognitionException.hpp>

#include "verilog/tn_verilogflexlexer.h"

class Tn_VerilogLexer : public antlr::TokenStream {
public:
    Tn_VerilogLexer(const Tn_VerilogOptions& options, Tn_VerilogDirectiveState& directives);
    ~Tn_VerilogLexer() override;
    Tn_VerilogLexer(const Tn_VerilogLexer&) = delete;
    Tn_VerilogLexer& operator=(const Tn_VerilogLexer&) = delete;

    // Starts on the source files of a compilation, or on a text scanned as
    // if it were a file (a -G value, say).
    void startFiles(const Tn_StringList& files);
    void startString(const Port_String& text);
    // Status messages for the files read name the work library too.
    void setAnnounceLibrary(bool announce) { scanner_.state().announceLibrary = announce; }

    antlr::RefToken nextToken() override;
    // The next token's type only: its text, file, line and column are left
    // in state() (the parser makes token objects for the few it keeps).
    int nextType();

    Tn_VerilogScannerState& state() { return scanner_.state(); }
    const Tn_VerilogFileList& fileList() const { return scanner_.state().fileList; }
    std::vector<Port_String>& pragmaComments() { return scanner_.state().pragmaComments; }
    Tn_VerilogDirectiveState& directives() { return scanner_.state().directives(); }

    // Reports a scanner error the way the parser reports it:
    // "\"file\" line N message".
    static void report(const antlr::TokenStreamRecognitionException& e);

private:
    Tn_VerilogFlexLexer scanner_;
};

#endif
