#include "src/tn_vcicompiler.h"

#include "access/tn_vpibase.h"
#include "src/tn_vcirun.h"
#include "verilog/tn_verilogcompiler.h"

Tn_VpiPtr Tn_VciCompiler::compile(const ArgList& args) {
    return Tn_VciRunDriver<Tn_VpiDesign>(&Tn_VerilogCompiler::compile, args);
}

Tn_VpiPtr Tn_VciCompiler::parse(const ArgList& args) {
    return Tn_VciRunDriver<Tn_VpiDesign>(&Tn_VerilogCompiler::parse, args);
}

Tn_VpiPtr Tn_VciCompiler::elaborate(const ArgList& args) {
    return Tn_VciRunDriver<Tn_VpiDesign>(&Tn_VerilogCompiler::elaborate, args);
}
