#pragma once

#include <filesystem>
#include <limits>
#include <optional>
#include <string>
#include <vector>

/// What a run of a program costs, or the least of several runs.
struct Cost {
    double wall = std::numeric_limits<double>::infinity(); ///< in seconds
    double cpu = std::numeric_limits<double>::infinity();  ///< in seconds, user and system
    double peak = std::numeric_limits<double>::infinity(); ///< resident, in bytes

    void Lower(Cost const &other);
};

/// Runs a program, its name and its arguments, in a folder, and waits for it. Without a path the
/// name is looked for as a shell does. A program that fails raises std::runtime_error. What it
/// prints is dropped if it is `quiet`.
Cost RunProgram(std::vector<std::string> words, std::filesystem::path const &folder, bool quiet);

/// What a program may use before it is stopped.
struct Limits {
    double cpu;    ///< in seconds, whole ones
    double memory; ///< in bytes, of addresses
};

/// The same, quietly, for a program that may take too long. An exit code of 0 or 1 is a success;
/// nothing comes back from a run that met a limit.
std::optional<Cost> TryProgram(std::vector<std::string> words, std::filesystem::path const &folder,
                               Limits const &limits);

/// A folder that goes away with this object.
class ScratchFolder {
public:
    ScratchFolder();
    ~ScratchFolder();
    ScratchFolder(ScratchFolder const &) = delete;
    ScratchFolder &operator=(ScratchFolder const &) = delete;

    std::filesystem::path const &GetPath() const { return path; }

private:
    std::filesystem::path path;
};
