// The line editor: editline with the keys, the history and the completion of the shell.

#include "tool/shell/LineEditor.h"

#include <clocale>
#include <cstdio>
#include <fcntl.h>
#include <histedit.h>
#include <unistd.h>

#include "tool/diagnostics/Terminal.h"

namespace {

constexpr int MAX_HISTORY = 1000;

/// Prints candidates in columns, as shells do.
void List(std::vector<std::string> const &candidates) {
    constexpr std::size_t COLUMNS = 80;
    std::size_t width = 0;
    for (std::string const &each : candidates)
        width = std::max(width, each.size() + 2);
    std::size_t column = 0;
    std::fputc('\n', stdout);
    for (std::string const &each : candidates) {
        if (column > 0 && column + width > COLUMNS) {
            std::fputc('\n', stdout);
            column = 0;
        }
        std::fprintf(stdout, "%-*s", static_cast<int>(width), SanitizeForTerminal(each).c_str());
        column += width;
    }
    std::fputc('\n', stdout);
    std::fflush(stdout);
}

} // namespace

struct LineEditor::Record {
    std::string prompt;
    std::string historyFile;
    Completer completer;
    EditLine *editor = nullptr;
    History *history = nullptr;

    static Record &Of(EditLine *editor) {
        void *record = nullptr;
        el_get(editor, EL_CLIENTDATA, &record);
        return *static_cast<Record *>(record);
    }

    void SaveHistory() const {
        HistEvent event;
        if (historyFile.empty())
            return;
        // Lines may hold names of customers: only the user may read the file. editline makes it
        // with the permissions of the umask, so that it is made here first.
        int const made = ::open(historyFile.c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600);
        if (made < 0)
            return;
        ::close(made);
        ::history(history, &event, H_SAVE, historyFile.c_str());
    }

    static char *Prompt(EditLine *editor) { return Of(editor).prompt.data(); }

    /// TAB: inserts what all candidates have in common; lists them if nothing more is common.
    static unsigned char CompleteWord(EditLine *editor, int) {
        LineInfo const *const line = el_line(editor);
        std::string const text(line->buffer, line->cursor);
        Completions const found = Of(editor).completer(text);
        std::string const word = text.substr(found.begin);
        std::string common = CommonBeginning(found.candidates);
        // A blank after the only candidate, so that the next word can be typed at once.
        if (found.candidates.size() == 1 && found.wordEnds)
            common += ' ';
        if (common.empty())
            return CC_ERROR;
        if (common != word) {
            el_deletestr(editor, static_cast<int>(word.size()));
            el_insertstr(editor, common.c_str());
        }
        if (found.candidates.size() == 1)
            return CC_REFRESH;
        if (common.size() > word.size())
            return CC_REFRESH;
        List(found.candidates);
        return CC_REDISPLAY;
    }

    /// Ctrl-C: gives the line up.
    static unsigned char DropLine(EditLine *editor, int) {
        LineInfo const *const line = el_line(editor);
        el_cursor(editor, static_cast<int>(line->lastchar - line->cursor));
        el_deletestr(editor, static_cast<int>(el_line(editor)->lastchar - el_line(editor)->buffer));
        std::fputs("^C\n", stdout);
        std::fflush(stdout);
        return CC_REDISPLAY;
    }
};

LineEditor::LineEditor(std::string const &prompt, std::string const &historyFile,
                       Completer completer)
    : record(std::make_unique<Record>()) {
    // editline asks the locale for letters beyond ASCII; the library does not depend on it.
    std::setlocale(LC_CTYPE, "");
    record->prompt = prompt;
    record->historyFile = historyFile;
    record->completer = std::move(completer);
    record->history = history_init();
    HistEvent event;
    history(record->history, &event, H_SETSIZE, MAX_HISTORY);
    history(record->history, &event, H_SETUNIQUE, 1);
    if (!historyFile.empty())
        history(record->history, &event, H_LOAD, historyFile.c_str());

    record->editor = el_init("vesk-hdl", stdin, stdout, stderr);
    EditLine *const editor = record->editor;
    el_set(editor, EL_CLIENTDATA, record.get());
    el_set(editor, EL_SIGNAL, 1); // the terminal is put back before a signal ends or stops us
    el_set(editor, EL_PROMPT, Record::Prompt);
    el_set(editor, EL_EDITOR, "emacs");
    el_set(editor, EL_HIST, history, record->history);
    el_set(editor, EL_ADDFN, "vesk-complete", "Complete the word", Record::CompleteWord);
    el_set(editor, EL_BIND, "^I", "vesk-complete", nullptr);
    // While a line is edited Ctrl-C is a key; while a command runs it is the signal.
    el_set(editor, EL_ADDFN, "vesk-drop", "Give the line up", Record::DropLine);
    el_set(editor, EL_BIND, "^C", "vesk-drop", nullptr);
    el_set(editor, EL_BIND, "^R", "em-inc-search-prev", nullptr);
    el_set(editor, EL_SETTY, "-d", "-isig", nullptr);
    el_source(editor, nullptr); // the user's own keys, ~/.editrc
}

LineEditor::~LineEditor() {
    el_end(record->editor);
    history_end(record->history);
}

std::optional<std::string> LineEditor::Next() {
    int length = 0;
    char const *const text = el_gets(record->editor, &length);
    if (!text || length <= 0)
        return std::nullopt;
    std::string line(text, static_cast<std::size_t>(length));
    while (!line.empty() && (line.back() == '\n' || line.back() == '\r'))
        line.pop_back();
    HistEvent event;
    if (line.find_first_not_of(' ') != std::string::npos) {
        history(record->history, &event, H_ENTER, line.c_str());
        record->SaveHistory(); // the line may be the last one
    }
    return line;
}
