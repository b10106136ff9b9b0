// vesk-hdl: a command-line client of the library like any other.

#include <cstdio>
#include <exception>
#include <string>

#include <CLI/CLI.hpp>

#include "tool/commands/CheckCommand.h"
#include "tool/commands/RunCommand.h"
#include "vesk_hdl/Vesk_Hdl.h"

namespace {

constexpr int USAGE_ERROR = 2;

int ParseAndRun(int argc, char **argv) {
    CLI::App app("Turns files of design-entry commands into structural VHDL and Verilog.",
                 "vesk-hdl");
    app.set_version_flag("--version",
                         std::string("vesk-hdl ") + Vesk_Hdl::HdlUtilities::GetVersion().GetText());
    app.require_subcommand(1);
    app.footer("Exit codes: 0 all lines ran; 1 a line was refused, a file could not be read or an "
               "output\ncould not be written; 2 the command line is wrong.");

    RunOptions options;
    CLI::App *const run = app.add_subcommand("run", "Run the lines of command files on one design");
    run->add_option("FILE", options.files, "Command files, in order; '-' is standard input")
        ->required();
    run->add_option("--model", options.modelName, "Name of the design")->capture_default_str();
    run->add_option("--output-dir", options.outputDir,
                    "Folder that relative names in WRITE lines are taken from")
        ->check(CLI::ExistingDirectory)
        ->default_str(".");
    run->add_flag("--keep-going", options.keepGoing,
                  "Go on after a refused line; the exit code still tells of it");

    CheckOptions checkOptions;
    CLI::App *const check = AddCheckCommand(app, checkOptions);

    try {
        app.parse(argc, argv);
    } catch (CLI::ParseError const &error) {
        return app.exit(error) == 0 ? 0 : USAGE_ERROR;
    }
    if (check->parsed())
        return Check(checkOptions);
    return Run(options);
}

} // namespace

int main(int argc, char **argv) {
    try {
        return ParseAndRun(argc, argv);
    } catch (std::exception const &error) {
        std::fprintf(stderr, "vesk-hdl: error: %s\n", error.what());
    } catch (...) {
        std::fputs("vesk-hdl: error: unknown failure\n", stderr);
    }
    return 1;
}
