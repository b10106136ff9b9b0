#include "tool/check/WrittenText.h"

#include <algorithm>
#include <cassert>
#include <cerrno>
#include <sys/mman.h>
#include <system_error>
#include <unistd.h>

using namespace Vesk_Hdl;

namespace Checks {

namespace {

/// Appends to a string, which a TextMemOutStream could only copy out.
class StringDst : public StreamDst {
public:
    explicit StringDst(std::string &to) : text(to) {}
    void Write(char const *piece) override { text += piece; }
    void Write(int number) override { text += std::to_string(number); }

private:
    std::string &text;
};

[[noreturn]] void RaiseError(int error) { throw std::system_error(error, std::generic_category()); }

} // namespace

std::string WrittenText::Plain(Write const &write) {
    std::string text;
    OutStream stream(new StringDst(text));
    write(stream);
    return text;
}

WrittenText::WrittenText() : memory(new StringDst(plain)) {}

bool WrittenText::Add(int level, Write const &write) {
    lastBegin = plain.size();
    write(memory);
    bool const mayFold = MayFold(level);
    if (mayFold)
        AddToFile(level, write);
    else
        plain.resize(lastBegin);
    return mayFold;
}

/// Most statements are shorter than any line that folds.
bool WrittenText::MayFold(int level) const {
    constexpr std::size_t MAX_COLUMNS = 80;
    constexpr std::size_t LEVEL_COLUMNS = 3;
    std::size_t const indentation = LEVEL_COLUMNS * static_cast<std::size_t>(level);
    for (std::size_t begin = lastBegin; begin < plain.size();) {
        std::size_t const end = std::min(plain.find('\n', begin), plain.size());
        if (indentation + (end - begin) > MAX_COLUMNS)
            return true;
        begin = end + 1;
    }
    return false;
}

/// Folding is known to file streams alone, so that this has to be a file.
void WrittenText::AddToFile(int level, Write const &write) {
    if (!file.IsOpen()) {
        file = Descriptor(::memfd_create("vesk-hdl", MFD_CLOEXEC));
        if (!file.IsOpen() || !stream.Adopt(::dup(file.Get())))
            RaiseError(errno);
    }
    for (int i = 0; i < level; ++i)
        stream.Indent();
    write(stream);
    for (int i = 0; i < level; ++i)
        stream.Unindent();
}

/// A file has further blanks and ends of lines, and nothing else, in addition to the plain text.
void WrittenText::ReadFolds() {
    if (plain.empty())
        return;
    std::size_t at = 0;
    for (char const c : TakeFile())
        if (at < plain.size() && c == plain[at])
            ++at;
        else if (c == '\n')
            folds.push_back(at);
    assert(at == plain.size());
}

/// What the file holds, which is empty then.
std::string WrittenText::TakeFile() {
    // Statements end their lines: nothing stays in the stream but what a flush brings to the file.
    stream << OutStream::FLUSH;
    if (stream.GetError() != 0)
        RaiseError(stream.GetError());
    off_t const size = ::lseek(file.Get(), 0, SEEK_END);
    std::string text(size > 0 ? static_cast<std::size_t>(size) : 0, '\0');
    std::size_t count = 0;
    while (count < text.size()) {
        ssize_t const more =
            ::pread(file.Get(), &text[count], text.size() - count, static_cast<off_t>(count));
        if (more <= 0)
            RaiseError(more < 0 ? errno : EIO);
        count += static_cast<std::size_t>(more);
    }
    // The stream writes at the position that it shares with this descriptor.
    if (size < 0 || ::ftruncate(file.Get(), 0) != 0 || ::lseek(file.Get(), 0, SEEK_SET) != 0)
        RaiseError(errno);
    return text;
}

/// A line folds after a blank. So a text is whole if the line folds at its beginning, and broken if
/// it folds after its last character.
bool WrittenText::IsFoldedWithin(Range const &part) const {
    auto const fold = std::upper_bound(folds.begin(), folds.end(), part.begin);
    return fold != folds.end() && *fold <= part.end;
}

void WrittenText::Clear() {
    plain.clear();
    folds.clear();
    lastBegin = 0;
}

} // namespace Checks
