#include "bench/measure.h"

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <fcntl.h>
#include <stdexcept>
#include <sys/resource.h>
#include <sys/wait.h>
#include <system_error>
#include <unistd.h>

namespace {

namespace fs = std::filesystem;

double Seconds(timeval const &time) {
    return static_cast<double>(time.tv_sec) + 1e-6 * static_cast<double>(time.tv_usec);
}

/// In the child, which has nothing but to become the program.
[[noreturn]] void Become(char *const *arguments, char const *folder, bool quiet) {
    int const nothing = ::open("/dev/null", O_RDWR);
    if (quiet && (::dup2(nothing, STDOUT_FILENO) < 0 || ::dup2(nothing, STDERR_FILENO) < 0))
        ::_exit(127);
    if (::dup2(nothing, STDIN_FILENO) >= 0 && ::chdir(folder) == 0)
        ::execvp(arguments[0], arguments);
    ::_exit(127);
}

} // namespace

void Cost::Lower(Cost const &other) {
    wall = std::min(wall, other.wall);
    cpu = std::min(cpu, other.cpu);
    peak = std::min(peak, other.peak);
}

Cost RunProgram(std::vector<std::string> words, fs::path const &folder, bool quiet) {
    std::vector<char *> arguments;
    for (std::string &word : words)
        arguments.push_back(word.data());
    arguments.push_back(nullptr);

    auto const begin = std::chrono::steady_clock::now();
    pid_t const process = ::fork();
    if (process == 0)
        Become(arguments.data(), folder.c_str(), quiet);
    int status = 0;
    rusage usage = {};
    if (process < 0 || ::wait4(process, &status, 0, &usage) < 0)
        throw std::system_error(errno, std::generic_category(), words[0]);
    std::chrono::duration<double> const wall = std::chrono::steady_clock::now() - begin;
    if (!WIFEXITED(status) || WEXITSTATUS(status) != 0)
        throw std::runtime_error(words[0] + ": failed in " + folder.string());
    return {wall.count(), Seconds(usage.ru_utime) + Seconds(usage.ru_stime),
            1024.0 * static_cast<double>(usage.ru_maxrss)};
}

ScratchFolder::ScratchFolder() {
    std::string name = (fs::temp_directory_path() / "vesk_hdl_bench.XXXXXX").string();
    if (!::mkdtemp(name.data()))
        throw std::system_error(errno, std::generic_category(), name);
    path = name;
}

ScratchFolder::~ScratchFolder() {
    std::error_code ignored;
    fs::remove_all(path, ignored);
}
