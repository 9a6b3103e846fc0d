// The data compiler's driver: preprocesses and reads the sources with the
// light grammar (modules, ports, parameters, instances) into one design.
#ifndef TARN_TN_VERILOGDATACOMPILER_H
#define TARN_TN_VERILOGDATACOMPILER_H

#include <memory>

#include "src/tn_verilogoptions.h"
#include "verilog/tn_verilogfilelist.h"

class Tn_VerilogDesign;

class Tn_VerilogDataCompiler {
public:
    Tn_VerilogDataCompiler();
    ~Tn_VerilogDataCompiler();
    Tn_VerilogDataCompiler(const Tn_VerilogDataCompiler&) = delete;
    Tn_VerilogDataCompiler& operator=(const Tn_VerilogDataCompiler&) = delete;

    // Returns the number of errors issued; the design is kept even then.
    int compile(const Tn_StringList& args);
    std::unique_ptr<Tn_VerilogDesign> takeResult();
    const Tn_VerilogFileList& sourceFiles() const { return files_; }

private:
    Tn_VerilogOptions options_;
    Tn_VerilogFileList files_;
    std::unique_ptr<Tn_VerilogDesign> result_;
};

#endif
