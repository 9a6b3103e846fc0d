#include "verilog/tn_verilogdirectivestate.h"

#include <algorithm>
#include <cctype>
#include <string_view>

namespace {

// Called for every macro reference: string_view compares lengths first.
template <size_t N>
bool inList(const std::string_view (&list)[N], const Port_String& name) {
    const std::string_view n(name.str());
    for (const std::string_view& entry : list)
        if (entry == n) return true;
    return false;
}

constexpr std::string_view kDirectives1995[] = {"celldefine", "default_nettype", "define", "else", "endcelldefine",
                                                "endif", "ifdef", "include", "nounconnected_drive", "resetall",
                                                "timescale", "unconnected_drive", "undef"};
constexpr std::string_view kDirectives2001[] = {"elsif", "ifndef", "line"};
constexpr std::string_view kNetTypes[] = {"wire", "tri", "tri0", "wand", "triand", "tri1", "wor", "trior", "trireg"};

struct TimeLiteral {
    const char* text;
    int32_t exponent;
};
const TimeLiteral kTimeLiterals[] = {
    {"100s", 2},    {"10s", 1},     {"1s", 0},      {"100ms", -1},  {"10ms", -2},   {"1ms", -3},
    {"100us", -4},  {"10us", -5},   {"1us", -6},    {"100ns", -7},  {"10ns", -8},   {"1ns", -9},
    {"100ps", -10}, {"10ps", -11},  {"1ps", -12},   {"100fs", -13}, {"10fs", -14},  {"1fs", -15},
};

bool isIdentStart(char c) { return std::isalpha(static_cast<unsigned char>(c)) || c == '_'; }
bool isIdentChar(char c) { return std::isalnum(static_cast<unsigned char>(c)) || c == '_' || c == '$'; }

}  // namespace

bool Tn_VerilogDirectiveState::Frame::active() const {
    return std::all_of(conditions.begin(), conditions.end(), [](bool c) { return c; });
}

Tn_VerilogDirectiveState::Tn_VerilogDirectiveState() { resetAll(); }

void Tn_VerilogDirectiveState::resetAll() {
    defaultNetType_ = "wire";
    cellDefine_ = false;
    timescaleGiven_ = false;
    unconnectedDrive_ = "none";
    timeUnit_ = 0;
    timePrecision_ = 0;
}

void Tn_VerilogDirectiveState::reset(const Tn_StringList& commandLineMacros) {
    resetAll();
    commandLine_.clear();
    for (const Port_String& entry : commandLineMacros) {
        const int eq = entry.GetIndexOfString("=");
        const Port_String name = eq < 0 ? entry : entry.Extract(0, eq);
        const Port_String body = eq < 0 ? Port_String() : entry.Extract(eq + 1);
        commandLine_.insert(name);
        definePlain(name, body);
    }
}

void Tn_VerilogDirectiveState::setTimescale(int32_t unit, int32_t precision) {
    timeUnit_ = unit;
    timePrecision_ = precision;
    timescaleGiven_ = true;
}

bool Tn_VerilogDirectiveState::isDirectiveName(const Port_String& name, bool verilog2001) {
    return inList(kDirectives1995, name) || (verilog2001 && inList(kDirectives2001, name));
}

bool Tn_VerilogDirectiveState::is2001DirectiveName(const Port_String& name) { return inList(kDirectives2001, name); }

bool Tn_VerilogDirectiveState::isNetType(const Port_String& name, bool verilog2001) {
    return inList(kNetTypes, name) || (verilog2001 && name == "none");
}

bool Tn_VerilogDirectiveState::timeLiteral(const Port_String& text, int32_t& exponent) {
    for (const TimeLiteral& t : kTimeLiterals)
        if (text == t.text) {
            exponent = t.exponent;
            return true;
        }
    return false;
}

const Port_String* Tn_VerilogDirectiveState::plainMacro(const Port_String& name) const {
    auto it = plain_.find(name);
    return it == plain_.end() ? nullptr : &it->second;
}

const Tn_VerilogDirectiveState::ParamMacro* Tn_VerilogDirectiveState::paramMacro(const Port_String& name) const {
    auto it = param_.find(name);
    return it == param_.end() ? nullptr : &it->second;
}

void Tn_VerilogDirectiveState::definePlain(const Port_String& name, const Port_String& body) {
    param_.erase(name);
    plain_[name] = body;
}

void Tn_VerilogDirectiveState::defineParam(const Port_String& name, const ParamMacro& m) {
    plain_.erase(name);
    param_[name] = m;
}

void Tn_VerilogDirectiveState::undefine(const Port_String& name) {
    plain_.erase(name);
    param_.erase(name);
}

Tn_VerilogDirectiveState::ParamMacro Tn_VerilogDirectiveState::prepare(const Port_String& parameterList,
                                                                       const Port_String& body) {
    std::vector<Port_String> formals;
    // Pieces between commas, trimmed of blanks and tabs; an empty piece is
    // still a formal (it just never matches a name).
    const std::string& list = parameterList.str();
    size_t from = 0;
    for (;;) {
        const size_t comma = list.find(',', from);
        Port_String f(list.substr(from, comma == std::string::npos ? std::string::npos : comma - from));
        formals.push_back(f.Trim(" \t"));
        if (comma == std::string::npos) break;
        from = comma + 1;
    }

    ParamMacro m;
    m.formals = static_cast<int>(formals.size());
    const std::string& b = body.str();
    std::string out;
    out.reserve(b.size());
    bool inString = false;
    for (size_t i = 0; i < b.size();) {
        const char c = b[i];
        if (c == kFormalMarker) {
            out += kFormalMarker;
            out += kFormalMarker;
            ++i;
        } else if (inString || c == '"') {
            if (c == '"') inString = !inString;
            out += c;
            ++i;
        } else if (isIdentChar(c)) {
            size_t j = i;
            while (j < b.size() && isIdentChar(b[j])) ++j;
            const std::string word = b.substr(i, j - i);
            int index = -1;
            if (isIdentStart(c))
                for (size_t f = 0; f < formals.size() && index < 0; ++f)
                    if (formals[f].str() == word) index = static_cast<int>(f);
            if (index < 0)
                out += word;
            else {
                out += kFormalMarker;
                out += std::to_string(index);
            }
            i = j;
        } else {
            out += c;
            ++i;
        }
    }
    m.body = Port_String(std::move(out));
    return m;
}

bool Tn_VerilogDirectiveState::conditionalsActive() const {
    return std::all_of(conditionals_.begin(), conditionals_.end(), [](const Frame& f) { return f.active(); });
}
