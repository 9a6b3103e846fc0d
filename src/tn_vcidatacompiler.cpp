#include "src/tn_vcidatacompiler.h"

#include "access/tn_vpibase.h"
#include "src/tn_vcirun.h"
#include "util/tn_message.h"
#include "verilog/tn_verilogdatacompiler.h"

Tn_VpiPtr Tn_VciDataCompiler::run(Operation op, const ArgList& args) {
    switch (op) {
    case COMPILE: return Tn_VciRunDriver<Tn_VpiDataDesign>(&Tn_VerilogDataCompiler::compile, args);
    case PARSE: TN_MSG().issueError("Method parse() is not implemented\n"); break;
    case ELABORATE: TN_MSG().issueError("Method elaborate() is not implemented\n"); break;
    }
    return Tn_VpiPtr();
}
