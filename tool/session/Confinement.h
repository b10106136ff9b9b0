#pragma once

#include <string>
#include <sys/types.h>

#include "tool/session/FilePlace.h"

/// A folder that files may not leave: for command files from strangers.
class Confinement {
public:
    /// Looks at the folder once; what it is called later plays no part. Throws std::system_error if
    /// there is none.
    explicit Confinement(std::string const &folder);

    /// Finds the place of a file. The name is resolved here, a component and a link at a time, and
    /// each folder is entered without following links: what somebody exchanges meanwhile leads
    /// nowhere else. False with `errno` set; EXDEV for a file outside the folder.
    bool Find(std::string const &name, FilePlace &place) const;

private:
    dev_t device;
    ino_t inode;
};
