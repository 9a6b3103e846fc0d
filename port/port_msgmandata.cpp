#include "tarn/port_msgmandata.h"

#include <cstdio>

namespace {

int g_errors = 0;
int g_warnings = 0;
Port_MsgSink* g_sink = nullptr;

// Default sink: one message per line on standard error, prefixed by its level.
void printDefault(const Port_MsgRecord& m) {
    static const char* const prefix[] = {"", "Warning: ", "Error: ", "Internal error: "};
    std::FILE* out = stderr;
    std::fputs(prefix[m.level], out);
    std::fputs(m.text, out);
    const Port_String text(m.text);
    if (text.IsEmpty() || text[text.GetLength() - 1] != '\n') std::fputc('\n', out);
}

// "src/tn_vcidatacompiler.cpp" -> "src/tn_vcidatacompiler": messages name the
// issuing source file without its extension.
Port_String sourceName(const char* file) {
    Port_String f(file);
    if (f.StartsWith("./")) f.Remove(0, 2);
    int slash = -1;
    for (int i = 0; i < f.GetLength(); ++i)
        if (f[i] == '/') slash = i;
    for (int i = f.GetLength() - 1; i > slash; --i)
        if (f[i] == '.') {
            f.SetLength(i);
            break;
        }
    return f;
}

}  // namespace

Port_MsgSink::~Port_MsgSink() {}

Port_MsgManData::Port_MsgManData(const char* facility, const char* file, int line, const char* revision)
    : facility_(facility ? facility : ""), file_(sourceName(file ? file : "")), line_(line), revision_(revision ? revision : "") {}

Port_MsgManData Port_MsgManData::createObject(const char* facility, const char* file, int line, const char* revision) {
    return Port_MsgManData(facility, file, line, revision);
}

void Port_MsgManData::issueV(Port_MsgLevel level, const char* fmt, va_list ap) const {
    Port_String text;
    text.FormatV(fmt, ap);
    if (level == PORT_MSG_ERROR || level == PORT_MSG_INTERNAL) ++g_errors;
    if (level == PORT_MSG_WARNING) ++g_warnings;
    const Port_MsgRecord rec = {level, facility_, file_.c_str(), line_, revision_, text.c_str()};
    if (g_sink)
        g_sink->receive(rec);
    else
        printDefault(rec);
}

#define TN_PORT_ISSUE(name, level)                        \
    void Port_MsgManData::name(const char* fmt, ...) const { \
        va_list ap;                                       \
        va_start(ap, fmt);                                \
        issueV(level, fmt, ap);                           \
        va_end(ap);                                       \
    }
TN_PORT_ISSUE(issueError, PORT_MSG_ERROR)
TN_PORT_ISSUE(issueWarning, PORT_MSG_WARNING)
TN_PORT_ISSUE(issueStatus, PORT_MSG_STATUS)
TN_PORT_ISSUE(issueInternal, PORT_MSG_INTERNAL)
#undef TN_PORT_ISSUE

Port_MsgSink* Port_MsgManData::setSink(Port_MsgSink* sink) {
    Port_MsgSink* old = g_sink;
    g_sink = sink;
    return old;
}

int Port_MsgDispatcher::getErrCount(bool reset) {
    int n = g_errors;
    if (reset) g_errors = 0;
    return n;
}

int Port_MsgDispatcher::getWarnCount(bool reset) {
    int n = g_warnings;
    if (reset) g_warnings = 0;
    return n;
}
