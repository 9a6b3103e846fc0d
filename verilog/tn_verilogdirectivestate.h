// Compiler-directive state shared by the scanner (which changes it) and the
// parser (which reads the settings in force for each design unit): net type,
// cell define, timescale, unconnected drive, uselib, the conditional stack and
// the macro tables.
#ifndef TARN_TN_VERILOGDIRECTIVESTATE_H
#define TARN_TN_VERILOGDIRECTIVESTATE_H

#include <cstdint>
#include <unordered_map>
#include <unordered_set>
#include <vector>

#include "src/tn_verilogoptions.h"

class Tn_VerilogDirectiveState {
public:
    // One `ifdef ... `endif: the frame is active when all its conditions hold;
    // `elsif and `else negate the last condition (and `elsif appends its own).
    struct Frame {
        bool elseSeen = false;
        std::vector<bool> conditions;
        bool active() const;
    };

    // A macro with formal parameters: each formal in the body is replaced by
    // the byte 0x01 and its index in decimal (a raw 0x01 of the source is
    // kept as 0x01 0x01).
    struct ParamMacro {
        int formals = 0;
        Port_String body;
        bool operator==(const ParamMacro& o) const { return formals == o.formals && body == o.body; }
        bool operator!=(const ParamMacro& o) const { return !(*this == o); }
    };
    static const char kFormalMarker = '\x01';

    Tn_VerilogDirectiveState();

    // `resetall: net type wire, no cell define, no timescale, no unconnected
    // drive. Macros, uselib and conditionals stay.
    void resetAll();
    // The driver's opening of a flow: resetAll, then each +define+ entry
    // (NAME or NAME=VALUE, split at the first '=') as a command-line macro.
    void reset(const Tn_StringList& commandLineMacros);

    // Settings.
    const Port_String& defaultNetType() const { return defaultNetType_; }
    void setDefaultNetType(const Port_String& t) { defaultNetType_ = t; }
    bool cellDefine() const { return cellDefine_; }
    void setCellDefine(bool v) { cellDefine_ = v; }
    bool timescaleGiven() const { return timescaleGiven_; }
    int32_t timeUnit() const { return timeUnit_; }
    int32_t timePrecision() const { return timePrecision_; }
    void setTimescale(int32_t unit, int32_t precision);
    const Port_String& unconnectedDrive() const { return unconnectedDrive_; }
    void setUnconnectedDrive(const Port_String& d) { unconnectedDrive_ = d; }
    const Tn_StringList& uselib() const { return uselib_; }
    Tn_StringList& uselib() { return uselib_; }

    // Fixed tables.
    static bool isDirectiveName(const Port_String& name, bool verilog2001);
    static bool is2001DirectiveName(const Port_String& name);
    static bool isNetType(const Port_String& name, bool verilog2001);
    // Exponent of a time literal such as "10ns" (-8); false when it is none.
    static bool timeLiteral(const Port_String& text, int32_t& exponent);

    // Macros.
    bool isDefined(const Port_String& name) const { return plain_.count(name) || param_.count(name); }
    bool isCommandLineMacro(const Port_String& name) const { return commandLine_.count(name) != 0; }
    const Port_String* plainMacro(const Port_String& name) const;
    const ParamMacro* paramMacro(const Port_String& name) const;
    void definePlain(const Port_String& name, const Port_String& body);
    void defineParam(const Port_String& name, const ParamMacro& m);
    void undefine(const Port_String& name);
    // The prepared form of a body with the formals of a parameter list
    // (the text between the parentheses).
    static ParamMacro prepare(const Port_String& parameterList, const Port_String& body);

    // Conditionals.
    std::vector<Frame>& conditionals() { return conditionals_; }
    const std::vector<Frame>& conditionals() const { return conditionals_; }
    bool conditionalsActive() const;

private:
    Port_String defaultNetType_;
    bool cellDefine_;
    bool timescaleGiven_;
    Port_String unconnectedDrive_;
    int32_t timeUnit_;
    int32_t timePrecision_;
    Tn_StringList uselib_;
    std::vector<Frame> conditionals_;
    std::unordered_set<Port_String> commandLine_;
    std::unordered_map<Port_String, Port_String> plain_;
    std::unordered_map<Port_String, ParamMacro> param_;
};

#endif
