#include "src/tn_optionstream.h"

#include <algorithm>
#include <boost/regex.hpp>

#include "port/port_file.h"
#include "util/tn_message.h"

Tn_OptionStream::Tn_OptionStream(const std::vector<Port_String>& args) : current_(args.begin(), args.end()) {}

bool Tn_OptionStream::moreTokens() const {
    if (!current_.empty()) return true;
    for (const auto& q : saved_)
        if (!q.empty()) return true;
    return false;
}

Port_String Tn_OptionStream::nextToken() {
    while (current_.empty() && !saved_.empty()) {
        current_ = std::move(saved_.back());
        saved_.pop_back();
        files_.pop_back();
    }
    if (current_.empty()) return Port_String();
    Port_String t = std::move(current_.front());
    current_.pop_front();
    return t;
}

void Tn_OptionStream::tokenizeLine(const std::string& line, std::deque<Port_String>& out) {
    static const boost::regex re("(//.*)|(#.*)|'([^']*)'|\"([^\"]*)\"|([^ \\t\\n]+)|([ \\t\\n]*)", boost::regex::perl);
    std::string::const_iterator it = line.begin();
    const std::string::const_iterator end = line.end();
    boost::smatch m;
    while (it != end && boost::regex_search(it, end, m, re, boost::match_continuous)) {
        if (m[1].matched || m[2].matched) break;  // comment: rest of the line
        for (int g = 3; g <= 5; ++g)
            if (m[g].matched) out.push_back(Port_String(m[g].str()));
        if (m.length(0) == 0) break;  // nothing more can match here
        it = m[0].second;
    }
}

void Tn_OptionStream::pushOptionFile(const Port_String& name) {
    if (std::find(files_.begin(), files_.end(), name) != files_.end()) {
        TN_MSG().issueError("Recursive specification of -f option file '%s'\n", name.c_str());
        return;
    }
    saved_.push_back(std::move(current_));
    current_.clear();
    files_.push_back(name);

    Port::Stream* s = Port::File::open(name.c_str(), Port::File::READ, Port::File::TEXT);
    if (!s) {
        TN_MSG().issueError("Could not open -f option file '%s'\n", name.c_str());
        return;
    }
    std::string text;
    char buf[8192];
    for (size_t n; (n = s->read(buf, sizeof buf)) > 0;) text.append(buf, n);
    Port::File::close(s);

    size_t pos = 0;
    while (pos < text.size()) {
        size_t nl = text.find('\n', pos);
        size_t stop = nl == std::string::npos ? text.size() : nl;
        // Text-mode reading: a carriage return before the newline ends the line.
        size_t len = stop - pos;
        if (len && text[stop - 1] == '\r') --len;
        tokenizeLine(text.substr(pos, len), current_);
        pos = stop + 1;
    }
}
