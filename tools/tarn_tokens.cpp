// tarn tokens [-count] ARGS...: the sources of ARGS preprocessed and scanned
// as a compilation reads them, one token per line in its string form, up to
// and including the end-of-file token. With -count only the number of tokens
// and of source bytes read is printed (the scanner's throughput benchmark).
#include <cstdio>
#include <cstring>
#include <string>

#include "tools/tarn_commands.h"
#include "verilog/tn_verilogcompiler.h"
#include "verilog/tn_veriloglexer.h"

int tarnTokens(const TarnArgs& args) {
    TarnArgs verilogArgs = args;
    const bool countOnly = verilogArgs.size() > 1 && verilogArgs[1] == "-count";
    if (countOnly) verilogArgs.erase(verilogArgs.begin() + 1);

    Tn_VerilogCompiler driver;
    if (!driver.scanSources(verilogArgs)) return 1;
    Tn_VerilogLexer& lexer = driver.lexer();
    static char buffer[1 << 16];
    std::setvbuf(stdout, buffer, _IOFBF, sizeof buffer);
    unsigned long long count = 0;
    try {
        for (;;) {
            antlr::RefToken t = lexer.nextToken();
            ++count;
            if (!countOnly) {
                const std::string s = t->toString();
                std::fwrite(s.data(), 1, s.size(), stdout);
                std::fputc('\n', stdout);
            }
            if (t->getType() == antlr::Token::EOF_TYPE) break;
        }
    } catch (const antlr::TokenStreamRecognitionException& e) {
        std::fflush(stdout);
        Tn_VerilogLexer::report(e);
        return 1;
    }
    if (countOnly)
        std::printf("%llu tokens, %llu bytes\n", count, static_cast<unsigned long long>(lexer.state().bytesRead));
    std::fflush(stdout);
    return 0;
}
