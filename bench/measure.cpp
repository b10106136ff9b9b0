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

void Limit(decltype(RLIMIT_CPU) resource, double most) {
    auto const value = static_cast<rlim_t>(most);
    rlimit const limit = {value, value};
    if (::setrlimit(resource, &limit) != 0)
        ::_exit(127);
}

/// In the child process, before it becomes the program.
[[noreturn]] void Become(char *const *arguments, char const *folder, bool quiet,
                         Limits const *limits) {
    if (limits) {
        Limit(RLIMIT_CPU, limits->cpu);
        Limit(RLIMIT_AS, limits->memory);
    }
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

namespace {

/// How a program ended, and at what cost.
struct Run {
    Cost cost;
    int status;
};

Run Start(std::vector<std::string> words, fs::path const &folder, bool quiet,
          Limits const *limits) {
    std::vector<char *> arguments;
    for (std::string &word : words)
        arguments.push_back(word.data());
    arguments.push_back(nullptr);

    auto const begin = std::chrono::steady_clock::now();
    pid_t const process = ::fork();
    if (process == 0)
        Become(arguments.data(), folder.c_str(), quiet, limits);
    int status = 0;
    rusage usage = {};
    if (process < 0 || ::wait4(process, &status, 0, &usage) < 0)
        throw std::system_error(errno, std::generic_category(), words[0]);
    std::chrono::duration<double> const wall = std::chrono::steady_clock::now() - begin;
    return {{wall.count(), Seconds(usage.ru_utime) + Seconds(usage.ru_stime),
             1024.0 * static_cast<double>(usage.ru_maxrss)},
            status};
}

} // namespace

Cost RunProgram(std::vector<std::string> words, fs::path const &folder, bool quiet) {
    std::string const name = words[0];
    Run const run = Start(std::move(words), folder, quiet, nullptr);
    if (!WIFEXITED(run.status) || WEXITSTATUS(run.status) != 0)
        throw std::runtime_error(name + ": failed in " + folder.string());
    return run.cost;
}

std::optional<Cost> TryProgram(std::vector<std::string> words, fs::path const &folder,
                               Limits const &limits) {
    std::string const name = words[0];
    Run const run = Start(std::move(words), folder, true, &limits);
    // The tool also ends with 1 when it is out of memory. It may do so well below the limit: a
    // buffer that doubles needs the old memory and the new.
    if (!WIFEXITED(run.status) || run.cost.peak > limits.memory / 4)
        return std::nullopt;
    if (WEXITSTATUS(run.status) > 1)
        throw std::runtime_error(name + ": failed in " + folder.string());
    return run.cost;
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
