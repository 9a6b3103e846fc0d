// The parsed options of one compiler call. Copying deep-copies the record:
// every library unit keeps its own copy of the options that made it.
#ifndef TARN_TN_VERILOGOPTIONS_H
#define TARN_TN_VERILOGOPTIONS_H

#include <cstdint>
#include <memory>
#include <utility>
#include <vector>

#include "tarn/port_stringbase.h"

typedef std::vector<Port_String> Tn_StringList;

class Tn_VerilogOptions {
public:
    typedef std::pair<Port_String, Port_String> ParamOverride;  // name (may be empty), value

    Tn_VerilogOptions();
    Tn_VerilogOptions(const Tn_VerilogOptions& o);
    Tn_VerilogOptions& operator=(const Tn_VerilogOptions& o);
    ~Tn_VerilogOptions();

    // Resets to the defaults, then reads every argument (element 0 is the
    // program name). Returns errors issued plus help requests.
    int parse(const Tn_StringList& args);

    const Port_String& programName() const { return r_->programName; }
    int32_t verilog2001() const { return r_->verilog2001; }
    const Port_String& iniFile() const { return r_->iniFile; }
    const Port_String& rootDirectory() const { return r_->rootDirectory; }
    const Port_String& workLibrary() const { return r_->workLibrary; }
    const Tn_StringList& sourceFiles() const { return r_->sourceFiles; }
    const Tn_StringList& topUnits() const { return r_->topUnits; }
    const Tn_StringList& searchLibraries() const { return r_->searchLibraries; }
    const Tn_StringList& includeDirectories() const { return r_->includeDirectories; }
    const Tn_StringList& macroDefinitions() const { return r_->macroDefinitions; }
    const Tn_StringList& librarySearchList() const { return r_->librarySearchList; }
    const Tn_StringList& libraryExtensions() const { return r_->libraryExtensions; }
    const std::vector<ParamOverride>& paramOverrides() const { return r_->paramOverrides; }
    const Tn_StringList& plusArgs() const { return r_->plusArgs; }
    int32_t timestamp() const { return r_->timestamp; }
    bool recursive() const { return r_->recursive; }
    int32_t iterationLimit() const { return r_->iterationLimit; }
    int32_t recursionLimit() const { return r_->recursionLimit; }
    bool compact() const { return r_->compact; }
    int32_t delaySelection() const { return r_->delaySelection; }
    bool strictPreprocessing() const { return r_->strictPreprocessing; }

    void setVerilog2001(int32_t v) { r_->verilog2001 = v; }
    void setStrictPreprocessing(bool v) { r_->strictPreprocessing = v; }
    void setRecursive(bool v) { r_->recursive = v; }

    // Plus-argument queries by prefix (stored without the leading '+').
    bool hasPlusArg(const Port_String& prefix) const;
    // What follows the prefix in the first plus-argument that has it; empty if none.
    Port_String plusArgValue(const Port_String& prefix) const;

    // Issues the usage text as status messages.
    void printUsage() const;

private:
    struct Record {
        Port_String programName;
        int32_t verilog2001 = 1;
        Port_String iniFile;
        Port_String rootDirectory;
        Port_String workLibrary = "work";
        Tn_StringList sourceFiles;
        Tn_StringList topUnits;
        Tn_StringList searchLibraries;
        Tn_StringList includeDirectories;
        Tn_StringList macroDefinitions;
        Tn_StringList librarySearchList;
        Tn_StringList libraryExtensions;
        std::vector<ParamOverride> paramOverrides;
        Tn_StringList plusArgs;
        int32_t timestamp = 0;
        bool recursive = true;
        int32_t iterationLimit = 1024;
        int32_t recursionLimit = 1024;
        bool compact = false;
        int32_t delaySelection = 1;
        bool strictPreprocessing = true;
    };
    class Parser;
    std::unique_ptr<Record> r_;
};

#endif
