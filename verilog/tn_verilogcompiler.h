// The driver of one compiler call: runs the compile, parse or elaborate flow
// over a command line and leaves the elaborated design (or null) behind.
#ifndef TARN_TN_VERILOGCOMPILER_H
#define TARN_TN_VERILOGCOMPILER_H

#include <memory>

#include "src/tn_verilogoptions.h"
#include "util/tn_messagecheckpoint.h"
#include "verilog/tn_verilogfilelist.h"

class Tn_Library;
class Tn_VerilogDesign;
class Tn_VerilogModuleInstance;
class Tn_VerilogDirectiveState;
class Tn_VerilogLexer;
class Tn_VerilogParser;
class Tn_VerilogTokenStreamFilter;

class Tn_VerilogCompiler {
public:
    Tn_VerilogCompiler();
    ~Tn_VerilogCompiler();
    Tn_VerilogCompiler(const Tn_VerilogCompiler&) = delete;
    Tn_VerilogCompiler& operator=(const Tn_VerilogCompiler&) = delete;

    // Each flow returns the number of errors issued during it.
    int compile(const Tn_StringList& args);
    int parse(const Tn_StringList& args);
    int elaborate(const Tn_StringList& args);

    // The Verilog units of work that no unit of work instantiates (every one
    // when recursive is false), in ascending byte order of their names.
    static Tn_StringList findTopUnits(Tn_Library& work, bool recursive);

    // The unelaborated container for the options of the last flow: one top
    // instance per name, -G overrides applied to each.
    std::unique_ptr<Tn_VerilogDesign> buildDesign(const Tn_StringList& tops);

    // The result design; the driver's slot becomes null.
    std::unique_ptr<Tn_VerilogDesign> takeResult();
    // The files read in this call.
    const Tn_VerilogFileList& sourceFiles() const;
    const Tn_VerilogOptions& options() const { return options_; }

    // The compile flow's opening, then the scanner started on the source
    // files, whose tokens the caller reads from lexer() (tarn tokens). False
    // when the options had errors.
    bool scanSources(const Tn_StringList& args);
    Tn_VerilogLexer& lexer() { return *lexer_; }

private:
    enum Flow { COMPILE, PARSE, ELABORATE };

    int run(Flow flow, const Tn_StringList& args);
    void open(Flow flow, const Tn_StringList& args);
    void compileFlow();
    void parseFlow();
    void elaborateFlow();
    bool errorsSoFar() const { return checkpoint_.errorsIssued(); }

    // The scanner (and the filter over it) started on the source files.
    void startScanner();
    // Front end: reads every source file into the work library; the names of
    // the units compiled are appended to compiled when given.
    void parseSources(Tn_Library& work, Tn_StringList* compiled);
    // The -top names, else the units no other unit instantiates (error when none).
    Tn_StringList topUnits(Tn_Library& work);
    // Elaborates tops (built into a design container) and keeps the result.
    void elaborateTops(const Tn_StringList& tops, bool recursive);
    // Applies the -G overrides to one top instance (all named or all ordered).
    void applyOverrides(Tn_VerilogDesign& design, Tn_VerilogModuleInstance& inst);

    Tn_VerilogOptions options_;
    // The front end's state, created with the driver in this order.
    std::unique_ptr<Tn_VerilogDirectiveState> directives_;
    std::unique_ptr<Tn_VerilogLexer> lexer_;
    std::unique_ptr<Tn_VerilogTokenStreamFilter> filter_;
    std::unique_ptr<Tn_VerilogParser> parser_;
    std::unique_ptr<Tn_VerilogDesign> result_;
    Tn_MessageCheckpoint checkpoint_;
};

#endif
