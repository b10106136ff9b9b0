#pragma once

#include <functional>
#include <limits>
#include <optional>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "tool/session/Confinement.h"
#include "tool/session/InputFiles.h"
#include "tool/session/UnfinishedFile.h"
#include "vesk_hdl/Vesk_Hdl.h"

/// What a command file may do with the files of a folder that it may not leave.
struct Restriction {
    std::string folder; ///< empty for no restriction
    bool overwrite = false;
    /// What names may end in, with the point, beside the suffixes of HDL text.
    std::vector<std::string> suffixes;
};

/// Opens the files of write commands for the tool. A regular file becomes complete or stays as it
/// was; pipes, devices and standard output are written as the text comes.
class OutputFiles : public Vesk_Hdl::WriteOpener {
public:
    /// From now on files are refused that the restriction does not allow. Throws as Confinement
    /// does.
    void Restrict(Restriction const &wanted);
    /// For files that the user named.
    void Unrestrict() { confinement.reset(); }
    /// Files that are read in this run and are not to be written. Not owned.
    void Protect(InputFiles const *files) { inputs = files; }
    /// The most bytes that all files together may get.
    void SetLimit(unsigned long long bytes) { most = bytes; }
    /// Whether the last write failed because it would have passed the limit.
    bool IsBeyondLimit() const { return beyondLimit; }
    /// `heard` is called with the name of each file before it is opened.
    void SetListener(std::function<void(char const *)> heard) { listener = std::move(heard); }
    /// The next file is standard output, whatever its name.
    void SendNextToStandardOutput() { nextIsStandardOutput = true; }

    int Open(char const *fileName, bool append) override;
    int Allow(std::size_t bytes) override;
    void Finish(Vesk_Hdl::WriteStatus &status) override;

private:
    bool Refuse(int error, std::string why);
    bool Find(char const *fileName, FilePlace &place);
    bool IsAllowed(FilePlace const &place);
    int PutInPlace();
    int OpenDirectly(char const *fileName, bool append) const;

    std::optional<Confinement> confinement;
    Restriction restriction;
    InputFiles const *inputs = nullptr;
    std::set<std::pair<dev_t, ino_t>> own; ///< the files that this run made
    unsigned long long most = std::numeric_limits<unsigned long long>::max();
    unsigned long long written = 0;
    bool beyondLimit = false;
    std::function<void(char const *)> listener;
    bool nextIsStandardOutput = false;
    UnfinishedFile unfinished;
    std::string reason; ///< why the last write failed, if `errno` does not say it
};
