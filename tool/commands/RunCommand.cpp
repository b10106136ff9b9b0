// The command line of `run`, and one run from the first line to the last file.

#include "tool/commands/RunCommand.h"

#include <cstring>
#include <filesystem>
#include <iostream>
#include <memory>
#include <new>
#include <sys/resource.h>
#include <system_error>

#include <CLI/CLI.hpp>

#include "tool/diagnostics/Format.h"
#include "tool/diagnostics/RefusalExplainer.h"
#include "tool/session/LineReader.h"
#include "tool/session/OutputFiles.h"
#include "tool/session/Progress.h"
#include "tool/session/Session.h"
#include "tool/session/Signals.h"

using namespace Vesk_Hdl;
namespace fs = std::filesystem;

namespace {

/// The memory, and the output, of a restricted run: several times what a design of a million
/// instances takes.
constexpr unsigned long long RESTRICTED_LIMIT = 4ULL << 30;

/// What `vesk-hdl run` was asked for.
struct RunOptions : SessionOptions {
    std::vector<std::string> files; ///< in order
    std::string vhdlFile;
    std::string verilogFile;
    Restriction restriction;
    std::string progress = "auto";
    bool keepGoing = false;
    bool stats = false;
    bool quiet = false;
    ReportOptions report;
};

/// The absolute name of a file, which stays right when the current folder changes.
std::string ToAbsolute(std::string const &file) {
    if (file.empty() || file == STANDARD_STREAM)
        return file;
    std::error_code error;
    fs::path const path = fs::absolute(file, error);
    return error ? file : path.string();
}

/// The bytes of all files, 0 if one of them has no size that is known.
unsigned long long SizeOf(std::vector<std::string> const &files) {
    unsigned long long total = 0;
    for (std::string const &file : files) {
        std::error_code error;
        std::uintmax_t const size = fs::file_size(file, error);
        if (error)
            return 0;
        total += size;
    }
    return total;
}

/// The file of --vhdl or --verilog is neither an input nor the other one.
void RefuseToOverwrite(RunOptions const &options) {
    InputFiles inputs;
    for (std::string const &file : options.files)
        inputs.Add(file);
    for (std::string const &output : {options.vhdlFile, options.verilogFile})
        if (output != STANDARD_STREAM && inputs.Holds(output))
            throw CLI::ValidationError(output, "is an input, too");
    // A terminal and the null device take the text of both languages.
    std::error_code error;
    if (!fs::is_character_file(options.vhdlFile, error) &&
        IsSamePlace(options.vhdlFile, options.verilogFile))
        throw CLI::ValidationError(options.verilogFile, "is to hold the VHDL, too");
}

/// One run, from the first line to the last file.
class Runner {
public:
    explicit Runner(RunOptions const &runOptions)
        : options(runOptions), reporter(std::cerr, StyleOf(runOptions)),
          progress(WhenOf(runOptions), SizeOf(runOptions.files)), memory(runOptions.limits.memory) {
    }

    int Run() {
        Signals::EndProgram(
            EndMessages(StyleOf(options), progress.GetEraser(),
                        "; files that were complete stay, others are as they were"));
        bool good = false;
        try {
            memory.Apply();
            good = Prepare() && RunFiles();
            // With --keep-going the files are written in spite of refused lines: the user asked for
            // what can be had.
            if (good || (session && options.keepGoing && !outputs.IsBeyondLimit()))
                good &= WriteFiles();
        } catch (std::bad_alloc const &) {
            memory.Lift();
            good = Fail(OutOfMemory(place, memory));
        }
        memory.Lift();
        progress.Clear();
        if (options.keepGoing && reporter.GetErrorCount() > 0 && !options.quiet)
            reporter.ReportCount();
        if (options.stats && session)
            PrintStats();
        return good ? ALL_WELL : SOMETHING_REFUSED;
    }

private:
    static ReportStyle StyleOf(RunOptions const &options) {
        ReportStyle style = options.report.GetStyle();
        style.brief = options.quiet;
        return style;
    }

    static Progress::When WhenOf(RunOptions const &options) {
        return options.quiet || options.progress == "never" ? Progress::NEVER
               : options.progress == "always"               ? Progress::ALWAYS
                                                            : Progress::AUTO;
    }

    bool Fail(Diagnostic const &diagnostic) {
        progress.Clear();
        reporter.Report(diagnostic);
        return false;
    }

    /// Makes names absolute, enters the output folder and makes the design.
    bool Prepare() {
        // First, as the names are relative to the folder from which the user started the tool.
        for (std::string const &file : options.files)
            paths.push_back(ToAbsolute(file));
        options.vhdlFile = ToAbsolute(options.vhdlFile);
        options.verilogFile = ToAbsolute(options.verilogFile);
        try {
            if (!options.restriction.folder.empty())
                outputs.Restrict(options.restriction);
        } catch (std::system_error const &error) {
            return Fail(About(options.restriction.folder,
                              "cannot confine files to it: " + error.code().message()));
        }
        // All command files, also those that are read later, are safe from the write commands of
        // each.
        for (std::string const &path : paths)
            inputs.Add(path);
        outputs.Protect(&inputs);
        if (options.limits.output > 0)
            outputs.SetLimit(options.limits.output);
        std::error_code error;
        if (!options.outputDir.empty())
            fs::current_path(options.outputDir, error);
        if (error)
            return Fail(
                About(options.outputDir, "cannot enter the output folder: " + error.message()));
        // Never deleted: the system frees the memory of a process faster than the destructors of a
        // million objects. The pointer is kept ("used") so that a leak checker reaches the design.
        [[gnu::used]] static Session *lasting = nullptr;
        session = lasting = new Session(options.modelName);
        // Hints are not shown in a quiet run, and some of them search the design.
        session->SetHints(!options.quiet);
        outputs.SetListener([this](char const *file) { progress.ShowWrite(file); });
        session->GetModel().SetWriteOpener(&outputs);
        session->GetModel().GetOptions()->headerTime = options.headerTime;
        return true;
    }

    bool RunFiles() {
        bool good = true;
        for (std::size_t i = 0; i < paths.size() && GoesOn(good); ++i) {
            std::string const &file = options.files[i];
            place = {file == STANDARD_STREAM ? "<stdin>" : file};
            good &= RunFile(paths[i]);
        }
        return good;
    }

    bool GoesOn(bool good) const { return good || (options.keepGoing && !outputs.IsBeyondLimit()); }

    /// The lines of one file, up to the first refused one unless we are to keep going.
    bool RunFile(std::string const &path) {
        LineReader reader(path);
        std::string line;
        bool good = true;
        while (GoesOn(good) && reader.Next(line)) {
            ++place.line;
            // The end of the line counts too, so that the bar reaches 100 %.
            progress.CountLine(line.size() + 1);
            if (std::optional<Diagnostic> const diagnostic = session->RunLine(line, place))
                good = Fail(*diagnostic);
        }
        if (reader.GetError() != 0)
            good = Fail(
                About(place.file, std::string("cannot read: ") + std::strerror(reader.GetError())));
        return good;
    }

    /// What --vhdl and --verilog ask for. The user named these files, so that they may lie
    /// anywhere.
    bool WriteFiles() {
        outputs.Unrestrict();
        bool good = true;
        for (auto const &[language, file] :
             {std::pair{"VHDL", &options.vhdlFile}, std::pair{"VERILOG", &options.verilogFile}}) {
            if (file->empty() || outputs.IsBeyondLimit())
                continue;
            if (*file == STANDARD_STREAM)
                outputs.SendNextToStandardOutput();
            place = {*file};
            WriteStatus const &write = session->Write(language, *file);
            if (write.error != 0)
                good = Fail(About(*file, "cannot write: " + FailureOf(write)));
        }
        return good;
    }

    void PrintStats() {
        Netlist const &netlist = *session->GetModel().GetNetlist();
        auto const count = [](auto &&objects, auto wanted) {
            unsigned long long number = 0;
            for (; objects.HasMore(); objects.Advance())
                number += wanted(objects.Current());
            return number;
        };
        auto const any = [](auto) { return true; };
        // A bit of a port is a port too. Only what is declared counts, so that each port counts
        // once.
        auto const isPort = [](Signal const *signal) {
            return signal->IsPort() && signal->IsNeededToDeclared();
        };
        rusage usage = {};
        ::getrusage(RUSAGE_SELF, &usage);
        std::pair<char const *, std::string> const rows[] = {
            {"components", std::to_string(count(netlist.GetComponentIterator(), any))},
            {"instances", std::to_string(count(netlist.GetInstanceIterator(), any))},
            {"signals", std::to_string(count(netlist.GetSignalIterator(), any))},
            {"ports", std::to_string(count(netlist.GetSignalIterator(), isPort))},
            {"lines", std::to_string(progress.GetLines())},
            {"time", Seconds(progress.GetSeconds())},
            // ru_maxrss is in units of 1024 bytes.
            {"peak memory", Bytes(static_cast<double>(usage.ru_maxrss) * 1024)}};
        for (auto const &[name, value] : rows)
            std::cerr << std::left << std::setw(12) << name << std::right << std::setw(12) << value
                      << '\n';
    }

    RunOptions options;
    std::vector<std::string> paths; ///< of the files, absolute
    Reporter reporter;
    InputFiles inputs;
    OutputFiles outputs;
    Progress progress;
    MemoryLimit memory;
    SourceRange place; ///< of the line that runs, or a file that is written
    Session *session = nullptr;
};

} // namespace

void AddRunCommand(CLI::App &app, Action &action) {
    CLI::App &run = *app.add_subcommand("run", "Run the lines of command files on one design");
    auto const options = std::make_shared<RunOptions>();
    run.add_option("FILE", options->files, "Command files, in order; '-' is standard input")
        ->required();
    AddModelOption(run, options->modelName);
    run.add_option("--vhdl", options->vhdlFile,
                   "Write the design as VHDL after the last line; '-' is standard output");
    run.add_option("--verilog", options->verilogFile, "The same as Verilog");
    AddOutputDirOption(run, options->outputDir);
    CLI::Option *const restrict =
        run.add_option(
               "--restrict", options->restriction.folder,
               "For files from strangers: WRITE lines may only make new HDL files, and only "
               "in this folder")
            ->check(CLI::ExistingDirectory);
    run.add_flag("--restrict-overwrite", options->restriction.overwrite,
                 "Let them write over files of the folder, too")
        ->needs(restrict);
    run.add_option("--restrict-suffix", options->restriction.suffixes,
                   "Further suffixes that their files may have, such as .txt")
        ->allow_extra_args(false)
        ->delimiter(',')
        ->check(CLI::Validator(
            [](std::string const &text) {
                return text.size() > 1 && text[0] == '.' ? ""
                                                         : text + ": a suffix begins with a point";
            },
            "SUFFIX"))
        ->needs(restrict);
    AddLimitOptions(run, options->limits);
    run.add_flag("--keep-going", options->keepGoing,
                 "Go on after a refused line; the exit code is 1 all the same");
    run.add_flag("--stats", options->stats, "Print the size of the design, time and memory");
    run.add_flag("--quiet", options->quiet, "One line for each error, without hints, and no bar");
    run.add_option("--progress", options->progress,
                   "A bar on standard error; 'auto' means on a terminal, when the work lasts")
        ->check(CLI::IsMember({"auto", "always", "never"}))
        ->capture_default_str();
    AddReportOptions(run, options->report);
    run.callback([options, &action] {
        RefuseToOverwrite(*options);
        options->headerTime = HeaderTime();
        LimitOptions &limits = options->limits;
        if (!options->restriction.folder.empty())
            for (unsigned long long *const limit : {&limits.memory, &limits.output})
                *limit = *limit == 0 ? RESTRICTED_LIMIT : *limit;
        action = [options] { return Runner(*options).Run(); };
    });
}

int RunStandardInput(SessionOptions const &given) {
    RunOptions options;
    options.files = {STANDARD_STREAM};
    static_cast<SessionOptions &>(options) = given;
    return Runner(options).Run();
}
