#include "verilog/tn_verilogflexlexer.h"

#include <algorithm>
#include <boost/regex.hpp>
#include <cctype>
#include <climits>
#include <cstdarg>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string_view>

#include "port/port_file.h"
#include "util/tn_message.h"
#include "verilog/tn_verilogdirectivestate.h"
#include "verilog/tn_verilogflexexception.h"

namespace {

// Bytes asked of a file at a time, and the scanner buffer over it.
const int kFileBufferSize = 64 * 1024;

// Keyword and timing-check tables, made from the token list: one lookup per
// identifier, so an open-addressing table with a cheap hash.
class KeywordTable {
public:
    enum Kind { KEYWORD, KEYWORD_2001, TIMING_CHECK, FIXED, LITERAL };
    struct Entry {
        std::string_view text;
        int type;
        bool only2001;
    };

    KeywordTable() {
        struct Row {
            const char* text;
            int type;
            Kind kind;
        };
        static const Row rows[] = {
#define TN_TOKEN(name, text, kind) {text, Tn_VerilogTokenTypes::name, kind},
#include "verilog/tn_verilogtokens.def"
#undef TN_TOKEN
        };
        for (const Row& r : rows)
            if (r.kind == KEYWORD || r.kind == KEYWORD_2001 || r.kind == TIMING_CHECK)
                insert(Entry{r.text, r.type, r.kind == KEYWORD_2001});
    }
    // The keyword (or, for "$..." texts, the timing check) of that text.
    const Entry* find(std::string_view text) const {
        for (size_t i = hash(text);; i = (i + 1) & kMask) {
            const Entry& e = slots_[i];
            if (e.text.empty()) return nullptr;
            if (e.text == text) return &e;
        }
    }

private:
    static constexpr size_t kSlots = 512;  // a power of two, well above the 136 entries
    static constexpr size_t kMask = kSlots - 1;
    static size_t hash(std::string_view s) {
        size_t h = s.size();
        for (char c : s) h = h * 31 + static_cast<unsigned char>(c);
        return h & kMask;
    }
    void insert(const Entry& e) {
        size_t i = hash(e.text);
        while (!slots_[i].text.empty()) i = (i + 1) & kMask;
        slots_[i] = e;
    }
    Entry slots_[kSlots] = {};
};

const KeywordTable& keywords() {
    static const KeywordTable table;
    return table;
}

// Small files get a buffer of their size.
int fileBufferSize(const Tn_VerilogScannerState::Input& in) {
    const Port::Stream::FileId* id = in.fileId();
    if (id && id->regular && id->size + 2 < kFileBufferSize) return static_cast<int>(id->size) + 2;
    return kFileBufferSize;
}

bool isIdentChar(char c) { return std::isalnum(static_cast<unsigned char>(c)) || c == '_' || c == '$'; }

// The name at the end of a directive lexeme ("`ifdef  NAME" gives NAME).
Port_String trailingWord(const char* text, int length) {
    int start = length;
    while (start > 0 && isIdentChar(text[start - 1])) --start;
    return Port_String(text + start, length - start);
}

void assignWithoutUnderscores(std::string& s, const char* text, int length) {
    s.assign(text, static_cast<size_t>(length));
    if (std::memchr(text, '_', static_cast<size_t>(length))) s.erase(std::remove(s.begin(), s.end(), '_'), s.end());
}

std::string withoutWhiteSpace(const std::string& s) {
    std::string r;
    for (char c : s)
        if (!std::isspace(static_cast<unsigned char>(c))) r += c;
    return r;
}

std::string trimmed(const std::string& s, const char* chars) {
    const size_t b = s.find_first_not_of(chars);
    if (b == std::string::npos) return std::string();
    return s.substr(b, s.find_last_not_of(chars) - b + 1);
}

// A character as an invalid-character token shows it.
std::string printable(unsigned char c) {
    switch (c) {
    case '\t': return "\\t";
    case '\n': return "\\n";
    case '"': return "\\\"";
    case '\\': return "\\\\";
    default: break;
    }
    if (c < 0x20 || c >= 0x7f) {
        char buf[8];
        std::snprintf(buf, sizeof buf, "\\%03o", c);
        return buf;
    }
    return std::string(1, static_cast<char>(c));
}

// The actual arguments of a parameterised macro reference: the text inside
// the parentheses, split at commas outside nested brackets and strings.
std::vector<std::string> splitActuals(const std::string& inner) {
    std::vector<std::string> actuals;
    std::string cur;
    int depth = 0;
    bool inString = false;
    for (size_t i = 0; i < inner.size(); ++i) {
        char c = inner[i];
        if (inString) {
            if (c == '\\' && i + 1 < inner.size()) {
                cur += c;
                c = inner[++i];
            } else if (c == '"') {
                inString = false;
            }
        } else if (c == '"') {
            inString = true;
        } else if (c == '(' || c == '[' || c == '{') {
            ++depth;
        } else if ((c == ')' || c == ']' || c == '}') && depth > 0) {
            --depth;
        } else if (c == ',' && depth == 0) {
            actuals.push_back(trimmed(cur, " \t\r\n"));
            cur.clear();
            continue;
        }
        cur += c;
    }
    actuals.push_back(trimmed(cur, " \t\r\n"));
    return actuals;
}

// A prepared body with its formal markers replaced by the actuals.
std::string substitute(const std::string& body, const std::vector<std::string>& actuals) {
    const char marker = Tn_VerilogDirectiveState::kFormalMarker;
    std::string out;
    out.reserve(body.size());
    for (size_t i = 0; i < body.size(); ++i) {
        if (body[i] != marker || i + 1 >= body.size()) {
            out += body[i];
            continue;
        }
        if (body[i + 1] == marker) {
            out += marker;
            ++i;
            continue;
        }
        size_t j = i + 1, index = 0;
        while (j < body.size() && std::isdigit(static_cast<unsigned char>(body[j])) && index < actuals.size())
            index = index * 10 + static_cast<size_t>(body[j++] - '0');
        if (j > i + 1 && index < actuals.size()) out += actuals[index];
        i = j - 1;
    }
    return out;
}

}  // namespace

Tn_VerilogFlexLexer::Tn_VerilogFlexLexer(const Tn_VerilogOptions& options, Tn_VerilogDirectiveState& directives)
    : state_(options, directives) {}

Tn_VerilogFlexLexer::~Tn_VerilogFlexLexer() { resetInput(); }

// ---------------------------------------------------------------- starting

void Tn_VerilogFlexLexer::start() {
    resetInput();
    const Tn_VerilogOptions& o = state_.options();
    verilog2001_ = o.verilog2001() != 0;
    strict_ = o.strictPreprocessing();
    pragmas_ = o.hasPlusArg("pls_client");
    debug_ = o.hasPlusArg("tarn+lexer+debug");
    set_debug(debug_ ? 1 : 0);
    state_.fileList.clear();
    state_.pragmaComments.clear();
    state_.sourceFiles.clear();
    state_.nextSource = 0;
    state_.bytesRead = 0;
    state_.expandedBytes = 0;
    state_.includesOpened = 0;
    state_.text.clear();
    state_.file = Tn_RCStringPtr();
    state_.line = 0;
    state_.column = 1;
    // Frames left open by an earlier, failed scan mean nothing here.
    state_.directives().conditionals().clear();
    finished_ = false;
}

void Tn_VerilogFlexLexer::startFiles(const Tn_StringList& files) {
    start();
    // The first file is opened by the first scan, so that failing to open it
    // is a scanner error like any other.
    state_.sourceFiles = files;
}

void Tn_VerilogFlexLexer::startString(const Port_String& text) {
    start();
    state_.line = 1;
    pushInput(new Tn_VerilogScannerState::Input(Tn_VerilogScannerState::Input::TEXT, Port_String(), text.str()),
              text.GetLength() + 2);
}

void Tn_VerilogFlexLexer::resetInput() {
    while (yy_buffer_stack && yy_buffer_stack[yy_buffer_stack_top]) yypop_buffer_state();
    state_.inputs.clear();
    state_.openExpansions = 0;
    state_.openExpansionBytes = 0;
    state_.pendingLines = 0;
    yy_start_stack_ptr = 0;
    yy_start = 1 + 2 * C_INITIAL;
    finished_ = true;
}

int Tn_VerilogFlexLexer::scan() {
    if (finished_) {
        state_.text = "EOF";
        return EOF_;
    }
    if (state_.inputs.empty() && state_.nextSource < state_.sourceFiles.size())
        openSourceFile(state_.sourceFiles[state_.nextSource++]);
    if (state_.inputs.empty()) {
        // Nothing to read at all (an empty list of files).
        finished_ = true;
        state_.text = "EOF";
        return EOF_;
    }
    return yylex();
}

// ---------------------------------------------------------------- messages

void Tn_VerilogFlexLexer::raise(const char* fmt, ...) {
    va_list ap;
    va_start(ap, fmt);
    Port_String text;
    text.FormatV(fmt, ap);
    va_end(ap);
    throw Tn_VerilogFlexException(text.str(), state_.fileName(), state_.line, state_.column);
}

void Tn_VerilogFlexLexer::raiseAt(int line, const char* fmt, ...) {
    va_list ap;
    va_start(ap, fmt);
    Port_String text;
    text.FormatV(fmt, ap);
    va_end(ap);
    throw Tn_VerilogFlexException(text.str(), state_.fileName(), line, state_.column);
}

// ---------------------------------------------------------------- position

void Tn_VerilogFlexLexer::newLine() {
    ++state_.line;
    state_.column = 1;
}

void Tn_VerilogFlexLexer::countLines(const char* text, int length) {
    for (int i = 0; i < length; ++i)
        if (text[i] == '\n') {
            ++state_.line;
            state_.column = length - i;
        }
}

void Tn_VerilogFlexLexer::pushState(int condition) { yy_push_state(condition); }

// Conditionals and the conditions they interleave with (edge lists, tables)
// can be closed in any order in faulty text; popping an empty stack goes back
// to the text instead of ending the process.
void Tn_VerilogFlexLexer::popState() {
    if (yy_start_stack_ptr > 0)
        yy_pop_state();
    else
        yy_start = 1 + 2 * C_INITIAL;
}

int Tn_VerilogFlexLexer::topState() { return yy_start_stack_ptr > 0 ? yy_top_state() : int(C_INITIAL); }

// ---------------------------------------------------------------- inputs

int Tn_VerilogFlexLexer::LexerInput(char* buf, int max_size) {
    if (state_.inputs.empty() || max_size <= 0) return 0;
    Tn_VerilogScannerState::Input& in = state_.input();
    const size_t n = in.read(buf, static_cast<size_t>(max_size));
    if (in.isFile()) state_.bytesRead += n;
    return static_cast<int>(n);
}

void Tn_VerilogFlexLexer::pushInput(Tn_VerilogScannerState::Input* input, int bufferSize) {
    state_.inputs.emplace_back(input);
    yypush_buffer_state(yy_create_buffer(yyin, bufferSize < 16 ? 16 : bufferSize));
}

void Tn_VerilogFlexLexer::popInput() {
    yypop_buffer_state();
    std::unique_ptr<Tn_VerilogScannerState::Input> in = std::move(state_.inputs.back());
    state_.inputs.pop_back();
    if (in->kind() == Tn_VerilogScannerState::Input::MACRO) {
        --state_.openExpansions;
        state_.openExpansionBytes -= in->textLength();
    }
    if (in->kind() == Tn_VerilogScannerState::Input::MACRO || in->kind() == Tn_VerilogScannerState::Input::INCLUDE_FILE) {
        state_.file = in->returnFile;
        state_.line = in->returnLine;
        state_.column = in->returnColumn;
    }
}

void Tn_VerilogFlexLexer::openSourceFile(const Port_String& path) {
    Port::Stream* s = Port::File::open(path.c_str(), Port::File::READ);
    if (!s) raise("Could not open file %s", path.c_str());
    state_.fileList.addSource(path);
    if (state_.announceLibrary)
        TN_MSG().issueStatus("Compiling verilog file \"%s\" in library %s\n", path.c_str(),
                             state_.options().workLibrary().c_str());
    else
        TN_MSG().issueStatus("Compiling verilog file \"%s\"\n", path.c_str());
    Tn_VerilogScannerState::Input* in = new Tn_VerilogScannerState::Input(Tn_VerilogScannerState::Input::SOURCE_FILE, path, s);
    pushInput(in, fileBufferSize(*in));
    state_.setFile(path);
    state_.line = 1;
    state_.column = 1;
}

int Tn_VerilogFlexLexer::endOfInput() {
    switch (condition()) {
    case C_LINE_COMMENT: {
        const int type = endComment();
        if (type) return type;
        break;
    }
    case C_BLOCK_COMMENT: raise("Unterminated comment");
    case C_STRING: raise("Unterminated string literal");
    case C_ESCAPED_ID: popState(); return invalidCharacter('\\');
    case C_DEFINE_BODY:
        popState();
        finishDefine();
        break;
    case C_MACRO_ARGS: {
        const std::string& b = state_.macroBuffer;
        const std::string name = b.substr(1, b.find('(') - 1);
        raiseAt(state_.macroLine, "Unterminated argument list of macro reference `%s", name.c_str());
    }
    default: break;
    }
    const Tn_VerilogScannerState::Input::Kind kind = state_.input().kind();
    popInput();
    if (kind == Tn_VerilogScannerState::Input::MACRO || kind == Tn_VerilogScannerState::Input::INCLUDE_FILE) return -1;
    if (state_.nextSource < state_.sourceFiles.size()) {
        openSourceFile(state_.sourceFiles[state_.nextSource++]);
        return -1;
    }
    // End of the last source.
    if (condition() == C_TRANSLATE_OFF)
        TN_MSG().issueWarning("%sEnd of source reached with 'translate_off' active\n", state_.locationText().c_str());
    if (!state_.directives().conditionals().empty()) raise("End of source reached before all `ifdefs have been closed");
    finished_ = true;
    state_.text = "EOF";
    return EOF_;
}

// ---------------------------------------------------------------- comments

void Tn_VerilogFlexLexer::beginComment(int cond) {
    // Comments in skipped text are no pragmas.
    collectComment_ = pragmas_ && condition() != C_SKIP_IFDEF;
    state_.commentBuffer.clear();
    pushState(cond);
}

int Tn_VerilogFlexLexer::endComment() {
    const bool lineComment = condition() == C_LINE_COMMENT;
    popState();
    if (!collectComment_) return 0;
    collectComment_ = false;
    // The carriage return of a CRLF line is no part of a line comment.
    if (lineComment && !state_.commentBuffer.empty() && state_.commentBuffer.back() == '\r')
        state_.commentBuffer.pop_back();
    static const boost::regex pragma("\\s*(synthesis|synopsys|pls|exemplar)\\s+.*");
    static const boost::regex translateOn("\\s*(synthesis|synopsys|exemplar)\\s+translate_on.*");
    static const boost::regex translateOff("\\s*(synthesis|synopsys|exemplar)\\s+translate_off.*");
    static const boost::regex attribute("\\s*(synthesis|synopsys|pls|exemplar)\\s+attribute.*");
    const std::string& text = state_.commentBuffer;
    if (!boost::regex_match(text, pragma)) return 0;
    if (condition() == C_TRANSLATE_OFF) {
        if (boost::regex_match(text, translateOn)) popState();
        return 0;
    }
    if (boost::regex_match(text, translateOff)) {
        pushState(C_TRANSLATE_OFF);
        return 0;
    }
    if (strict_ && !boost::regex_match(text, attribute)) {
        state_.text = text;
        return METACOMMENT;
    }
    state_.pragmaComments.push_back(Port_String(text));
    return 0;
}

// ---------------------------------------------------------------- directives

void Tn_VerilogFlexLexer::beginDefine() {
    state_.defineBuffer.assign(yytext, static_cast<size_t>(yyleng));
    state_.defineLine = state_.line;
    pushState(C_DEFINE_BODY);
}

void Tn_VerilogFlexLexer::finishDefine() {
    static const boost::regex form("`define\\s+([A-Za-z_][\\w$]*)(\\([^\\)]*\\))?\\s*(.*)");
    boost::smatch m;
    if (!boost::regex_match(state_.defineBuffer, m, form)) return;
    const Port_String name(m.str(1));
    const std::string params = trimmed(m[2].matched ? m.str(2).substr(1, m.length(2) - 2) : std::string(), " \t");
    std::string body = m.str(3);
    body.erase(body.find_last_not_of(" \t\f\r\n") + 1);

    Tn_VerilogDirectiveState& d = state_.directives();
    const Port_String loc = Tn_VerilogScannerState::locationText(state_.fileName(), state_.defineLine);
    if (Tn_VerilogDirectiveState::isDirectiveName(name, verilog2001_))
        raiseAt(state_.defineLine, "Cannot redefine `%s directive with `define", name.c_str());
    if (!verilog2001_ && Tn_VerilogDirectiveState::is2001DirectiveName(name))
        TN_MSG().issueWarning("%s`%s is a compiler directive in Verilog-2001\n", loc.c_str(), name.c_str());
    if (d.isCommandLineMacro(name)) {
        TN_MSG().issueWarning(
            "%sAttempt to redefine macro '%s' ignored because the initial command line definition takes precedence.\n",
            loc.c_str(), name.c_str());
        return;
    }
    if (params.empty()) {
        if (d.isDefined(name)) {
            const Port_String* old = d.plainMacro(name);
            if ((old ? old->str() : std::string()) != body)
                TN_MSG().issueWarning("%sMacro '%s' redefined\n", loc.c_str(), name.c_str());
        }
        d.definePlain(name, Port_String(body));
    } else {
        const Tn_VerilogDirectiveState::ParamMacro macro = Tn_VerilogDirectiveState::prepare(params, body);
        if (d.isDefined(name)) {
            const Tn_VerilogDirectiveState::ParamMacro* old = d.paramMacro(name);
            if (!old || *old != macro) TN_MSG().issueWarning("%sMacro '%s' redefined\n", loc.c_str(), name.c_str());
        }
        d.defineParam(name, macro);
    }
}

void Tn_VerilogFlexLexer::undef() {
    const Port_String name = trailingWord(yytext, yyleng);
    Tn_VerilogDirectiveState& d = state_.directives();
    if (d.isCommandLineMacro(name))
        TN_MSG().issueWarning(
            "%sAttempt to undefine macro '%s' ignored because the initial command line definition takes precedence.\n",
            state_.locationText().c_str(), name.c_str());
    else
        d.undefine(name);
}

void Tn_VerilogFlexLexer::ifdef(bool negate) {
    Tn_VerilogDirectiveState& d = state_.directives();
    Tn_VerilogDirectiveState::Frame frame;
    frame.conditions.push_back(d.isDefined(trailingWord(yytext, yyleng)) != negate);
    d.conditionals().push_back(frame);
    // The matching `endif pops back to the condition in force here.
    pushState(d.conditionalsActive() ? condition() : int(C_SKIP_IFDEF));
}

void Tn_VerilogFlexLexer::elsif() {
    Tn_VerilogDirectiveState& d = state_.directives();
    if (d.conditionals().empty() || d.conditionals().back().elseSeen) raise("Illegal `elsif directive");
    std::vector<bool>& c = d.conditionals().back().conditions;
    c.back() = !c.back();
    c.push_back(d.isDefined(trailingWord(yytext, yyleng)));
    begin(d.conditionalsActive() ? topState() : int(C_SKIP_IFDEF));
}

void Tn_VerilogFlexLexer::elseDirective() {
    Tn_VerilogDirectiveState& d = state_.directives();
    if (d.conditionals().empty() || d.conditionals().back().elseSeen) raise("Illegal `else directive");
    Tn_VerilogDirectiveState::Frame& f = d.conditionals().back();
    f.conditions.back() = !f.conditions.back();
    f.elseSeen = true;
    begin(d.conditionalsActive() ? topState() : int(C_SKIP_IFDEF));
}

void Tn_VerilogFlexLexer::endif() {
    Tn_VerilogDirectiveState& d = state_.directives();
    if (d.conditionals().empty()) raise("Illegal `endif directive");
    d.conditionals().pop_back();
    popState();
}

void Tn_VerilogFlexLexer::include() {
    const char* open = std::strchr(yytext, '"');
    std::string name(open + 1, static_cast<size_t>(yytext + yyleng - 1 - (open + 1)));
    for (size_t i = 0; (i = name.find("\\\"", i)) != std::string::npos;) name.replace(i, 2, "\"");

    // The name as given (relative to the current directory), then in each
    // include directory; the first that opens as a file wins.
    Port_String path(name);
    Port::Stream* s = Port::File::open(path.c_str(), Port::File::READ);
    for (const Port_String& dir : state_.options().includeDirectories()) {
        if (s) break;
        path = dir + "/" + name.c_str();
        s = Port::File::open(path.c_str(), Port::File::READ);
    }
    if (!s) {
        if (strict_) raise("Could not find verilog include file '%s'", name.c_str());
        TN_MSG().issueWarning("%sCould not find include file '%s'\n", state_.locationText().c_str(), name.c_str());
        return;
    }
    std::unique_ptr<Tn_VerilogScannerState::Input> in(
        new Tn_VerilogScannerState::Input(Tn_VerilogScannerState::Input::INCLUDE_FILE, path, s));
    int depth = 0;
    for (const auto& open : state_.inputs) {
        if (!open->isFile()) continue;
        ++depth;
        if (in->fileId() && open->sameFile(*in->fileId()))
            raise("Recursive include of verilog include file '%s'", path.c_str());
    }
    if (depth > kMaxIncludeDepth)
        raise("Verilog include files nested more than %d deep at '%s'", kMaxIncludeDepth, path.c_str());
    if (++state_.includesOpened > state_.includeLimit)
        raise("More than %zu include files opened at '%s'", state_.includeLimit, path.c_str());

    state_.fileList.addInclude(path, state_.currentFilePath());
    TN_MSG().issueStatus("Compiling verilog include file \"%s\"\n", path.c_str());
    in->returnFile = state_.file;
    in->returnLine = state_.line;
    in->returnColumn = state_.column;
    const int size = fileBufferSize(*in);
    pushInput(in.release(), size);
    state_.setFile(path);
    state_.line = 1;
    state_.column = 1;
}

// The argument of `timescale or `uselib: the rest of the line, or the
// expansion of the one macro reference that stands there instead.
Port_String Tn_VerilogFlexLexer::directiveArgument(const char* directive) {
    const std::string rest(yytext + 1 + std::strlen(directive), yytext + yyleng);
    const std::string word = trimmed(rest, " \t\f\r");
    if (word.size() > 1 && word[0] == '`' && trailingWord(word.c_str(), static_cast<int>(word.size())).GetLength() ==
                                                 static_cast<int>(word.size()) - 1) {
        const Port_String name(word.substr(1));
        return Port_String(" " + expansion(name, Port_String(), false));
    }
    return Port_String(rest);
}

void Tn_VerilogFlexLexer::timescale() {
    const std::string arg = directiveArgument("timescale").str();
    const size_t slash = arg.find('/');
    int32_t unit = 0, precision = 0;
    if (slash == std::string::npos ||
        !Tn_VerilogDirectiveState::timeLiteral(Port_String(withoutWhiteSpace(arg.substr(0, slash))), unit) ||
        !Tn_VerilogDirectiveState::timeLiteral(Port_String(withoutWhiteSpace(arg.substr(slash + 1))), precision) ||
        unit < precision)
        raise("Invalid `timescale directive");
    state_.directives().setTimescale(unit, precision);
}

void Tn_VerilogFlexLexer::defaultNettype() {
    const Port_String name = trailingWord(yytext, yyleng);
    if (!Tn_VerilogDirectiveState::isNetType(name, verilog2001_)) raise("Invalid `default_nettype directive");
    state_.directives().setDefaultNetType(name);
}

void Tn_VerilogFlexLexer::unconnectedDrive() {
    const Port_String name = trailingWord(yytext, yyleng);
    if (name != "pull0" && name != "pull1") raise("Invalid `unconnected_drive directive");
    state_.directives().setUnconnectedDrive(name);
}

void Tn_VerilogFlexLexer::uselib() {
    static const boost::regex forms[] = {boost::regex("\\s+(lib=\\S+)(.*)"), boost::regex("\\s+(libext=\\S+)(.*)"),
                                         boost::regex("\\s+(file=\\S+)(.*)"), boost::regex("\\s+(dir=\\S+)(.*)")};
    Tn_StringList& list = state_.directives().uselib();
    list.clear();
    // Trailing blanks (and the carriage return of a CRLF line) are no argument.
    std::string arg = directiveArgument("uselib").str();
    arg.erase(arg.find_last_not_of(" \t\f\r\n") + 1);
    while (arg.size() >= 2) {
        boost::smatch m;
        bool matched = false;
        for (const boost::regex& form : forms)
            if (boost::regex_match(arg, m, form)) {
                list.push_back(Port_String(m.str(1)));
                arg = m.str(2);
                matched = true;
                break;
            }
        if (matched) continue;
        const char* text =
            "%sA `uselib argument beginning other than lib, libext, file, or dir was found.  (Note: only the lib "
            "argument is currently supported.)\n";
        if (strict_)
            TN_MSG().issueError(text, state_.locationText().c_str());
        else
            TN_MSG().issueWarning(text, state_.locationText().c_str());
        break;
    }
}

void Tn_VerilogFlexLexer::lineDirective() {
    static const boost::regex form("`line\\s+(\\d+)\\s*\"(.*)\"\\s*(\\d+)\\s*");
    boost::cmatch m;
    const char* text = yytext;
    if (!boost::regex_match(text, text + yyleng, m, form)) raise("Invalid `line directive");
    const long n = std::strtol(m[1].first, nullptr, 10);
    state_.setFile(Port_String(m.str(2)));
    state_.line = static_cast<int>(std::min<long>(n, INT_MAX)) - 1;
}

void Tn_VerilogFlexLexer::unsupportedDirective(const char* name) {
    // The odd spacing of `unsigned is part of the message text.
    const bool isUnsigned = std::strcmp(name, "unsigned") == 0;
    TN_MSG().issueWarning(
        "%s`%s, a %sVerilog-XL specific compiler directive is not implemented and hence any code containing this "
        "directive may behave differently compared Verilog-XL\n",
        state_.locationText().c_str(), name, isUnsigned ? " " : "");
}

// ---------------------------------------------------------------- macros

void Tn_VerilogFlexLexer::beginMacroArgs() {
    state_.macroBuffer.assign(yytext, static_cast<size_t>(yyleng));
    state_.macroDepth = 1;
    state_.macroInString = false;
    state_.macroLine = state_.line;
    state_.pendingLines = 0;
    pushState(C_MACRO_ARGS);
}

void Tn_VerilogFlexLexer::endMacroArgs() {
    popState();
    const std::string& b = state_.macroBuffer;
    const size_t paren = b.find('(');
    macroReference(Port_String(b.substr(1, paren - 1)), Port_String(b.substr(paren)), true);
}

std::string Tn_VerilogFlexLexer::expansion(const Port_String& name, const Port_String& args, bool hasArgs) {
    Tn_VerilogDirectiveState& d = state_.directives();
    if (Tn_VerilogDirectiveState::isDirectiveName(name, verilog2001_))
        raise("Illegal use of `%s directive", name.c_str());
    if (const Tn_VerilogDirectiveState::ParamMacro* macro = d.paramMacro(name)) {
        std::vector<std::string> actuals;
        const std::string text = trimmed(args.str(), " \t");
        const std::string inner = text.size() >= 2 ? text.substr(1, text.size() - 2) : std::string();
        if (!trimmed(inner, " \t\r\n").empty()) actuals = splitActuals(inner);
        if (static_cast<int>(actuals.size()) != macro->formals)
            raise("Invalid number of arguments passed to macro reference %s", name.c_str());
        return substitute(macro->body.str(), actuals);
    }
    if (const Port_String* body = d.plainMacro(name)) return hasArgs ? body->str() + args.str() : body->str();
    if (strict_) raise("Macro reference `%s is not defined", name.c_str());
    TN_MSG().issueWarning("%sMacro reference `%s is not defined\n", state_.locationText().c_str(), name.c_str());
    return std::string();
}

void Tn_VerilogFlexLexer::macroReference(const Port_String& name, const Port_String& args, bool hasArgs) {
    std::string text = expansion(name, args, hasArgs);
    // Lines of the argument text count once the expansion is done.
    const int lines = state_.pendingLines;
    state_.pendingLines = 0;
    if (debug_) {
        std::printf("Macro substitution expanded to:\n  %s\n", text.c_str());
        std::fflush(stdout);
    }
    if (text.empty()) {
        state_.line += lines;
        return;
    }
    if (state_.openExpansions >= kMaxExpansionDepth || state_.openExpansionBytes + text.size() > kMaxExpansionBytes)
        raise("Recursive expansion of macro `%s", name.c_str());
    state_.expandedBytes += text.size();
    if (state_.expandedBytes > std::max(kMinTotalExpansionBytes, kExpansionRatio * state_.bytesRead))
        raise("Macro expansions exceed their limit at `%s (%zu bytes expanded from %zu bytes of source)", name.c_str(),
              state_.expandedBytes, state_.bytesRead);
    const int size = static_cast<int>(text.size()) + 2;
    Tn_VerilogScannerState::Input* in =
        new Tn_VerilogScannerState::Input(Tn_VerilogScannerState::Input::MACRO, name, std::move(text));
    in->returnFile = state_.file;
    in->returnLine = state_.line + lines;
    in->returnColumn = state_.column;
    ++state_.openExpansions;
    state_.openExpansionBytes += in->textLength();
    pushInput(in, size);
}

// ---------------------------------------------------------------- tokens

int Tn_VerilogFlexLexer::token(int type) {
    state_.text.assign(yytext, static_cast<size_t>(yyleng));
    return type;
}

int Tn_VerilogFlexLexer::identifier() {
    state_.text.assign(yytext, static_cast<size_t>(yyleng));
    const KeywordTable::Entry* k = keywords().find(std::string_view(yytext, static_cast<size_t>(yyleng)));
    if (!k) return IDENTIFIER;
    if (k->only2001 && !verilog2001_) {
        TN_MSG().issueWarning("%s'%s' is a reserved word in Verilog-2001\n", state_.locationText().c_str(), yytext);
        return IDENTIFIER;
    }
    if (k->type == K_EDGE) pushState(C_EDGE_LIST);
    if (k->type == K_TABLE) pushState(C_UDP_TABLE);
    return k->type;
}

int Tn_VerilogFlexLexer::systemIdentifier() {
    state_.text.assign(yytext, static_cast<size_t>(yyleng));
    const KeywordTable::Entry* k = keywords().find(std::string_view(yytext, static_cast<size_t>(yyleng)));
    return k ? k->type : int(SYSTEM_IDENTIFIER);
}

int Tn_VerilogFlexLexer::number(int type) {
    assignWithoutUnderscores(state_.text, yytext, yyleng);
    return type;
}

int Tn_VerilogFlexLexer::base(int type, int digits) {
    state_.text.assign(yytext, static_cast<size_t>(yyleng));
    pushState(digits);
    return type;
}

int Tn_VerilogFlexLexer::basedDigits(int type) {
    popState();
    return number(type);
}

int Tn_VerilogFlexLexer::illegalDigits(int type, const char* baseName) {
    popState();
    TN_MSG().issueError("%sIllegal digit(s) in %s constant '%s'\n", state_.locationText().c_str(), baseName, yytext);
    state_.text = "0";
    return type;
}

int Tn_VerilogFlexLexer::invalidCharacter(unsigned char c) {
    state_.text = printable(c);
    return 0;
}

void Tn_VerilogFlexLexer::beginString() {
    state_.stringBuffer.clear();
    pushState(C_STRING);
}

int Tn_VerilogFlexLexer::endString() {
    state_.text = state_.stringBuffer;
    return STRING;
}
