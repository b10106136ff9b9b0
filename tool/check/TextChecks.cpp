// Texts that go into the files as they are: comments, fields of the header, attribute values and
// include paths.

#include "tool/check/Attributes.h"
#include "tool/check/WrittenText.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

/// What the readers of a language allow in strings and comments. VHDL-93 reads Latin-1 and allows
/// no control characters but tabs, and these outside of strings. In Verilog a carriage return ends
/// the line.
bool IsRefused(char c, Languages language, bool inString) {
    auto const code = static_cast<unsigned char>(c);
    if (language == VERILOG)
        return c == '\r';
    return code < ' ' ? c != '\t' || inString : code >= 0x7F && code < 0xA0;
}

/// A comment that tools of synthesis or lint take for a directive.
Languages DirectiveIn(std::string_view comment) {
    std::vector<std::string> const words = WordsOf(comment);
    if (words.size() < 2)
        return NO_LANGUAGE;
    auto const is = [](std::string const &word, std::initializer_list<char const *> known) {
        return std::any_of(known.begin(), known.end(),
                           [&word](char const *one) { return SameIgnoringCase(word, one); });
    };
    if (is(words[0], {"verilator"}))
        return VERILOG;
    bool const isTool = is(words[0], {"synopsys", "synthesis", "pragma", "exemplar", "cadence",
                                      "ambit", "rtl_synthesis"});
    bool const isSwitch = is(
        words[1], {"translate_off", "translate_on", "synthesis_off", "synthesis_on", "off", "on"});
    return isTool && isSwitch ? BOTH : NO_LANGUAGE;
}

class TextChecker {
public:
    explicit TextChecker(Design const &checked) : design(checked), options(checked.options) {}

    void Run() {
        CheckComment(design.netlist, "design", BOTH);
        bool const isDeclared = !options.vhdlOption.suppressComponent;
        design.ForEachUsedComponent([&](Component const *component) {
            CheckComment(*component, "component", isDeclared ? BOTH : VERILOG);
        });
        design.ForEachInstance(
            [&](Instance const *instance) { CheckComment(*instance, "instance", BOTH); });
        design.ForEachSignal([&](Signal const *signal) {
            if (signal->HasComment() && signal->IsNeededToDeclared())
                CheckComment(*signal, signal->IsPort() ? "port" : "net",
                             signal->IsPort() ? VERILOG : BOTH);
        });
        if (options.writeHeader)
            CheckHeader();
        ForEachAttribute(design, [this](AttributeUse const &use) { CheckAttribute(use); });
        CheckIncludes();
    }

private:
    void AddRefused(std::string_view text, bool inString, Languages languages, CompactLocation spot,
                    std::string const &subject) {
        for (Languages const language : {VHDL, VERILOG}) {
            auto const found = std::find_if(
                text.begin(), text.end(), [&](char c) { return IsRefused(c, language, inString); });
            if ((languages & language) == 0 || found == text.end())
                continue;
            constexpr char const *DIGITS = "0123456789ABCDEF";
            auto const code = static_cast<unsigned char>(*found);
            design.findings.Add({Id::TEXT_CHARACTER,
                                 spot,
                                 subject,
                                 {},
                                 language,
                                 std::string("the byte ") + DIGITS[code / 16] + DIGITS[code % 16]});
        }
    }

    void AddDirective(std::string_view line, Languages languages, CompactLocation spot,
                      std::string const &subject) {
        if (Languages const readers = DirectiveIn(line) & languages)
            design.findings.Add({Id::DIRECTIVE_COMMENT,
                                 spot,
                                 subject,
                                 {},
                                 readers,
                                 Quoted(WordsOf(line)[0] + " " + WordsOf(line)[1])});
    }

    /// A command adds one line of a comment.
    void CheckComment(Object const &object, char const *kind, Languages languages) {
        if (!object.HasComment())
            return;
        Text const comment = object.GetComment();
        std::string_view rest = comment.View();
        auto const count = static_cast<int>(std::count(rest.begin(), rest.end(), '\n'));
        std::string const subject =
            std::string("comment of ") + kind + " " + Quoted(object.GetNameRef().View());
        for (CompactLocation const spot : design.TextsAt(&object, count)) {
            std::string_view const line = rest.substr(0, rest.find('\n'));
            rest.remove_prefix(line.size() + 1);
            AddRefused(line, false, languages, spot, subject);
            AddDirective(line, languages, spot, subject);
        }
    }

    void CheckHeader() {
        auto const check = [this](Text const &field, char const *name) {
            AddRefused(field.View(), false, BOTH, design.TextAt(&field),
                       std::string(name) + " in the header");
        };
        check(options.application, "the application");
        check(options.commandStr, "the command");
        check(options.device, "the device");
        check(options.purpose, "the purpose");
        check(options.reference, "the reference");
        CheckSentences(options.purpose, "the purpose in the header");
        CheckSentences(options.reference, "the reference in the header");
    }

    /// Whether a text needs a closer look, which most do not.
    static bool IsDoubtful(std::string_view text) {
        return std::any_of(text.begin(), text.end(),
                           [](char c) { return c < ' ' || c > '~' || c == '*'; });
    }

    /// Free texts of the header are wrapped: any word may come first on a line. Of the lines of a
    /// header only those of the text can be directives.
    void CheckSentences(Text const &text, char const *subject) {
        if (text.IsEmpty())
            return;
        std::string const header = WrittenText::Plain([&text](OutStream &stream) {
            NetlistHeader("", "", "", "", "", text, "", true, stream).Write("");
        });
        constexpr std::size_t MARK = 2;
        for (std::size_t begin = 0, end = 0; begin < header.size(); begin = end + 1) {
            end = std::min(header.find('\n', begin), header.size());
            AddDirective(std::string_view(header).substr(begin, end - begin).substr(MARK), BOTH,
                         design.TextAt(&text), subject);
        }
    }

    void CheckAttribute(AttributeUse const &use) {
        Attribute const &attribute = *use.attribute;
        Attribute::ValueType const type = attribute.GetValueType();
        bool const isText = type == Attribute::VALUE_STRING || type == Attribute::VALUE_USER ||
                            type == Attribute::VALUE_BIT_VECTOR;
        Text const value = isText ? attribute.GetValueString() : Text();
        if (!IsDoubtful(value.View()) && !IsDoubtful(attribute.GetNameRef().View()))
            return;
        CompactLocation spot = design.MadeAt(&attribute);
        if (spot.line == 0)
            spot = design.MadeAt(use.owner);
        std::string const subject = "attribute " + Quoted(attribute.GetNameRef().View()) + " of " +
                                    Quoted(use.owner->GetNameRef().View());
        bool const isTyped = use.generic || options.vhdlOption.useAttrType;
        bool const isLeftOut =
            use.kind == AttributeUse::COMPONENT && options.vhdlOption.suppressComponent;
        if (!isLeftOut)
            AddRefused(value.View(), !isTyped || type == Attribute::VALUE_STRING, VHDL, spot,
                       subject);
        using VerilogOption = HdlOptions::VerilogOption;
        auto const tool = options.verilogOption.synthesisType;
        bool const inBlock = tool == VerilogOption::SYNTHESIS_SYNPLICITY ||
                             tool == VerilogOption::SYNTHESIS_SYNOPSYS;
        if (use.generic || (!inBlock && tool != VerilogOption::SYNTHESIS_VERILOG2001))
            AddRefused(value.View(), use.generic, VERILOG, spot, subject);
        auto const endsComment = [](Text const &text) {
            return text.View().find("*/") != std::string_view::npos;
        };
        if (!use.generic && inBlock && (endsComment(value) || endsComment(attribute.GetNameRef())))
            design.findings.Add({Id::COMMENT_END, spot, subject});
    }

    void CheckIncludes() {
        StringArray const &includes = options.verilogOption.includes;
        std::vector<CompactLocation> const spots = design.TextsAt(&includes, includes.GetSize());
        WrittenText lines; // empty if none may fold
        lines.Add(0, [&includes](OutStream &stream) {
            VerilogStatements(stream).WriteIncludePath(includes);
        });
        lines.ReadFolds();
        std::size_t end = 0;
        for (int i = 0; i < includes.GetSize(); ++i) {
            CompactLocation const spot = spots[static_cast<std::size_t>(i)];
            Text const path = HdlUtilities::RemoveQuotes(includes.At(i));
            std::string const subject = "include file " + Quoted(path.View());
            std::size_t const begin = end;
            end = std::min(lines.GetPlain().find('\n', begin), lines.GetPlain().size());
            if (lines.IsFoldedWithin({begin, end++}) ||
                path.View().find('"') != std::string_view::npos)
                design.findings.Add({Id::INCLUDE_PATH, spot, subject});
            AddRefused(path.View(), true, VERILOG, spot, subject);
        }
    }

    Design const &design;
    HdlOptions const &options;
};

} // namespace

void CheckTexts(Design const &design) { TextChecker(design).Run(); }

Languages RefusedInComment(std::string_view text) {
    Languages languages = NO_LANGUAGE;
    for (char const c : text)
        for (Languages const language : {VHDL, VERILOG})
            languages |= IsRefused(c, language, false) ? language : NO_LANGUAGE;
    return languages;
}

} // namespace Checks
