// Tasks and functions as callees: their types, and the seam where constant
// function calls will be evaluated.
#include "verilog/tn_verilognodes.h"

namespace {

// The parameter types of a task or function: its argument declarations in
// order, each with its direction.
Tn_VerilogTypeList argumentTypes(const Tn_VerilogRegion& r) {
    Tn_VerilogTypeList list;
    for (Tn_VerilogIODeclaration* io : r.IODeclaration) {
        if (!io) continue;
        Tn_VerilogTypePtr t = io->type();
        if (io->isA(Tn_Verilog::Input)) t->setInput();
        else if (io->isA(Tn_Verilog::Inout)) t->setInout();
        else if (io->isA(Tn_Verilog::Output)) t->setOutput();
        list.push_back(t);
    }
    return list;
}

}  // namespace

Port_String Tn_VerilogTask::describe() const { return Port_String::doFormat("task '%s'", Name.c_str()); }

Tn_VerilogTypePtr Tn_VerilogTask::type() const { return Tn_VerilogType::createTask(argumentTypes(*this)); }

Port_String Tn_VerilogFunction::describe() const { return Port_String::doFormat("function '%s'", Name.c_str()); }

// The result is written as a type definition (a ranged reg, integer, real...)
// or as a bare range; without either it is one unsigned bit.
Tn_VerilogTypePtr Tn_VerilogFunction::type() const {
    Tn_VerilogTypePtr result;
    if (Tn_VerilogTypeDef* t = Tn_VerilogNode::cast<Tn_VerilogTypeDef>(ReturnType)) {
        result = t->type();
    } else if (Tn_VerilogRange* r = Tn_VerilogNode::cast<Tn_VerilogRange>(ReturnType)) {
        int32_t msb, lsb;
        result = r->bounds(msb, lsb) ? Tn_VerilogType::createVector(false, msb, lsb) : Tn_VerilogType::createScalar(false);
    } else {
        result = Tn_VerilogType::createScalar(false);
    }
    return Tn_VerilogType::createFunction(result, argumentTypes(*this));
}

// Constant functions are run by the procedural code's interpreter; until it
// exists no call has a constant value.
Tn_VerilogValuePtr Tn_VerilogFunction::evaluateConstantCall(const std::vector<Tn_VerilogValuePtr>&,
                                                          const Tn_VerilogEvalContext&) const {
    return Tn_VerilogValue::createNull();
}
