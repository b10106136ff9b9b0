#include "tool/check/WrittenText.h"

#include <algorithm>
#include <cassert>
#include <cerrno>
#include <sys/mman.h>
#include <system_error>
#include <unistd.h>

using namespace Vesk_Hdl;

namespace Checks {

std::string WrittenText::Plain(Write const &write) {
    TextMemOutStream memory;
    write(memory);
    return std::string(memory.GetValue().View());
}

void WrittenText::Take(int level, Write const &write) {
    plain = Plain(write);
    folds.clear();
    if (!MayFold(level))
        return;
    // A file has further blanks and ends of lines, and nothing else, in addition to the plain text.
    std::size_t at = 0;
    for (char const c : TakeFile(level, write))
        if (at < plain.size() && c == plain[at])
            ++at;
        else if (c == '\n')
            folds.push_back(at);
    assert(at == plain.size());
}

/// A short cut: most statements are shorter than any line that folds.
bool WrittenText::MayFold(int level) const {
    constexpr std::size_t MAX_COLUMNS = 80;
    constexpr std::size_t LEVEL_COLUMNS = 3;
    std::size_t const indentation = LEVEL_COLUMNS * static_cast<std::size_t>(level);
    for (std::size_t begin = 0; begin < plain.size();) {
        std::size_t const end = std::min(plain.find('\n', begin), plain.size());
        if (indentation + (end - begin) > MAX_COLUMNS)
            return true;
        begin = end + 1;
    }
    return false;
}

/// Folding is known to file streams alone, so that this has to be a file.
std::string WrittenText::TakeFile(int level, Write const &write) {
    if (!file.IsOpen()) {
        file = Descriptor(::memfd_create("vesk-hdl", MFD_CLOEXEC));
        if (!file.IsOpen() || !stream.Adopt(::dup(file.Get())))
            throw std::system_error(errno, std::generic_category());
    }
    for (int i = 0; i < level; ++i)
        stream.Indent();
    write(stream);
    for (int i = 0; i < level; ++i)
        stream.Unindent();
    // Statements end their lines: nothing stays in the stream but what a flush brings to the file.
    stream << OutStream::FLUSH;
    if (stream.GetError() != 0)
        throw std::system_error(stream.GetError(), std::generic_category());
    return ReadOn();
}

/// What was written since the last call. The file begins anew when it is large: to empty it takes
/// longer than to read a statement.
std::string WrittenText::ReadOn() {
    constexpr std::size_t PIECE = 4096;
    constexpr off_t MAX_SIZE = 1024 * 1024;
    std::string text;
    char piece[PIECE];
    ssize_t count = 0;
    do {
        count = ::pread(file.Get(), piece, sizeof piece, readUpTo);
        if (count < 0)
            throw std::system_error(errno, std::generic_category());
        text.append(piece, static_cast<std::size_t>(count));
        readUpTo += count;
    } while (count == sizeof piece);
    if (readUpTo > MAX_SIZE) {
        readUpTo = 0;
        if (::ftruncate(file.Get(), 0) != 0 || ::lseek(file.Get(), 0, SEEK_SET) != 0)
            throw std::system_error(errno, std::generic_category());
    }
    return text;
}

/// A line folds after a blank. So a text is whole if the line folds at its beginning, and broken if
/// it folds after its last character.
bool WrittenText::IsFoldedWithin(std::size_t begin, std::size_t end) const {
    auto const fold = std::upper_bound(folds.begin(), folds.end(), begin);
    return fold != folds.end() && *fold <= end;
}

} // namespace Checks
