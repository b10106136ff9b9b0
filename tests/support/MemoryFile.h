#pragma once

#include <string>
#include <sys/mman.h>
#include <unistd.h>

#include "vesk_hdl/Vesk_Hdl.h"

/// A file in memory.
class MemoryFile {
public:
    MemoryFile() : descriptor(::memfd_create("vesk", MFD_CLOEXEC)) {}
    MemoryFile(MemoryFile const &) = delete;
    MemoryFile &operator=(MemoryFile const &) = delete;
    ~MemoryFile() { ::close(descriptor); }

    /// A new descriptor of the file, which the caller closes.
    int Open() const { return ::dup(descriptor); }
    /// All that was written; from then on the file is empty.
    std::string Take() {
        std::string text(static_cast<std::size_t>(::lseek(descriptor, 0, SEEK_END)), '\0');
        ssize_t const got = ::pread(descriptor, text.data(), text.size(), 0);
        text.resize(got < 0 ? 0 : static_cast<std::size_t>(got));
        if (::ftruncate(descriptor, 0) == 0)
            ::lseek(descriptor, 0, SEEK_SET);
        return text;
    }

private:
    int descriptor;
};

/// Keeps what write commands write, whatever file they name.
class Capture : public Vesk_Hdl::WriteOpener {
public:
    int Open(char const *, bool) override { return file.Open(); }
    std::string Take() { return file.Take(); }

private:
    MemoryFile file;
};
