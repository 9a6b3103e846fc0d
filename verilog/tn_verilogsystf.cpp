#include "verilog/tn_verilogsystf.h"

#include <cstring>
#include <string>
#include <unordered_map>

namespace {

struct Signature {
    const char* names;  // blank-separated
    const char* text;
};

// Verilog-1995 functions.
const Signature kFunctions1995[] = {
    {"$fopen", "(u in, u in opt) u"},
    {"$realtime", "() real"},
    {"$stime $time", "() u"},
    {"$bitstoreal", "(u in) real"},
    {"$realtobits", "(real in) u"},
    {"$itor", "(s in) real"},
    {"$rtoi", "(real in) s"},
    {"$dist_chi_square $dist_exponential $dist_poisson $dist_t", "(s inout, s in) s"},
    {"$dist_erlang $dist_normal $dist_uniform", "(s inout, s in, s in) s"},
    {"$random", "(s inout opt) s"},
    {"$test$plusargs", "(u in) u"},
};

// Functions added by Verilog-2001. The scanned arguments of $fscanf and
// $sscanf are the variables that receive the values.
const Signature kFunctions2001[] = {
    {"$fgetc $rewind $ftell", "(u in) u"},
    {"$ungetc", "(u in, u in) u"},
    {"$ferror", "(u in, u out) u"},
    {"$fgets", "(u out, u in) u"},
    {"$fread", "(...) u"},
    {"$fscanf $sscanf", "(u in, u in, ... out) u"},
    {"$fseek", "(u in, u in, u in) u"},
    {"$sformat", "(u out, u in, ...) u"},
    {"$signed", "(u in) s"},
    {"$unsigned", "(s in) u"},
    {"$value$plusargs", "(u in, u out) u"},
};

// Verilog-1995 tasks. Display-like tasks take anything (strings, empty
// arguments, scopes for %m-less hierarchy printing); the memory of $readmem
// and the scopes of $dumpvars, $printtimescale and $sdf_annotate are names
// rather than values.
const Signature kTasks1995[] = {
    {"$display $displayb $displayh $displayo $monitor $monitorb $monitorh $monitoro "
     "$strobe $strobeb $strobeh $strobeo $write $writeb $writeh $writeo",
     "(... in opt any)"},
    {"$fdisplay $fdisplayb $fdisplayh $fdisplayo $fmonitor $fmonitorb $fmonitorh $fmonitoro "
     "$fstrobe $fstrobeb $fstrobeh $fstrobeo $fwrite $fwriteb $fwriteh $fwriteo",
     "(u in, ... in opt any)"},
    {"$fclose $dumpfile $dumplimit", "(u in)"},
    {"$readmemb $readmemh", "(u in, u in any, u in opt, u in opt)"},
    {"$sdf_annotate", "(u in, u in opt any, u in opt, u in opt, u in opt, u in opt, u in opt)"},
    {"$printtimescale", "(u in opt any)"},
    {"$finish $stop", "(u in opt)"},
    {"$monitoroff $monitoron $dumpall $dumpflush $dumpoff $dumpon", "()"},
    {"$timeformat", "(s in opt, u in opt, u in opt, u in opt)"},
    {"$dumpvars", "(u in opt, ... in opt any)"},
};

// Tasks added by Verilog-2001.
const Signature kTasks2001[] = {
    {"$fflush $dumpportson $dumpportsall $dumpportsoff $dumpportsflush", "(u in opt)"},
    {"$swrite $swriteb $swriteh $swriteo", "(u out, ... in opt any)"},
    {"$sformat", "(u out, u in, ... in opt any)"},
    {"$dumpports", "(... in opt any)"},
    {"$dumpportslimit", "(u in, u in opt)"},
};

typedef std::unordered_map<std::string, Tn_VerilogTypePtr> Table;

void fill(Table& table, const Signature* begin, const Signature* end) {
    for (const Signature* s = begin; s != end; ++s) {
        std::string names(s->names);
        size_t pos = 0;
        while (pos < names.size()) {
            size_t next = names.find(' ', pos);
            if (next == std::string::npos) next = names.size();
            if (next > pos) table[names.substr(pos, next - pos)] = Tn_VerilogSysTf::signature(s->text);
            pos = next + 1;
        }
    }
}

struct Tables {
    Table functions1995, functions2001, tasks1995, tasks2001;
    Tables() {
        fill(functions1995, std::begin(kFunctions1995), std::end(kFunctions1995));
        fill(functions2001, std::begin(kFunctions2001), std::end(kFunctions2001));
        fill(tasks1995, std::begin(kTasks1995), std::end(kTasks1995));
        fill(tasks2001, std::begin(kTasks2001), std::end(kTasks2001));
    }
};

const Tables& tables() {
    static const Tables t;
    return t;
}

const Tn_VerilogType* find(const Table& first, const Table& second, bool useSecond, const Port_String& name) {
    auto it = first.find(name.str());
    if (it != first.end()) return it->second.get();
    if (!useSecond) return nullptr;
    it = second.find(name.str());
    return it != second.end() ? it->second.get() : nullptr;
}

// Reads the words of a signature text.
class SignatureReader {
public:
    explicit SignatureReader(const char* text) : p_(text) {}

    Tn_VerilogTypePtr read() {
        if (!punct('(')) return Tn_VerilogTypePtr();
        Tn_VerilogTypeList params;
        if (!punct(')')) {
            for (;;) {
                Tn_VerilogTypePtr t = parameter();
                if (!t) return Tn_VerilogTypePtr();
                params.push_back(t);
                if (punct(')')) break;
                if (!punct(',')) return Tn_VerilogTypePtr();
            }
        }
        std::string w = word();
        if (w.empty()) return Tn_VerilogType::createTask(params);
        Tn_VerilogTypePtr result = valueType(w);
        if (!result || !word().empty()) return Tn_VerilogTypePtr();
        return Tn_VerilogType::createFunction(result, params);
    }

private:
    void blanks() {
        while (*p_ == ' ') ++p_;
    }
    bool punct(char c) {
        blanks();
        if (*p_ != c) return false;
        ++p_;
        return true;
    }
    std::string word() {
        blanks();
        const char* start = p_;
        while (*p_ && !std::strchr(" ,()", *p_)) ++p_;
        return std::string(start, p_);
    }
    static Tn_VerilogTypePtr valueType(const std::string& w) {
        if (w == "u") return Tn_VerilogType::createScalar(false);
        if (w == "s") return Tn_VerilogType::createScalar(true);
        if (w == "real") return Tn_VerilogType::createReal();
        return Tn_VerilogTypePtr();
    }
    Tn_VerilogTypePtr parameter() {
        std::string w = word();
        Tn_VerilogTypePtr t = w == "..." ? Tn_VerilogType::createEllipses() : valueType(w);
        if (!t) return t;
        for (;;) {
            const char* mark = p_;
            w = word();
            if (w == "in") t->setInput();
            else if (w == "out") t->setOutput();
            else if (w == "inout") t->setInout();
            else if (w == "opt") t->setOptional();
            else if (w == "any") t->setAcceptsAny();
            else if (w.empty()) return t;
            else {
                p_ = mark;
                return Tn_VerilogTypePtr();
            }
        }
    }

    const char* p_;
};

}  // namespace

Tn_VerilogTypePtr Tn_VerilogSysTf::signature(const char* text) { return SignatureReader(text).read(); }

const Tn_VerilogType* Tn_VerilogSysTf::function(const Port_String& name, bool verilog2001) {
    const Tables& t = tables();
    return find(t.functions1995, t.functions2001, verilog2001, name);
}

const Tn_VerilogType* Tn_VerilogSysTf::task(const Port_String& name, bool verilog2001) {
    const Tables& t = tables();
    return find(t.tasks1995, t.tasks2001, verilog2001, name);
}
