// Runs each design.cmd under golden/ and compares what it writes, byte for byte, with the files in
// the same folder. golden/README.md says how to add a design and how to accept new output.

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <map>
#include <regex>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "tests/support/ReadFile.h"
#include "tests/support/TempDir.h"
#include "vesk_hdl/Vesk_Hdl.h"

namespace {

namespace fs = std::filesystem;
using Files = std::map<std::string, std::string>; ///< text by name

fs::path const FOLDER = fs::path(VESK_HDL_TESTS_DIR) / "golden";

std::vector<std::string> Designs() {
    std::vector<std::string> names;
    for (fs::directory_entry const &entry : fs::directory_iterator(FOLDER))
        if (entry.is_directory())
            names.push_back(entry.path().filename().string());
    std::sort(names.begin(), names.end());
    return names;
}

/// Masks the time of writing, which is in the eighth line of a header, after comment mark, logo and
/// label. Text that has not the form of a time is left, so that the comparison fails.
std::string WithoutTime(std::string const &text) {
    static std::regex const TIME(R"(((--|//)\2{39}\n(?:.*\n){6}\2.{16}Timestamp : ))"
                                 R"(\d\d/\d\d/\d{4} \d\d:\d\d:\d\d\n)");
    return std::regex_replace(text, TIME, "$1MM/DD/YYYY hh:mm:ss\n");
}

Files WrittenBy(fs::path const &commandFile) {
    TempDir const folder;
    struct Visit {
        fs::path const home = fs::current_path();
        ~Visit() { fs::current_path(home); }
    } const visit;
    fs::current_path(folder.Path(""));
    Vesk_Hdl::Engine engine;
    try {
        EXPECT_TRUE(engine.ReadCommandFile("golden", commandFile.c_str()));
    } catch (Vesk_Hdl::Exception const &refusal) {
        ADD_FAILURE() << refusal.getDescription();
    }
    Files files;
    for (fs::directory_entry const &entry : fs::recursive_directory_iterator("."))
        files[entry.path().lexically_normal().string()] = WithoutTime(ReadFile(entry.path()));
    return files;
}

Files ExpectedIn(fs::path const &folder) {
    Files files;
    for (fs::directory_entry const &entry : fs::directory_iterator(folder)) {
        std::string const name = entry.path().filename().string();
        if (name != "design.cmd" && name != "judge")
            files[name] = ReadFile(entry.path());
    }
    return files;
}

class Golden : public testing::TestWithParam<std::string> {};

TEST_P(Golden, WritesWhatLiesBesideIt) {
    fs::path const folder = FOLDER / GetParam();
    Files const written = WrittenBy(folder / "design.cmd");
    Files expected = ExpectedIn(folder);
    if (std::getenv("VESK_HDL_ACCEPT_GOLDEN")) {
        for (auto const &[name, text] : expected)
            fs::remove(folder / name);
        for (auto const &[name, text] : written)
            WriteFile(folder / name, text);
        expected = written;
    }
    for (auto const &[name, text] : written)
        EXPECT_TRUE(expected.count(name)) << name << " was written and is not expected";
    for (auto const &[name, text] : expected)
        if (written.count(name))
            EXPECT_EQ(text, written.at(name)) << name;
        else
            ADD_FAILURE() << name << " was not written";
}

std::string TestName(testing::TestParamInfo<std::string> const &folder) {
    std::string name = folder.param;
    std::replace(name.begin(), name.end(), '-', '_');
    return name;
}
INSTANTIATE_TEST_SUITE_P(Designs, Golden, testing::ValuesIn(Designs()), TestName);

} // namespace
