// Files that cannot be read or written: a client learns of each, nothing is lost and no descriptor
// is left open.

#include <cerrno>
#include <csignal>
#include <filesystem>
#include <sys/resource.h>

#include <gtest/gtest.h>

#include "tests/support/Consistency.h"
#include "tests/support/Lines.h"
#include "tests/support/MemoryFile.h"
#include "tests/support/ReadFile.h"
#include "tests/support/TempDir.h"

using namespace Vesk_Hdl;
namespace fs = std::filesystem;

namespace {

/// A limit of this process, put back in the end.
class Limit {
public:
    Limit(__rlimit_resource kind, rlim_t value) : resource(kind) {
        ::getrlimit(resource, &former);
        rlimit const now = {value, former.rlim_max};
        ::setrlimit(resource, &now);
    }
    ~Limit() { ::setrlimit(resource, &former); }
    Limit(Limit const &) = delete;
    Limit &operator=(Limit const &) = delete;

private:
    __rlimit_resource resource;
    rlimit former = {};
};

std::size_t OpenDescriptors() {
    auto const all = fs::directory_iterator("/proc/self/fd");
    return static_cast<std::size_t>(std::distance(begin(all), end(all)));
}

TEST(Faults, AWriteThatFailsIsReportedAndLosesNothing) {
    TempDir folder;
    std::signal(SIGXFSZ, SIG_IGN);
    WriteFile(folder.Path("file"), "");
    struct Row {
        std::string file;
        int error;
        rlim_t largest = RLIM_INFINITY;
        rlim_t descriptors = 1024;
    };
    for (Row const &row :
         {Row{"/dev/full", ENOSPC}, Row{folder.Path(""), EISDIR}, Row{folder.Path("no/x"), ENOENT},
          Row{folder.Path("file") + "/x", ENOTDIR}, Row{folder.Path("large"), EFBIG, 300},
          Row{folder.Path("late"), EMFILE, RLIM_INFINITY, 3}}) {
        SCOPED_TRACE(row.file);
        Design design(CellsAnd("a u1.A; port q out; q u1.Y; q u2.A"));
        std::size_t const open = OpenDescriptors();
        {
            Limit const size(RLIMIT_FSIZE, row.largest);
            Limit const descriptors(RLIMIT_NOFILE, row.descriptors);
            design.model.Execute(("WRITE VHDL -NOHEADER \"" + row.file + "\"").c_str());
        }
        EXPECT_EQ(design.model.GetLastWrite().error, row.error);
        EXPECT_EQ(OpenDescriptors(), open);
        for (std::string const &path : {folder.Path("again"), folder.Path("as ever")})
            design.model.Execute(("WRITE VHDL -NOHEADER \"" + path + "\"").c_str());
        EXPECT_EQ(design.model.GetLastWrite().error, 0);
        EXPECT_EQ(ReadFile(folder.Path("again")), ReadFile(folder.Path("as ever")));
        EXPECT_NE(ReadFile(folder.Path("again")).find("q <= q_DUMMY;"), std::string::npos);
    }
}

TEST(Faults, ReadsWithoutEndLeaveNoDescriptor) {
    TempDir folder;
    WriteFile(folder.Path("good"), "NOOP\n");
    WriteFile(folder.Path("bad"), "NOOP\nbogus\nNOOP\n");
    Design design;
    std::size_t const open = OpenDescriptors();
    for (int i = 0; i < 2000; ++i) {
        EXPECT_TRUE(design.model.Read(folder.Path("good").c_str()));
        EXPECT_EQ(MessageOf([&] { design.model.Read(folder.Path("bad").c_str()); }),
                  "Command not find.\n");
        EXPECT_FALSE(design.model.Read(folder.Path("none").c_str()));
        EXPECT_FALSE(design.model.Read(folder.Path("").c_str()));
    }
    EXPECT_EQ(OpenDescriptors(), open);
    {
        Limit const none(RLIMIT_NOFILE, 3);
        EXPECT_FALSE(design.model.Read(folder.Path("good").c_str()));
    }
    EXPECT_TRUE(design.model.Read(folder.Path("good").c_str()));
}

/// The opener that a client sets opens the files instead of the library.
TEST(Faults, AClientOpensTheFiles) {
    struct Opener : WriteOpener {
        std::string asked;
        int error = 0;
        int Open(char const *fileName, bool append) override {
            asked += fileName + std::string(append ? "+ " : " ");
            errno = error;
            return -1;
        }
    } opener;
    Design design;
    design.model.SetWriteOpener(&opener);
    opener.error = EPERM;
    design.model.Execute("WRITE VHDL /no/where");
    EXPECT_EQ(design.model.GetLastWrite().error, EPERM);
    design.model.Execute("WRITE VERILOG -APPEND elsewhere");
    EXPECT_EQ(opener.asked, "/no/where elsewhere+ ");
    EXPECT_STREQ(design.model.GetLastWrite().fileName, "elsewhere");
}

/// Allows blocks of text up to a limit, and records its calls.
struct Rationing : WriteOpener {
    int Open(char const *, bool) override {
        asked += "open ";
        if (!opens)
            errno = EPERM;
        return opens ? file.Open() : -1;
    }
    int Allow(std::size_t bytes) override {
        allowed += bytes;
        return allowed > most ? EDQUOT : 0;
    }
    void Finish(WriteStatus &status) override {
        asked += "finish " + std::to_string(status.error);
        if (status.error != 0)
            status.reason = "enough";
    }

    MemoryFile file;
    bool opens = true;
    std::size_t most = SIZE_MAX;
    std::size_t allowed = 0;
    std::string asked;
};

/// A port map of 2^31 bits would take hours. The write ends at the first text that is not written.
TEST(Faults, AFailedBlockEndsTheGeneration) {
    struct Row {
        char const *name;
        bool opens;
        std::size_t most;
        int error;
    };
    for (Row const &row :
         {Row{"refused", true, 1 << 20, EDQUOT}, Row{"refused at once", true, 0, EDQUOT},
          Row{"not opened", false, SIZE_MAX, EPERM}}) {
        SCOPED_TRACE(row.name);
        Design design(CellsAnd("a u1.A; port q out; q u1.Y; q u2.A"));
        for (char const *const line : {"ADD COMPONENT WIDE", "ADD PIN WIDE D(2147483645:0) in",
                                       "ADD INSTANCE WIDE w", "ADD SIGNAL huge(2147483646:0)",
                                       "CONNECT SIGNAL huge(0:2147483645) w.D(2147483645:0)"})
            design.model.Execute(line);
        Rationing opener;
        opener.opens = row.opens;
        opener.most = row.most;
        design.model.SetWriteOpener(&opener);
        std::size_t const open = OpenDescriptors();
        design.model.Execute("WRITE VHDL x");
        EXPECT_EQ(opener.asked, "open finish " + std::to_string(row.error));
        EXPECT_EQ(OpenDescriptors(), open);
        EXPECT_EQ(design.model.GetLastWrite().error, row.error);
        EXPECT_STREQ(design.model.GetLastWrite().reason, "enough");
        // The netlist was rewritten before the first text, and is consistent.
        EXPECT_TRUE(design.netlist.GetSignal("q_DUMMY"));
        EXPECT_EQ(Inconsistency(design.netlist), "");
    }
}

/// A stream without a write command drops text that cannot be written, unless its guard throws.
TEST(Faults, AStreamAsksItsGuard) {
    struct Guard : Basis::Stream::Guard {
        int Allow(std::size_t bytes) override { return (allowed += bytes) > 5 ? EDQUOT : 0; }
        void Failed() override { ++failures; }
        std::size_t allowed = 0;
        int failures = 0;
    } guard;
    MemoryFile file;
    TextFileOutStream stream(nullptr);
    stream.SetGuard(&guard);
    stream << "nowhere";
    EXPECT_EQ(guard.failures, 1);
    stream.Adopt(file.Open());
    for (int i = 0; i < 3; ++i)
        stream << "abc\n" << OutStream::FLUSH;
    stream.Close();
    EXPECT_EQ(stream.GetError(), EDQUOT);
    EXPECT_EQ(guard.failures, 2);
    EXPECT_EQ(file.Take(), "abc\n");
}

} // namespace
