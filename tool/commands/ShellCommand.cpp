// The interactive shell: lines of the user are commands of the library, or one of the few words
// that the shell itself knows.

#include "tool/commands/ShellCommand.h"

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <iostream>
#include <memory>
#include <new>
#include <system_error>
#include <unistd.h>

#include <CLI/CLI.hpp>

#include "tool/commands/CommandsCommand.h"
#include "tool/commands/RunCommand.h"
#include "tool/diagnostics/Format.h"
#include "tool/diagnostics/Words.h"
#include "tool/session/OutputFiles.h"
#include "tool/session/Session.h"
#include "tool/session/Signals.h"
#include "tool/shell/LineEditor.h"

using namespace Vesk_Hdl;
namespace fs = std::filesystem;

namespace {

constexpr char HELP[] =
    "Type a command of the command language, or one of these:\n"
    "  help             all commands; help WORD... shows those whose keyword holds the words\n"
    "  show THING       netlist, components, instances, signals, ports, options, pins NAME\n"
    "  quit             leaves; so do exit and Ctrl-D\n"
    "TAB completes keywords, names in the design and files; the arrow keys and Ctrl-R go through\n"
    "the history; Ctrl-C gives the line up, or ends the command that runs.\n";
/// What the message of a signal says.
constexpr char LOST[] = "; the design is gone, files that were complete stay";

/// $XDG_STATE_HOME/vesk-hdl/history, in a folder that is made; empty if there can be none.
std::string HistoryFile() {
    char const *const state = std::getenv("XDG_STATE_HOME");
    char const *const home = std::getenv("HOME");
    if (!(state && *state) && !(home && *home))
        return "";
    // The XDG base directories have this folder for data that outlasts a run and is no
    // configuration.
    fs::path const folder =
        (state && *state ? fs::path(state) : fs::path(home) / ".local" / "state") / "vesk-hdl";
    std::error_code error;
    fs::create_directories(folder, error);
    return error ? "" : (folder / "history").string();
}

char const *DirectionOf(Signal const &signal) {
    Polarity const polarity = signal.GetPortPolarity();
    return polarity == Polarity::INPUT     ? "in"
           : polarity == Polarity::OUTPUT  ? "out"
           : polarity == Polarity::INVALID ? ""
                                           : "inout";
}

/// Calls `act` with each object until Ctrl-C: `show` may print a million lines.
template <class T, class Act> void Visit(Iterator<T> objects, Act act) {
    for (; objects.HasMore() && !Signals::IsInterrupted(); objects.Advance())
        if (T const object = objects.Current())
            act(object);
}

class Shell {
public:
    explicit Shell(SessionOptions const &options)
        : session(options.modelName), model(session.GetModel()), memory(options.limits.memory),
          outputDir(options.outputDir), reporter(std::cerr, ReportOptions().GetStyle()) {
        model.SetWriteOpener(&outputs);
        model.GetOptions()->headerTime = options.headerTime;
        if (options.limits.output > 0)
            outputs.SetLimit(options.limits.output);
    }

    int Run() {
        std::error_code error;
        if (!outputDir.empty())
            fs::current_path(outputDir, error);
        if (error) {
            reporter.Report(About(outputDir, "cannot enter the output folder: " + error.message()));
            return SOMETHING_REFUSED;
        }
        Signals::MarkInterrupts(EndMessages(ReportOptions().GetStyle(), "\n", LOST));
        std::cout << "vesk-hdl " << HdlUtilities::GetVersion() << "; type \"help\" for help\n";
        LineEditor editor("vesk-hdl> ", HistoryFile(),
                          [this](std::string_view line) { return Complete(line, model); });
        for (;;) {
            std::optional<std::string> const line = editor.Next();
            // While a line is edited Ctrl-C is a key: this is a signal from another process.
            bool const interrupted = Signals::IsInterrupted();
            Signals::ClearInterrupt();
            if (!line && !interrupted)
                break;
            if (!line) {
                std::cout << '\n';
                continue;
            }
            std::vector<std::string> const words = WordsOf(*line);
            if (!words.empty() &&
                (SameIgnoringCase(words[0], "quit") || SameIgnoringCase(words[0], "exit")))
                return ALL_WELL;
            ++place.line;
            if (!words.empty() && !RunOwn(words))
                RunLine(*line);
            // An interrupt may have ended a write to the terminal, which leaves the streams failed.
            std::cout.clear();
            std::clearerr(stdout);
            Signals::ClearInterrupt();
        }
        std::cout << '\n';
        return ALL_WELL;
    }

private:
    /// The memory limit holds while a command runs. The line editor runs without it, since editline
    /// does not expect an allocation to fail.
    void RunLine(std::string const &line) {
        std::optional<Diagnostic> diagnostic;
        try {
            memory.Apply();
            diagnostic = session.RunLine(line, place);
            memory.Lift();
        } catch (std::bad_alloc const &) {
            memory.Lift();
            diagnostic = OutOfMemory(place, memory);
        }
        if (diagnostic)
            reporter.Report(*diagnostic);
    }

    /// A line of the shell itself; false if it is none.
    bool RunOwn(std::vector<std::string> const &words) {
        std::string const first = Lowercase(words[0]);
        if (first == "help") {
            if (words.size() == 1)
                std::cout << HELP << '\n';
            if (!PrintCommands(std::cout, {words.begin() + 1, words.end()}))
                std::cout << "no keyword holds these words; \"help\" lists all\n";
        } else if (first == "undo") {
            std::cout << "there is no undo: a command changes the design for good\n";
        } else if (first == "show") {
            Show({words.begin() + 1, words.end()});
        } else {
            return false;
        }
        return true;
    }

    void Show(std::vector<std::string> const &words) {
        Netlist const &netlist = *model.GetNetlist();
        std::string const thing = words.empty() ? "" : Lowercase(words[0]);
        if (thing == "netlist")
            ShowNetlist();
        else if (thing == "components")
            Visit(netlist.GetComponentIterator(),
                  [](Component *component) { std::cout << component->GetName() << '\n'; });
        else if (thing == "instances")
            Visit(netlist.GetInstanceIterator(), [](Instance *instance) {
                std::cout << instance->GetName() << " : " << instance->GetComponent()->GetName()
                          << '\n';
            });
        else if (thing == "signals" || thing == "ports")
            Visit(netlist.GetSignalIterator(), [&](Signal *signal) {
                // A bit of a port is a port too. Only what is declared counts, so that each port is
                // shown once.
                if (thing == "signals" || (signal->IsPort() && signal->IsNeededToDeclared()))
                    ShowSignal(*signal);
            });
        else if (thing == "pins" && words.size() > 1)
            ShowPins(words[1]);
        else if (thing == "options")
            ShowOptions();
        else
            std::cout << "show what? " << Alternatives(ShownThings())
                      << "; pins wants the name of an instance or a component\n";
    }

    void ShowNetlist() {
        Netlist const &netlist = *model.GetNetlist();
        auto const count = [](auto objects) {
            unsigned long number = 0;
            Visit(objects, [&number](auto) { ++number; });
            return number;
        };
        std::cout << netlist.GetName() << ": " << count(netlist.GetComponentIterator())
                  << " components, " << count(netlist.GetInstanceIterator()) << " instances, "
                  << count(netlist.GetSignalIterator()) << " signals\n";
    }

    static void ShowSignal(Signal const &signal) {
        std::cout << signal.GetName();
        if (char const *const direction = DirectionOf(signal); *direction)
            std::cout << " : " << direction;
        if (signal.HasConstantValue())
            std::cout << " = " << signal.GetConstantValue().GetValue();
        std::cout << '\n';
    }

    void ShowPins(std::string const &name) {
        auto const show = [](Pin const *pin) {
            std::cout << pin->GetName() << " : " << pin->GetPolarityName();
            if (Signal const *const signal = pin->GetSignal())
                std::cout << " -> " << signal->GetName();
            std::cout << '\n';
        };
        if (Instance const *const instance = model.GetInstance(name.c_str()))
            Visit(instance->GetPinIterator(), show);
        else if (Component const *const component = model.GetComponent(name.c_str()))
            Visit(component->GetPinIterator(), show);
        else
            std::cout << "there is no instance or component " << Quoted(name) << '\n';
    }

    void ShowOptions() {
        HdlOptions const &options = *model.GetOptions();
        auto const flag = [](char const *name, bool value) {
            std::cout << name << ": " << (value ? "yes" : "no") << '\n';
        };
        flag("default libraries", options.vhdlOption.useDefaultLibrary);
        flag("components suppressed", options.vhdlOption.suppressComponent);
        flag("configuration suppressed", options.vhdlOption.suppressConfiguration);
        flag("open input pins stay open", options.vhdlOption.openPin);
        flag("attributes with their types", options.vhdlOption.useAttrType);
        std::cout << "libraries: " << options.vhdlOption.libraries.Concatenate(" ")
                  << "\nused: " << options.vhdlOption.useLibraries.Concatenate(" ")
                  << "\nincludes: " << options.verilogOption.includes.Concatenate(" ") << '\n';
    }

    Session session;
    Model &model;
    OutputFiles outputs;
    MemoryLimit memory;
    std::string outputDir; ///< empty for the current folder
    Reporter reporter;
    SourceRange place{"<shell>"};
};

} // namespace

void AddShellCommand(CLI::App &app, Action &action) {
    CLI::App &shell = *app.add_subcommand(
        "shell", "An interactive session; runs standard input if that is no terminal");
    auto const options = std::make_shared<SessionOptions>();
    AddModelOption(shell, options->modelName);
    AddOutputDirOption(shell, options->outputDir);
    AddLimitOptions(shell, options->limits);
    shell.callback([options, &action] {
        options->headerTime = HeaderTime();
        action = [options] {
            if (::isatty(STDIN_FILENO) == 0 || ::isatty(STDOUT_FILENO) == 0)
                return RunStandardInput(*options);
            return Shell(*options).Run();
        };
    });
}
