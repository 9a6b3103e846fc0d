// In-memory libraries and the choice of top-level units.
#include <gtest/gtest.h>

#include "library/tn_transientlibrary.h"
#include "verilog/tn_verilogcompiler.h"
#include "verilog/tn_verilogdesignunit.h"
#include "verilog/tn_verilognodes.h"

namespace {

typedef std::vector<std::string> Strings;

// Builds parsed units by hand: a module per unit, with instances.
class Work {
public:
    Tn_TransientLibraryManager manager;
    Tn_Library* lib = manager.open("work");
    Tn_VerilogOptions options;

    Tn_VerilogModule* module(const char* name) {
        std::unique_ptr<Tn_VerilogDesignUnit> u(new Tn_VerilogDesignUnit("work", name, options));
        Tn_VerilogNodeFactory& f = u->factory();
        u->setRoot(f.createRoot());
        Tn_VerilogModule* m = f.createModule();
        m->Name = name;
        m->DefName = name;
        m->Parent = u->root();
        u->setNode(m);
        lib->add(std::move(u));
        return m;
    }
    static Tn_VerilogNodeFactory& factoryOf(Tn_VerilogModule* m, Work& w) {
        for (Tn_LibraryUnit* u : w.lib->units())
            if (static_cast<Tn_VerilogDesignUnit*>(u)->node() == m) return static_cast<Tn_VerilogDesignUnit*>(u)->factory();
        throw std::runtime_error("no unit");
    }
    void instance(Tn_VerilogConcurrentRegion* in, Tn_VerilogModule* owner, const char* def) {
        Tn_VerilogModuleInstance* i = factoryOf(owner, *this).createModuleInstance();
        i->DefName = def;
        in->ModuleInstance.push_back(i);
    }
    Strings tops(bool recursive = true) {
        Strings r;
        for (const Port_String& s : Tn_VerilogCompiler::findTopUnits(*lib, recursive)) r.push_back(s.str());
        return r;
    }
};

}  // namespace

TEST(Library, AddReplacesAndFindsByKey) {
    Tn_TransientLibraryManager manager;
    Tn_Library* lib = manager.open("work");
    EXPECT_EQ(manager.open("work"), lib);
    EXPECT_NE(manager.open("other"), lib);
    EXPECT_EQ(lib->name().str(), "work");
    Tn_VerilogOptions options;
    Tn_VerilogDesignUnit* first = new Tn_VerilogDesignUnit("work", "m", options);
    EXPECT_TRUE(lib->add(std::unique_ptr<Tn_LibraryUnit>(first)));
    EXPECT_EQ(lib->find("m"), first);
    Tn_VerilogDesignUnit* second = new Tn_VerilogDesignUnit("work", "m", options);
    EXPECT_TRUE(lib->add(std::unique_ptr<Tn_LibraryUnit>(second)));  // deletes the first
    EXPECT_EQ(lib->find("m"), second);
    EXPECT_EQ(lib->units().size(), 1u);
    EXPECT_EQ(lib->find("m", "arch"), nullptr);
    EXPECT_EQ(lib->find("nothing"), nullptr);
    EXPECT_FALSE(lib->add(nullptr));
}

TEST(TopUnits, UnitsNothingInstantiatesInByteOrder) {
    Work w;
    Tn_VerilogModule* top = w.module("top");
    Tn_VerilogModule* mid = w.module("mid");
    w.module("leaf");
    w.module("B");
    w.module("a");
    w.module("ab");
    w.module("A");
    w.instance(top, top, "mid");
    w.instance(mid, mid, "leaf");
    w.instance(mid, mid, "missing");  // unknown definitions change nothing
    EXPECT_EQ(w.tops(), (Strings{"A", "B", "a", "ab", "top"}));
    EXPECT_EQ(w.tops(false), (Strings{"A", "B", "a", "ab", "leaf", "mid", "top"}));
}

TEST(TopUnits, GenerateRegionsCountButGenerateStatementsDoNot) {
    Work w;
    Tn_VerilogModule* top = w.module("top");
    w.module("inRegion");
    w.module("inArray");
    w.module("inArrayInstance");
    w.module("inLoop");
    Tn_VerilogNodeFactory& f = Work::factoryOf(top, w);
    Tn_VerilogGenerate* region = f.createGenerate();
    top->Generate.push_back(region);
    w.instance(region, top, "inRegion");
    Tn_VerilogGenerateArray* arr = f.createGenerateArray();
    Tn_VerilogGenerate* element = f.createGenerate();
    arr->Generate.insert(0, element);
    top->GenerateArray.push_back(arr);
    w.instance(element, top, "inArray");
    Tn_VerilogModuleArray* marr = f.createModuleArray();
    Tn_VerilogModuleInstance* mi = f.createModuleInstance();
    mi->DefName = "inArrayInstance";
    marr->ModuleInstance.push_back(mi);
    top->ModuleArray.push_back(marr);
    // A module instantiated only inside a generate for stays a candidate.
    Tn_VerilogGenerateFor* loop = f.createGenerateFor();
    top->GenerateStatement.push_back(loop);
    Tn_VerilogGenerateArray* body = f.createGenerateArray();
    loop->GenerateArray = body;
    Tn_VerilogGenerate* bodyScope = f.createGenerate();
    body->Generate.insert(0, bodyScope);
    w.instance(bodyScope, top, "inLoop");
    EXPECT_EQ(w.tops(), (Strings{"inLoop", "top"}));
}

TEST(TopUnits, MutualInstantiationLeavesNoTop) {
    Work w;
    Tn_VerilogModule* a = w.module("a");
    Tn_VerilogModule* b = w.module("b");
    w.instance(a, a, "b");
    w.instance(b, b, "a");
    EXPECT_TRUE(w.tops().empty());
    EXPECT_EQ(w.tops(false), (Strings{"a", "b"}));
}
