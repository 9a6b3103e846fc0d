#include "src/tn_vcicompiler.h"

#include "access/tn_vpibase.h"
#include "src/tn_vcirun.h"
#include "verilog/tn_verilogcompiler.h"

Tn_VpiPtr Tn_VciCompiler::run(Operation op, const ArgList& args) {
    static int (Tn_VerilogCompiler::*const flows[])(const Tn_StringList&) = {
        &Tn_VerilogCompiler::compile, &Tn_VerilogCompiler::parse, &Tn_VerilogCompiler::elaborate};
    return Tn_VciRunDriver<Tn_VpiDesign>(flows[op], args);
}
