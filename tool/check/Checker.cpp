#include "tool/check/Checker.h"

#include <cstring>
#include <memory>
#include <utility>

#include "tool/check/Rewriting.h"
#include "tool/diagnostics/RefusalExplainer.h"
#include "tool/diagnostics/Words.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

/// The language that the command writes.
Languages LanguageOf(CommandHelp const &command) {
    return std::strcmp(command.keyword, "WRITE VHDL") == 0      ? VHDL
           : std::strcmp(command.keyword, "WRITE VERILOG") == 0 ? VERILOG
                                                                : NO_LANGUAGE;
}

} // namespace

std::optional<Diagnostic> Checker::RunLine(std::string const &line, SourceRange const &place) {
    std::uint32_t const number = places.NextLine(line);
    tokens.Read(line);
    CommandHelp const *const command = CommandReference::FindFor(tokens.GetTokens());
    if (command && LanguageOf(*command) != NO_LANGUAGE && line.find('\0') == std::string::npos)
        return PassWrite(line, place, number, *command);
    if (tokens.GetSize() > 0) {
        changed = true;
        RewriteDesign();
    }
    // What happens while lines run concerns whatever will be written.
    findings.SetLanguages(RequestedOr(BOTH));
    recorder.Before(tokens, command, command ? command->words : 0, number);
    std::optional<Diagnostic> diagnostic = session.RunLine(line, tokens.GetTokens(), place);
    recorder.After(!diagnostic);
    return diagnostic;
}

void Checker::Finish(std::function<void(Diagnostic &)> const &show) {
    if (changed)
        CheckDesign(RequestedOr(written != NO_LANGUAGE ? written : BOTH));
    findings.Show(places, show);
}

/// A line that writes: its arguments are read and what it would write is checked. The design stays
/// as it is until the next line: most often there is none, and no text need be made.
std::optional<Diagnostic> Checker::PassWrite(std::string const &line, SourceRange const &place,
                                             std::uint32_t number, CommandHelp const &command) {
    WriteArguments arguments;
    if (!arguments.Parse(tokens.GetTokens(), command.words)) {
        Basis::Exception refusal("DesignEntry", "Checker", "", __LINE__);
        refusal.setDescription("%s: Invalid Arguments.\n", command.keyword)
            .setKind(Exception::INVALID_ARGUMENTS, command.keyword);
        return ExplainRefusal(line, place, refusal, session.GetModel());
    }
    Languages const language = LanguageOf(command);
    written |= language;
    changed = false;
    findings.SetLanguages(RequestedOr(language));
    // Each line says whether there is a header.
    session.GetModel().GetOptions()->writeHeader = arguments.writeHeader;
    CheckWriteLine(number, command.words, arguments);
    CheckDesign(RequestedOr(language));
    lastWrites.push_back(line);
    writesVhdl |= language == VHDL;
    return std::nullopt;
}

/// What the lines that wrote did to the design, for the first line after them: most often there
/// is none.
void Checker::RewriteDesign() {
    for (std::string const &line : std::exchange(lastWrites, {}))
        Rewrite(session, DesignNow(), places, line);
    writesVhdl = false;
}

void Checker::CheckWriteLine(std::uint32_t number, int first, WriteArguments const &arguments) {
    int const file = arguments.fileToken;
    auto const add = [&](Id id, int token) {
        findings.Add({id, LocationOf(tokens, token, number), Quoted(tokens.At(token))});
    };
    if (tokens.At(file).substr(0, 1) == "-")
        add(Id::WRITE_FILE_NAME, file);
    for (int token = first; token < tokens.GetSize(); ++token)
        if (token > file || (token < file && Vocabulary::IndexOf(Vocabulary::WRITE_OPTIONS,
                                                                 tokens.GetTokens().At(token)) < 0))
            add(Id::WRITE_OPTION, token);
    std::string_view const path = tokens.At(file);
    Languages const readers = RefusedInComment(path.substr(path.rfind('/') + 1));
    if (arguments.writeHeader && readers != NO_LANGUAGE)
        findings.Add({Id::TEXT_CHARACTER,
                      LocationOf(tokens, file, number),
                      "file name " + Quoted(path) + " in the header",
                      {},
                      readers});
}

void Checker::CheckDesign(Languages languages) {
    findings.SetLanguages(languages);
    Design const design = DesignNow();
    CheckNames(design);
    CheckMadeNets(design, writesVhdl);
    CheckNets(design);
    CheckPins(design);
    CheckConnections(design);
    CheckConstants(design);
    CheckAttributes(design);
    CheckMacro(design);
    CheckTexts(design);
}

} // namespace Checks
