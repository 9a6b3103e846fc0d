#include "src/tn_verilogoptions.h"

#include <algorithm>
#include <boost/regex.hpp>
#include <cstring>

#include "port/port_file.h"
#include "src/tn_optionstream.h"
#include "util/tn_message.h"
#include "util/tn_messagecheckpoint.h"

namespace {

// "dir/" and "dir\" name dir; a lone "/" stays the root.
Port_String withoutTrailingSeparators(Port_String s) {
    while (s.GetLength() > 1 && (s[s.GetLength() - 1] == '/' || s[s.GetLength() - 1] == '\\')) s.SetLength(s.GetLength() - 1);
    return s;
}

const char* const kUsageLines[] = {
    "[-verilog2001 yes|no]",
    "[+pls_client]",
    "{-f <file>}",
    "[-ini <inifile>]",
    "[-root <dir>]",
    "{-work <library>}",
    "{-y <libdir>}",
    "{-v <libfile>}",
    "{-top <topdesignunit>}",
    "{-G[<parameter>=]<value>}",
    "[-timestamp <timestamp>]",
    "[-[no]recursive",
    "[-iteration_limit <iteration_limit>]",
    "[-recursion_limit <recursion_limit>]",
    "[-compact]",
    "{+incdir+<incdir>{+<incdir>}}",
    "{+libext+<libext>{+<libext>}}",
    "{+define+<name>[=<value>]{+<name>[=<value>]}}",
    "[+mindelays | +typdelays | +maxdelays]",
    "{+<user-plusarg>}",
    "<file> {<file>}",
};

}  // namespace

// Reads the tokens of one call into a record.
class Tn_VerilogOptions::Parser {
public:
    Parser(Tn_VerilogOptions& opts, Tn_OptionStream& ts) : o_(opts), r_(*opts.r_), ts_(ts) {}

    int helpRequests = 0;

    void argument(const Port_String& tok) {
        if (tok.GetAt(0) == '+')
            plus(tok);
        else if (tok.GetAt(0) == '-')
            dash(tok);
        else if (Port::File::isfile(tok.c_str()))
            r_.sourceFiles.push_back(tok);
        else
            TN_MSG().issueError("Source file %s does not exist\n", tok.c_str());
    }

private:
    void plus(Port_String arg) {
        arg.Trim("+", Port::TRIM_LEFT);
        int pos = 0;
        Port_String key;
        if (!arg.NextToken("+", pos, key, Port::PARSE_TRIMMED)) return;
        Port_String piece;
        if (key == "incdir") {
            while (arg.NextToken("+", pos, piece, Port::PARSE_TRIMMED)) {
                piece = withoutTrailingSeparators(piece);
                if (Port::File::isdir(piece.c_str()))
                    r_.includeDirectories.push_back(piece);
                else
                    TN_MSG().issueWarning("Include directory %s does not exist\n", piece.c_str());
            }
        } else if (key == "libext") {
            while (arg.NextToken("+", pos, piece, Port::PARSE_VERBATIM)) r_.libraryExtensions.push_back(piece);
        } else if (key == "define") {
            while (arg.NextToken("+", pos, piece, Port::PARSE_TRIMMED)) r_.macroDefinitions.push_back(piece);
        } else if (key == "mindelays") {
            r_.delaySelection = 0;
        } else if (key == "typdelays") {
            r_.delaySelection = 1;
        } else if (key == "maxdelays") {
            r_.delaySelection = 2;
        } else {
            r_.plusArgs.push_back(arg);
        }
    }

    typedef void (Parser::*Handler)(const Port_String& opt);
    struct Option {
        const char* name;
        Handler handler;
    };

    void dash(Port_String opt) {
        opt.Trim("-", Port::TRIM_LEFT);
        if (opt.GetAt(0) == 'G') return paramOverride(opt);
        static const Option table[] = {
            {"f", &Parser::optionFile},
            {"top", &Parser::top},
            {"L", &Parser::searchLibrary},
            {"ini", &Parser::ini},
            {"root", &Parser::root},
            {"work", &Parser::work},
            {"y", &Parser::libraryDirectory},
            {"v", &Parser::libraryFile},
            {"verilog2001", &Parser::verilog2001},
            {"2001", &Parser::mode2001},
            {"95", &Parser::mode1995},
            {"1995", &Parser::mode1995},
            {"timestamp", &Parser::timestamp},
            {"recursive", &Parser::recursive},
            {"norecursive", &Parser::noRecursive},
            {"iteration_limit", &Parser::iterationLimit},
            {"recursion_limit", &Parser::recursionLimit},
            {"compact", &Parser::compact},
            {"help", &Parser::help},
            {"h", &Parser::help},
            {"?", &Parser::help},
        };
        for (const Option& o : table)
            if (opt == o.name) return (this->*o.handler)(opt);
        TN_MSG().issueError("Unrecognized option '%s'\n", opt.c_str());
    }

    Port_String value() { return ts_.nextToken(); }
    static int32_t decimal(const Port_String& s) { return s.GetINT32(10); }

    void optionFile(const Port_String&) { ts_.pushOptionFile(value()); }
    void top(const Port_String&) {
        Port_String unit = value();
        if (std::find(r_.topUnits.begin(), r_.topUnits.end(), unit) != r_.topUnits.end())
            TN_MSG().issueError("Top level design unit %s specified more than once\n", unit.c_str());
        else
            r_.topUnits.push_back(unit);
    }
    void searchLibrary(const Port_String&) { r_.searchLibraries.push_back(value()); }
    void ini(const Port_String&) { r_.iniFile = value(); }
    void root(const Port_String&) { r_.rootDirectory = value(); }
    void work(const Port_String&) { r_.workLibrary = value(); }
    void libraryDirectory(const Port_String&) {
        Port_String dir = withoutTrailingSeparators(value());
        if (Port::File::isdir(dir.c_str()))
            r_.librarySearchList.push_back("dir:" + dir);
        else
            TN_MSG().issueWarning("Library directory %s does not exist\n", dir.c_str());
    }
    void libraryFile(const Port_String&) {
        Port_String file = value();
        if (Port::File::isfile(file.c_str()))
            r_.librarySearchList.push_back("file:" + file);
        else
            TN_MSG().issueWarning("Library file %s does not exist\n", file.c_str());
    }
    void verilog2001(const Port_String&) {
        static const boost::regex yes("[Yy]([Ee]([Ss])?)?");
        r_.verilog2001 = boost::regex_match(value().str(), yes) ? 1 : 0;
    }
    void mode2001(const Port_String&) { r_.verilog2001 = 1; }
    void mode1995(const Port_String&) { r_.verilog2001 = 0; }
    void timestamp(const Port_String&) { r_.timestamp = decimal(value()); }
    void recursive(const Port_String&) { r_.recursive = true; }
    void noRecursive(const Port_String&) { r_.recursive = false; }
    void iterationLimit(const Port_String&) { r_.iterationLimit = decimal(value()); }
    void recursionLimit(const Port_String&) { r_.recursionLimit = decimal(value()); }
    void compact(const Port_String&) { r_.compact = true; }
    void help(const Port_String&) {
        o_.printUsage();
        ++helpRequests;
    }

    // -Gname=value, -Gvalue, or -G followed by the override as the next token.
    void paramOverride(const Port_String& opt) {
        static const boost::regex split("(([^=]*)=)?(.*)");
        const Port_String text = opt.GetLength() == 1 ? value() : opt.Extract(1);
        boost::smatch m;
        boost::regex_match(text.str(), m, split);  // always matches
        r_.paramOverrides.emplace_back(Port_String(m[2].str()), Port_String(m[3].str()));
    }

    Tn_VerilogOptions& o_;
    Record& r_;
    Tn_OptionStream& ts_;
};

Tn_VerilogOptions::Tn_VerilogOptions() : r_(new Record) {}

Tn_VerilogOptions::Tn_VerilogOptions(const Tn_VerilogOptions& o) : r_(new Record(*o.r_)) {}

Tn_VerilogOptions& Tn_VerilogOptions::operator=(const Tn_VerilogOptions& o) {
    if (this != &o) *r_ = *o.r_;
    return *this;
}

Tn_VerilogOptions::~Tn_VerilogOptions() {}

int Tn_VerilogOptions::parse(const Tn_StringList& args) {
    Tn_MessageCheckpoint checkpoint;
    *r_ = Record();
    Tn_OptionStream ts(args);
    r_->programName = ts.nextToken();
    Parser p(*this, ts);
    while (ts.moreTokens()) p.argument(ts.nextToken());
    return checkpoint.errorCount() + p.helpRequests;
}

bool Tn_VerilogOptions::hasPlusArg(const Port_String& prefix) const {
    for (const Port_String& a : r_->plusArgs)
        if (a.GetIndexOfString(prefix, Port::COMPARE_EXACT) == 0) return true;
    return false;
}

Port_String Tn_VerilogOptions::plusArgValue(const Port_String& prefix) const {
    for (const Port_String& a : r_->plusArgs)
        if (a.GetIndexOfString(prefix, Port::COMPARE_EXACT) == 0) return a.Extract(prefix.GetLength());
    return Port_String();
}

void Tn_VerilogOptions::printUsage() const {
    const Port_MsgManData msg = TN_MSG();
    msg.issueStatus("\n");
    msg.issueStatus("Usage: %s [-?|h|help]\n", r_->programName.c_str());
    for (const char* line : kUsageLines) msg.issueStatus("          %s\n", line);
    msg.issueStatus("\n");
}
