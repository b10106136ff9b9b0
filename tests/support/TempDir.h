#pragma once

#include <filesystem>
#include <stdexcept>
#include <stdlib.h>
#include <string>

/// A fresh folder under the system's temporary one, gone with this object.
class TempDir {
public:
    TempDir() : folder((std::filesystem::temp_directory_path() / "vesk-XXXXXX").string()) {
        if (!mkdtemp(folder.data()))
            throw std::runtime_error("no temporary folder " + folder);
    }
    ~TempDir() {
        std::error_code ignored;
        std::filesystem::remove_all(folder, ignored);
    }
    TempDir(TempDir const &) = delete;
    TempDir &operator=(TempDir const &) = delete;

    std::string Path(std::string const &name) const { return folder + "/" + name; }

private:
    std::string folder;
};
