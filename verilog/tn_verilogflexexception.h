// A scanner or preprocessor error: a recognition exception carrying the
// message and the scanner's location. It ends the parse of the compilation.
#ifndef TARN_TN_VERILOGFLEXEXCEPTION_H
#define TARN_TN_VERILOGFLEXEXCEPTION_H

#include <antlr/RecognitionException.hpp>
#include <string>

class Tn_VerilogFlexException : public antlr::RecognitionException {
public:
    Tn_VerilogFlexException(const std::string& message, const std::string& file, int line, int column)
        : antlr::RecognitionException(message, file, line, column) {}
    ~Tn_VerilogFlexException() throw() override;
};

#endif
