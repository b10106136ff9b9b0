#include "tool/commands/Common.h"

#include <cstdlib>
#include <cstring>
#include <unistd.h>

#include <CLI/CLI.hpp>

ReportStyle ReportOptions::GetStyle() const {
    auto const given = [](char const *name) {
        char const *const value = std::getenv(name);
        return value && *value;
    };
    char const *const terminal = std::getenv("TERM");
    bool const dumb = terminal && std::strcmp(terminal, "dumb") == 0;
    ReportStyle style;
    style.format = format == "json" ? ReportStyle::JSON : ReportStyle::TEXT;
    style.colour = colour == "always" || (colour == "auto" && ::isatty(STDERR_FILENO) == 1 &&
                                          !given("NO_COLOR") && !dumb);
    return style;
}

void AddReportOptions(CLI::App &command, ReportOptions &options) {
    command
        .add_option("--diagnostics", options.format,
                    "Form of messages: text with the line and a caret, or a JSON object a line")
        ->check(CLI::IsMember({"text", "json"}))
        ->capture_default_str();
    command
        .add_option("--color", options.colour,
                    "Colour in messages; 'auto' means on a terminal, unless NO_COLOR is set")
        ->check(CLI::IsMember({"auto", "always", "never"}))
        ->capture_default_str();
}

void AddModelOption(CLI::App &command, std::string &modelName) {
    modelName = "hdlNetlist";
    command.add_option("--model", modelName, "Name of the design")->capture_default_str();
}

void AddOutputDirOption(CLI::App &command, std::string &folder) {
    command
        .add_option("--output-dir", folder,
                    "Folder that relative names in WRITE lines are taken from")
        ->check(CLI::ExistingDirectory)
        ->default_str(".");
}

Diagnostic About(std::string const &file, std::string const &message) {
    Diagnostic diagnostic;
    diagnostic.place.file = file;
    diagnostic.message = message;
    return diagnostic;
}
