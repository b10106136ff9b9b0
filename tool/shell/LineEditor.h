#pragma once

#include <functional>
#include <memory>
#include <optional>
#include <string>

#include "tool/shell/Completion.h"

/// Lines from a terminal, with editing keys, history and completion by TAB.
class LineEditor {
public:
    using Completer = std::function<Completions(std::string_view)>;

    /// The history is read from the file and kept in it; an empty name or a file that cannot be
    /// used means a history of this session alone.
    LineEditor(std::string const &prompt, std::string const &historyFile, Completer completer);
    ~LineEditor();
    LineEditor(LineEditor const &) = delete;
    LineEditor &operator=(LineEditor const &) = delete;

    /// The next line without its end; nothing at the end of input.
    std::optional<std::string> Next();

private:
    struct Record;
    std::unique_ptr<Record> record;
};
