#pragma once

#include <memory>
#include <string>

#include "tool/session/LineReader.h"

/// The lines of an input that cannot be read a second time, such as a pipe: in memory while they
/// are few, then in a file without a name, in the folder for temporary files. If the file cannot
/// hold them they are lost, and reading gives none.
class LineStore {
public:
    LineStore() = default;
    ~LineStore();
    LineStore(LineStore const &) = delete;
    LineStore &operator=(LineStore const &) = delete;

    void Add(std::string const &line);
    /// Reads all lines from the first one on. None is added any more; one reader at a time.
    std::unique_ptr<LineReader> Read();

private:
    bool Flush();

    std::string block; ///< what is not in the file yet
    int file = -1;
    bool isLost = false;
};
