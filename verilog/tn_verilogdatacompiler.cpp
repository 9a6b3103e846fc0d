#include "verilog/tn_verilogdatacompiler.h"

#include "util/tn_exception.h"
#include "util/tn_messagecheckpoint.h"
#include "verilog/tn_verilogdesign.h"
#include "verilog/tn_verilognodes.h"

Tn_VerilogDataCompiler::Tn_VerilogDataCompiler() {}

Tn_VerilogDataCompiler::~Tn_VerilogDataCompiler() {}

std::unique_ptr<Tn_VerilogDesign> Tn_VerilogDataCompiler::takeResult() { return std::move(result_); }

int Tn_VerilogDataCompiler::compile(const Tn_StringList& args) {
    Tn_MessageCheckpoint checkpoint;
    try {
        options_.parse(args);
        // Missing includes and undefined macros are only warnings here.
        options_.setStrictPreprocessing(false);
        files_.clear();
        if (!checkpoint.errorsIssued()) {
            result_.reset(new Tn_VerilogDesign(options_.workLibrary(), "DESIGN", options_));
            result_->setRoot(result_->factory().createRoot());
            // The data parser reads the source files into result_ here.
        }
    } catch (const Tn_Exception& e) {
        e.report();
    }
    return checkpoint.errorCount();
}
