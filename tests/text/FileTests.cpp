#include "vesk_hdl/text/basis/File.h"

#include <cerrno>
#include <chrono>
#include <csignal>
#include <fcntl.h>
#include <memory>
#include <pthread.h>
#include <sys/stat.h>
#include <thread>
#include <unistd.h>

#include <gtest/gtest.h>

#include "tests/support/ReadFile.h"
#include "tests/support/TempDir.h"

using Basis::File;
using Basis::Stream;
using Text = Basis::StringBase<char>;

namespace {

std::unique_ptr<Stream> OpenToRead(std::string const &path) {
    return std::unique_ptr<Stream>(File::open(path.c_str(), Stream::ACCESS_READ, true));
}

TEST(File, ReadsLinesWithoutTheirEnds) {
    TempDir const folder;
    std::string const longLine(200000, 'x');
    using Row = std::pair<char const *, char const *>;
    for (auto const &[bytes, expected] :
         {Row{"", ""}, Row{"\n\na\n\n", "||a||"}, Row{"\xFF\n\xE4\n", "\xFF|\xE4|"},
          Row{"a\r\n\r\nb\rc\n", "a||b\rc|"}}) {
        WriteFile(folder.Path("in"), bytes + longLine); // which no line end follows
        auto const stream = OpenToRead(folder.Path("in"));
        std::string lines;
        for (Text line; line.ReadLine(stream.get());)
            lines += std::string(line) + '|';
        EXPECT_EQ(lines, expected + longLine + '|');
    }
}

TEST(File, AForgottenReadingStreamHoldsNoDescriptor) {
    TempDir const folder;
    auto openDescriptors = [] {
        return std::distance(std::filesystem::directory_iterator("/proc/self/fd"), {});
    };
    std::ptrdiff_t const before = openDescriptors();
    Stream *const written = File::open(folder.Path("a").c_str(), Stream::ACCESS_REPLACE, true);
    EXPECT_EQ(openDescriptors(), before + 1);
    EXPECT_TRUE(File::close(written));
    auto const stream = OpenToRead(folder.Path("a"));
    EXPECT_TRUE(stream && !OpenToRead(folder.Path(""))); // nor does a folder, which is refused
    EXPECT_EQ(openDescriptors(), before);
}

/// A signal during the first read must not be taken for the end of the file.
TEST(File, ReadsWholeInSpiteOfSignals) {
    TempDir const folder;
    std::string const path = folder.Path("fifo");
    ASSERT_EQ(mkfifo(path.c_str(), 0600), 0);
    struct sigaction interrupt = {};
    interrupt.sa_handler = [](int) {};
    sigaction(SIGUSR1, &interrupt, nullptr);
    sigaction(SIGPIPE, &interrupt, nullptr);
    std::thread writer([&path, reader = pthread_self()] {
        int const end = ::open(path.c_str(), O_WRONLY);
        std::this_thread::sleep_for(std::chrono::milliseconds(50));
        pthread_kill(reader, SIGUSR1);
        std::this_thread::sleep_for(std::chrono::milliseconds(50));
        EXPECT_EQ(::write(end, "line", 4), 4);
        ::close(end);
    });
    Text line;
    EXPECT_TRUE(line.ReadLine(OpenToRead(path).get()));
    writer.join();
}

} // namespace
