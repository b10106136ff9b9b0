#include "tool/commands/CheckCommand.h"

#include <cstring>
#include <iostream>
#include <memory>
#include <tuple>

#include <CLI/CLI.hpp>

#include "tool/check/Design.h"
#include "tool/check/Rewriting.h"
#include "tool/diagnostics/Blame.h"
#include "tool/session/LineReader.h"
#include "tool/session/Session.h"

using namespace Vesk_Hdl;

namespace {

/// What `vesk-hdl check` was asked for.
struct CheckOptions {
    std::vector<std::string> files; ///< in order
    std::string modelName;
    std::string language; ///< "vhdl", "verilog", "both"; empty for what the WRITE lines write
    std::vector<std::string> off;
    std::vector<std::string> only;
    bool strict = false;
    bool list = false;
    bool markdown = false;
    ReportOptions report;
};

/// The lines of all files on one design, and the checks at each line that writes.
class CheckRun {
public:
    explicit CheckRun(CheckOptions const &checkOptions)
        : options(checkOptions), reporter(std::cerr, checkOptions.report.GetStyle()),
          session(checkOptions.modelName), findings(checkOptions.strict),
          recorder(session.GetModel(), places, findings) {
        for (Checks::Row const &row : Checks::All()) {
            auto const isIn = [&row](std::vector<std::string> const &names) {
                return std::find(names.begin(), names.end(), row.name) != names.end();
            };
            if (isIn(options.off) || (!options.only.empty() && !isIn(options.only)))
                findings.SwitchOff(row.id);
        }
        requested = options.language == "vhdl"      ? Checks::VHDL
                    : options.language == "verilog" ? Checks::VERILOG
                    : options.language == "both"    ? Checks::BOTH
                                                    : Checks::NO_LANGUAGE;
    }

    int Run() {
        for (std::string const &file : options.files)
            RunFile(file);
        if (changed) {
            Checks::Languages const all = written != Checks::NO_LANGUAGE ? written : Checks::BOTH;
            CheckDesign(requested != Checks::NO_LANGUAGE ? requested : all);
        }
        findings.Deliver(reporter, places);
        if (reporter.GetErrorCount() + reporter.GetWarningCount() > 0)
            reporter.ReportCount();
        return failed || reporter.GetErrorCount() > 0 ? SOMETHING_REFUSED : ALL_WELL;
    }

private:
    void RunFile(std::string const &file) {
        LineReader reader(file);
        Place place{file == STANDARD_STREAM ? "<stdin>" : file};
        places.BeginFile(file, place.file);
        std::string line;
        while (reader.Next(line)) {
            ++place.line;
            RunLine(line, place);
        }
        if (reader.GetError() == 0)
            return;
        Refuse(About(place.file, std::string("cannot read: ") + std::strerror(reader.GetError())));
    }

    void Refuse(Diagnostic const &diagnostic) {
        failed = true;
        reporter.Report(diagnostic);
    }

    void RunLine(std::string const &line, Place const &place) {
        std::uint32_t const number = places.NextLine();
        LineTokens const tokens(line);
        int words = 0;
        CommandHelp const *const command = KeywordOf(tokens.GetTokens(), words);
        bool const isVhdl = command && std::strcmp(command->keyword, "WRITE VHDL") == 0;
        bool const isVerilog = command && std::strcmp(command->keyword, "WRITE VERILOG") == 0;
        if ((isVhdl || isVerilog) && line.find('\0') == std::string::npos) {
            PassWrite(line, place, tokens, number, isVhdl ? Checks::VHDL : Checks::VERILOG);
            return;
        }
        if (tokens.GetSize() > 0) {
            changed = true;
            RewriteDesign();
        }
        // What happens while lines run concerns whatever will be written.
        findings.SetLanguages(requested != Checks::NO_LANGUAGE ? requested : Checks::BOTH);
        recorder.Before(tokens, command, words, number);
        std::optional<Diagnostic> const diagnostic = session.RunLine(line, place);
        recorder.After(!diagnostic);
        if (diagnostic)
            Refuse(*diagnostic);
    }

    /// A line that writes: its arguments are read and what it would write is checked.
    void PassWrite(std::string const &line, Place const &place, LineTokens const &tokens,
                   std::uint32_t number, Checks::Languages language) {
        std::unique_ptr<Command> const command(
            factory.CreateCommand(&session.GetModel(), tokens.GetTokens()));
        if (!command->ParseArguments(tokens.GetTokens())) {
            std::string const text = std::string(command->GetKeyword()) + ": Invalid Arguments.";
            Refuse(BlameRefusal(line, place, text, session.GetModel()));
            return;
        }
        written |= language;
        changed = false;
        findings.SetLanguages(requested != Checks::NO_LANGUAGE ? requested : language);
        CheckWriteLine(tokens, number);
        CheckDesign(requested != Checks::NO_LANGUAGE ? requested : language);
        lastWritten |= language;
    }

    /// What the lines that wrote did to the design, for the first line behind them: most often
    /// there is none.
    void RewriteDesign() {
        for (Checks::Languages const language : {Checks::VHDL, Checks::VERILOG})
            if ((lastWritten & language) != 0)
                Checks::Rewrite(session.GetModel(), DesignNow(), places, language);
        lastWritten = Checks::NO_LANGUAGE;
    }

    Checks::Design DesignNow() {
        return Checks::Design(session.GetModel(), places, recorder, findings);
    }

    /// The number of tokens alone tells which one names the file.
    void CheckWriteLine(LineTokens const &tokens, std::uint32_t number) {
        constexpr int FIRST = 2;
        int const size = tokens.GetSize();
        int const file = size == FIRST + 2 || size == FIRST + 3 ? size - 1 : FIRST;
        auto const add = [&](Checks::Id id, int token) {
            findings.Add({id,
                          {number, static_cast<std::uint16_t>(tokens.GetColumn(token)),
                           static_cast<std::uint16_t>(tokens.GetLength(token))},
                          Checks::Quote(tokens.At(token))});
        };
        if (tokens.At(file).substr(0, 1) == "-")
            add(Checks::Id::WRITE_FILE_NAME, file);
        for (int token = FIRST; token < size; ++token) {
            auto const is = [&](char const *word) {
                return Checks::SameFolded(tokens.At(token), word);
            };
            bool const known = is("-APPEND") || is("-OVERWRITE") || is("-NOHEADER");
            if (token > file || (token < file && !known))
                add(Checks::Id::WRITE_OPTION, token);
        }
    }

    void CheckDesign(Checks::Languages languages) {
        findings.SetLanguages(languages);
        Checks::Design const design = DesignNow();
        Checks::CheckNames(design);
        Checks::CheckNets(design);
        Checks::CheckPins(design);
        Checks::CheckConnections(design);
        Checks::CheckConstants(design);
        Checks::CheckAttributes(design);
    }

    CheckOptions const &options;
    Reporter reporter;
    Session session;
    CommandFactory factory;
    Checks::Places places;
    Checks::Findings findings;
    Checks::Recorder recorder;
    Checks::Languages requested = Checks::NO_LANGUAGE;
    Checks::Languages written = Checks::NO_LANGUAGE;
    Checks::Languages lastWritten = Checks::NO_LANGUAGE; ///< and not yet rewritten for it
    bool changed = false;                                ///< since the last line that wrote
    bool failed = false;
};

int List(bool asMarkdown) {
    if (asMarkdown)
        std::cout
            << "# What `vesk-hdl check` looks for\n\n"
               "This page is what `vesk-hdl check --list --markdown` prints. A finding begins "
               "with what was found and\ngoes on as the third column says; it may concern "
               "fewer languages than the second column names.\n\n"
               "| Check | Language | What was found ... | What to do |\n|---|---|---|---|\n";
    for (Checks::Row const &row : Checks::All()) {
        char const *const language = Checks::NameOf(row.languages);
        if (asMarkdown)
            std::cout << "| `" << row.name << "` | " << language << " | ... " << row.sentence
                      << " | " << row.hint << " |\n";
        else
            std::cout << row.name << " (" << language << ", "
                      << (row.severity == Severity::ERROR ? "error" : "warning") << ")\n  ... "
                      << row.sentence << "\n  hint: " << row.hint << '\n';
    }
    return ALL_WELL;
}

} // namespace

void AddCheckCommand(CLI::App &app, Action &action) {
    CLI::App &check = *app.add_subcommand(
        "check", "Tell what will be illegal, wrong or suspicious in the written text");
    auto const options = std::make_shared<CheckOptions>();
    check.add_option("FILE", options->files, "Command files, in order; '-' is standard input");
    AddModelOption(check, options->modelName);
    check
        .add_option("--language", options->language,
                    "Language of the text; without it those that the WRITE lines write")
        ->check(CLI::IsMember({"vhdl", "verilog", "both"}));
    check.add_flag("--strict", options->strict, "Findings are errors: the exit code is 1");
    CLI::Validator const isName(
        [](std::string const &name) {
            return Checks::Find(name) ? std::string()
                                      : name + ": no such check; --list names all of them";
        },
        "NAME");
    for (auto const &[name, names, what] :
         {std::tuple{"--off", &options->off, "Checks to leave out"},
          std::tuple{"--only", &options->only, "Checks to make, and no others"}})
        check.add_option(name, *names, what)
            ->allow_extra_args(false)
            ->delimiter(',')
            ->check(isName);
    check.add_flag("--list", options->list, "List all checks and do nothing else");
    check.add_flag("--markdown", options->markdown, "List them as a page")->needs("--list");
    AddReportOptions(check, options->report);
    check.callback([options, &action] {
        if (!options->list && options->files.empty())
            throw CLI::RequiredError("FILE");
        action = [options] {
            return options->list ? List(options->markdown) : CheckRun(*options).Run();
        };
    });
}
