#include "tool/check/Checker.h"

#include <cstring>
#include <memory>
#include <utility>

#include "tool/check/Rewriting.h"
#include "tool/diagnostics/RefusalExplainer.h"
#include "tool/diagnostics/Words.h"

using namespace Vesk_Hdl;

namespace Checks {

std::optional<Diagnostic> Checker::RunLine(std::string const &line, Place const &place) {
    std::uint32_t const number = places.NextLine(line);
    tokens.Read(line);
    CommandHelp const *const command = CommandReference::FindFor(tokens.GetTokens());
    bool const isVhdl = command && std::strcmp(command->keyword, "WRITE VHDL") == 0;
    bool const isVerilog = command && std::strcmp(command->keyword, "WRITE VERILOG") == 0;
    if ((isVhdl || isVerilog) && line.find('\0') == std::string::npos)
        return PassWrite(line, place, number, isVhdl ? VHDL : VERILOG);
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

/// A line that writes: its arguments are read and what it would write is checked.
std::optional<Diagnostic> Checker::PassWrite(std::string const &line, Place const &place,
                                             std::uint32_t number, Languages language) {
    std::unique_ptr<Command> const command(
        factory.CreateCommand(&session.GetModel(), tokens.GetTokens()));
    if (!command->ParseArguments(tokens.GetTokens())) {
        Basis::Exception refusal("DesignEntry", "Checker", "", __LINE__);
        refusal.setDescription("%s: Invalid Arguments.\n", command->GetKeyword())
            .setKind(Exception::INVALID_ARGUMENTS, command->GetKeyword());
        return ExplainRefusal(line, place, refusal, session.GetModel());
    }
    written |= language;
    changed = false;
    findings.SetLanguages(RequestedOr(language));
    CheckWriteLine(number);
    CheckDesign(RequestedOr(language));
    lastWrites.push_back(line);
    writesVhdl |= language == VHDL;
    return std::nullopt;
}

/// What the lines that wrote did to the design, for the first line behind them: most often there
/// is none.
void Checker::RewriteDesign() {
    for (std::string const &line : std::exchange(lastWrites, {}))
        Rewrite(session, DesignNow(), places, line);
    writesVhdl = false;
}

/// The number of tokens alone tells which one names the file. Each line says whether there is a
/// header.
void Checker::CheckWriteLine(std::uint32_t number) {
    constexpr int FIRST = 2;
    int const size = tokens.GetSize();
    int const file = size == FIRST + 2 || size == FIRST + 3 ? size - 1 : FIRST;
    auto const add = [&](Id id, int token) {
        findings.Add({id, SpotOf(tokens, token, number), Quoted(tokens.At(token))});
    };
    if (tokens.At(file).substr(0, 1) == "-")
        add(Id::WRITE_FILE_NAME, file);
    bool &writeHeader = session.GetModel().GetOptions()->writeHeader;
    writeHeader = true;
    for (int token = FIRST; token < size; ++token) {
        auto const is = [&](char const *word) { return SameIgnoringCase(tokens.At(token), word); };
        writeHeader &= token >= file || !is("-NOHEADER");
        bool const known = is("-APPEND") || is("-OVERWRITE") || is("-NOHEADER");
        if (token > file || (token < file && !known))
            add(Id::WRITE_OPTION, token);
    }
    std::string_view const path = tokens.At(file);
    Languages const readers = RefusedInComment(path.substr(path.rfind('/') + 1));
    if (writeHeader && readers != NO_LANGUAGE)
        findings.Add({Id::TEXT_CHARACTER,
                      SpotOf(tokens, file, number),
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
