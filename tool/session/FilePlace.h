#pragma once

#include <string>
#include <sys/stat.h>

#include "tool/session/Descriptor.h"

/// Where a file lies or will lie: the folder that holds it and its name there, links followed.
struct FilePlace {
    Descriptor folder; ///< open as a place only (O_PATH)
    std::string name;  ///< without a "/"
    bool exists = false;
    struct stat status = {}; ///< of the file, if it exists
    /// It is an entry of /proc/*/fd, such as /dev/stdout: an open file that no name may lead to.
    bool isOpenFile = false;

    /// Finds the place that a path leads to. False with `errno` set if a folder cannot be entered
    /// or the path names no file.
    bool Find(std::string const &path);
    /// Looks at what lies there; a link is not followed. False with `errno` set if that fails.
    bool Look();
    bool IsLink() const { return exists && S_ISLNK(status.st_mode); }

    static constexpr int MAX_LINKS = 40; ///< on one way, as the kernel counts
};

/// Where a link in a folder leads; empty with `errno` set if it is none or cannot be read.
std::string ReadLink(int folder, std::string const &name);

/// Whether these are the same object of the file system.
inline bool IsSame(struct stat const &left, struct stat const &right) {
    return left.st_dev == right.st_dev && left.st_ino == right.st_ino;
}

/// Whether two paths lead to one place, links and hard links resolved; there need not be a file.
bool IsSamePlace(std::string const &left, std::string const &right);
