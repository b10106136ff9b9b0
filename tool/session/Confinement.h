#pragma once

#include <string>
#include <sys/types.h>

/// A folder that files may not leave: for command files from strangers.
class Confinement {
public:
    /// Looks at the folder once; what it is called later plays no part. Throws std::system_error if
    /// there is none.
    explicit Confinement(std::string const &folder);

    /// Opens a file for writing. The name is resolved here, a component and a link at a time, and
    /// each is opened without following links: what somebody exchanges meanwhile leads nowhere
    /// else. -1 with `errno` set; EXDEV for a file outside the folder.
    int Open(std::string const &name, bool append) const;

private:
    dev_t device;
    ino_t inode;
};
