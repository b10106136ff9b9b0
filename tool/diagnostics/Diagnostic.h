#pragma once

#include <optional>
#include <string>
#include <vector>

/// A place in a command file.
struct SourceRange {
    std::string file;       ///< as the user named it, "<stdin>" for standard input
    unsigned long line = 0; ///< from 1; 0 is the file as a whole
    unsigned column = 0;    ///< from 1, in bytes; 0 is the line as a whole
    unsigned length = 0;    ///< in bytes, from the column on
};

enum class Severity { ERROR, WARNING };

/// Something the tool has to say about a place: a refused line, an output that could not be
/// written, a finding of `check`.
struct Diagnostic {
    struct Note {
        SourceRange place;
        std::string text;
    };

    Severity severity = Severity::ERROR;
    SourceRange place;
    std::string message; ///< without an end of line; of a refused line the library's own text
    std::string source;  ///< the line that the place is in, shown with a caret; may be empty
    std::size_t sourceBegin = 0;    ///< bytes of the line in front of `source`, if that is a part
    bool sourceGoesOn = false;      ///< the line has more than this part
    std::vector<std::string> hints; ///< what to do next, a sentence each
    std::vector<Note> notes;        ///< other places that have to do with it
    std::string name;               ///< of a finding, such as "reserved-word"; otherwise empty
    std::string language; ///< that a finding concerns: "vhdl", "verilog" or "both"; otherwise empty
};
