// One compiler call: a fresh driver runs one flow; its result, the files it
// read and its error count become the new root; the driver dies with the call.
#ifndef TARN_TN_VCIRUN_H
#define TARN_TN_VCIRUN_H

#include <memory>

#include "src/tn_verilogoptions.h"
#include "tarn/tn_vpi.h"
#include "verilog/tn_verilogdesign.h"

template <class Root, class Driver>
Tn_VpiPtr Tn_VciRunDriver(int (Driver::*flow)(const Tn_StringList&), const Tn_StringList& args) {
    std::unique_ptr<Driver> driver(new Driver);
    const int errors = (driver.get()->*flow)(args);
    std::unique_ptr<Tn_VerilogDesign> design = driver->takeResult();
    return Tn_VpiPtr(new Root(std::move(design), driver->sourceFiles(), errors));
}

#endif
