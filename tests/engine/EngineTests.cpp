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
    EXPECT_STREQ("", engine.GetModel(nullptr)->GetSourceFileName());
}

TEST(Engine, TheCurrentModel) {
    Engine engine;
    EXPECT_TRUE(engine.CreateAndAddModel("A", nullptr));
    EXPECT_TRUE(engine.CreateAndAddModel("", nullptr));
    EXPECT_EQ("Missing Model.\n", EngineRefusal(engine, "NOOP"));
    EXPECT_EQ("Missing Model.\n", EngineRefusal(engine, ""));
    engine.Execute("A", "ADD SIGNAL s");
    EXPECT_EQ(nullptr, engine.GetCurrentModel());
    EXPECT_EQ("Missing Model.\n", MessageOf([&] { engine.Execute("B", "NOOP"); }));
    EXPECT_EQ(nullptr, engine.GetModel("B"));
    EXPECT_TRUE(engine.UseModel("a"));
    EXPECT_FALSE(engine.UseModel("B"));
    EXPECT_EQ("Identifier \"s\" already defined.\n", EngineRefusal(engine, "ADD SIGNAL s"));
    EXPECT_EQ("", EngineRefusal(engine, "   "));
    EXPECT_EQ("", EngineRefusal(engine, nullptr));
}

TEST(Engine, RemovingModels) {
    Engine engine;
    engine.CreateAndAddModel("A", nullptr);
    engine.CreateAndAddModel("", nullptr);
    engine.UseModel("A");
    EXPECT_FALSE(engine.RemoveModel("B"));
    EXPECT_TRUE(engine.RemoveModel("A"));
    EXPECT_EQ("Missing Model.\n", EngineRefusal(engine, "NOOP"));
    EXPECT_TRUE(engine.UseModel(""));
    EXPECT_TRUE(engine.CreateAndAddModel("A", nullptr));
    EXPECT_TRUE(engine.RemoveModel("a")); // another than the current one
    EXPECT_EQ(engine.GetModel(""), engine.GetCurrentModel());
}

TEST(Model, Names) {
    Model model;
    EXPECT_STREQ("hdlNetlist", model.GetName());
    for (char const *const name : {"", "x<1>"}) {
        model.SetName(name);
        EXPECT_STREQ(name, model.GetName());
    }
    model.SetName(nullptr);
    EXPECT_STREQ("HDL_NETLIST", model.GetName());
    model.SetSourceFileName("f");
    model.SetSourceFileName(nullptr);
    EXPECT_STREQ("", model.GetSourceFileName());
    EXPECT_FALSE(model.IsModified());
    EXPECT_EQ("Command not find.\n", Refusal(model, {"NOOP"})); // it has no factory
    EXPECT_TRUE(model.Execute(StringArray()));
}

TEST(Model, ReadsCommandFiles) {
    TempDir const dir;
    struct Row {
        char const *name;
        char const *text;
        char const *message;
        bool isModified; ///< afterwards, with true before
        char const *signals;
    };
    for (Row const &row : std::vector<Row>{
             {"good", "ADD SIGNAL a\n\n   \nadd signal 'b'\n", "", false, "a b"},
             {"without last end of line", "ADD SIGNAL a\r\nADD SIGNAL b", "", false, "a b"},
             {"empty", "", "", false, ""},
             {"last line bad", "ADD SIGNAL a\nBAD\n", "Command not find.\n", true, "a"},
             {"bad in between", "ADD SIGNAL a\nADD SIGNAL A\nADD SIGNAL b\n",
              "Identifier \"A\" already defined.\n", true, "a"},
             {"comment", "-- x\nADD SIGNAL a\n", "Command not find.\n", true, ""}}) {
        WriteFile(dir.Path("f"), row.text);
        Design design;
        design.model.SetModifiedFlag(true);
        bool result = true;
        EXPECT_EQ(row.message,
                  MessageOf([&] { result = design.model.Read(dir.Path("f").c_str()); }))
            << row.name;
        EXPECT_TRUE(result) << row.name;
        EXPECT_EQ(row.isModified, design.model.IsModified()) << row.name;
        EXPECT_EQ(row.signals, NamesOf(design.netlist.GetSignalIterator())) << row.name;
    }
}

TEST(Model, FilesThatCannotBeRead) {
    TempDir const dir;
    Design design;
    for (std::string const &name : Lines{dir.Path("missing"), "/", "", "/dev/null/x"}) {
        design.model.SetModifiedFlag(true);
        EXPECT_FALSE(design.model.Read(name.c_str())) << name;
        EXPECT_FALSE(design.model.IsModified());
    }
    EXPECT_FALSE(design.model.Read(nullptr));
    EXPECT_TRUE(design.model.Read("/dev/null"));
}

TEST(Model, FailingReadsLeakNoDescriptor) {
    TempDir const dir;
    WriteFile(dir.Path("bad"), "NOOP\nBAD\n");
    WriteFile(dir.Path("good"), "NOOP\n");
    auto const descriptors = [] {
        auto const folder = std::filesystem::directory_iterator("/proc/self/fd");
        return std::distance(begin(folder), end(folder));
    };
    Design design;
    auto const before = descriptors();
    for (int i = 0; i < 2000; ++i) {
        EXPECT_EQ("Command not find.\n",
                  MessageOf([&] { design.model.Read(dir.Path("bad").c_str()); }));
        EXPECT_TRUE(design.model.Read(dir.Path("good").c_str()));
        EXPECT_FALSE(design.model.Read(dir.Path("").c_str()));
    }
    EXPECT_EQ(before, descriptors());
    EXPECT_EQ(4000, design.model.GetCommandManager()->GetDoneCommandCount());
}

TEST(Engine, CommandFiles) {
    TempDir const dir;
    std::string const missing = dir.Path("missing");
    Engine engine;
    EXPECT_FALSE(engine.ReadCommandFile("m", missing.c_str()));
    EXPECT_STREQ(missing.c_str(), engine.GetModel("m")->GetSourceFileName());
    EXPECT_EQ(nullptr, engine.GetCurrentModel());
    WriteFile(dir.Path("f"), "ADD SIGNAL a\n");
    EXPECT_TRUE(engine.ReadCommandFile("M", dir.Path("f").c_str()));
    EXPECT_STREQ(missing.c_str(), engine.GetModel("m")->GetSourceFileName());
    EXPECT_EQ("Identifier \"a\" already defined.\n",
              MessageOf([&] { engine.ReadCommandFile("m", dir.Path("f").c_str()); }));
    EXPECT_FALSE(engine.ReadCommandFile(nullptr, nullptr));
    EXPECT_NE(nullptr, engine.GetModel(""));
    engine.GetModel("m")->SetModifiedFlag(true);
    EXPECT_TRUE(engine.WriteCommandFile("m", dir.Path("out").c_str()));
    EXPECT_FALSE(engine.GetModel("m")->IsModified());
    EXPECT_FALSE(std::filesystem::exists(dir.Path("out")));
    EXPECT_FALSE(engine.WriteCommandFile("none", dir.Path("out").c_str()));
}

Lines Words(char const *text) {
    std::istringstream stream(text);
    return {std::istream_iterator<std::string>(stream), {}};
}

TEST(Engine, KeywordTables) {
    Lines const vhdl = Words(
        "abs access after alias all and architecture array assert attribute begin block body "
        "buffer "
        "bus case component configuration constant disconnect downto else elsif end entity exit "
        "file "
        "for function generate generic group guarded if impure in inertial inout is label library "
        "linkage literal loop map mod nand new next nor not null of on open or others out package "
        "port postponed procedure process pure range record register reject rem report return rol "
        "ror "
        "select severity signal shared sla sll sra srl subtype then to transport type unaffected "
        "units until use variable wait when while with xnor xor");
    Lines const verilog = Words(
        "always and assign begin buf bufif0 bufif1 case casex casez cmos deassign default defparam "
        "disable edge else end endcase endmodule endfunction endprimitive endspecify endtable "
        "endtask "
        "event for forever fork function highz0 highz1 if ifnone initial inout input integer join "
        "large macromodule medium module nand negedge nmos nor not notif0 notif1 or output "
        "parameter "
        "pmos posedge primitive pull0 pull1 pullup pulldown rcmos real realtime reg release repeat "
        "rnmos rpmos rtran rtranif0 rtranif1 scalared small specify specparam strong0 strong1 "
        "supply0 "
        "supply1 table task time tran tranif0 tranif1 tri tri0 tri1 triand trior trireg vectored "
        "wait "
        "wand weak0 weak1 while wire wor xnor xor");
    EXPECT_EQ(97U, vhdl.size());
    EXPECT_EQ(101U, verilog.size());
    Lines all = vhdl;
    all.insert(all.end(), verilog.begin(), verilog.end());
    for (char const *const other : {"force", "protected", "context", "signed", "logic", "std_logic",
                                    "automatic", "localparam", "xnorx", "xo", ""})
        all.emplace_back(other);
    for (std::string const &word : all) {
        bool const isVhdl = std::count(vhdl.begin(), vhdl.end(), word) > 0;
        bool const isVerilog = std::count(verilog.begin(), verilog.end(), word) > 0;
        EXPECT_EQ(isVhdl, Engine::IsVhdlKeyword(word.c_str())) << word;
        EXPECT_EQ(isVerilog, Engine::IsVerilogKeyword(word.c_str())) << word;
        std::string upper = word;
        std::transform(word.begin(), word.end(), upper.begin(),
                       [](char c) { return std::toupper(c); });
        EXPECT_EQ(isVhdl, Engine::IsVhdlKeyword(upper.c_str())) << upper;
        EXPECT_FALSE(Engine::IsVerilogKeyword(upper.c_str())) << upper;
    }
    EXPECT_FALSE(Engine::IsVhdlKeyword(nullptr) || Engine::IsVerilogKeyword(nullptr));
}

TEST(WriteCommands, TheNumberOfTokensTellsWhereTheFileNameStands) {
    struct Row {
        char const *arguments; ///< files a and b, with DIR for their folder
        char const *written;
        bool writesHeader;
        bool appends;
    };
    for (Row const &row : std::vector<Row>{
             {"DIR/a", "a", true, false},
             {"-NOHEADER DIR/a", "a", false, false},
             {"-append DIR/a", "a", true, true},
             {"-overwrite DIR/a", "a", true, false},
             {"-other DIR/a", "a", true, false},
             {"DIR/a DIR/b", "b", true, false}, // the first is an option that nobody knows
             {"-noheader -APPEND DIR/a", "a", false, true},
             {"-APPEND -NOHEADER DIR/a", "a", false, true},
             {"-OVERWRITE -APPEND DIR/a", "a", true, true},
             {"-NOHEADER -NOHEADER DIR/a", "a", false, false},
             {"DIR/a -NOHEADER DIR/b", "b", false, false},
             {"DIR/a -NOHEADER -APPEND DIR/b", "a", true, false},
             {"DIR/b 3 4 5 6 7", "b", true, false}}) {
        TempDir const dir;
        WriteFile(dir.Path("a"), "old\n");
        WriteFile(dir.Path("b"), "old\n");
        std::string line = std::string("WRITE VHDL ") + row.arguments;
        for (std::size_t at; (at = line.find("DIR/")) != std::string::npos;)
            line.replace(at, 4, dir.Path(""));
        Design design;
        design.model.GetOptions()->writeHeader = !row.writesHeader;
        EXPECT_EQ("", Refusal(design.model, {line})) << row.arguments;
        EXPECT_EQ(row.writesHeader, design.model.GetOptions()->writeHeader) << row.arguments;
        for (char const *const name : {"a", "b"}) {
            std::string const text = ReadFile(dir.Path(name));
            bool const isWritten = std::string(name) == row.written;
            EXPECT_EQ(!isWritten || row.appends, text.starts_with("old\n")) << row.arguments;
            EXPECT_EQ(isWritten, text.find("architecture") != std::string::npos) << row.arguments;
        }
        EXPECT_EQ(dir.Path(row.written), design.model.GetLastWrite().fileName.GetText());
        EXPECT_FALSE(design.model.IsModified());
    }
}

TEST(WriteCommands, WhatBecameOfTheLastWrite) {
    TempDir const dir;
    Design design;
    EXPECT_EQ(0, design.model.GetLastWrite().number);
    struct Row {
        std::string fileName;
        int error;
    };
    int number = 0;
    for (Row const &row : std::vector<Row>{{dir.Path("none/a"), ENOENT},
                                           {dir.Path("a"), 0},
                                           {"/dev/full", ENOSPC},
                                           {dir.Path(""), EISDIR},
                                           {dir.Path("a"), 0}}) {
        EXPECT_EQ("", Refusal(design.model, {"WRITE VHDL " + row.fileName})) << row.fileName;
        WriteStatus const &status = design.model.GetLastWrite();
        EXPECT_EQ(++number, status.number) << row.fileName;
        EXPECT_EQ(row.error, status.error) << row.fileName;
        EXPECT_EQ(row.fileName, status.fileName.GetText());
    }
    EXPECT_EQ("WRITE VHDL: Invalid Arguments.\n", Refusal(design.model, {"WRITE VHDL"}));
    EXPECT_EQ(number, design.model.GetLastWrite().number);
}

} // namespace
