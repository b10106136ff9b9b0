// The command line of `check`, and the loop over its files. What is found is decided in tool/check.

#include "tool/commands/CheckCommand.h"

#include <algorithm>
#include <cstring>
#include <iostream>
#include <memory>
#include <new>
#include <streambuf>
#include <tuple>

#include <CLI/CLI.hpp>

#include "tool/check/Checker.h"
#include "tool/session/LineReader.h"
#include "tool/session/Signals.h"

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
    LimitOptions limits;
    ReportOptions report;
};

/// Whether a check is switched off: by --off, or by --only for others.
bool IsOff(CheckOptions const &options, Checks::Row const &row) {
    auto const isIn = [&row](std::vector<std::string> const &names) {
        return std::find(names.begin(), names.end(), row.name) != names.end();
    };
    return isIn(options.off) || (!options.only.empty() && !isIn(options.only));
}

/// Standard error up to a limit. The first message that would pass it is left out as a whole, and
/// so are all that follow: half a JSON object would be of no use.
class LimitedError : public std::streambuf {
public:
    /// The most bytes; 0 for no limit.
    explicit LimitedError(unsigned long long bytes) : most(bytes) {}
    bool IsBeyondLimit() const { return beyondLimit; }

protected:
    std::streamsize xsputn(char const *text, std::streamsize size) override {
        written += static_cast<unsigned long long>(size);
        beyondLimit |= most > 0 && written > most;
        return beyondLimit ? size : std::cerr.rdbuf()->sputn(text, size);
    }
    int overflow(int c) override {
        char const text = static_cast<char>(c);
        return xsputn(&text, 1) == 1 ? c : EOF;
    }

private:
    unsigned long long most;
    unsigned long long written = 0;
    bool beyondLimit = false;
};

int CheckFiles(CheckOptions const &options, LimitedError &output, SourceRange &place) {
    Checks::Languages const requested = options.language == "vhdl"      ? Checks::VHDL
                                        : options.language == "verilog" ? Checks::VERILOG
                                        : options.language == "both"    ? Checks::BOTH
                                                                        : Checks::NO_LANGUAGE;
    std::ostream stream(&output);
    Reporter reporter(stream, options.report.GetStyle());
    // Never deleted: the system frees the memory of a process faster than the destructors of a
    // million objects. The pointer is kept ("used") so that a leak checker still reaches the
    // design.
    [[gnu::used]] static Checks::Checker *lasting = nullptr;
    Checks::Checker &checker = *(lasting = new Checks::Checker(options.modelName, requested));
    for (Checks::Row const &row : Checks::All())
        if (IsOff(options, row))
            checker.SwitchOff(row.id);

    auto const refuse = [&reporter](Diagnostic const &diagnostic) { reporter.Report(diagnostic); };
    for (std::string const &file : options.files) {
        LineReader reader(file);
        place = {file == STANDARD_STREAM ? "<stdin>" : file};
        checker.BeginFile(file, place.file);
        std::string line;
        while (!output.IsBeyondLimit() && reader.Next(line)) {
            ++place.line;
            // A refused line is reported and the check goes on: what follows may be wrong because
            // of it, but most is not.
            if (auto const diagnostic = checker.RunLine(line, place))
                refuse(*diagnostic);
        }
        if (reader.GetError() != 0)
            refuse(
                About(place.file, std::string("cannot read: ") + std::strerror(reader.GetError())));
    }
    checker.Finish([&](Diagnostic &finding) {
        if (options.strict)
            finding.severity = Severity::ERROR;
        reporter.ReportNext(finding);
    });
    if (reporter.GetErrorCount() + reporter.GetWarningCount() > 0)
        reporter.ReportCount();
    return reporter.GetErrorCount() > 0 ? SOMETHING_REFUSED : ALL_WELL;
}

int Check(CheckOptions const &options) {
    ReportStyle const style = options.report.GetStyle();
    Signals::EndProgram(EndMessages(style, "", ""));
    Reporter reporter(std::cerr, style);
    LimitedError output(options.limits.output);
    MemoryLimit memory(options.limits.memory);
    SourceRange place;
    int exitCode = SOMETHING_REFUSED;
    try {
        memory.Apply();
        exitCode = CheckFiles(options, output, place);
    } catch (std::bad_alloc const &) {
        memory.Lift();
        reporter.Report(OutOfMemory(place, memory));
    }
    memory.Lift();
    if (!output.IsBeyondLimit())
        return exitCode;
    reporter.Report(About("vesk-hdl", "the messages would pass the " +
                                          SizeText(options.limits.output) +
                                          " that --max-output allows; allow more, or leave "
                                          "findings out with --off"));
    return SOMETHING_REFUSED;
}

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
            std::cout << row.name << " (" << language << ")\n  ... " << row.sentence
                      << "\n  hint: " << row.hint << '\n';
    }
    return ALL_WELL;
}

} // namespace

void AddCheckCommand(CLI::App &app, Action &action) {
    CLI::App &check = *app.add_subcommand(
        "check", "Report what will be illegal, wrong or suspicious in the written text");
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
    AddLimitOptions(check, options->limits);
    AddReportOptions(check, options->report);
    check.callback([options, &action] {
        if (!options->list && options->files.empty())
            throw CLI::RequiredError("FILE");
        action = [options] { return options->list ? List(options->markdown) : Check(*options); };
    });
}
