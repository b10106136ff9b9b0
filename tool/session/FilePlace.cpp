// Resolves the name of an output. A file is replaced by renaming another one, which would replace a
// link by a file; so links are followed here, down to the folder that holds the file itself.

#include "tool/session/FilePlace.h"

#include <array>
#include <climits>
#include <fcntl.h>
#include <linux/magic.h>
#include <sys/statfs.h>

namespace {

/// Links on /proc such as /proc/self/fd/1 name open files: the text of such a link is not always a
/// path.
bool IsOnProc(int folder) {
    struct statfs system = {};
    return ::fstatfs(folder, &system) == 0 && system.f_type == PROC_SUPER_MAGIC;
}

} // namespace

bool FilePlace::Find(std::string const &path) {
    std::string way = path;
    for (int links = 0; links <= MAX_LINKS; ++links) {
        // Only the last component is resolved by hand: the kernel follows links in the folders
        // before it.
        std::size_t const begin = way.rfind('/') + 1; // 0 without a "/"
        std::string const front = begin == 0 ? "./" : way.substr(0, begin);
        name = way.substr(begin);
        if (name.empty()) {
            errno = way.empty() ? ENOENT : EISDIR;
            return false;
        }
        folder = Descriptor(::open(front.c_str(), O_PATH | O_DIRECTORY | O_CLOEXEC));
        if (!folder.IsOpen() || !Look())
            return false;
        isOpenFile = IsLink() && IsOnProc(folder.Get());
        if (!IsLink() || isOpenFile)
            return true;
        std::string const target = ReadLink(folder.Get(), name);
        if (target.empty())
            return false;
        way = target[0] == '/' ? target : front + target;
    }
    errno = ELOOP;
    return false;
}

bool FilePlace::Look() {
    exists = ::fstatat(folder.Get(), name.c_str(), &status, AT_SYMLINK_NOFOLLOW) == 0;
    // A file that does not exist yet is a place too; any other error is one.
    return exists || errno == ENOENT;
}

std::string ReadLink(int folder, std::string const &name) {
    std::array<char, PATH_MAX> target = {};
    ssize_t const length = ::readlinkat(folder, name.c_str(), target.data(), target.size());
    return {target.data(), static_cast<std::size_t>(length < 0 ? 0 : length)};
}

bool IsSamePlace(std::string const &left, std::string const &right) {
    FilePlace one;
    FilePlace other;
    if (!one.Find(left) || !other.Find(right))
        return false;
    if (one.exists || other.exists)
        return one.exists && other.exists && IsSame(one.status, other.status);
    // Neither file exists: they would be one file if they got the same name in the same folder.
    struct stat oneFolder = {};
    struct stat otherFolder = {};
    return one.name == other.name && ::fstat(one.folder.Get(), &oneFolder) == 0 &&
           ::fstat(other.folder.Get(), &otherFolder) == 0 && IsSame(oneFolder, otherFolder);
}
