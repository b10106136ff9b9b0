// Writes a file so that others see the old text or the new one. Whatever ends the program in
// between, a hidden file without a lock is all that can be left; the next run on the same file
// removes it.

#include "tool/session/UnfinishedFile.h"

#include <algorithm>
#include <array>
#include <atomic>
#include <climits>
#include <cstdio>
#include <cstring>
#include <fcntl.h>
#include <sys/file.h>

#include "tool/session/Signals.h"

namespace {

constexpr mode_t PERMISSIONS = 0777;

/// How a signal handler undoes the file that is being written. A handler may not take memory or
/// locks, so that all it needs is kept here.
struct HandlerUndo {
    enum Way { NOTHING, REMOVE, CUT };

    std::atomic<Way> way = NOTHING; ///< set when the rest is
    int folder = -1;                ///< to remove the hidden file of that name
    std::array<char, NAME_MAX + 1> name = {};
    int file = -1; ///< to cut to that length
    off_t length = 0;

    void Do() {
        Way const now = way.exchange(NOTHING);
        if (now == REMOVE)
            ::unlinkat(folder, name.data(), 0);
        else if (now == CUT) {
            [[maybe_unused]] int const failed = ::ftruncate(file, length);
        }
    }
} undo;
static_assert(std::atomic<HandlerUndo::Way>::is_always_lock_free);

/// Long names are cut: should two files share a hidden one, their writers take turns.
std::string HiddenNameOf(std::string const &name) {
    constexpr std::size_t MAX_KEPT = 80;
    std::size_t length = std::min(name.size(), MAX_KEPT);
    while (length < name.size() && length > 0 &&
           (static_cast<unsigned char>(name[length]) & 0xC0) == 0x80)
        --length; // not in the middle of a character of UTF-8
    return "." + name.substr(0, length) + "." + std::to_string(::geteuid()) + ".vesk-hdl";
}

/// Waits for the lock. False if an interrupt ends the wait. On a file system without locks the run
/// goes on without one.
bool Lock(int file) {
    while (!Signals::IsInterrupted())
        if (::flock(file, LOCK_EX) == 0 || errno != EINTR)
            return true;
    errno = EINTR;
    return false;
}

} // namespace

void UnfinishedFile::UndoInHandler() { undo.Do(); }

int UnfinishedFile::Begin(FilePlace wanted, std::string &reason) {
    Undo();
    place = std::move(wanted);
    hiddenName = HiddenNameOf(place.name);
    while (!Make()) {
        if (errno != EEXIST) {
            reason = std::string("no file can be made in its folder: ") + std::strerror(errno);
            return -1;
        }
        if (!RemoveLeftover(reason))
            return -1;
    }
    return Lend();
}

/// Makes and locks the hidden file. While the text is written it is private if there is an old
/// file, whose permissions it gets in the end.
bool UnfinishedFile::Make() {
    constexpr mode_t NEW = 0666;
    constexpr mode_t PRIVATE = 0600;
    Signals::Held const held;
    file = Descriptor(::openat(place.folder.Get(), hiddenName.c_str(),
                               O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW | O_CLOEXEC,
                               place.exists ? PRIVATE : NEW));
    if (!file.IsOpen())
        return false;
    // Before the lock is set another run may take the file for a leftover.
    bool const lost = ::flock(file.Get(), LOCK_EX | LOCK_NB) != 0 && errno == EWOULDBLOCK;
    if (lost || ::fstat(file.Get(), &status) != 0 || status.st_nlink == 0) {
        file.Close();
        errno = EEXIST;
        return false;
    }
    undo.folder = place.folder.Get();
    std::snprintf(undo.name.data(), undo.name.size(), "%s", hiddenName.c_str());
    // Last: the handler reads the rest when it sees this.
    undo.way = HandlerUndo::REMOVE;
    return true;
}

/// Removes the hidden file of a run that was killed, once no run holds it. What is not of this user
/// is left alone.
bool UnfinishedFile::RemoveLeftover(std::string &reason) {
    int const folder = place.folder.Get();
    Descriptor const left(
        ::openat(folder, hiddenName.c_str(), O_RDONLY | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC));
    if (!left.IsOpen() && errno == ENOENT)
        return true;
    struct stat opened = {};
    if (!left.IsOpen() || ::fstat(left.Get(), &opened) != 0 || !S_ISREG(opened.st_mode) ||
        opened.st_uid != ::geteuid()) {
        reason = "its text would be put together in " + hiddenName +
                 " beside it, and something else has that name: remove it";
        errno = EEXIST;
        return false;
    }
    if (!Lock(left.Get())) {
        reason = "interrupted while another run writes it";
        return false;
    }
    struct stat named = {};
    // While this run waited, the other one may have finished and a third one may have made a file
    // of that name.
    if (::fstatat(folder, hiddenName.c_str(), &named, AT_SYMLINK_NOFOLLOW) == 0 &&
        IsSame(named, opened))
        ::unlinkat(folder, hiddenName.c_str(), 0);
    return true;
}

int UnfinishedFile::BeginAppending(FilePlace wanted, std::string &reason) {
    Undo();
    place = std::move(wanted);
    hiddenName.clear();
    file = Descriptor(::openat(place.folder.Get(), place.name.c_str(),
                               O_WRONLY | O_APPEND | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC));
    if (!file.IsOpen())
        return -1;
    if (!Lock(file.Get())) {
        reason = "interrupted while another run writes it";
        return -1;
    }
    if (::fstat(file.Get(), &status) != 0 || !IsSame(status, place.status)) {
        reason = "another program replaced it at this moment: try again";
        errno = EAGAIN;
        return -1;
    }
    // Text that is appended goes into the file itself. If the write fails the file is cut to its
    // former length.
    undo.file = file.Get();
    undo.length = status.st_size;
    undo.way = HandlerUndo::CUT;
    return Lend();
}

/// A copy of the descriptor for the library, which closes it. The lock belongs to both and lasts
/// until the second one is closed, when the file has its name.
int UnfinishedFile::Lend() const { return ::fcntl(file.Get(), F_DUPFD_CLOEXEC, STDERR_FILENO + 1); }

int UnfinishedFile::Finish() {
    Signals::Held const held;
    int error = 0;
    if (!hiddenName.empty()) {
        if (place.exists)
            GiveModeAndOwner();
        int const folder = place.folder.Get();
        if (::renameat(folder, hiddenName.c_str(), folder, place.name.c_str()) != 0)
            error = errno;
    }
    if (error == 0)
        undo.way = HandlerUndo::NOTHING;
    Undo();
    return error;
}

/// Only root may give a file away. If the former group cannot be kept, members of the new group get
/// no more rights than all others have.
void UnfinishedFile::GiveModeAndOwner() const {
    struct stat const &old = place.status;
    mode_t mode = old.st_mode & PERMISSIONS;
    auto const give = [this](uid_t user, gid_t group) {
        return ::fchown(file.Get(), user, group) == 0;
    };
    constexpr auto SAME_USER = static_cast<uid_t>(-1);
    if ((old.st_uid != status.st_uid || old.st_gid != status.st_gid) &&
        !give(old.st_uid, old.st_gid) && old.st_gid != status.st_gid &&
        !give(SAME_USER, old.st_gid))
        mode &= ~static_cast<mode_t>(S_IRWXG) | (mode & S_IRWXO) << 3;
    ::fchmod(file.Get(), mode);
}

void UnfinishedFile::Undo() {
    Signals::Held const held;
    if (file.IsOpen())
        undo.Do();
    file.Close();
    place.folder.Close();
}
