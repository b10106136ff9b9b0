#include <algorithm>
#include <cctype>
#include <memory>

#include <gtest/gtest.h>

#include "tests/support/Lines.h"
#include "tests/support/MemoryFile.h"
#include "tests/support/Options.h"
#include "tests/support/Owners.h"

using namespace Vesk_Hdl;

namespace {

std::string Lower(std::string text) {
    for (char &c : text)
        c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
    return text;
}

StringArray Tokens(std::string const &line) {
    return StringArray(line.c_str(), " ", true, "\"\"''");
}

std::string Invalid(std::string const &keyword) { return keyword + ": Invalid Arguments.\n"; }

/// A design in which each owner has an integer attribute W and a user attribute U.
struct Owned : Design {
    Owned() : Design(CellsAnd("sig s")) {
        for (Owner const &owner : Owners())
            EXPECT_EQ("", Refusal(model, {owner.Line("ADD @ ATTRIBUTE % -TYPE=Integer W 8"),
                                          owner.Line("ADD @ ATTRIBUTE % -TYPE=User U on")}));
        model.SetModifiedFlag(false);
    }
};

/// All keywords, each with the fewest arguments that it accepts.
std::vector<std::pair<std::string, std::string>> Language() {
    std::string language =
        "NOOP=; SET NETLIST NAME=n; SET SOURCE FILE=f; ADD COMPONENT=C; ADD PIN=CELL p in;"
        "ADD INSTANCE=CELL u9; ADD PORT=p out; ADD SIGNAL=t; CONNECT SIGNAL=s u1.A;"
        "ASSIGN CONSTANT=s 1; WRITE VERILOG=/dev/null; ADD INCLUDE=i.v; SET SYNTHESIS=QRT;"
        "UPPERCASE=siganl; LOWERCASE=signal; WRITE VHDL=/dev/null; FLATTEN BUS=;"
        "SUPPRESS CONFIGURATION=; SUPPRESS COMPONENT=; USE DEFAULT LIBRARY=; ADD LIBRARY=l;"
        "ADD USE LIBRARY=l.p.ALL; ADD NOTES=note; SET PORT ONEPERLINE=; Use AttrType=;"
        "Set Application=a; Set Command=c; Set Device=d; Set Purpose=p; Set Reference=r;"
        "Set Open Pin=";
    for (Owner const &owner : Owners())
        for (char const *const family :
             {";ADD @ COMMENT=% c", ";ADD @ ATTRIBUTE=% N", ";SET @ ATTRIBUTE VALUE=% U v",
              ";SET @ ATTRIBUTE USERTYPE=% U t", ";SET @ ATTRIBUTE OPTION=% U -GENERIC=SYN"})
            language += owner.Line(family);
    return Pairs(language);
}

TEST(CommandLanguage, EachKeywordRunsOnJustEnoughArgumentsAndNeedsAModel) {
    EXPECT_EQ(static_cast<std::size_t>(CommandReference::GetCount()), Language().size())
        << "Language() in this file lists each command once: add a new one there.";
    for (auto const &[keyword, arguments] : Language()) {
        std::string const line = Lower(keyword) + " " + arguments;
        Owned design;
        std::unique_ptr<Command> const made(design.factory.CreateCommand(nullptr, line.c_str()));
        EXPECT_STREQ(keyword.c_str(), made ? made->GetKeyword() : "none") << line;
        EXPECT_EQ("", Refusal(design.model, {line})) << line;
        EXPECT_EQ(arguments.empty() ? "" : Invalid(keyword),
                  Refusal(design.model, {line.substr(0, line.rfind(' '))}))
            << line;
        CommandManager manager;
        EXPECT_EQ(keyword == "NOOP" ? "" : "Missing Model.\n", MessageOf([&] {
                      manager.CreateAndExecute(Tokens(line), nullptr, &design.factory);
                  }))
            << line;
    }
}

struct AttrRow {
    char const *words;   ///< after keyword and owner; several lines are separated by semicolons
    char const *message; ///< null for invalid arguments
    char const *attrs;   ///< afterwards: U and those after it, or all; null if nothing changed
};

void ExpectAttrs(std::string const &family, std::vector<AttrRow> const &rows) {
    for (Owner const &owner : Owners())
        for (AttrRow const &row : rows)
            for (std::string const &words : Pieces(row.words)) {
                Owned design;
                std::string const keyword = owner.Words(family);
                std::string const line = keyword + " " + owner.Name() + " " + words;
                std::string const message = row.message ? row.message : Invalid(keyword);
                std::string const attrs = row.attrs ? row.attrs : "U()=on NONE NONE";
                EXPECT_EQ(message, Refusal(design.model, {line})) << line;
                for (Owner const &each : Owners())
                    EXPECT_EQ(each.words != owner.words ? "W=8 NONE NONE; U()=on NONE NONE"
                              : attrs[0] == 'W'         ? attrs
                                                        : "W=8 NONE NONE; " + attrs,
                              AttrsOf(each.Attrs(design.model)))
                        << line << " " << each.words;
                EXPECT_EQ(message.empty() || row.attrs, design.model.IsModified()) << line;
            }
}

TEST(CommandLanguage, AddAttribute) {
    ExpectAttrs(
        "ADD @ ATTRIBUTE",
        {{"INIT", "", "U()=on NONE NONE; INIT= NONE NONE"},
         {"INIT 'a b' c", "", "U()=on NONE NONE; INIT=a b NONE NONE"},
         {"INIT '\"a\"' c", "", "U()=on NONE NONE; INIT=\"a\" NONE NONE"},
         {"'' v", "", "U()=on NONE NONE; =v NONE NONE"},
         {"-TYPE=Integer N 8x;-type=bitvector N 2:h:8", "", "U()=on NONE NONE; N=8 NONE NONE"},
         {"-type=FLOAT N 2 -TYPE=Bit", "", "U()=on NONE NONE; N=2.0 NONE NONE"},
         {"-TYPE=User -TYPE=x v", "", "U()=on NONE NONE; :TYPE=x()=v NONE NONE"},
         {"-TYPE Integer N", "", "U()=on NONE NONE; :TYPE=Integer NONE NONE"},
         {"N[1] -TYPE=Bit", "", "U()=on NONE NONE; N(1)=-TYPE=Bit NONE NONE"},
         {"-TYPE=Word w 9", "", "W=9 NONE NONE; U()=on NONE NONE"},
         {"'';-TYPE=Integer", nullptr, nullptr}, // an empty last word is lost
         {"-TYPE= N v;-TYPE=Word N v;'-TYPE=Bit ' N", "Invalid attribute type.\n", nullptr}});
}

TEST(CommandLanguage, SetAttribute) {
    char const *const refused = "Invalid generic value.\n";
    ExpectAttrs("SET @ ATTRIBUTE VALUE",
                {{"w 12abc x", "", "W=12 NONE NONE; U()=on NONE NONE"},
                 {"u 'a b'", "", "U()=a b NONE NONE"},
                 {"U '' x", "", "U()= NONE NONE"},
                 {"U;U ''", nullptr, nullptr},
                 {"-TYPE=Bit 1", "Attribute \"-TYPE=Bit\" not found.\n", nullptr}});
    ExpectAttrs("SET @ ATTRIBUTE USERTYPE", {{"u STATE x", "", "U(STATE)=on NONE NONE"},
                                             {"U '' x", "", nullptr},
                                             {"U", nullptr, nullptr},
                                             {"W STATE", "Invalid attribute type.\n", nullptr},
                                             {"Z STATE", "Attribute \"Z\" not found.\n", nullptr}});
    ExpectAttrs(
        "SET @ ATTRIBUTE OPTION",
        {{"u -GENERIC=SYN;U -GENERIC=1 -GENERIC=SYN", "", "U()=on SYN NONE"}, // the later one
         {"U -generic=nosyn", "", "U()=on NOSYN NONE"},
         {"U -SynAttr=AssignNoDec", "", "U()=on NONE ASSIGNNODEC"},
         {"U -GENERIC=SYN -SYNATTR=ASSIGN -FOO=1;U -SYNATTR=ASSIGN -GENERIC=SYN", "",
          "U()=on SYN ASSIGN"},
         {"U -GENERIC=SYN -SYNATTR=2;U -SYNATTR=2 -GENERIC=SYN", refused, "U()=on SYN NONE"},
         {"U -SYNATTR=ASSIGN -GENERIC=1;U -GENERIC=;U -SYNATTR=SYN", refused, nullptr},
         {"Z -GENERIC=SYN;Z -SYNATTR=NONE", "Attribute \"Z\" not found.\n", nullptr},
         {"U;U -FOO=1;U -GENERIC SYN;U x-GENERIC=SYN;U -GENERIC=SYN -FOO=2;"
          "U -GENERIC=SYN '' -SYNATTR=ASSIGN",
          nullptr, nullptr}});
}

TEST(CommandLanguage, Comments) {
    std::vector<Owner> owners = Owners();
    owners.push_back(owners[0]); // again for ADD NOTES, which does what ADD MODULE COMMENT does
    using Row = std::pair<char const *, char const *>;
    for (std::size_t i = 0; i < owners.size(); ++i)
        for (auto const &[words, comment] :
             {Row{"one", "old\none\n"}, Row{"a  b '  c d", "old\na b   c d\n"},
              Row{"'' x", "old\n x\n"}, Row{"a \"\" b", "old\na  b\n"},
              Row{"-- \"x\"", "old\n-- x\n"}, Row{"\"\"", nullptr}}) {
            Owned design;
            Object &object = owners[i].find(design.model);
            object.AddComment("old");
            std::string const keyword = i == 6 ? "ADD NOTES" : owners[i].Words("ADD @ COMMENT");
            std::string const line = keyword + " " + owners[i].Name() + " " + words;
            EXPECT_EQ(comment ? "" : Invalid(keyword), Refusal(design.model, {line})) << line;
            EXPECT_STREQ(comment ? comment : "old\n", object.GetComment()) << line;
            EXPECT_FALSE(design.model.IsModified()) << line;
        }
}

TEST(CommandLanguage, PinsAreOneToken) {
    using Row = std::pair<char const *, char const *>;
    for (auto const &[keyword, arguments] : Language()) {
        if (keyword.find(" PIN ") == std::string::npos)
            continue;
        std::size_t const point = arguments.find('.');
        for (auto const &[pin, message] :
             {Row{"@.a", ""}, Row{"@", nullptr}, Row{"@.", nullptr}, Row{".@", nullptr},
              Row{"'@ A'", nullptr}, Row{"@.A.B", "Pin \"A.B\" not found.\n"},
              Row{"@..A", "Pin \".A\" not found.\n"}, Row{".@.A", "Pin \"A\" not found.\n"}}) {
            std::string const line = keyword + " " +
                                     Owner::Put(pin, '@', arguments.substr(0, point)) +
                                     arguments.substr(point + 2);
            Owned design;
            EXPECT_EQ(message ? message : Invalid(keyword), Refusal(design.model, {line})) << line;
        }
    }
}

TEST(CommandLanguage, Options) {
    // Lines; the options they change; the keyword of the last line, if its arguments are invalid.
    using Row = std::tuple<char const *, char const *, char const *>;
    for (auto const &[text, changed, refused] :
         {Row{"SET PORT ONEPERLINE false x", "", ""},
          Row{"USE ATTRTYPE false x y", "type=1", ""},
          Row{"FLATTEN BUS 0 false", "flat=1", ""},
          Row{"FLATTEN BUS true;FLATTEN BUS False", "", ""},
          Row{"SUPPRESS CONFIGURATION '';SUPPRESS COMPONENT no", "noconfig=1 nocomp=1", ""},
          Row{"SUPPRESS CONFIGURATION;SUPPRESS COMPONENT falsehood;SUPPRESS CONFIGURATION false;"
              "SUPPRESS COMPONENT false",
              "", ""},
          Row{"Set Open Pin false x;USE DEFAULT LIBRARY FALSE", "default=0 open=0", ""},
          Row{"Set Open Pin false;USE DEFAULT LIBRARY false;set open pin;USE DEFAULT LIBRARY 0", "",
              ""},
          Row{"ADD LIBRARY work x;ADD LIBRARY work", "lib=work|work", ""},
          Row{"ADD LIBRARY '' x", "", "ADD LIBRARY"},
          Row{"ADD USE LIBRARY a.b.ALL;ADD INCLUDE 'a b.v' x;ADD INCLUDE c",
              "use=a.b.ALL include=a b.v|c", ""},
          Row{"SET SYNTHESIS synplicity x", "syn=2", ""},
          Row{"SET SYNTHESIS '' EXEMPLAR", "", "SET SYNTHESIS"},
          Row{"UPPERCASE Instance x;UPPERCASE SIGANL", "signal=11 instance=11", ""},
          Row{"UPPERCASE component;UPPERCASE signal", "component=11", "UPPERCASE"},
          Row{"LOWERCASE instance;LOWERCASE Component", "instance=12 component=12", ""},
          Row{"LOWERCASE Signal;LOWERCASE siganl", "signal=12", "LOWERCASE"},
          Row{"Set Application 'a b' c;Set Device d e", "app=a b device=d", ""},
          Row{"Set Command run  it \"a  b\"", "command=run it a  b", ""},
          Row{"set command one;set command '' two", "command= two", ""},
          Row{"Set Purpose b c;SET PURPOSE ''", "purpose=b c", "Set Purpose"},
          Row{"Set Reference 'a' b;Set Reference", "reference=a b", "Set Reference"}}) {
        Design design;
        EXPECT_EQ(*refused ? Invalid(refused) : "", Refusal(design.model, Pieces(text))) << text;
        EXPECT_EQ(changed, Changed(*design.model.GetOptions())) << text;
        EXPECT_FALSE(design.model.IsModified()) << text;
    }
}

TEST(CommandReference, ItsExamplesRunAndItsWrongLinesAreRefusedAsItSays) {
    for (int i = 0; i < CommandReference::GetCount(); ++i) {
        CommandHelp const &help = *CommandReference::GetAt(i);
        SCOPED_TRACE(help.keyword);
        EXPECT_EQ(CommandReference::Find(Lower(help.keyword).c_str()), &help);
        Capture capture;
        Design design;
        design.model.SetWriteOpener(&capture);
        StringArray const lines(help.example, "\n", true, nullptr);
        for (int line = 0; line < lines.GetSize(); ++line)
            EXPECT_EQ(Refusal(design.model, {lines.GetAt(line).GetText()}), "");
        EXPECT_EQ(design.model.GetCommandManager()->GetDoneCommandCount(), lines.GetSize());
        std::string const expected = help.message + std::string(*help.message ? "\n" : "");
        EXPECT_EQ(Refusal(design.model, {help.wrong}), expected);
        EXPECT_EQ(help.words, Tokens(help.keyword).GetSize());
        EXPECT_EQ(CommandReference::FindFor(Tokens(Lower(help.keyword) + " x")), &help);
        EXPECT_EQ(CommandReference::FindFor(Tokens("'" + Lower(help.keyword) + "'")), &help);
    }
    for (auto const &[keyword, arguments] : Language()) {
        CommandHelp const &help = *CommandReference::Find(keyword.c_str());
        auto const required = std::count_if(help.arguments.begin(), help.arguments.end(),
                                            [](Argument const &each) { return !each.optional; });
        EXPECT_EQ(required, Tokens(arguments).GetSize()) << keyword;
    }
    EXPECT_EQ(CommandReference::GetAt(-1), nullptr);
    EXPECT_EQ(CommandReference::GetAt(CommandReference::GetCount()), nullptr);
    EXPECT_EQ(CommandReference::Find("ADD"), nullptr);
    EXPECT_EQ(CommandReference::FindFor(Tokens("ADD x")), nullptr);
}

TEST(PinReference, SplitsAtTheFirstPointAfterTheFirstOtherCharacter) {
    using Row = std::tuple<char const *, char const *, char const *>;
    for (auto const &[token, holder, pin] :
         {Row{"u.A", "u", "A"}, Row{"u.A.B", "u", "A.B"}, Row{"u..", "u", "."},
          Row{".u.D(7:0)", ".u", "D(7:0)"}, Row{"..u.A", "..u", "A"}, Row{"u", "-", "-"},
          Row{"u.", "-", "-"}, Row{".u", "-", "-"}, Row{"..", "-", "-"}, Row{"", "-", "-"}}) {
        std::string left = "-";
        std::string right = "-";
        EXPECT_EQ(SplitPinReference(token, left, right), *holder != '-') << token;
        EXPECT_EQ(left, holder) << token;
        EXPECT_EQ(right, pin) << token;
    }
    EXPECT_EQ(FindPinPoint(".u."), 2U); // the pin may still be missing
}

} // namespace
