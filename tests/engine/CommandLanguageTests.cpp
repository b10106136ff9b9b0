#include <cctype>
#include <set>
#include <typeinfo>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "tests/support/Owners.h"
#include "vesk_hdl/engine/Commands.h"

using namespace Vesk_Hdl;

namespace {

std::string Lower(std::string text) {
    for (char &c : text)
        c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
    return text;
}

std::string Invalid(std::string const &keyword) { return keyword + ": Invalid Arguments.\n"; }

/// The text with `with` in place of the mark.
std::string Put(std::string text, char mark, std::string const &with) {
    std::size_t const at = text.find(mark);
    return at == std::string::npos ? text : text.replace(at, 1, with);
}

/// A line for an owner, from a pattern with `@` for its words and `%` for its name.
std::string LineOf(Owner const &owner, std::string const &pattern) {
    return Put(Put(pattern, '@', owner.words), '%', owner.Name());
}

/// Lines of a design in which each owner has an integer attribute W and a user attribute U.
Lines Owned() {
    Lines lines = CellsAnd({"ADD SIGNAL s"});
    for (Owner const &owner : Owners()) {
        lines.push_back(LineOf(owner, "ADD @ ATTRIBUTE % -TYPE=Integer W 8"));
        lines.push_back(LineOf(owner, "ADD @ ATTRIBUTE % -TYPE=User U on"));
    }
    return lines;
}

/// A keyword, the class of its command, and arguments that are just enough.
struct Keyword {
    std::string keyword;
    std::string className;
    std::string arguments;
};

/// The whole language, in the order of its registration.
std::vector<Keyword> Language() {
    std::vector<Keyword> all = {{"NOOP", "NoOperationCommand", ""},
                                {"SET NETLIST NAME", "SetNetlistNameCommand", "n"},
                                {"SET SOURCE FILE", "SetSourceFileCommand", "f"},
                                {"ADD COMPONENT", "AddComponentCommand", "C"},
                                {"ADD PIN", "AddPinCommand", "CELL p in"},
                                {"ADD INSTANCE", "AddInstanceCommand", "CELL u9"},
                                {"ADD PORT", "AddPortCommand", "p out"},
                                {"ADD SIGNAL", "AddSignalCommand", "t"},
                                {"CONNECT SIGNAL", "ConnectSignalCommand", "s u1.A"},
                                {"ASSIGN CONSTANT", "AssignConstantCommand", "s 1"},
                                {"WRITE VERILOG", "WriteVerilogCommand", "/dev/null"},
                                {"ADD INCLUDE", "AddIncludeCommand", "i.v"},
                                {"SET SYNTHESIS", "SetSynthesisCommand", "QRT"},
                                {"UPPERCASE", "UppercaseCommand", "siganl"},
                                {"LOWERCASE", "LowercaseCommand", "signal"},
                                {"WRITE VHDL", "WriteVhdlCommand", "/dev/null"},
                                {"FLATTEN BUS", "FlattenBusCommand", ""},
                                {"SUPPRESS CONFIGURATION", "SuppressConfigurationCommand", ""},
                                {"SUPPRESS COMPONENT", "SuppressComponentCommand", ""},
                                {"USE DEFAULT LIBRARY", "UseDefaultLibraryCommand", ""},
                                {"ADD LIBRARY", "AddLibraryCommand", "l"},
                                {"ADD USE LIBRARY", "AddUseLibraryCommand", "l.p.ALL"},
                                {"ADD NOTES", "AddNotesCommand", "note"},
                                {"SET PORT ONEPERLINE", "SetPortOnePerLineCommand", ""}};
    for (Keyword const &family : std::vector<Keyword>{
             {"ADD @ COMMENT", "Add@CommentCommand", "% c"},
             {"ADD @ ATTRIBUTE", "Add@AttrCommand", "% N"},
             {"SET @ ATTRIBUTE VALUE", "Set@AttrValueCommand", "% U v"},
             {"SET @ ATTRIBUTE USERTYPE", "Set@AttrUserTypeCommand", "% U t"},
             {"SET @ ATTRIBUTE OPTION", "Set@AttrOptionCommand", "% U -GENERIC=SYN"}})
        for (Owner const &owner : Owners())
            all.push_back({LineOf(owner, family.keyword),
                           Put(family.className, '@', owner.className),
                           LineOf(owner, family.arguments)});
    for (Keyword const &keyword :
         std::vector<Keyword>{{"Use AttrType", "UseAttrTypeCommand", ""},
                              {"Set Application", "SetApplicationCommand", "a"},
                              {"Set Command", "SetCommandStrCommand", "c"},
                              {"Set Device", "SetDeviceCommand", "d"},
                              {"Set Purpose", "SetPurposeCommand", "p"},
                              {"Set Reference", "SetReferenceCommand", "r"},
                              {"Set Open Pin", "SetOpenPinCommand", ""}})
        all.push_back(keyword);
    return all;
}

TEST(CommandLanguage, HasSixtyOneKeywordsEachWithItsClass) {
    struct Row {
        char const *keyword;
        char const *className;
        std::type_info const &type;
    };
#define ROW(keyword, Class, ...) {keyword, #Class, typeid(Class)},
    std::vector<Row> const table = {VESK_HDL_COMMANDS(ROW)};
#undef ROW
    std::vector<Keyword> const language = Language();
    ASSERT_EQ(61U, language.size());
    ASSERT_EQ(61U, table.size());
    std::set<std::string> seen;
    for (std::size_t i = 0; i < language.size(); ++i) {
        EXPECT_EQ(language[i].keyword, table[i].keyword);
        EXPECT_EQ(language[i].className, table[i].className);
        std::string const line = Lower(table[i].keyword);
        EXPECT_TRUE(seen.insert(line).second) << line;
        std::unique_ptr<Command> const made(CommandFactory().CreateCommand(nullptr, line.c_str()));
        Command const &command = *made;
        EXPECT_EQ(table[i].type, typeid(command)) << line;
        EXPECT_EQ(language[i].keyword, command.GetKeyword());
    }
}

TEST(CommandLanguage, EachCommandRunsOnJustEnoughArgumentsAndNeedsAModel) {
    for (Keyword const &row : Language()) {
        std::string const line = Lower(row.keyword) + " " + row.arguments;
        Design design(Owned());
        EXPECT_EQ("", Refusal(design.model, {line})) << line;
        EXPECT_EQ(row.arguments.empty() ? "" : Invalid(row.keyword),
                  Refusal(design.model, {line.substr(0, line.rfind(' '))}))
            << line;
        StringArray const tokens(line.c_str(), " ", true, "\"\"''");
        CommandManager manager;
        EXPECT_EQ(row.keyword == "NOOP" ? "" : "Missing Model.\n",
                  MessageOf([&] { manager.CreateAndExecute(tokens, nullptr, &design.factory); }))
            << line;
    }
}

// What the families make of their words, on all six owners.

struct AttrRow {
    char const *words;   ///< behind keyword and owner
    char const *message; ///< null for invalid arguments
    char const *attrs;   ///< afterwards; null if they are as they were
};

void ExpectAttrs(std::string const &family, std::vector<AttrRow> const &rows) {
    for (Owner const &owner : Owners())
        for (AttrRow const &row : rows) {
            Design design(Owned());
            std::string const keyword = LineOf(owner, family);
            std::string const line = keyword + " " + owner.Name() + " " + row.words;
            EXPECT_EQ(row.message ? row.message : Invalid(keyword), Refusal(design.model, {line}))
                << line;
            EXPECT_EQ(row.attrs ? row.attrs : "W=8 NONE NONE; U()=on NONE NONE",
                      AttrsOf(owner.Attrs(design.model)))
                << line;
        }
}

TEST(CommandLanguage, AddAttribute) {
#define BOTH "W=8 NONE NONE; U()=on NONE NONE; "
    ExpectAttrs("ADD @ ATTRIBUTE", {{"INIT", "", BOTH "INIT= NONE NONE"},
                                    {"INIT 'a b' c", "", BOTH "INIT=a b NONE NONE"},
                                    {"INIT '\"a\"' c", "", BOTH "INIT=\"a\" NONE NONE"},
                                    {"'' v", "", BOTH "=v NONE NONE"},
                                    {"-TYPE=Integer N 8x", "", BOTH "N=8 NONE NONE"},
                                    {"-type=FLOAT N 2 -TYPE=Bit", "", BOTH "N=2.0 NONE NONE"},
                                    {"-TYPE=bitvector N 8:h:F", "", BOTH "N=F NONE NONE"},
                                    {"-TYPE=Boolean N", "", BOTH "N=FALSE NONE NONE"},
                                    {"-TYPE=User -TYPE=x v", "", BOTH ":TYPE=x()=v NONE NONE"},
                                    {"-TYPE Integer N", "", BOTH ":TYPE=Integer NONE NONE"},
                                    {"N[1] -TYPE=Bit", "", BOTH "N(1)=-TYPE=Bit NONE NONE"},
                                    {"-TYPE=Bit w 9", "", "W=9 NONE NONE; U()=on NONE NONE"},
                                    {"", nullptr, nullptr},
                                    {"''", nullptr, nullptr}, // an empty last word is lost
                                    {"-TYPE=Integer", nullptr, nullptr},
                                    {"-TYPE= N v", "Invalid attribute type.\n", nullptr},
                                    {"-TYPE=Word N v", "Invalid attribute type.\n", nullptr},
                                    {"'-TYPE=Bit ' N", "Invalid attribute type.\n", nullptr}});
#undef BOTH
}

TEST(CommandLanguage, SetAttributeValueAndUserType) {
    ExpectAttrs("SET @ ATTRIBUTE VALUE",
                {{"w 12abc x", "", "W=12 NONE NONE; U()=on NONE NONE"},
                 {"u 'a b'", "", "W=8 NONE NONE; U()=a b NONE NONE"},
                 {"U '' x", "", "W=8 NONE NONE; U()= NONE NONE"},
                 {"U", nullptr, nullptr},
                 {"U ''", nullptr, nullptr},
                 {"Z 1", "Attribute \"Z\" not found.\n", nullptr},
                 {"-TYPE=Bit 1", "Attribute \"-TYPE=Bit\" not found.\n", nullptr}});
    ExpectAttrs("SET @ ATTRIBUTE USERTYPE",
                {{"u STATE x", "", "W=8 NONE NONE; U(STATE)=on NONE NONE"},
                 {"U '' x", "", nullptr},
                 {"U", nullptr, nullptr},
                 {"W STATE", "Invalid attribute type.\n", nullptr},
                 {"Z STATE", "Attribute \"Z\" not found.\n", nullptr}});
}

TEST(CommandLanguage, SetAttributeOption) {
    char const *const both = "W=8 NONE NONE; U()=on SYN ASSIGN";
    char const *const generic = "W=8 NONE NONE; U()=on SYN NONE";
    char const *const refused = "Invalid generic value.\n";
    ExpectAttrs("SET @ ATTRIBUTE OPTION",
                {{"u -GENERIC=SYN", "", generic},
                 {"U -generic=nosyn", "", "W=8 NONE NONE; U()=on NOSYN NONE"},
                 {"U -SynAttr=AssignNoDec", "", "W=8 NONE NONE; U()=on NONE ASSIGNNODEC"},
                 {"U -GENERIC=SYN -SYNATTR=ASSIGN -FOO=1", "", both},
                 {"U -SYNATTR=ASSIGN -GENERIC=SYN", "", both},
                 {"U -GENERIC=1 -GENERIC=SYN", "", generic}, // the later one counts
                 {"U -GENERIC=SYN -SYNATTR=2", refused, generic},
                 {"U -SYNATTR=2 -GENERIC=SYN", refused, generic},
                 {"U -SYNATTR=ASSIGN -GENERIC=1", refused, nullptr},
                 {"U -GENERIC=", refused, nullptr},
                 {"Z -GENERIC=SYN", "Attribute \"Z\" not found.\n", nullptr},
                 {"Z -SYNATTR=NONE", "Attribute \"Z\" not found.\n", nullptr},
                 {"U", nullptr, nullptr},
                 {"U -FOO=1", nullptr, nullptr},
                 {"U -GENERIC SYN", nullptr, nullptr},
                 {"U x-GENERIC=SYN", nullptr, nullptr},
                 {"U -GENERIC=SYN -FOO=2", nullptr, nullptr},
                 {"U -GENERIC=SYN '' -SYNATTR=ASSIGN", nullptr, nullptr}});
}

TEST(CommandLanguage, Comments) {
    std::vector<Owner> owners = Owners();
    owners.push_back(owners[0]); // for ADD NOTES, which is another word for the module's
    for (std::size_t i = 0; i < owners.size(); ++i)
        for (auto const &[words, comment] :
             std::vector<std::pair<std::string, char const *>>{{"one", "old\none\n"},
                                                               {"a  b '  c d", "old\na b   c d\n"},
                                                               {"'' x", "old\n x\n"},
                                                               {"a \"\" b", "old\na  b\n"},
                                                               {"-- \"x\"", "old\n-- x\n"},
                                                               {"", nullptr},
                                                               {"\"\"", nullptr}}) {
            Design design(Owned());
            Object &object = owners[i].find(design.model);
            object.AddComment("old");
            std::string const keyword = LineOf(owners[i], i == 6 ? "ADD NOTES" : "ADD @ COMMENT");
            std::string const line = keyword + " " + owners[i].Name() + " " + words;
            EXPECT_EQ(comment ? "" : Invalid(keyword), Refusal(design.model, {line})) << line;
            EXPECT_STREQ(comment ? comment : "old\n", object.GetComment()) << line;
        }
}

TEST(CommandLanguage, PinsAreOneToken) {
    for (Keyword const &command : Language()) {
        if (command.keyword.find(" PIN ") == std::string::npos)
            continue;
        std::size_t const point = command.arguments.find('.');
        for (auto const &[pin, message] : std::vector<std::pair<std::string, char const *>>{
                 {"@.a", ""},
                 {"@", nullptr},
                 {"@.", nullptr},
                 {".@", nullptr},
                 {"'@ A'", nullptr},
                 {"@.A.B", "Pin \"A.B\" not found.\n"},
                 {"@..A", "Pin \".A\" not found.\n"},
                 {".@.A", "Pin \"A\" not found.\n"},
                 {"none.A", "Pin \"A\" not found.\n"}}) {
            std::string const line = command.keyword + " " +
                                     Put(pin, '@', command.arguments.substr(0, point)) +
                                     command.arguments.substr(point + 2);
            Design design(Owned());
            EXPECT_EQ(message ? message : Invalid(command.keyword), Refusal(design.model, {line}))
                << line;
        }
    }
}

// The options of the output.

/// All fields but the macro flag, by name.
std::vector<std::pair<std::string, std::string>> Fields(HdlOptions const &o) {
    HdlOptions::VhdlOption const &v = o.vhdlOption;
    HdlOptions::VerilogOption const &w = o.verilogOption;
    auto const number = [](int value) { return std::to_string(value); };
    auto const list = [](StringArray const &a) { return std::string(a.Concatenate("|")); };
    return {{"noconfig", number(v.suppressConfiguration)},
            {"flat", number(v.flattenBus)},
            {"default", number(v.useDefaultLibrary)},
            {"lib", list(v.libraries)},
            {"use", list(v.useLibraries)},
            {"type", number(v.useAttrType)},
            {"open", number(v.openPin)},
            {"nocomp", number(v.suppressComponent)},
            {"syn", number(w.synthesisType)},
            {"signal", number(w.signalCase)},
            {"instance", number(w.instanceCase)},
            {"component", number(w.componentCase)},
            {"include", list(w.includes)},
            {"header", number(o.writeHeader)},
            {"app", std::string(o.application)},
            {"command", std::string(o.commandStr)},
            {"device", std::string(o.device)},
            {"purpose", std::string(o.purpose)},
            {"reference", std::string(o.reference)},
            {"oneperline", number(o.portOnePerLine)}};
}

/// The fields that are not as they are at first: "flat=1 lib=a|b".
std::string Changed(HdlOptions const &options) {
    auto const initial = Fields(HdlOptions());
    auto const now = Fields(options);
    std::string text;
    for (std::size_t i = 0; i < now.size(); ++i)
        if (now[i] != initial[i])
            text += (text.empty() ? "" : " ") + now[i].first + "=" + now[i].second;
    return text;
}

TEST(CommandLanguage, Options) {
    struct Row {
        Lines lines;
        std::string changed;
        char const *refused = ""; ///< keyword of the last line, if its arguments are invalid
    };
    for (Row const &row : std::vector<Row>{
             {{"SET PORT ONEPERLINE false x"}, ""},
             {{"USE ATTRTYPE false x y"}, "type=1"},
             {{"FLATTEN BUS"}, "flat=1"},
             {{"FLATTEN BUS falsehood"}, "flat=1"},
             {{"FLATTEN BUS 0 false"}, "flat=1"},
             {{"SUPPRESS CONFIGURATION ''"}, "noconfig=1"},
             {{"SUPPRESS COMPONENT no"}, "nocomp=1"},
             {{"Set Open Pin false x"}, "open=0"},
             {{"USE DEFAULT LIBRARY FALSE"}, "default=0"},
             {{"FLATTEN BUS true", "FLATTEN BUS False"}, ""},
             {{"SUPPRESS CONFIGURATION", "SUPPRESS CONFIGURATION false"}, ""},
             {{"SUPPRESS COMPONENT", "SUPPRESS COMPONENT false"}, ""},
             {{"set open pin false", "set open pin"}, ""},
             {{"USE DEFAULT LIBRARY false", "USE DEFAULT LIBRARY 0"}, ""},
             {{"ADD LIBRARY work x", "ADD LIBRARY work"}, "lib=work|work"},
             {{"ADD LIBRARY '' x"}, "", "ADD LIBRARY"},
             {{"ADD USE LIBRARY a.b.ALL", "ADD USE LIBRARY c"}, "use=a.b.ALL|c"},
             {{"ADD USE LIBRARY '' x"}, "", "ADD USE LIBRARY"},
             {{"ADD INCLUDE 'a b.v' x", "ADD INCLUDE c"}, "include=a b.v|c"},
             {{"ADD INCLUDE '' x"}, "", "ADD INCLUDE"},
             {{"SET SYNTHESIS synplicity x"}, "syn=2"},
             {{"SET SYNTHESIS PRECISION", "SET SYNTHESIS none"}, ""},
             {{"SET SYNTHESIS '' EXEMPLAR"}, "", "SET SYNTHESIS"},
             {{"UPPERCASE Instance x", "UPPERCASE SIGANL"}, "signal=11 instance=11"},
             {{"UPPERCASE component", "UPPERCASE signal"}, "component=11", "UPPERCASE"},
             {{"UPPERCASE x instance"}, "", "UPPERCASE"},
             {{"LOWERCASE instance", "LOWERCASE Component"}, "instance=12 component=12"},
             {{"LOWERCASE Signal", "LOWERCASE siganl"}, "signal=12", "LOWERCASE"},
             {{"Set Application 'a b' c", "Set Device d e"}, "app=a b device=d"},
             {{"Set Application '' b"}, "", "Set Application"},
             {{"Set Device '' b"}, "", "Set Device"},
             {{"Set Command run  it \"a  b\""}, "command=run it a  b"},
             {{"set command one", "set command '' two"}, "command= two"},
             {{"Set Purpose a", "Set Purpose b c", "SET PURPOSE ''"}, "purpose=b c", "Set Purpose"},
             {{"Set Reference 'a' b", "Set Reference"}, "reference=a b", "Set Reference"},
             {{"WRITE VHDL -NOHEADER /dev/null"}, "header=0"},
             {{"WRITE VERILOG -NOHEADER /dev/null", "WRITE VHDL /dev/null"}, ""}}) {
        Design design;
        EXPECT_EQ(*row.refused ? Invalid(row.refused) : "", Refusal(design.model, row.lines))
            << row.lines[0];
        EXPECT_EQ(row.changed, Changed(*design.model.GetOptions())) << row.lines[0];
        EXPECT_FALSE(design.model.IsModified()) << row.lines[0];
    }
}

} // namespace
