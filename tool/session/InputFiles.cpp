#include "tool/session/InputFiles.h"

#include <algorithm>
#include <unistd.h>

#include "tool/session/FilePlace.h"

void InputFiles::Add(std::string const &path) {
    struct stat status = {};
    // Standard input may be a file that was redirected: a write to it would lose lines that are
    // still to be read.
    int const failed = path == "-" ? ::fstat(STDIN_FILENO, &status) : ::stat(path.c_str(), &status);
    if (failed == 0 && S_ISREG(status.st_mode))
        files.push_back(status);
}

bool InputFiles::Holds(struct stat const &status) const {
    return std::any_of(files.begin(), files.end(),
                       [&status](struct stat const &file) { return IsSame(file, status); });
}

bool InputFiles::Holds(std::string const &path) const {
    struct stat status = {};
    return ::stat(path.c_str(), &status) == 0 && Holds(status);
}
