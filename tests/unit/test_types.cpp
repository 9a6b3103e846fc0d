// Types: the kind predicates, directions and marks, what fits where, and the
// system function and task tables built from their signatures.
#include <gtest/gtest.h>

#include <functional>

#include "verilog/tn_verilogsystf.h"
#include "verilog/tn_verilogtype.h"

namespace {

typedef Tn_VerilogType T;

struct Kind {
    const char* name;
    std::function<Tn_VerilogTypePtr()> make;
};

const std::vector<Kind>& kinds() {
    static const std::vector<Kind> k = {
        {"error", T::createError},
        {"unknown", T::createUnknown},
        {"void", T::createVoid},
        {"event", T::createEvent},
        {"ellipses", T::createEllipses},
        {"array", [] { return T::createArray(T::createScalar(false), 0, 3); }},
        {"function", [] { return T::createFunction(T::createReal(), {}); }},
        {"task", [] { return T::createTask({}); }},
        {"block", T::createBlock},
        {"real", T::createReal},
        {"signed scalar", [] { return T::createScalar(true); }},
        {"unsigned scalar", [] { return T::createScalar(false); }},
        {"signed vector", [] { return T::createVector(true, 7, 0); }},
        {"unsigned vector", [] { return T::createVector(false, 0, 7); }},
    };
    return k;
}

}  // namespace

TEST(Types, EachTypeIsExactlyOneKind) {
    for (const Kind& k : kinds()) {
        SCOPED_TRACE(k.name);
        Tn_VerilogTypePtr t = k.make();
        const bool kindOf[] = {t->isError(), t->isUnknown(),  t->isVoid(), t->isEvent(), t->isEllipses(),
                               t->isArray(), t->isFunction(), t->isTask(), t->isBlock(), t->isValueType()};
        int count = 0;
        for (bool b : kindOf) count += b;
        EXPECT_EQ(count, 1);
        const std::string name = k.name;
        const bool integral = name.find("scalar") != std::string::npos || name.find("vector") != std::string::npos;
        EXPECT_EQ(t->isIntegral(), integral);
        EXPECT_EQ(t->isValueType(), integral || name == "real");
        EXPECT_EQ(t->isRealType(), name == "real");
        EXPECT_EQ(t->isScalar(), name.find("scalar") != std::string::npos);
        EXPECT_EQ(t->isVector(), name.find("vector") != std::string::npos);
        EXPECT_EQ(t->isSignedType(), integral && name.compare(0, 6, "signed") == 0);
        EXPECT_EQ(t->isUnsignedType(), integral && name.compare(0, 8, "unsigned") == 0);
        // New types have no direction and no marks.
        EXPECT_FALSE(t->isInput() || t->isInout() || t->isOutput());
        EXPECT_FALSE(t->isOptional() || t->acceptsAny());
    }
}

TEST(Types, BoundsElementsResultsAndParameters) {
    EXPECT_EQ(T::createScalar(true)->msb(), 0);
    EXPECT_EQ(T::createScalar(true)->lsb(), 0);
    Tn_VerilogTypePtr v = T::createVector(false, 3, 10);
    EXPECT_EQ(v->msb(), 3);
    EXPECT_EQ(v->lsb(), 10);
    Tn_VerilogTypePtr a = T::createArray(v, 255, 0);
    EXPECT_EQ(a->msb(), 255);
    EXPECT_EQ(a->elementType().get(), v.get());
    EXPECT_FALSE(v->elementType());
    Tn_VerilogTypePtr f = T::createFunction(T::createReal(), {T::asInput(T::createScalar(true)), T::asOutput(T::createReal())});
    EXPECT_TRUE(f->returnType()->isRealType());
    ASSERT_EQ(f->parameterTypes().size(), 2u);
    EXPECT_TRUE(f->parameterType(0)->isInput());
    EXPECT_TRUE(f->parameterType(1)->isOutput());
    EXPECT_FALSE(f->parameterType(2));
    EXPECT_TRUE(T::createTask({})->parameterTypes().empty());
    EXPECT_TRUE(T::createReal()->parameterTypes().empty());
    EXPECT_FALSE(T::createTask({})->returnType());
    EXPECT_EQ(f->text(), "function (input signed scalar, output real) real");
}

TEST(Types, DirectionsAndMarks) {
    Tn_VerilogTypePtr t = T::createScalar(false);
    EXPECT_EQ(T::asInout(t).get(), t.get());
    EXPECT_TRUE(t->isInout());
    EXPECT_FALSE(t->isInput() || t->isOutput());
    t->setOutput();
    EXPECT_TRUE(t->isOutput());
    EXPECT_STREQ(t->directionText(), "output");
    t->setOptional();
    t->setAcceptsAny();
    EXPECT_TRUE(t->isOptional() && t->acceptsAny());
    EXPECT_EQ(t->text(), "output unsigned scalar opt");
}

TEST(Types, ValuesFitValuesAndKindsFitTheirOwnKind) {
    const Tn_VerilogTypePtr err = T::createError(), unknown = T::createUnknown();
    for (const Kind& k : kinds()) {
        Tn_VerilogTypePtr t = k.make();
        SCOPED_TRACE(k.name);
        if (t->isVoid()) {
            // Void fits only void.
            EXPECT_FALSE(t->matches(*err));
            EXPECT_TRUE(t->matches(*T::createVoid()));
            continue;
        }
        // The error and unknown types fit everywhere: nothing is reported twice.
        EXPECT_TRUE(t->matches(*err));
        EXPECT_TRUE(t->matches(*unknown));
        for (const Kind& o : kinds()) {
            Tn_VerilogTypePtr other = o.make();
            if (other->isError() || other->isUnknown()) continue;
            bool expected = t->isError() || t->isUnknown() || t->isEllipses() ||
                            (t->isValueType() ? other->isValueType()
                                              : std::string(k.name) == o.name);
            EXPECT_EQ(t->matches(*other), expected) << "with " << o.name;
        }
    }
    // Arrays fit arrays of fitting elements.
    EXPECT_TRUE(T::createArray(T::createScalar(false), 0, 3)->matches(*T::createArray(T::createReal(), 7, 0)));
    EXPECT_FALSE(T::createArray(T::createEvent(), 0, 3)->matches(*T::createArray(T::createReal(), 7, 0)));
}

TEST(SystemFunctionTables, SignaturesReadBackAsWritten) {
    EXPECT_EQ(Tn_VerilogSysTf::signature("(u in, u in opt) u")->text(),
              "function (input unsigned scalar, input unsigned scalar opt) unsigned scalar");
    EXPECT_EQ(Tn_VerilogSysTf::signature("(s inout opt) s")->text(), "function (inout signed scalar opt) signed scalar");
    EXPECT_EQ(Tn_VerilogSysTf::signature("(u out, ... in opt any)")->text(), "task (output unsigned scalar, input ... opt)");
    EXPECT_TRUE(Tn_VerilogSysTf::signature("(u out, ... in opt any)")->parameterType(1)->acceptsAny());
    EXPECT_EQ(Tn_VerilogSysTf::signature("()")->text(), "task ()");
    EXPECT_EQ(Tn_VerilogSysTf::signature("() real")->text(), "function () real");
    for (const char* bad : {"", "u", "(u", "(u in", "(w in) u", "(u sideways) u", "() u u", "(u in,) u"})
        EXPECT_FALSE(Tn_VerilogSysTf::signature(bad)) << bad;
}

TEST(SystemFunctionTables, EveryNameIsInTheTablesOfItsLanguage) {
    const char* functions1995[] = {"$fopen", "$realtime", "$stime", "$time", "$bitstoreal", "$realtobits", "$itor",
                                   "$rtoi", "$dist_chi_square", "$dist_erlang", "$dist_exponential", "$dist_normal",
                                   "$dist_poisson", "$dist_t", "$dist_uniform", "$random", "$test$plusargs"};
    const char* functions2001[] = {"$fgetc", "$ungetc", "$ferror", "$fgets", "$rewind", "$fread", "$fscanf",
                                   "$fseek", "$ftell", "$sformat", "$sscanf", "$signed", "$unsigned",
                                   "$value$plusargs"};
    const char* tasks1995[] = {"$display", "$displayb", "$displayh", "$displayo", "$monitor", "$monitorb",
                               "$monitorh", "$monitoro", "$monitoroff", "$monitoron", "$strobe", "$strobeb",
                               "$strobeh", "$strobeo", "$write", "$writeb", "$writeh", "$writeo", "$fclose",
                               "$fdisplay", "$fdisplayb", "$fdisplayh", "$fdisplayo", "$fmonitor", "$fmonitorb",
                               "$fmonitorh", "$fmonitoro", "$fstrobe", "$fstrobeb", "$fstrobeh", "$fstrobeo",
                               "$fwrite", "$fwriteb", "$fwriteh", "$fwriteo", "$readmemb", "$readmemh",
                               "$sdf_annotate", "$printtimescale", "$timeformat", "$finish", "$stop", "$dumpall",
                               "$dumpfile", "$dumpflush", "$dumplimit", "$dumpoff", "$dumpon", "$dumpvars"};
    const char* tasks2001[] = {"$fflush", "$swrite", "$swriteb", "$swriteh", "$swriteo", "$sformat", "$dumpports",
                               "$dumpportsoff", "$dumpportson", "$dumpportsall", "$dumpportslimit", "$dumpportsflush"};
    for (const char* n : functions1995) {
        EXPECT_TRUE(Tn_VerilogSysTf::function(n, false) && Tn_VerilogSysTf::function(n, false)->isFunction()) << n;
        EXPECT_FALSE(Tn_VerilogSysTf::task(n, true)) << n;
    }
    for (const char* n : functions2001) {
        EXPECT_FALSE(Tn_VerilogSysTf::function(n, false)) << n;
        EXPECT_TRUE(Tn_VerilogSysTf::function(n, true)) << n;
    }
    for (const char* n : tasks1995) EXPECT_TRUE(Tn_VerilogSysTf::task(n, false) && Tn_VerilogSysTf::task(n, false)->isTask()) << n;
    for (const char* n : tasks2001) {
        EXPECT_FALSE(Tn_VerilogSysTf::task(n, false)) << n;
        EXPECT_TRUE(Tn_VerilogSysTf::task(n, true)) << n;
    }
    EXPECT_FALSE(Tn_VerilogSysTf::function("$display", true));
    EXPECT_FALSE(Tn_VerilogSysTf::function("$foo", true));
    // A few signatures as IEEE 1364 gives them.
    EXPECT_EQ(Tn_VerilogSysTf::function("$random", true)->text(), "function (inout signed scalar opt) signed scalar");
    EXPECT_EQ(Tn_VerilogSysTf::function("$fscanf", true)->text(),
              "function (input unsigned scalar, input unsigned scalar, output ...) unsigned scalar");
    EXPECT_EQ(Tn_VerilogSysTf::task("$timeformat", true)->parameterTypes().size(), 4u);
    EXPECT_EQ(Tn_VerilogSysTf::task("$sdf_annotate", true)->parameterTypes().size(), 7u);
}
