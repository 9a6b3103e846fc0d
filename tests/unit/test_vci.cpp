// The exported compiler objects, their pointers and the flows' gating.
#include <gtest/gtest.h>

#include "access/tn_vpibase.h"
#include "src/tn_vpiverilogoptions.h"
#include "tarn/tn_vci.h"
#include "tests/support/capturesink.h"
#include "tests/support/testfiles.h"
#include "verilog/tn_verilogcompiler.h"
#include "verilog/tn_verilogdesign.h"
#include "verilog/tn_verilognodes.h"

namespace {

typedef std::vector<std::string> Strings;

class CountedVpi : public Tn_VpiDesign {
public:
    explicit CountedVpi(int* live) : Tn_VpiDesign(nullptr, Tn_VerilogFileList(), 0), live_(live) { ++*live_; }
    ~CountedVpi() override { --*live_; }

private:
    int* live_;
};

// A handle that answers every query with fixed results, to see forwarding.
class FixedHandle : public Tn_VpiHandle {
public:
    explicit FixedHandle(int* live) : live_(live) { ++*live_; }
    ~FixedHandle() override { --*live_; }
    Tn_VpiHandlePtr handle(int32_t, const Options&, Error&) override { return Tn_VpiHandlePtr(this); }
    Tn_VpiHandlePtr handle_by_name(const Port_String&, const Options&, Error&) override { return nullptr; }
    Tn_VpiHandlePtr handle_by_index(int32_t, const Options&, Error&) override { return nullptr; }
    Tn_VpiIteratorPtr iterate(int32_t, const Options&, Error&) override { return nullptr; }
    int32_t get_int(int32_t p, const Options&, Error&) override { return p * 2; }
    Port_String get_str(int32_t p, const Options&, Error&) override { return Port_String::doFormat("s%d", p); }
    void get_value(p_vpi_value v, const Options&, Error&) override { v->value.integer = 5; }
    void get_sd_value(p_vpi_value v, const Options&, Error&) override { v->value.integer = 6; }
    bool put_data(Tn_Vpi::s_data* d, Tn_VpiUserDataMap& m, const Options&, Error&) override {
        m.put(this, d);
        return true;
    }
    Tn_Vpi::s_data* get_data(Tn_VpiUserDataMap& m, const Options&, Error&) override { return m.get(this); }

private:
    int* live_;
};

}  // namespace

TEST(VciPtr, DefaultIsNullAndComparesWithNullInBothOrders) {
    Tn_VciPtr p;
    EXPECT_FALSE(p);
    EXPECT_TRUE(!p);
    const Tn_Vci* null = nullptr;
    EXPECT_TRUE(p == null);
    EXPECT_TRUE(null == p);
    EXPECT_FALSE(p != null);
    Tn_VciPtr c = Tn_Vci::create_compiler();
    EXPECT_TRUE(c);
    EXPECT_TRUE(c != null && null != c);
    EXPECT_TRUE(c == c.get() && c.get() == c);
    EXPECT_FALSE(c == p);
}

TEST(VpiPtr, CopiesKeepTheRootAliveUntilTheLast) {
    int live = 0;
    Tn_VpiPtr* first = new Tn_VpiPtr(new CountedVpi(&live));
    Tn_VpiPtr second(*first);
    EXPECT_EQ(second.useCount(), 2u);
    delete first;
    EXPECT_EQ(live, 1);
    Tn_VpiPtr third;
    third = second;
    third = third;  // self-assignment
    EXPECT_EQ(third.useCount(), 2u);
    second = Tn_VpiPtr();
    EXPECT_EQ(live, 1);
    third = Tn_VpiPtr();
    EXPECT_EQ(live, 0);
}

TEST(VpiHandlePtr, SelfAssignmentKeepsTheCountAndTheHandle) {
    int live = 0;
    {
        Tn_VpiHandlePtr h(new FixedHandle(&live));
        h = h;
        EXPECT_EQ(h->refCount(), 1u);
        EXPECT_EQ(live, 1);
        Tn_VpiHandlePtr g(h);
        EXPECT_TRUE(g == h);
        EXPECT_TRUE(g == h.get() && h.get() == g);
        EXPECT_EQ(h->refCount(), 2u);
        Tn_VpiIteratorPtr none;
        EXPECT_FALSE(none);
    }
    EXPECT_EQ(live, 0);
}

TEST(VpiRoot, NullReferencesRecordTheErrorAndGiveNeutralResults) {
    Tn_VpiDesign root(nullptr, Tn_VerilogFileList(), 0);
    s_vpi_error_info info;
    EXPECT_EQ(root.get_int(1, Tn_VpiHandlePtr()), -1);
    EXPECT_EQ(root.chk_error(&info), 3);
    EXPECT_STREQ(info.message, "Tn_Vpi::get_int: refHandle must not be null");
    EXPECT_STREQ(info.product, "Tarn Verilog Compiler");
    EXPECT_EQ(info.state, 1);
    EXPECT_STREQ(root.get_str(1, Tn_VpiHandlePtr()), "");
    root.chk_error(&info);
    EXPECT_STREQ(info.message, "Tn_Vpi::get_str: refHandle must not be null");
    EXPECT_FALSE(root.handle(32, Tn_VpiHandlePtr()));
    root.chk_error(&info);
    EXPECT_STREQ(info.message, "Tn_Vpi::handle: null handle not allowed");
    Tn_VpiIteratorPtr it = root.iterate(32, Tn_VpiHandlePtr());
    ASSERT_TRUE(it);
    EXPECT_FALSE(root.scan(it));
    EXPECT_EQ(root.chk_error(nullptr), 0);  // scan cleared the record
    EXPECT_FALSE(root.put_data(Tn_VpiHandlePtr(), nullptr));
    EXPECT_EQ(root.chk_error(nullptr), 3);
    EXPECT_EQ(root.get_data(Tn_VpiHandlePtr()), nullptr);
    root.chk_error(&info);
    EXPECT_STREQ(info.message, "Tn_Vpi::get_data: refHandle must not be null");
}

TEST(VpiRoot, ForwardsToHandlesAndKeepsSixteenStrings) {
    int live = 0;
    {
        Tn_VpiDesign root(nullptr, Tn_VerilogFileList(), 0);
        Tn_VpiHandlePtr h(new FixedHandle(&live));
        EXPECT_EQ(root.get_int(21, h), 42);
        EXPECT_EQ(root.chk_error(nullptr), 0);
        s_vpi_value v;
        root.get_value(h, &v);
        EXPECT_EQ(v.value.integer, 5);
        root.get_sd_value(h, &v);
        EXPECT_EQ(v.value.integer, 6);
        EXPECT_TRUE(root.handle(1, h) == h);
        struct Data : Tn_Vpi::s_data {
            int x = 9;
        };
        EXPECT_TRUE(root.put_data(h, new Data));
        EXPECT_EQ(static_cast<Data*>(root.get_data(h))->x, 9);

        std::vector<const char*> kept;
        for (int i = 0; i < 17; ++i) kept.push_back(root.get_str(i, h));
        // The 16 most recent strings are still valid.
        for (int i = 1; i < 17; ++i) EXPECT_EQ(std::string(kept[i]), "s" + std::to_string(i));
        EXPECT_EQ(root.free_object(h), 1);
        EXPECT_FALSE(h);
    }
    EXPECT_EQ(live, 0);
}

TEST(Flows, CompileWithNoArgumentsFindsNoTopUnits) {
    CaptureSink sink;
    Tn_VpiPtr root = Tn_Vci::create_compiler()->compile(0, nullptr);
    ASSERT_TRUE(root);
    EXPECT_GT(root->error_count(), 0);
    EXPECT_EQ(sink.errors(), Strings{"No top level design units found for elaboration\n"});
    EXPECT_EQ(sink.messages[0].file, "verilog/tn_verilogcompiler");
    EXPECT_EQ(static_cast<Tn_VpiBase&>(*root).design(), nullptr);
    EXPECT_FALSE(root->has_plusarg("tarn"));
}

TEST(Flows, ElaborateWithNoTopIsAnErrorToo) {
    CaptureSink sink;
    Tn_VpiPtr root = Tn_Vci::create_compiler()->elaborate(Tn_Vci::ArgList{Port_String("tarn")});
    EXPECT_EQ(root->error_count(), 1);
    EXPECT_EQ(sink.errors(), Strings{"No top level design units found for elaboration\n"});
}

TEST(Flows, OptionErrorsStopTheFlowBeforeTopSearch) {
    CaptureSink sink;
    const char* argv[] = {"tarn", "-nosuch", "missing.v"};
    Tn_VpiPtr root = Tn_Vci::create_compiler()->compile(3, argv);
    EXPECT_EQ(root->error_count(), 2);
    EXPECT_EQ(sink.errors(), (Strings{"Unrecognized option 'nosuch'\n", "Source file missing.v does not exist\n"}));
}

TEST(Flows, MixedOverridesAreReportedOnceAndStopFurtherTops) {
    CaptureSink sink;
    Tn_VerilogCompiler driver;
    EXPECT_EQ(driver.compile({"tarn", "-top", "a", "-top", "b", "-Gwidth=8", "-G4"}), 1);
    EXPECT_EQ(sink.errors(), Strings{"-G parameter assignments must either be all named or all ordered\n"});
    EXPECT_EQ(driver.takeResult(), nullptr);
    // Consistent overrides pass.
    sink.clear();
    EXPECT_EQ(driver.compile({"tarn", "-top", "a", "-G1", "-G2"}), 0);
    EXPECT_TRUE(sink.messages.empty());
}

TEST(Flows, BuildDesignMakesOneTopInstanceEachWithEveryOverride) {
    CaptureSink sink;
    Tn_VerilogCompiler driver;
    driver.compile({"tarn", "-top", "a", "-top", "b", "-Gwidth=8", "-Gdepth=2"});
    std::unique_ptr<Tn_VerilogDesign> d = driver.buildDesign({"a", "b"});
    EXPECT_EQ(d->name().str(), "DESIGN");
    EXPECT_EQ(d->libraryName().str(), "work");
    ASSERT_NE(d->root(), nullptr);
    ASSERT_EQ(d->root()->ModuleInstance.size(), 2u);
    for (size_t i = 0; i < 2; ++i) {
        Tn_VerilogModuleInstance* inst = d->root()->ModuleInstance[i];
        EXPECT_EQ(inst->Name.str().str(), i ? "b" : "a");
        EXPECT_EQ(inst->DefName, inst->Name);
        EXPECT_EQ(inst->Parent.get(), d->root());
        ASSERT_EQ(inst->ParamAssignment.size(), 2u);
        EXPECT_EQ(inst->ParamAssignment[0]->Name.str().str(), "width");
        EXPECT_EQ(inst->ParamAssignment[1]->Name.str().str(), "depth");
        EXPECT_TRUE(inst->ParamAssignment[0]->NamedParamAssignmentFlag);
        EXPECT_TRUE(inst->ParamAssignment[0]->CmdLineParamAssignmentFlag);
    }
    // Mixed overrides: the first top keeps what came before the mismatch; no further tops.
    driver.compile({"tarn", "-top", "a", "-Gwidth=8", "-G4", "-Gx=1"});
    sink.clear();
    d = driver.buildDesign({"a", "b"});
    EXPECT_EQ(sink.errors(), Strings{"-G parameter assignments must either be all named or all ordered\n"});
    ASSERT_EQ(d->root()->ModuleInstance.size(), 1u);
    EXPECT_EQ(d->root()->ModuleInstance[0]->ParamAssignment.size(), 1u);
}

TEST(Flows, DriverStateDoesNotCarryOverBetweenCalls) {
    CaptureSink sink;
    Tn_VerilogCompiler driver;
    driver.compile({"tarn", "-top", "a", "+x"});
    EXPECT_TRUE(driver.options().hasPlusArg("x"));
    driver.compile({"tarn", "-top", "a"});
    EXPECT_FALSE(driver.options().hasPlusArg("x"));
}

TEST(Flows, DataCompilerKeepsItsDesignAndRejectsParseAndElaborate) {
    CaptureSink sink;
    Tn_VciPtr data = Tn_Vci::create_data_compiler();
    Tn_VpiPtr root = data->compile(Tn_Vci::ArgList{Port_String("tarn"), Port_String("+tarn+dump=node")});
    ASSERT_TRUE(root);
    EXPECT_EQ(root->error_count(), 0);
    ASSERT_NE(static_cast<Tn_VpiBase&>(*root).design(), nullptr);
    // Plus-argument queries outlive the driver: the design holds the options.
    EXPECT_TRUE(root->has_plusarg("tarn+dump"));
    EXPECT_STREQ(root->plusarg_value("tarn+dump="), "node");
    EXPECT_STREQ(root->plusarg_value("none"), "");

    const char* argv[] = {"tarn"};
    for (int slot = 3; slot <= 6; ++slot) {
        sink.clear();
        Tn_VpiPtr r = slot == 3   ? data->parse(Tn_Vci::ArgList())
                      : slot == 4 ? data->parse(1, argv)
                      : slot == 5 ? data->elaborate(Tn_Vci::ArgList())
                                  : data->elaborate(1, argv);
        EXPECT_FALSE(r);
        ASSERT_EQ(sink.count(PORT_MSG_ERROR), 1u);
        EXPECT_EQ(sink.errors()[0], slot <= 4 ? "Method parse() is not implemented\n" : "Method elaborate() is not implemented\n");
        EXPECT_EQ(sink.messages[0].file, "src/tn_vcidatacompiler");
    }
}

TEST(Flows, ArgvFormCopiesEveryEntry) {
    const char* argv[] = {"prog", "-top", "t"};
    Tn_Vci::ArgList l = Tn_Vci::argList(3, argv);
    ASSERT_EQ(l.size(), 3u);
    EXPECT_EQ(l[0].str(), "prog");
    EXPECT_TRUE(Tn_Vci::argList(-1, argv).empty());
    EXPECT_TRUE(Tn_Vci::argList(0, nullptr).empty());
}
