// Writes diagnostics as text or as JSON. Text of a command file comes from strangers: whatever is
// shown passes SanitizeForTerminal or JsonString.

#include "tool/diagnostics/Reporter.h"

#include <algorithm>
#include <array>
#include <ostream>

#include "tool/diagnostics/Terminal.h"

namespace {

constexpr std::size_t MAX_SOURCE = 160;   ///< bytes of a line that are shown around the caret
constexpr std::size_t SOURCE_BEFORE = 60; ///< of these, before the caret
constexpr char CLIPPED[] = "...";

struct Word {
    char const *text;
    char const *colour;
};
constexpr Word ERROR_WORD = {"error", "\033[1;31m"};
constexpr Word WARNING_WORD = {"warning", "\033[1;35m"};
constexpr Word NOTE_WORD = {"note", "\033[1;36m"};
constexpr Word HINT_WORD = {"hint", "\033[1;34m"};
constexpr char BOLD[] = "\033[1m";
constexpr char GREEN[] = "\033[1;32m";
constexpr char PLAIN[] = "\033[m";

Word const &WordOf(Severity severity) {
    return severity == Severity::ERROR ? ERROR_WORD : WARNING_WORD;
}

// Bytes that a terminal or JSON treats as commands, and bytes that continue a UTF-8 character.
bool IsControl(char c) { return static_cast<unsigned char>(c) < ' ' || c == '\x7f'; }
bool Continues(char c) { return (static_cast<unsigned char>(c) & 0xC0) == 0x80; }

/// How many characters of UTF-8 a text has.
std::size_t CharactersIn(std::string_view text) {
    return text.size() -
           static_cast<std::size_t>(std::count_if(text.begin(), text.end(), Continues));
}

/// Length of the UTF-8 sequence that the text begins with; 0 if it begins with none.
std::size_t SequenceAt(std::string_view text) {
    unsigned char const lead = static_cast<unsigned char>(text[0]);
    std::size_t const length = lead < 0x80                   ? 1
                               : lead >= 0xC2 && lead < 0xE0 ? 2
                               : lead >= 0xE0 && lead < 0xF0 ? 3
                               : lead >= 0xF0 && lead < 0xF5 ? 4
                                                             : 0;
    if (length == 0 || length > text.size() ||
        !std::all_of(text.begin() + 1, text.begin() + static_cast<std::ptrdiff_t>(length),
                     Continues))
        return 0;
    // Overlong forms, surrogates and code points above U+10FFFF are no UTF-8 (RFC 3629).
    unsigned char const second = length > 1 ? static_cast<unsigned char>(text[1]) : 0;
    bool const bad = (lead == 0xE0 && second < 0xA0) || (lead == 0xED && second > 0x9F) ||
                     (lead == 0xF0 && second < 0x90) || (lead == 0xF4 && second > 0x8F);
    return bad ? 0 : length;
}

/// What is shown of a line: all, or of a long one the part around a column.
struct Window {
    std::string_view text;
    std::size_t begin; ///< bytes of the line in front of it
    bool goesOn;
};

Window WindowOf(std::string_view line, unsigned column) {
    std::size_t const at = std::min<std::size_t>(column - 1, line.size());
    std::size_t begin = 0;
    if (line.size() > MAX_SOURCE && at > SOURCE_BEFORE) {
        begin = at - SOURCE_BEFORE;
        while (begin < at && Continues(line[begin]))
            ++begin;
    }
    std::string_view const rest = line.substr(begin);
    if (rest.size() <= MAX_SOURCE)
        return {rest, begin, false};
    std::size_t end = MAX_SOURCE;
    // Neither end of the part is in the middle of a character.
    while (end > 0 && Continues(rest[end]))
        --end;
    return {rest.substr(0, end), begin, true};
}

/// Writes the members of a JSON object, a comma between them.
class JsonObject {
public:
    explicit JsonObject(std::ostream &output) : stream(output) { stream << '{'; }
    JsonObject(JsonObject const &) = delete;
    JsonObject &operator=(JsonObject const &) = delete;
    ~JsonObject() { stream << '}'; }

    std::ostream &Name(char const *name) {
        stream << (first ? "" : ",") << '"' << name << "\":";
        first = false;
        return stream;
    }
    void Text(char const *name, std::string_view text) { Name(name) << JsonString(text); }
    void Put(SourceRange const &place) {
        Text("file", place.file);
        Name("line") << place.line;
        Name("column") << place.column;
        Name("length") << place.length;
    }

private:
    std::ostream &stream;
    bool first = true;
};

} // namespace

std::string JsonString(std::string_view text) {
    constexpr char HEX[] = "0123456789abcdef";
    std::string json = "\"";
    while (!text.empty()) {
        std::size_t const length = SequenceAt(text);
        char const c = text[0];
        if (length == 0)
            // The replacement character: a JSON text with other bytes would be refused as a whole.
            json += "\\ufffd";
        else if (c == '"' || c == '\\')
            json.append({'\\', c});
        else if (IsControl(c))
            json.append("\\u00").append({HEX[c >> 4], HEX[c & 15]});
        else
            json.append(text, 0, length);
        text.remove_prefix(std::max<std::size_t>(length, 1));
    }
    return json + '"';
}

Reporter::Reporter(std::ostream &destination, ReportStyle style)
    : output(destination), reportStyle(style) {}

void SetSource(Diagnostic &diagnostic, std::string_view line) {
    if (diagnostic.place.column == 0)
        return;
    Window const window = WindowOf(line, diagnostic.place.column);
    diagnostic.source = window.text;
    diagnostic.sourceBegin = window.begin;
    diagnostic.sourceGoesOn = window.goesOn;
}

/// Writes all at once: standard error is not buffered, and lines of several processes that share it
/// would mix.
void Reporter::Show() {
    output << stream.str();
    output.flush();
    stream.str("");
}

void Reporter::Report(Diagnostic const &diagnostic) {
    Put(diagnostic);
    Show();
}

void Reporter::ReportNext(Diagnostic const &diagnostic) {
    // A hundred thousand findings would otherwise take as many system calls.
    constexpr int ENOUGH = 32 * 1024;
    Put(diagnostic);
    if (stream.tellp() > ENOUGH)
        Show();
}

void Reporter::Put(Diagnostic const &diagnostic) {
    ++(diagnostic.severity == Severity::ERROR ? errors : warnings);
    if (reportStyle.format == ReportStyle::JSON)
        ReportJson(diagnostic);
    else
        ReportText(diagnostic);
}

void Reporter::ReportText(Diagnostic const &diagnostic) {
    auto const colour = [this](char const *code) { return reportStyle.colour ? code : ""; };
    auto const head = [&](SourceRange const &place, Word const &word, std::string_view text) {
        stream << colour(BOLD) << SanitizeForTerminal(place.file);
        for (unsigned long const number : {place.line, static_cast<unsigned long>(place.column)})
            if (number > 0)
                stream << ':' << number;
        stream << ": " << colour(PLAIN) << colour(word.colour) << word.text << ": " << colour(PLAIN)
               << SanitizeForTerminal(text);
    };

    head(diagnostic.place, WordOf(diagnostic.severity), diagnostic.message);
    if (!diagnostic.name.empty())
        stream << " [" << diagnostic.name << ", " << diagnostic.language << ']';
    stream << '\n';
    if (reportStyle.brief)
        return;
    ReportSource(diagnostic, colour(GREEN), colour(PLAIN));
    for (std::string const &hint : diagnostic.hints)
        stream << "  " << colour(HINT_WORD.colour) << HINT_WORD.text << ": " << colour(PLAIN)
               << SanitizeForTerminal(hint) << '\n';
    for (Diagnostic::Note const &note : diagnostic.notes) {
        head(note.place, NOTE_WORD, note.text);
        stream << '\n';
    }
}

/// Shows the line and, below it, a caret under the token that is wrong.
void Reporter::ReportSource(Diagnostic const &diagnostic, char const *colour, char const *plain) {
    if (diagnostic.place.column == 0 || diagnostic.source.empty())
        return;
    // Findings of `check` keep a part of a long line; a refused line is here as a whole.
    bool const isPart = diagnostic.sourceBegin > 0 || diagnostic.sourceGoesOn;
    auto const [source, begin, goesOn] =
        isPart ? Window{diagnostic.source, diagnostic.sourceBegin, diagnostic.sourceGoesOn}
               : WindowOf(diagnostic.source, diagnostic.place.column);
    std::size_t const at =
        std::min<std::size_t>(diagnostic.place.column - 1 - begin, source.size());
    bool const clipFront = begin > 0;
    // Columns are bytes for editors; the caret is placed by characters.
    std::size_t const marked = CharactersIn(source.substr(at, diagnostic.place.length));
    stream << "  " << (clipFront ? CLIPPED : "") << SanitizeForTerminal(source)
           << (goesOn ? CLIPPED : "") << '\n'
           << std::string(2 + (clipFront ? sizeof CLIPPED - 1 : 0) +
                              CharactersIn(source.substr(0, at)),
                          ' ')
           << colour << '^' << std::string(marked > 1 ? marked - 1 : 0, '~') << plain << '\n';
}

void Reporter::ReportJson(Diagnostic const &diagnostic) {
    {
        JsonObject object(stream);
        object.Text("severity", WordOf(diagnostic.severity).text);
        object.Put(diagnostic.place);
        object.Text("message", diagnostic.message);
        if (!diagnostic.name.empty()) {
            object.Text("finding", diagnostic.name);
            object.Text("language", diagnostic.language);
        }
        auto const list = [&](char const *name, auto const &elements, auto putElement) {
            object.Name(name) << '[';
            for (std::size_t i = 0; i < elements.size(); ++i) {
                stream << (i > 0 ? "," : "");
                putElement(elements[i]);
            }
            stream << ']';
        };
        list("hints", diagnostic.hints,
             [this](std::string const &hint) { stream << JsonString(hint); });
        list("notes", diagnostic.notes, [this](Diagnostic::Note const &note) {
            JsonObject place(stream);
            place.Put(note.place);
            place.Text("message", note.text);
        });
    }
    stream << '\n';
}

void Reporter::ReportCount() {
    if (reportStyle.format == ReportStyle::JSON) {
        JsonObject object(stream);
        object.Text("severity", "count");
        object.Name("errors") << errors;
        object.Name("warnings") << warnings;
    } else {
        auto const plural = [](unsigned long count) { return count == 1 ? "" : "s"; };
        stream << errors << " error" << plural(errors);
        if (warnings > 0)
            stream << ", " << warnings << " warning" << plural(warnings);
    }
    stream << '\n';
    Show();
}
