#include "verilog/tn_verilogcompiler.h"

#include <algorithm>
#include <unordered_set>

#include "library/tn_transientlibrary.h"

#include "util/tn_exception.h"
#include "util/tn_message.h"
#include "verilog/tn_verilogdesign.h"
#include "verilog/tn_verilogdesignunit.h"
#include "verilog/tn_verilognodes.h"
#include "verilog/tn_verilogdirectivestate.h"
#include "verilog/tn_veriloglexer.h"
#include "verilog/tn_verilogparser.h"
#include "verilog/tn_verilogtokenstreamfilter.h"

Tn_VerilogCompiler::Tn_VerilogCompiler()
    : directives_(new Tn_VerilogDirectiveState()),
      lexer_(new Tn_VerilogLexer(options_, *directives_)),
      filter_(new Tn_VerilogTokenStreamFilter(*lexer_)),
      parser_(new Tn_VerilogParser(options_, *directives_, *filter_)) {}

Tn_VerilogCompiler::~Tn_VerilogCompiler() {}

std::unique_ptr<Tn_VerilogDesign> Tn_VerilogCompiler::takeResult() { return std::move(result_); }

const Tn_VerilogFileList& Tn_VerilogCompiler::sourceFiles() const { return lexer_->fileList(); }

int Tn_VerilogCompiler::compile(const Tn_StringList& args) { return run(COMPILE, args); }
int Tn_VerilogCompiler::parse(const Tn_StringList& args) { return run(PARSE, args); }
int Tn_VerilogCompiler::elaborate(const Tn_StringList& args) { return run(ELABORATE, args); }

int Tn_VerilogCompiler::run(Flow flow, const Tn_StringList& args) {
    checkpoint_.reset();
    try {
        open(flow, args);
        switch (flow) {
        case COMPILE: compileFlow(); break;
        case PARSE: parseFlow(); break;
        case ELABORATE: elaborateFlow(); break;
        }
    } catch (const Tn_Exception& e) {
        e.report();
    }
    if (errorsSoFar()) result_.reset();
    return checkpoint_.errorCount();
}

// Common opening: options, then the preprocessor's state and command-line macros.
void Tn_VerilogCompiler::open(Flow flow, const Tn_StringList& args) {
    options_.parse(args);
    // Status lines name the library when units are not elaborated right away.
    if (flow == COMPILE) lexer_->setAnnounceLibrary(!options_.recursive());
    if (flow == PARSE) lexer_->setAnnounceLibrary(true);
    directives_->reset(options_.macroDefinitions());
}

bool Tn_VerilogCompiler::scanSources(const Tn_StringList& args) {
    checkpoint_.reset();
    open(COMPILE, args);
    if (errorsSoFar()) return false;
    startScanner();
    return true;
}

void Tn_VerilogCompiler::startScanner() {
    lexer_->startFiles(options_.sourceFiles());
    filter_->reset();
}

void Tn_VerilogCompiler::compileFlow() {
    Tn_TransientLibraryManager libraries;
    Tn_Library* work = libraries.open(options_.workLibrary());
    if (!errorsSoFar()) parseSources(*work, nullptr);
    Tn_StringList tops;
    if (!errorsSoFar()) tops = topUnits(*work);
    if (!errorsSoFar()) elaborateTops(tops, options_.recursive());
}

void Tn_VerilogCompiler::parseFlow() {
    // The binary library manager takes the work library's place here.
    Tn_TransientLibraryManager libraries;
    Tn_Library* work = libraries.open(options_.workLibrary());
    Tn_StringList compiled;
    if (!errorsSoFar()) parseSources(*work, &compiled);
    // Each unit compiled here is checked by itself.
    if (!errorsSoFar()) elaborateTops(compiled, false);
}

void Tn_VerilogCompiler::elaborateFlow() {
    Tn_TransientLibraryManager libraries;
    Tn_Library* work = libraries.open(options_.workLibrary());
    Tn_StringList tops;
    if (!errorsSoFar()) tops = topUnits(*work);
    if (!errorsSoFar()) elaborateTops(tops, options_.recursive());
}

void Tn_VerilogCompiler::parseSources(Tn_Library& work, Tn_StringList* compiled) {
    parser_->parse(options_.sourceFiles(), work, compiled);
}

Tn_StringList Tn_VerilogCompiler::topUnits(Tn_Library& work) {
    Tn_StringList tops = options_.topUnits();
    if (tops.empty()) tops = findTopUnits(work, options_.recursive());
    if (tops.empty()) TN_MSG().issueError("No top level design units found for elaboration\n");
    return tops;
}

namespace {

// Adds the definition names instantiated in region, looking into generate
// regions and generate arrays but not into generate statements.
void collectInstantiated(Tn_VerilogConcurrentRegion* region, std::unordered_set<Port_String>& names) {
    if (!region) return;
    for (Tn_VerilogModuleInstance* inst : region->ModuleInstance) names.insert(inst->DefName.str());
    for (Tn_VerilogModuleArray* array : region->ModuleArray)
        for (Tn_VerilogModuleInstance* inst : array->ModuleInstance) names.insert(inst->DefName.str());
    for (Tn_VerilogGenerate* g : region->Generate) collectInstantiated(g, names);
    for (Tn_VerilogGenerateArray* array : region->GenerateArray)
        for (auto& element : array->Generate.raw()) collectInstantiated(static_cast<Tn_VerilogGenerate*>(element.second), names);
}

}  // namespace

Tn_StringList Tn_VerilogCompiler::findTopUnits(Tn_Library& work, bool recursive) {
    std::vector<Port_String> units;
    std::unordered_set<Port_String> instantiated;
    for (Tn_LibraryUnit* u : work.units()) {
        if (u->unitKind() != Tn_LibraryUnit::VERILOG_DESIGN_UNIT && u->unitKind() != Tn_LibraryUnit::VERILOG_DESIGN_UNIT_2)
            continue;
        units.push_back(u->name());
        if (recursive)
            collectInstantiated(Tn_VerilogNode::cast<Tn_VerilogModule>(static_cast<Tn_VerilogDesignUnit*>(u)->node()),
                                instantiated);
    }
    Tn_StringList tops;
    for (const Port_String& name : units)
        if (!instantiated.count(name)) tops.push_back(name);
    // Byte order: std::string compares bytes as unsigned char.
    std::sort(tops.begin(), tops.end());
    return tops;
}

void Tn_VerilogCompiler::elaborateTops(const Tn_StringList& tops, bool /*recursive*/) {
    std::unique_ptr<Tn_VerilogDesign> design = buildDesign(tops);
    // Elaboration of the container replaces result_ here.
    if (result_ && options_.hasPlusArg("tarn+memoryreport")) result_->memoryReport();
    if (errorsSoFar()) result_.reset();
}

std::unique_ptr<Tn_VerilogDesign> Tn_VerilogCompiler::buildDesign(const Tn_StringList& tops) {
    std::unique_ptr<Tn_VerilogDesign> design(new Tn_VerilogDesign(options_.workLibrary(), "DESIGN", options_));
    Tn_VerilogNodeFactory& f = design->factory();
    Tn_VerilogRoot* root = f.createRoot();
    design->setRoot(root);
    for (const Port_String& top : tops) {
        Tn_VerilogModuleInstance* inst = f.createModuleInstance();
        inst->Name = top;
        inst->DefName = top;
        inst->Parent = root;
        root->ModuleInstance.push_back(inst);
        applyOverrides(*design, *inst);
        if (errorsSoFar()) break;
    }
    return design;
}

void Tn_VerilogCompiler::applyOverrides(Tn_VerilogDesign& design, Tn_VerilogModuleInstance& inst) {
    const auto& overrides = options_.paramOverrides();
    if (overrides.empty()) return;
    const bool named = !overrides.front().first.IsEmpty();
    for (const auto& o : overrides) {
        if (o.first.IsEmpty() == named) {
            TN_MSG().issueError("-G parameter assignments must either be all named or all ordered\n");
            return;
        }
        Tn_VerilogExpression* value = nullptr;
        try {
            value = Tn_VerilogParser::parseExpression(o.second, design.factory(), options_, directives_.get());
        } catch (const Tn_VerilogExpressionSyntaxError&) {
            if (named)
                TN_MSG().issueError("Invalid value '%s' specified for parameter '%s'\n", o.second.c_str(), o.first.c_str());
            else
                TN_MSG().issueError("Invalid value '%s' specified for parameter\n", o.second.c_str());
            continue;
        }
        Tn_VerilogParamAssignment* a = design.factory().createParamAssignment();
        a->Value = value;
        a->Name = o.first;
        a->NamedParamAssignmentFlag = named;
        a->CmdLineParamAssignmentFlag = true;
        inst.ParamAssignment.push_back(a);
    }
}
