// Captures every message issued while it is installed.
#ifndef TARN_TESTS_CAPTURESINK_H
#define TARN_TESTS_CAPTURESINK_H

#include <string>
#include <vector>

#include "tarn/port_msgmandata.h"

class CaptureSink : public Port_MsgSink {
public:
    struct Message {
        Port_MsgLevel level;
        std::string facility;
        std::string file;
        int line;
        std::string text;
    };

    CaptureSink() : previous_(Port_MsgManData::setSink(this)) {}
    ~CaptureSink() override { Port_MsgManData::setSink(previous_); }
    CaptureSink(const CaptureSink&) = delete;
    CaptureSink& operator=(const CaptureSink&) = delete;

    void receive(const Port_MsgRecord& m) override {
        messages.push_back(Message{m.level, m.facility, m.file, m.line, m.text});
    }

    // Texts of the messages of one level, in order.
    std::vector<std::string> texts(Port_MsgLevel level) const {
        std::vector<std::string> r;
        for (const Message& m : messages)
            if (m.level == level) r.push_back(m.text);
        return r;
    }
    std::vector<std::string> errors() const { return texts(PORT_MSG_ERROR); }
    std::vector<std::string> warnings() const { return texts(PORT_MSG_WARNING); }
    std::vector<std::string> statuses() const { return texts(PORT_MSG_STATUS); }
    size_t count(Port_MsgLevel level) const { return texts(level).size(); }
    void clear() { messages.clear(); }

    std::vector<Message> messages;

private:
    Port_MsgSink* previous_;
};

#endif
