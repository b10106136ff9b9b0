#include "tool/session/Confinement.h"

#include <cerrno>
#include <deque>
#include <fcntl.h>
#include <filesystem>
#include <string_view>
#include <sys/stat.h>
#include <system_error>
#include <unistd.h>
#include <vector>

namespace {

/// A walk from the root to the folder of a file. The stack of folders is the real way there, so
/// that ".." leads back along it whatever links were on it.
class Walk {
public:
    /// False with errno set if a component cannot be entered or the last one cannot be looked at.
    bool ToFolderOf(std::string const &path) {
        Push(path);
        return Root() && Enter();
    }

    /// Follows the last component, which is a link.
    bool FollowLast(FilePlace &place) {
        folders.push_back(std::move(place.folder));
        return Follow(place.name) && Enter();
    }

    /// The last component in its folder, which leaves the walk.
    bool TakeLast(FilePlace &place) {
        place.folder = std::move(folders.back());
        folders.pop_back();
        place.name = last;
        return place.Look();
    }

    bool IsBelow(dev_t device, ino_t inode) const {
        for (Descriptor const &folder : folders) {
            struct stat status = {};
            if (::fstat(folder.Get(), &status) == 0 && status.st_dev == device &&
                status.st_ino == inode)
                return true;
        }
        return false;
    }

private:
    int Folder() const { return folders.back().Get(); }

    bool Root() {
        folders.clear();
        return Step("/");
    }

    bool Step(char const *name) {
        int const parent = folders.empty() ? AT_FDCWD : Folder();
        // O_PATH: only the right to pass through is needed. O_NOFOLLOW: a link that was put here
        // meanwhile is not followed but reported.
        Descriptor next(::openat(parent, name, O_PATH | O_NOFOLLOW | O_DIRECTORY | O_CLOEXEC));
        if (next.Get() < 0)
            return false;
        folders.push_back(std::move(next));
        return true;
    }

    /// Puts the components of a path in front of those still to go.
    void Push(std::string_view path) {
        std::vector<std::string> components;
        while (!path.empty()) {
            std::size_t const end = std::min(path.find('/'), path.size());
            if (end > 0)
                components.emplace_back(path.substr(0, end));
            path.remove_prefix(std::min(end + 1, path.size()));
        }
        toGo.insert(toGo.begin(), components.begin(), components.end());
    }

    bool Follow(std::string const &link) {
        std::string const target = ReadLink(Folder(), link);
        if (target.empty())
            return false;
        // As the kernel does: links that lead to each other would never end.
        if (++links > FilePlace::MAX_LINKS) {
            errno = ELOOP;
            return false;
        }
        Push(target);
        return target[0] != '/' || Root();
    }

    /// Enters folders until one component is left.
    bool Enter() {
        while (toGo.size() > 1) {
            std::string const name = toGo.front();
            toGo.pop_front();
            if (name == ".")
                continue;
            if (name == "..") {
                if (folders.size() > 1)
                    folders.pop_back();
            } else if (!Step(name.c_str())) {
                // A link is no folder (ENOTDIR) until it is followed.
                int const error = errno;
                if ((error != ENOTDIR && error != ELOOP) || !Follow(name)) {
                    errno = errno == EINVAL ? error : errno; // no link either
                    return false;
                }
            }
        }
        last = toGo.empty() ? "." : toGo.front();
        toGo.clear();
        return true;
    }

    std::vector<Descriptor> folders;
    std::deque<std::string> toGo;
    std::string last;
    int links = 0;
};

} // namespace

Confinement::Confinement(std::string const &folder) : device(0), inode(0) {
    struct stat status = {};
    if (::stat(folder.c_str(), &status) != 0)
        throw std::system_error(errno, std::generic_category());
    if (!S_ISDIR(status.st_mode))
        throw std::system_error(ENOTDIR, std::generic_category());
    // By device and inode: the folder is recognized under any of its names.
    device = status.st_dev;
    inode = status.st_ino;
}

bool Confinement::Find(std::string const &name, FilePlace &place) const {
    if (name.empty() || name.back() == '/') {
        errno = name.empty() ? ENOENT : EISDIR;
        return false;
    }
    std::error_code error;
    std::filesystem::path const here = std::filesystem::current_path(error);
    if (error) {
        errno = error.value();
        return false;
    }
    Walk walk;
    if (!walk.ToFolderOf(name[0] == '/' ? name : here.string() + "/" + name))
        return false;
    for (;;) {
        // The last component may be a link as well. Each of its targets has to lie in the folder
        // too.
        if (!walk.IsBelow(device, inode)) {
            errno = EXDEV;
            return false;
        }
        if (!walk.TakeLast(place))
            return false;
        if (!place.IsLink())
            return true;
        if (!walk.FollowLast(place))
            return false;
    }
}
