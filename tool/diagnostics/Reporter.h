#pragma once

#include <iosfwd>
#include <sstream>
#include <string>
#include <string_view>

#include "tool/diagnostics/Diagnostic.h"

/// How diagnostics are shown.
struct ReportStyle {
    enum Format { TEXT, JSON };

    Format format = TEXT;
    bool colour = false;
    bool brief = false; ///< a line each, without source, hints and notes
};

/// Shows diagnostics, as text for people and their editors or as one JSON object a line, and counts
/// them.
class Reporter {
public:
    /// The stream is not owned.
    Reporter(std::ostream &destination, ReportStyle style);
    Reporter(Reporter const &) = delete;
    Reporter &operator=(Reporter const &) = delete;
    ~Reporter() { Show(); }

    void Report(Diagnostic const &diagnostic);
    /// The same for one of many, which may be shown together with those that follow.
    void ReportNext(Diagnostic const &diagnostic);
    /// How many there were, on a line of its own.
    void ReportCount();
    unsigned long GetErrorCount() const { return errors; }
    unsigned long GetWarningCount() const { return warnings; }

private:
    void ReportText(Diagnostic const &diagnostic);
    void ReportSource(Diagnostic const &diagnostic, char const *colour, char const *plain);
    void ReportJson(Diagnostic const &diagnostic);

    void Put(Diagnostic const &diagnostic);
    void Show();

    std::ostream &output;
    std::ostringstream stream; ///< what is being put together
    ReportStyle reportStyle;
    unsigned long errors = 0;
    unsigned long warnings = 0;
};

/// Gives a diagnostic as much of the line of its place as is shown.
void SetSource(Diagnostic &diagnostic, std::string_view line);

/// Text as a JSON string, with its quotes. Bytes that are no UTF-8 become U+FFFD.
std::string JsonString(std::string_view text);
