#include "tool/session/OutputFiles.h"

#include <cerrno>
#include <fcntl.h>
#include <unistd.h>
#include <utility>

int OutputFiles::Open(char const *fileName, bool append) {
    if (listener)
        listener(fileName);
    if (std::exchange(nextIsStandardOutput, false))
        return ::fcntl(STDOUT_FILENO, F_DUPFD_CLOEXEC, STDERR_FILENO + 1);
    if (confinement)
        return confinement->Open(fileName, append);
    constexpr mode_t MODE = 0666;
    int const flags = O_WRONLY | O_CREAT | O_CLOEXEC | (append ? O_APPEND : O_TRUNC);
    int opened = -1;
    do
        opened = ::open(fileName, flags, MODE);
    while (opened < 0 && errno == EINTR);
    return opened;
}
