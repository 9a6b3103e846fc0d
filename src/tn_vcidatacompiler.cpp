#include "src/tn_vcidatacompiler.h"

#include "access/tn_vpibase.h"
#include "src/tn_vcirun.h"
#include "util/tn_message.h"
#include "verilog/tn_verilogdatacompiler.h"

Tn_VpiPtr Tn_VciDataCompiler::compile(const ArgList& args) {
    return Tn_VciRunDriver<Tn_VpiDataDesign>(&Tn_VerilogDataCompiler::compile, args);
}

Tn_VpiPtr Tn_VciDataCompiler::parse(const ArgList&) {
    TN_MSG().issueError("Method parse() is not implemented\n");
    return Tn_VpiPtr();
}

Tn_VpiPtr Tn_VciDataCompiler::elaborate(const ArgList&) {
    TN_MSG().issueError("Method elaborate() is not implemented\n");
    return Tn_VpiPtr();
}
