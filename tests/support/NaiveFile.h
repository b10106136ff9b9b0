#pragma once

#include <string>

/// A slow model of the folding file stream: each line is a plain string that is searched again for
/// every piece.
struct NaiveFile {
    std::string file, line;
    std::size_t level = 0;

    std::string Indentation() const { return std::string(3 * level, ' '); }
    void Indent() { ++level; }
    void Unindent() { level -= level > 0 ? 1 : 0; }
    void Flush() {
        if (!line.empty())
            BreakLine(line.size());
    }
    void Write(std::string rest) {
        for (std::size_t end; (end = rest.find('\n')) != std::string::npos; line.clear()) {
            file += (line.empty() ? Indentation() : line) + rest.substr(0, end + 1);
            rest.erase(0, end + 1);
        }
        if (!rest.empty())
            AppendToken(rest);
    }

private:
    void AppendToken(std::string const &token) {
        if (line.empty())
            line = Indentation();
        bool const comment = line.find("--") + 1 || line.find('/') + 1;
        if (!comment && line.size() + token.size() > 80) {
            std::size_t const blank = line.rfind(' ');
            std::size_t const comma = line.rfind(',');
            BreakLine(blank + 1 ? blank : comma + 1 ? comma : line.size());
        }
        line += token;
    }
    void BreakLine(std::size_t position) {
        file += line.substr(0, position + 1) + "\n";
        line = Indentation() + std::string(6, ' ') + line.erase(0, position + 1);
    }
};
