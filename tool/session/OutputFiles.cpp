// Opens what write commands write. The order of the tests in Find and IsAllowed decides which
// reason the user reads, when several apply.

#include "tool/session/OutputFiles.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <fcntl.h>
#include <string_view>
#include <unistd.h>

#include "tool/session/Limits.h"
#include "tool/session/Signals.h"

namespace {

constexpr std::array<std::string_view, 6> HDL_SUFFIXES = {".vhd", ".vhdl", ".v",
                                                          ".vh",  ".sv",   ".svh"};

bool EndsIn(std::string_view name, std::string_view suffix) {
    // In any case: file systems that ignore case open .V for .v.
    auto const same = [](char a, char b) {
        auto const lower = [](char c) { return c >= 'A' && c <= 'Z' ? c - 'A' + 'a' : c; };
        return lower(a) == lower(b);
    };
    return name.size() > suffix.size() &&
           std::equal(suffix.rbegin(), suffix.rend(), name.rbegin(), same);
}

std::pair<dev_t, ino_t> IdentityOf(struct stat const &status) {
    return {status.st_dev, status.st_ino};
}

} // namespace

void OutputFiles::Restrict(Restriction const &wanted) {
    restriction = wanted;
    confinement.emplace(wanted.folder);
}

bool OutputFiles::Refuse(int error, std::string why) {
    reason = std::move(why);
    errno = error;
    return false;
}

int OutputFiles::Open(char const *fileName, bool append) {
    if (listener)
        listener(fileName);
    reason.clear();
    beyondLimit = false;
    if (std::exchange(nextIsStandardOutput, false))
        // A copy, since the library closes what it is given; above 2, so that it never takes the
        // place of a standard stream that is closed.
        return ::fcntl(STDOUT_FILENO, F_DUPFD_CLOEXEC, STDERR_FILENO + 1);
    FilePlace place;
    if (!Find(fileName, place))
        return -1;
    if (place.isOpenFile || (place.exists && !S_ISREG(place.status.st_mode)))
        // A pipe, a device or an open file cannot be replaced by renaming.
        return OpenDirectly(fileName, append);
    return append && place.exists ? unfinished.BeginAppending(std::move(place), reason)
                                  : unfinished.Begin(std::move(place), reason);
}

/// The place of a file that may be written.
bool OutputFiles::Find(char const *fileName, FilePlace &place) {
    if (confinement ? !confinement->Find(fileName, place) : !place.Find(fileName))
        return confinement && errno == EXDEV
                   ? Refuse(EXDEV, "it lies outside the folder that --restrict names")
                   : false;
    if (inputs && (place.isOpenFile ? inputs->Holds(std::string(fileName))
                                    : place.exists && inputs->Holds(place.status)))
        return Refuse(EBUSY, "it is a command file of this run, which would be lost");
    if (confinement)
        return IsAllowed(place);
    if (!place.exists || !S_ISREG(place.status.st_mode))
        return true;
    // The system would let us replace a read-only file if only its folder can be written.
    return ::faccessat(place.folder.Get(), place.name.c_str(), W_OK, AT_EACCESS) == 0;
}

/// What a stranger's command file may write inside the folder.
bool OutputFiles::IsAllowed(FilePlace const &place) {
    auto const isSuffix = [&place](std::string_view suffix) { return EndsIn(place.name, suffix); };
    if (place.exists && S_ISDIR(place.status.st_mode))
        return Refuse(EISDIR, "");
    if (place.exists && !S_ISREG(place.status.st_mode))
        return Refuse(EPERM, "it is a pipe or a device, which --restrict does not allow");
    if (std::none_of(HDL_SUFFIXES.begin(), HDL_SUFFIXES.end(), isSuffix) &&
        std::none_of(restriction.suffixes.begin(), restriction.suffixes.end(), isSuffix))
        return Refuse(EPERM,
                      "its name does not end in a suffix of HDL text such as .vhd or .v, and "
                      "--restrict-suffix names no other");
    if (place.name[0] == '-')
        return Refuse(EPERM, "its name begins with \"-\", which other programs take for an option");
    if (!place.exists)
        return true;
    if (place.status.st_nlink > 1)
        // Its other name may lie outside the folder.
        return Refuse(EMLINK, "it has other names (hard links), which --restrict does not allow");
    if (!restriction.overwrite && own.count(IdentityOf(place.status)) == 0)
        return Refuse(EEXIST,
                      "it was there before this run; --restrict-overwrite allows to replace "
                      "such files");
    return true;
}

/// Opens a pipe, a device or what is open already. A pipe waits for its reader.
int OutputFiles::OpenDirectly(char const *fileName, bool append) const {
    int const flags = O_WRONLY | O_CLOEXEC | (append ? O_APPEND : O_TRUNC);
    while (!Signals::IsInterrupted()) {
        int const opened = ::open(fileName, flags);
        if (opened >= 0 || errno != EINTR)
            return opened;
    }
    errno = EINTR;
    return -1;
}

int OutputFiles::Allow(std::size_t bytes) {
    if (Signals::IsInterrupted())
        return EINTR;
    // So written, the sum cannot overflow.
    if (bytes > most - written) {
        beyondLimit = true;
        return EDQUOT;
    }
    written += bytes;
    return 0;
}

void OutputFiles::Finish(Vesk_Hdl::WriteStatus &status) {
    if (status.error == 0 && unfinished.IsBegun())
        status.error = PutInPlace();
    // Also after a failure to put it in place: the old file stays.
    unfinished.Undo();
    if (status.error == 0 || status.error == ECANCELED) // an exception reports what happened
        return;
    if (beyondLimit && status.error == EDQUOT)
        reason = "all files together would pass the " + SizeText(most) +
                 " that --max-output allows; allow more, or write less";
    else if (status.error == EINTR)
        reason = "interrupted";
    status.reason = reason.c_str();
}

/// In a restricted run a file that this run made may be written again. It is known by its inode,
/// which is another one after each write.
int OutputFiles::PutInPlace() {
    auto const made = IdentityOf(unfinished.GetStatus());
    auto const former = IdentityOf(unfinished.GetFormerStatus());
    if (confinement)
        own.insert(made);
    int const error = unfinished.Finish();
    if (error == 0 && former != made)
        own.erase(former);
    return error;
}
