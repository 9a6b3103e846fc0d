// Checks the arguments of a call against the parameter types of a function
// or task type: counts, directions, optional and empty arguments, the
// ellipses tail. One checker serves system and user functions and tasks;
// only the message texts differ.
#ifndef TARN_TN_VERILOGCALLCHECKER_H
#define TARN_TN_VERILOGCALLCHECKER_H

#include <vector>

#include "tarn/port_stringbase.h"
#include "verilog/tn_verilogtype.h"

class Tn_VerilogElabContext;
class Tn_VerilogExpression;
class Tn_VerilogNode;

class Tn_VerilogCallChecker {
public:
    // The texts of one kind of callee. Each begins with the location and ends
    // with a newline; counts take (location, name), argument messages
    // (location, argument number from 1, [direction word,] name).
    struct Messages {
        const char* tooMany;
        const char* tooFew;
        const char* illegalDirected;  // "... %d (%s) ..."
        const char* illegal;          // without a direction
        const char* noDirection;
    };
    static const Messages kSystemFunction;
    static const Messages kUserFunction;
    static const Messages kSystemTask;
    static const Messages kUserTask;

    Tn_VerilogCallChecker(Tn_VerilogElabContext& ctx, const Messages& messages) : ctx_(ctx), messages_(messages) {}

    // Checks arguments (null entries are empty arguments) of call against the
    // parameter types of callee; false when something was reported, or an
    // argument's own check had already failed.
    bool check(const Tn_VerilogNode& call, const Port_String& name, const std::vector<Tn_VerilogExpression*>& arguments,
               const Tn_VerilogType& callee);

private:
    bool checkArgument(const Tn_VerilogNode& call, const Port_String& name, Tn_VerilogExpression* argument,
                       const Tn_VerilogType& parameter, int number);

    Tn_VerilogElabContext& ctx_;
    const Messages& messages_;
};

#endif
