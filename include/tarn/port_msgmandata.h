// Message manager: every diagnostic of Tarn is issued through this layer.
// A tool embedding the library (or a test) may install its own sink.
#ifndef TARN_PORT_MSGMANDATA_H
#define TARN_PORT_MSGMANDATA_H

#include <cstdarg>

#include "tarn/port_stringbase.h"

enum Port_MsgLevel { PORT_MSG_STATUS = 0, PORT_MSG_WARNING = 1, PORT_MSG_ERROR = 2, PORT_MSG_INTERNAL = 3 };

// One issued message, as a sink receives it. The text is the formatted text,
// usually ending in a newline.
struct Port_MsgRecord {
    Port_MsgLevel level;
    const char* facility;
    const char* file;      // issuing source file, e.g. "verilog/tn_verilogcompiler"
    int line;              // issuing source line
    const char* revision;
    const char* text;
};

class Port_MsgSink {
public:
    virtual ~Port_MsgSink();
    virtual void receive(const Port_MsgRecord& msg) = 0;
};

// A message object: who issues (facility, source file, line, revision); each
// issue operation formats and delivers one message of its level.
class Port_MsgManData {
public:
    static Port_MsgManData createObject(const char* facility, const char* file, int line, const char* revision);

    void issueError(const char* fmt, ...) const __attribute__((format(printf, 2, 3)));
    void issueWarning(const char* fmt, ...) const __attribute__((format(printf, 2, 3)));
    void issueStatus(const char* fmt, ...) const __attribute__((format(printf, 2, 3)));
    void issueInternal(const char* fmt, ...) const __attribute__((format(printf, 2, 3)));
    void issueV(Port_MsgLevel level, const char* fmt, va_list ap) const;

    // Installs a sink (null restores the default one, which prints on standard
    // error) and returns the previous sink (null for the default).
    static Port_MsgSink* setSink(Port_MsgSink* sink);

private:
    Port_MsgManData(const char* facility, const char* file, int line, const char* revision);
    const char* facility_;
    Port_String file_;
    int line_;
    const char* revision_;
};

// Process-wide counts of issued errors and warnings. Internal errors count as
// errors. With reset true the count is read and then set back to zero.
class Port_MsgDispatcher {
public:
    static int getErrCount(bool reset = false);
    static int getWarnCount(bool reset = false);
};

#endif
