// Argument tokens of one call, with the contents of -f option files spliced in
// where they are named, to any depth.
#ifndef TARN_TN_OPTIONSTREAM_H
#define TARN_TN_OPTIONSTREAM_H

#include <deque>
#include <vector>

#include "tarn/port_stringbase.h"

class Tn_OptionStream {
public:
    explicit Tn_OptionStream(const std::vector<Port_String>& args);

    bool moreTokens() const;
    // The next token; the empty string when there are none.
    Port_String nextToken();
    // Reads the option file name; its tokens come before the remaining ones.
    void pushOptionFile(const Port_String& name);

    // The tokens of one option-file line (comments, quoting, blanks).
    static void tokenizeLine(const std::string& line, std::deque<Port_String>& out);

private:
    std::deque<Port_String> current_;
    std::vector<std::deque<Port_String>> saved_;
    std::vector<Port_String> files_;
};

#endif
