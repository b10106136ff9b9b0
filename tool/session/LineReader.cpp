#include "tool/session/LineReader.h"

#include <cerrno>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>

namespace {

constexpr std::size_t BLOCK = 64 * 1024;

} // namespace

LineReader::LineReader(std::string const &path)
    : descriptor(path == "-" ? STDIN_FILENO : ::open(path.c_str(), O_RDONLY | O_CLOEXEC)),
      error(descriptor < 0 ? errno : 0) {}

LineReader::LineReader(int ownDescriptor, std::string text)
    : descriptor(ownDescriptor), error(0), block(std::move(text)) {}

LineReader::~LineReader() {
    // Standard input belongs to the process.
    if (descriptor > STDIN_FILENO)
        ::close(descriptor);
}

bool LineReader::CanReadAgain(std::string const &path) {
    struct stat status = {};
    return path != "-" && ::stat(path.c_str(), &status) == 0 && S_ISREG(status.st_mode);
}

bool LineReader::Fill() {
    if (error != 0 || descriptor < 0)
        return false;
    block.resize(BLOCK);
    position = 0;
    ssize_t got = 0;
    do
        got = ::read(descriptor, block.data(), BLOCK);
    // A signal whose handler only sets a mark ends the read early; nothing is lost by reading
    // again.
    while (got < 0 && errno == EINTR);
    if (got < 0)
        error = errno;
    block.resize(got > 0 ? static_cast<std::size_t>(got) : 0);
    return got > 0;
}

bool LineReader::Next(std::string &line) {
    line.clear();
    bool some = false;
    while (position < block.size() || Fill()) {
        some = true;
        std::size_t const end = block.find('\n', position);
        if (end == std::string::npos) {
            line.append(block, position);
            position = block.size();
            continue;
        }
        line.append(block, position, end - position);
        position = end + 1;
        // Files from DOS end their lines in "\r\n"; a carriage return would become part of the last
        // word.
        if (!line.empty() && line.back() == '\r')
            line.pop_back();
        return true;
    }
    // A last line without an end is a line. After an error the beginning of a line is none: half a
    // command must not run.
    return some && error == 0;
}
