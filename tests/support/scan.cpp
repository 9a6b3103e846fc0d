#include "tests/support/scan.h"

#include "verilog/tn_verilogcompiler.h"
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

ScanResult scanArgs(const std::vector<std::string>& args) {
    Tn_StringList list{Port_String("tarn")};
    for (const std::string& a : args) list.push_back(Port_String(a));
    ScanResult r;
    Tn_VerilogCompiler driver;
    if (!driver.scanSources(list)) {
        r.failed = true;
        r.error = "options";
        return r;
    }
    try {
        for (;;) {
            antlr::RefToken t = driver.lexer().nextToken();
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

ScanResult scanSource(const TempDir& dir, const std::string& source, const std::vector<std::string>& args,
                      const std::string& name) {
    std::vector<std::string> all{dir.write(name, source)};
    all.insert(all.end(), args.begin(), args.end());
    return scanArgs(all);
}
