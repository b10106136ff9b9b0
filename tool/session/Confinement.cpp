#include "tool/session/Confinement.h"

#include <array>
#include <cerrno>
#include <climits>
#include <deque>
#include <fcntl.h>
#include <filesystem>
#include <string_view>
#include <sys/stat.h>
#include <system_error>
#include <unistd.h>
#include <utility>
#include <vector>

namespace {

constexpr int MOST_LINKS = 40; // as the kernel counts

/// An open descriptor.
class Descriptor {
public:
    explicit Descriptor(int opened) : number(opened) {}
    Descriptor(Descriptor &&other) noexcept : number(std::exchange(other.number, -1)) {}
    Descriptor(Descriptor const &) = delete;
    Descriptor &operator=(Descriptor const &) = delete;
    Descriptor &operator=(Descriptor &&) = delete;
    ~Descriptor() {
        int const error = errno;
        if (number >= 0)
            ::close(number);
        errno = error;
    }
    int Get() const { return number; }

private:
    int number;
};

/// A walk from the root to the folder of a file. The stack of folders is the real way there, so
/// that ".." leads back along it whatever links were on it.
class Walk {
public:
    /// False with errno set if a component cannot be entered. On success `rest` is the last
    /// component, not looked at yet.
    bool ToFolderOf(std::string const &path) {
        Push(path);
        return Root() && Enter();
    }

    /// Opens the last component; a link there goes on the walk.
    int OpenLast(bool append) {
        constexpr mode_t MODE = 0666;
        int const flags =
            O_WRONLY | O_CREAT | O_CLOEXEC | O_NOFOLLOW | (append ? O_APPEND : O_TRUNC);
        return ::openat(Folder(), last.c_str(), flags, MODE);
    }

    /// Follows the last component, which is a link.
    bool FollowLast() { return Follow(last) && Enter(); }

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
        std::array<char, PATH_MAX> target = {};
        ssize_t const length = ::readlinkat(Folder(), link.c_str(), target.data(), target.size());
        if (length < 0)
            return false;
        if (++links > MOST_LINKS) {
            errno = ELOOP;
            return false;
        }
        std::string_view const text(target.data(), static_cast<std::size_t>(length));
        Push(text);
        return text.substr(0, 1) != "/" || Root();
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
    device = status.st_dev;
    inode = status.st_ino;
}

int Confinement::Open(std::string const &name, bool append) const {
    if (name.empty() || name.back() == '/') {
        errno = name.empty() ? ENOENT : EISDIR;
        return -1;
    }
    std::error_code error;
    std::filesystem::path const here = std::filesystem::current_path(error);
    if (error) {
        errno = error.value();
        return -1;
    }
    Walk walk;
    if (!walk.ToFolderOf(name[0] == '/' ? name : here.string() + "/" + name))
        return -1;
    for (;;) {
        if (!walk.IsBelow(device, inode)) {
            errno = EXDEV;
            return -1;
        }
        int opened = -1;
        do
            opened = walk.OpenLast(append);
        while (opened < 0 && errno == EINTR);
        if (opened >= 0 || errno != ELOOP)
            return opened;
        if (!walk.FollowLast())
            return -1;
    }
}
