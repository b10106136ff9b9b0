// Runs a target once on each of the stored inputs: replay FOLDER...

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <vector>

#include "fuzz/Fuzz.h"

int main(int argc, char **argv) {
    std::vector<std::filesystem::path> files;
    for (int i = 1; i < argc; ++i)
        for (auto const &entry : std::filesystem::recursive_directory_iterator(argv[i]))
            if (entry.is_regular_file())
                files.push_back(entry.path());
    std::sort(files.begin(), files.end());
    for (std::filesystem::path const &file : files) {
        std::ifstream stream(file, std::ios::binary);
        std::string const bytes{std::istreambuf_iterator<char>(stream), {}};
        std::fprintf(stderr, "%s\n",
                     file.c_str()); // the last name is that of the input that failed
        LLVMFuzzerTestOneInput(reinterpret_cast<std::uint8_t const *>(bytes.data()), bytes.size());
    }
    std::fprintf(stderr, "%zu inputs\n", files.size());
    return files.empty() ? 1 : 0;
}
