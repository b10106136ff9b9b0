#include "tool/session/LineStore.h"

#include <cerrno>
#include <cstdlib>
#include <fcntl.h>
#include <unistd.h>
#include <utility>

namespace {

constexpr std::size_t MAX_IN_MEMORY = 1024 * 1024;

/// A file that ends with its descriptor, -1 if there is no place for it.
int OpenUnnamed() {
    char const *const asked = std::getenv("TMPDIR");
    std::string const folder = asked && *asked ? asked : "/tmp";
    int const file = ::open(folder.c_str(), O_TMPFILE | O_RDWR | O_CLOEXEC, 0600);
    if (file >= 0)
        return file;
    // Not every file system makes files without a name.
    std::string name = folder + "/vesk-hdl.XXXXXX";
    int const named = ::mkostemp(name.data(), O_CLOEXEC);
    if (named >= 0)
        ::unlink(name.c_str());
    return named;
}

bool WriteAll(int file, std::string const &text) {
    for (std::size_t done = 0; done < text.size();) {
        ssize_t const count = ::write(file, text.data() + done, text.size() - done);
        if (count < 0 && errno == EINTR)
            continue;
        if (count <= 0)
            return false;
        done += static_cast<std::size_t>(count);
    }
    return true;
}

} // namespace

LineStore::~LineStore() {
    if (file >= 0)
        ::close(file);
}

void LineStore::Add(std::string const &line) {
    // Without the lines the findings are reported all the same, but the source is not shown.
    if (isLost)
        return;
    // With both characters, so that a line that ends in a carriage return keeps it.
    block.append(line).append("\r\n");
    if (block.size() > MAX_IN_MEMORY && !Flush()) {
        isLost = true;
        block = {};
    }
}

bool LineStore::Flush() {
    if (file < 0)
        file = OpenUnnamed();
    if (file < 0 || !WriteAll(file, block))
        return false;
    block.clear();
    return true;
}

std::unique_ptr<LineReader> LineStore::Read() {
    if (isLost)
        return std::make_unique<LineReader>(-1, std::string());
    if (file < 0)
        return std::make_unique<LineReader>(-1, block);
    if (!Flush() || ::lseek(file, 0, SEEK_SET) != 0)
        return std::make_unique<LineReader>(-1, std::string());
    // A descriptor of its own for the reader, which closes it. Both share the position in the file:
    // that is why there is one reader at a time.
    return std::make_unique<LineReader>(::fcntl(file, F_DUPFD_CLOEXEC, 3), std::string());
}
