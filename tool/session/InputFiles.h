#pragma once

#include <string>
#include <sys/stat.h>
#include <vector>

/// The command files of a run, which no write command of it may destroy. They are known by device
/// and inode: links and hard links lead to the same file.
class InputFiles {
public:
    /// Adds a file, or standard input for "-". A pipe or device cannot be destroyed and is left
    /// out, and so is what does not exist.
    void Add(std::string const &path);
    bool Holds(struct stat const &status) const;
    /// The same of the file that the path leads to; false if there is none.
    bool Holds(std::string const &path) const;

private:
    std::vector<struct stat> files;
};
