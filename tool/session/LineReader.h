#pragma once

#include <string>

/// Reads a command file or standard input line by line, in blocks: what a design costs is the
/// design, not its text.
class LineReader {
public:
    /// Opens a file, or standard input for "-".
    explicit LineReader(std::string const &path);
    /// Reads a text, then from a descriptor on, which becomes the reader's; -1 for none.
    LineReader(int ownDescriptor, std::string text);
    ~LineReader();
    LineReader(LineReader const &) = delete;
    LineReader &operator=(LineReader const &) = delete;

    /// Whether a path names a file that gives the same lines whenever it is read: no standard
    /// input, no pipe, no device.
    static bool CanReadAgain(std::string const &path);

    /// The next line without its end, "\n" or "\r\n". False at the end and after an error.
    bool Next(std::string &line);
    /// The `errno` of a failure to open or read, 0 for none.
    int GetError() const { return error; }

private:
    bool Fill();

    int descriptor;
    int error;
    std::string block;
    std::size_t position = 0;
};
