// compile, parse, elaborate, data: one compiler call each.
#include "tarn/tn_vci.h"
#include "tools/tarn_commands.h"

namespace {

typedef Tn_VpiPtr (Tn_Vci::*VciOperation)(const Tn_Vci::ArgList&);

int runOperation(Tn_VciPtr compiler, VciOperation op, const TarnArgs& args) {
    Tn_VpiPtr root = ((*compiler).*op)(args);
    return (!root || root->error_count() > 0) ? 1 : 0;
}

}  // namespace

int tarnCompile(const TarnArgs& args) { return runOperation(Tn_Vci::create_compiler(), &Tn_Vci::compile, args); }

int tarnParse(const TarnArgs& args) { return runOperation(Tn_Vci::create_compiler(), &Tn_Vci::parse, args); }

int tarnElaborate(const TarnArgs& args) { return runOperation(Tn_Vci::create_compiler(), &Tn_Vci::elaborate, args); }

int tarnData(const TarnArgs& args) { return runOperation(Tn_Vci::create_data_compiler(), &Tn_Vci::compile, args); }
