// What the subcommands share: options, their defaults and the messages that are not about a line.

#include "tool/commands/Common.h"

#include <charconv>
#include <cstdlib>
#include <cstring>
#include <sstream>
#include <tuple>
#include <unistd.h>

#include <CLI/CLI.hpp>

ReportStyle ReportOptions::GetStyle() const {
    auto const given = [](char const *name) {
        char const *const value = std::getenv(name);
        return value && *value;
    };
    // A user may ask for no colour by NO_COLOR (no-color.org), and a dumb terminal shows escape
    // sequences as text.
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

void AddLimitOptions(CLI::App &command, LimitOptions &options) {
    for (auto const &[name, size, what] :
         {std::tuple{"--max-memory", &options.memory, "End the run when it needs more memory"},
          std::tuple{"--max-output", &options.output, "End the run when it would write more"}})
        command
            .add_option(
                name,
                [option = name, bytes = size](CLI::results_t const &given) {
                    // 0 means that there is no limit, and is what BytesOf gives for a text that is
                    // no size: a user who asks for no memory at all made a mistake.
                    *bytes = BytesOf(given.back());
                    if (*bytes == 0)
                        throw CLI::ValidationError(option, given.back() +
                                                               " is no size: give a number above 0 "
                                                               "such as 500000, 500M or 2G");
                    return true;
                },
                std::string(what) + ": bytes, or with k, M, G, T in units of 1024")
            ->type_name("SIZE");
}

/// For builds that have to give the same bytes again (reproducible-builds.org).
std::optional<std::time_t> HeaderTime() {
    constexpr char NAME[] = "SOURCE_DATE_EPOCH";
    constexpr std::time_t LAST = 253402300799; // of the year 9999: the header has four digits
    char const *const text = std::getenv(NAME);
    if (!text || !*text)
        return std::nullopt;
    std::string_view const digits(text);
    std::time_t moment = 0;
    auto const [end, error] = std::from_chars(digits.begin(), digits.end(), moment);
    if (error != std::errc() || end != digits.end() || moment < 0 || moment > LAST)
        throw CLI::ValidationError(NAME, "is no number of seconds since 1970 up to the year 9999");
    return moment;
}

std::function<std::string(char const *)> EndMessages(ReportStyle style, char const *eraser,
                                                     char const *consequence) {
    // The message is made before any signal comes: a handler may not format text.
    return [=](char const *signal) {
        std::ostringstream text;
        text << eraser;
        Reporter(text, style)
            .Report(About("vesk-hdl", std::string("ended by ") + signal + consequence));
        return text.str();
    };
}

Diagnostic OutOfMemory(SourceRange const &place, MemoryLimit const &limit) {
    Diagnostic diagnostic;
    diagnostic.place = place;
    diagnostic.message = limit.GetSize() == 0
                             ? "out of memory"
                             : "out of memory: the run would pass the " +
                                   SizeText(limit.GetSize()) +
                                   " that --max-memory allows; allow more, or split the design";
    return diagnostic;
}

Diagnostic About(std::string const &file, std::string const &message) {
    Diagnostic diagnostic;
    diagnostic.place.file = file;
    diagnostic.message = message;
    return diagnostic;
}
