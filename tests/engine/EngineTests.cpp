#include <algorithm>
#include <cerrno>
#include <filesystem>
#include <sstream>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "tests/support/ReadFile.h"
#include "tests/support/TempDir.h"
#include "vesk_hdl/engine/HdlEngine.h"

using namespace Vesk_Hdl;

namespace {

std::string EngineRefusal(Engine &engine, char const *line) {
    return MessageOf([&] { engine.Execute(line); });
}

TEST(Engine, ModelsByName) {
    Engine engine;
    EXPECT_TRUE(engine.CreateAndAddModel("A", "a.sch"));
    EXPECT_FALSE(engine.CreateAndAddModel("a", nullptr));
    EXPECT_TRUE(engine.CreateAndAddModel(nullptr, nullptr));
    EXPECT_FALSE(engine.CreateAndAddModel("", nullptr));
    EXPECT_STREQ("a.sch", engine.GetModel("a")->GetSourceFileName());
    EXPECT_EQ("Missing Model.\n", EngineRefusal(engine, "NOOP"));
    EXPECT_EQ("Missing Model.\n", EngineRefusal(engine, ""));
    engine.Execute("A", "ADD SIGNAL s"); // which makes none the current one
    EXPECT_EQ("Missing Model.\n", MessageOf([&] { engine.Execute("B", "NOOP"); }));
    EXPECT_EQ(nullptr, engine.GetCurrentModel());
    EXPECT_TRUE(engine.UseModel("a"));
    EXPECT_FALSE(engine.UseModel("B") || engine.RemoveModel("B"));
    EXPECT_EQ("Identifier \"s\" already defined.\n", EngineRefusal(engine, "ADD SIGNAL s"));
    EXPECT_EQ("", EngineRefusal(engine, "   "));
    EXPECT_EQ("", EngineRefusal(engine, nullptr));
    EXPECT_TRUE(engine.RemoveModel("A"));
    EXPECT_EQ("Missing Model.\n", EngineRefusal(engine, "NOOP"));
    EXPECT_TRUE(engine.UseModel("") && engine.CreateAndAddModel("A", nullptr));
    EXPECT_TRUE(engine.RemoveModel("a")); // another than the current one
    EXPECT_EQ(engine.GetModel(""), engine.GetCurrentModel());
}

TEST(Engine, TheFirstOfTwoModelsOfOneNameIsFound) {
    for (int const more : {0, 20}) { // found by a walk, by index
        Engine engine;
        for (char const *const name : {"a", "b"})
            engine.CreateAndAddModel(name, nullptr);
        for (int i = 0; i < more; ++i)
            engine.CreateAndAddModel(std::to_string(i).c_str(), nullptr);
        Model *const first = engine.GetModel("a");
        Model *const second = engine.GetModel("b");
        second->SetName("A");
        EXPECT_TRUE(engine.GetModel("a") == first && !engine.GetModel("b"));
        EXPECT_TRUE(engine.RemoveModel("a"));
        EXPECT_EQ(engine.GetModel("a"), second);
    }
}

TEST(Model, Names) {
    Model model;
    EXPECT_STREQ("hdlNetlist", model.GetName());
    model.SetName("x<1>");
    EXPECT_STREQ("x<1>", model.GetName());
    model.SetName(nullptr);
    EXPECT_STREQ("HDL_NETLIST", model.GetName());
    model.SetSourceFileName("f");
    model.SetSourceFileName(nullptr);
    EXPECT_STREQ("", model.GetSourceFileName());
    EXPECT_EQ("Command not find.\n", Refusal(model, {"NOOP"})); // it has no factory
    EXPECT_TRUE(model.Execute(StringArray()));
}

TEST(Model, ReadsCommandFiles) {
    TempDir const dir;
    std::string const file = dir.Path("f");
    using Row = std::tuple<char const *, char const *, char const *>;
    for (auto const &[text, message, signals] :
         {Row{"ADD SIGNAL a\n\n   \nadd signal 'b'\n", "", "a b"},
          Row{"ADD SIGNAL a\r\nADD SIGNAL b", "", "a b"}, Row{"", "", ""},
          Row{"ADD SIGNAL a\nBAD\n", "Command not find.\n", "a"},
          Row{"ADD SIGNAL a\nADD SIGNAL A\nADD SIGNAL b\n", "Identifier \"A\" already defined.\n",
              "a"}}) {
        WriteFile(file, text);
        Design design;
        design.model.SetModifiedFlag(true);
        EXPECT_EQ(message, MessageOf([&] { EXPECT_TRUE(design.model.Read(file.c_str())); }))
            << text;
        EXPECT_EQ(*message != '\0', design.model.IsModified()) << text;
        EXPECT_EQ(signals, NamesOf(design.netlist.GetSignalIterator())) << text;
    }
    Design design;
    for (std::string const &name : Lines{dir.Path("missing"), "/", "", "/dev/null/x"}) {
        design.model.SetModifiedFlag(true);
        EXPECT_FALSE(design.model.Read(name.c_str())) << name;
        EXPECT_FALSE(design.model.IsModified()) << name;
    }
    EXPECT_FALSE(design.model.Read(nullptr));
}

TEST(Engine, CommandFiles) {
    TempDir const dir;
    std::string const file = dir.Path("f");
    Engine engine;
    EXPECT_FALSE(engine.ReadCommandFile("m", file.c_str()));
    WriteFile(file, "ADD SIGNAL a\n");
    EXPECT_TRUE(engine.ReadCommandFile("M", file.c_str()));
    EXPECT_STREQ(file.c_str(), engine.GetModel("m")->GetSourceFileName());
    EXPECT_EQ(nullptr, engine.GetCurrentModel());
    EXPECT_FALSE(engine.ReadCommandFile(nullptr, nullptr));
    engine.GetModel("m")->SetModifiedFlag(true);
    EXPECT_TRUE(engine.WriteCommandFile("m", dir.Path("out").c_str()));
    EXPECT_FALSE(engine.GetModel("m")->IsModified() || std::filesystem::exists(dir.Path("out")));
    EXPECT_FALSE(engine.WriteCommandFile("none", dir.Path("out").c_str()));
}

Lines Words(char const *text) {
    std::istringstream stream(text);
    return {std::istream_iterator<std::string>(stream), {}};
}

TEST(Engine, KeywordTables) {
    Lines const vhdl = Words(R"(
abs access after alias all and architecture array assert attribute begin block body buffer bus case
component configuration constant disconnect downto else elsif end entity exit file for function
generate generic group guarded if impure in inertial inout is label library linkage literal loop map
mod nand new next nor not null of on open or others out package port postponed procedure process
pure range record register reject rem report return rol ror select severity signal shared sla sll sra
srl subtype then to transport type unaffected units until use variable wait when while with xnor xor
)");
    Lines const verilog = Words(R"(
always and assign begin buf bufif0 bufif1 case casex casez cmos deassign default defparam disable
edge else end endcase endmodule endfunction endprimitive endspecify endtable endtask event for
forever fork function highz0 highz1 if ifnone initial inout input integer join large macromodule
medium module nand negedge nmos nor not notif0 notif1 or output parameter pmos posedge primitive
pull0 pull1 pullup pulldown rcmos real realtime reg release repeat rnmos rpmos rtran rtranif0
rtranif1 scalared small specify specparam strong0 strong1 supply0 supply1 table task time tran
tranif0 tranif1 tri tri0 tri1 triand trior trireg vectored wait wand weak0 weak1 while wire wor xnor
xor)");
    EXPECT_TRUE(vhdl.size() == 97 && verilog.size() == 101);
    Lines all =
        Words("force protected context signed logic std_logic automatic localparam xnorx xo");
    all.insert(all.end(), vhdl.begin(), vhdl.end());
    all.insert(all.end(), verilog.begin(), verilog.end());
    for (std::string const &word : all) {
        bool const isVhdl = std::count(vhdl.begin(), vhdl.end(), word) > 0;
        bool const isVerilog = std::count(verilog.begin(), verilog.end(), word) > 0;
        EXPECT_EQ(isVhdl, Engine::IsVhdlKeyword(word.c_str())) << word;
        EXPECT_EQ(isVerilog, Engine::IsVerilogKeyword(word.c_str())) << word;
        std::string upper = word;
        upper[0] = static_cast<char>(std::toupper(word[0]));
        EXPECT_EQ(isVhdl, Engine::IsVhdlKeyword(upper.c_str())) << upper;
        EXPECT_FALSE(Engine::IsVerilogKeyword(upper.c_str())) << upper;
    }
    EXPECT_FALSE(Engine::IsVhdlKeyword(nullptr) || Engine::IsVerilogKeyword(nullptr));
}

TEST(WriteCommands, WhatBecameOfTheLastWrite) {
    TempDir const dir;
    Design design;
    int number = 0;
    EXPECT_EQ(number, design.model.GetLastWrite().number);
    for (auto const &[fileName, error] : {std::pair{dir.Path("none/a"), ENOENT},
                                          {dir.Path("a"), 0},
                                          {"/dev/full", ENOSPC},
                                          {dir.Path(""), EISDIR},
                                          {dir.Path("a"), 0}}) {
        EXPECT_EQ("", Refusal(design.model, {"WRITE VHDL " + fileName})) << fileName;
        WriteStatus const &status = design.model.GetLastWrite();
        EXPECT_EQ(++number, status.number) << fileName;
        EXPECT_EQ(error, status.error) << fileName;
        EXPECT_EQ(fileName, status.fileName.GetText());
    }
    EXPECT_EQ("WRITE VHDL: Invalid Arguments.\n", Refusal(design.model, {"WRITE VHDL"}));
    EXPECT_EQ(number, design.model.GetLastWrite().number);
}

} // namespace
