// The scanner engine: the flex C++ scanner class (input buffers, buffer stack,
// start-condition stack) under the name Tn_VerilogBaseFlexLexer. The scanner
// generated from verilog/tn_verilogflexlexer.l declares the class itself
// (option prefix "Tn_VerilogBase"); every other file gets it from here.
#ifndef TARN_TN_VERILOGBASEFLEXLEXER_H
#define TARN_TN_VERILOGBASEFLEXLEXER_H

#ifndef TN_VERILOGBASEFLEXLEXER_DECLARED
#define TN_VERILOGBASEFLEXLEXER_DECLARED
#undef yyFlexLexer
#define yyFlexLexer Tn_VerilogBaseFlexLexer
#include <FlexLexer.h>
#undef yyFlexLexer
#endif

#endif
