#include "tests/support/scan.h"

#include "verilog/tn_verilogcompiler.h"
#include "verilog/tn_verilogdirectivestate.h"
#include "verilog/tn_veriloglexer.h"
#include "verilog/tn_verilogtokentypes.h"

std::string ScanResult::text() const {
    std::string s;
    for (const ScannedToken& t : tokens) {
        if (t.type == Tn_VerilogTokenTypes::EOF_) break;
        if (!s.empty()) s += ' ';
        s += t.text;
    }
    return s;
}

std::vector<int> ScanResult::types() const {
    std::vector<int> r;
    for (const ScannedToken& t : tokens)
        if (t.type != Tn_VerilogTokenTypes::EOF_) r.push_back(t.type);
    return r;
}

ScanResult drainTokens(Tn_VerilogLexer& lexer) {
    ScanResult r;
    try {
        for (;;) {
            antlr::RefToken t = lexer.nextToken();
            r.tokens.push_back(ScannedToken{t->getType(), t->getText(), t->getFilename(), t->getLine(), t->getColumn()});
            if (t->getType() == Tn_VerilogTokenTypes::EOF_) break;
        }
    } catch (const antlr::TokenStreamRecognitionException& e) {
        r.failed = true;
        r.error = e.getMessage();
        r.errorFile = e.getFilename();
        r.errorLine = e.getLine();
    }
    return r;
}

ScanResult scanArgs(const std::vector<std::string>& args, bool strict) {
    Tn_StringList list{Port_String("tarn")};
    for (const std::string& a : args) list.push_back(Port_String(a));
    if (!strict) {
        Tn_VerilogOptions options;
        options.parse(list);
        options.setStrictPreprocessing(false);
        Tn_VerilogDirectiveState directives;
        directives.reset(options.macroDefinitions());
        Tn_VerilogLexer lexer(options, directives);
        lexer.startFiles(options.sourceFiles());
        return drainTokens(lexer);
    }
    Tn_VerilogCompiler driver;
    if (!driver.scanSources(list)) {
        ScanResult r;
        r.failed = true;
        r.error = "options";
        return r;
    }
    return drainTokens(driver.lexer());
}

ScanResult scanSource(const TempDir& dir, const std::string& source, const std::vector<std::string>& args,
                      const std::string& name, bool strict) {
    std::vector<std::string> all{dir.write(name, source)};
    all.insert(all.end(), args.begin(), args.end());
    return scanArgs(all, strict);
}
