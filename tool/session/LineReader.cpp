#include "tool/session/LineReader.h"

#include <cerrno>
#include <fcntl.h>
#include <unistd.h>

namespace {

constexpr std::size_t BLOCK = 64 * 1024;

} // namespace

LineReader::LineReader(std::string const &path)
    : descriptor(path == "-" ? STDIN_FILENO : ::open(path.c_str(), O_RDONLY | O_CLOEXEC)),
      error(descriptor < 0 ? errno : 0), position(0) {}

LineReader::~LineReader() {
    if (descriptor > STDIN_FILENO)
        ::close(descriptor);
}

bool LineReader::Fill() {
    if (error != 0)
        return false;
    block.resize(BLOCK);
    position = 0;
    ssize_t got = 0;
    do
        got = ::read(descriptor, block.data(), BLOCK);
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
        if (!line.empty() && line.back() == '\r')
            line.pop_back();
        return true;
    }
    return some && error == 0;
}
