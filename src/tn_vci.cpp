#include "tarn/tn_vci.h"

#include "src/tn_vcicompiler.h"
#include "src/tn_vcidatacompiler.h"

Tn_Vci::~Tn_Vci() {}

Tn_VciPtr Tn_Vci::create_compiler() { return Tn_VciPtr(new Tn_VciCompiler); }

Tn_VciPtr Tn_Vci::create_data_compiler() { return Tn_VciPtr(new Tn_VciDataCompiler); }

Tn_Vci::ArgList Tn_Vci::argList(int argc, const char* const* argv) {
    ArgList args;
    for (int i = 0; argv && i < argc; ++i) args.push_back(Port_String(argv[i]));
    return args;
}
