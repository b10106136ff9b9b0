#include "tool/commands/RunCommand.h"

#include <cstring>
#include <filesystem>
#include <iostream>
#include <memory>
#include <sys/resource.h>
#include <system_error>

#include <CLI/CLI.hpp>

#include "tool/diagnostics/Format.h"
#include "tool/session/LineReader.h"
#include "tool/session/OutputFiles.h"
#include "tool/session/Progress.h"
#include "tool/session/Session.h"

using namespace Vesk_Hdl;
namespace fs = std::filesystem;

namespace {

/// What `vesk-hdl run` was asked for.
struct RunOptions {
    std::vector<std::string> files; ///< in order
    std::string modelName;
    std::string outputDir; ///< empty for the current folder
    std::string vhdlFile;
    std::string verilogFile;
    std::string confinement; ///< empty for none
    std::string progress = "auto";
    bool keepGoing = false;
    bool stats = false;
    bool quiet = false;
    ReportOptions report;
};

/// A name of a file that stays right when the current folder changes.
std::string Lasting(std::string const &file) {
    return file.empty() || file == STANDARD_STREAM ? file : fs::absolute(file).string();
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
    auto const same = [](std::string const &left, std::string const &right) {
        std::error_code error;
        return fs::equivalent(left, right, error) ||
               fs::absolute(left).lexically_normal() == fs::absolute(right).lexically_normal();
    };
    for (std::string const &output : {options.vhdlFile, options.verilogFile}) {
        if (output.empty() || output == STANDARD_STREAM || fs::is_character_file(output))
            continue;
        for (std::string const &input : options.files)
            if (input != STANDARD_STREAM && same(output, input))
                throw CLI::ValidationError(output, "is an input, too");
    }
    if (!options.vhdlFile.empty() && options.vhdlFile != STANDARD_STREAM &&
        !options.verilogFile.empty() && !fs::is_character_file(options.vhdlFile) &&
        same(options.vhdlFile, options.verilogFile))
        throw CLI::ValidationError(options.verilogFile, "is to hold the VHDL, too");
}

/// One run, from the first line to the last file.
class Runner {
public:
    explicit Runner(RunOptions const &runOptions)
        : options(runOptions), reporter(std::cerr, StyleOf(runOptions)),
          progress(WhenOf(runOptions), SizeOf(runOptions.files)) {}

    int Run() {
        bool good = Prepare() && RunFiles();
        if (good || (session && options.keepGoing))
            good &= WriteFiles();
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

    /// Makes names lasting, enters the output folder and makes the design.
    bool Prepare() {
        for (std::string const &file : options.files)
            paths.push_back(Lasting(file));
        options.vhdlFile = Lasting(options.vhdlFile);
        options.verilogFile = Lasting(options.verilogFile);
        try {
            if (!options.confinement.empty())
                outputs.Confine(options.confinement);
        } catch (std::system_error const &error) {
            return Fail(About(options.confinement,
                              "cannot confine files to it: " + error.code().message()));
        }
        std::error_code error;
        if (!options.outputDir.empty())
            fs::current_path(options.outputDir, error);
        if (error)
            return Fail(
                About(options.outputDir, "cannot enter the output folder: " + error.message()));
        // The design dies with the process: to take it apart object by object would only cost time.
        // "used", so that no optimizer takes away what a search for leaks starts from.
        [[gnu::used]] static Session *lasting = nullptr;
        session = lasting = new Session(options.modelName);
        session->SetHints(!options.quiet);
        outputs.SetListener([this](char const *file) { progress.TellWrite(file); });
        session->GetModel().SetWriteOpener(&outputs);
        return true;
    }

    bool RunFiles() {
        bool good = true;
        for (std::size_t i = 0; i < paths.size() && (good || options.keepGoing); ++i) {
            std::string const &file = options.files[i];
            good &= RunFile(paths[i], {file == STANDARD_STREAM ? "<stdin>" : file});
        }
        return good;
    }

    /// The lines of one file, up to the first refused one unless we are to keep going.
    bool RunFile(std::string const &path, Place place) {
        LineReader reader(path);
        std::string line;
        bool good = true;
        while ((good || options.keepGoing) && reader.Next(line)) {
            ++place.line;
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
        OutputFiles unconfined;
        session->GetModel().SetWriteOpener(&unconfined);
        bool good = true;
        for (auto const &[language, file] :
             {std::pair{"VHDL", &options.vhdlFile}, std::pair{"VERILOG", &options.verilogFile}}) {
            if (file->empty())
                continue;
            if (*file == STANDARD_STREAM)
                unconfined.SendNextToStandardOutput();
            progress.TellWrite(file->c_str());
            if (int const error = session->Write(language, *file))
                good = Fail(About(*file, std::string("cannot write: ") + std::strerror(error)));
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
            {"peak memory", Bytes(static_cast<double>(usage.ru_maxrss) * 1024)}};
        for (auto const &[name, value] : rows)
            std::cerr << std::left << std::setw(12) << name << std::right << std::setw(12) << value
                      << '\n';
    }

    RunOptions options;
    std::vector<std::string> paths; ///< of the files, absolute
    Reporter reporter;
    OutputFiles outputs;
    Progress progress;
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
                   "Write the design as VHDL behind the last line; '-' is standard output");
    run.add_option("--verilog", options->verilogFile, "The same as Verilog");
    AddOutputDirOption(run, options->outputDir);
    run.add_option("--restrict", options->confinement,
                   "Refuse WRITE lines whose file lies outside this folder, links resolved")
        ->check(CLI::ExistingDirectory);
    run.add_flag("--keep-going", options->keepGoing,
                 "Go on after a refused line; the exit code still tells of it");
    run.add_flag("--stats", options->stats, "Tell the size of the design, time and memory");
    run.add_flag("--quiet", options->quiet, "Errors a line each, without hints, and no bar");
    run.add_option("--progress", options->progress,
                   "A bar on standard error; 'auto' means on a terminal, when the work lasts")
        ->check(CLI::IsMember({"auto", "always", "never"}))
        ->capture_default_str();
    AddReportOptions(run, options->report);
    run.callback([options, &action] {
        RefuseToOverwrite(*options);
        action = [options] { return Runner(*options).Run(); };
    });
}

int RunStandardInput(std::string const &modelName, std::string const &outputDir) {
    RunOptions options;
    options.files = {STANDARD_STREAM};
    options.modelName = modelName;
    options.outputDir = outputDir;
    return Runner(options).Run();
}
