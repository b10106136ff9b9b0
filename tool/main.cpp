// vesk-hdl: a command-line client of the library like any other.

#include <csignal>
#include <cstdio>
#include <exception>
#include <iostream>
#include <new>
#include <string>

#include <CLI/CLI.hpp>

#include "tool/commands/CheckCommand.h"
#include "tool/commands/CommandsCommand.h"
#include "tool/commands/HeaderCommand.h"
#include "tool/commands/RunCommand.h"
#include "tool/commands/ShellCommand.h"
#include "vesk_hdl/Vesk_Hdl.h"

namespace {

/// The exit code, or 1 if the rest of the output cannot be written: standard output may be a file
/// on a full disk.
int FlushStdout(int exitCode) {
    if (std::cout.flush())
        return exitCode;
    std::cerr << "vesk-hdl: error: cannot write to standard output\n";
    return SOMETHING_REFUSED;
}

int ParseAndRun(int argc, char **argv) {
    CLI::App app("Turns files of design-entry commands into structural VHDL and Verilog.",
                 "vesk-hdl");
    app.set_version_flag("--version",
                         std::string("vesk-hdl ") + Vesk_Hdl::HdlUtilities::GetVersion().GetText());
    app.require_subcommand(1);
    app.footer("Exit codes: 0 all went well; 1 a line was refused, a file could not be read, an "
               "output\ncould not be written or a limit was met; 2 the command line is wrong; 128 "
               "and the\nnumber of a signal that ended the run.");
    Action action;
    AddRunCommand(app, action);
    AddCheckCommand(app, action);
    AddShellCommand(app, action);
    AddCommandsCommand(app, action);
    AddHeaderCommand(app, action);
    try {
        app.parse(argc, argv);
    } catch (CLI::ParseError const &error) {
        return app.exit(error) == 0 ? FlushStdout(ALL_WELL) : USAGE_ERROR;
    }
    return FlushStdout(action());
}

} // namespace

int main(int argc, char **argv) {
    // Without this the process would be killed when a file meets the limit of `ulimit -f`. Ignored,
    // the write fails with EFBIG and the user reads which file it was.
    std::signal(SIGXFSZ, SIG_IGN);
    try {
        return ParseAndRun(argc, argv);
    } catch (std::bad_alloc const &) {
        // No stream: it might want memory.
        std::fputs("vesk-hdl: error: out of memory\n", stderr);
    } catch (std::exception const &error) {
        std::fprintf(stderr, "vesk-hdl: error: %s\n", error.what());
    } catch (...) {
        std::fputs("vesk-hdl: error: unknown failure\n", stderr);
    }
    return SOMETHING_REFUSED;
}
