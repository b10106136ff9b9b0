// Files through the descriptors of the system. The streams of the standard library do not report
// which error ended a write, and let no client decide about each block.

#include "vesk_hdl/text/basis/File.h"

#include <algorithm>
#include <cerrno>
#include <exception>
#include <fcntl.h>
#include <memory>
#include <string>
#include <unistd.h>
#include <utility>

#include "vesk_hdl/text/basis/OrEmpty.h"

namespace Basis {

namespace {

constexpr std::size_t BLOCK = 64 * 1024; ///< bytes; files are read and written in such blocks

/// Reads from a descriptor up to its end; false with errno set if reading breaks off. The size of a
/// pipe or device is not known before, so that the text grows by doubling.
bool ReadAll(int descriptor, std::string &text) {
    for (;;) {
        std::size_t const old = text.size();
        std::size_t const room = std::max(BLOCK, old);
        text.resize(old + room);
        ssize_t const got = ::read(descriptor, text.data() + old, room);
        text.resize(old + static_cast<std::size_t>(got > 0 ? got : 0));
        if (got == 0 || (got < 0 && errno != EINTR))
            return got == 0;
    }
}

/// Writes a text and returns 0, or the errno that ended it. A signal does not end it unless the
/// guard says so: a client that wants to stop at Ctrl-C sets a guard.
int WriteAll(int descriptor, std::string_view text, Stream::Guard *guard) {
    int error = guard ? guard->Allow(text.size()) : 0;
    while (error == 0 && !text.empty()) {
        ssize_t const put = ::write(descriptor, text.data(), text.size());
        if (put >= 0)
            text.remove_prefix(static_cast<std::size_t>(put));
        else if (errno != EINTR)
            error = errno;
        else if (guard)
            error = guard->Allow(0);
    }
    return error;
}

} // namespace

struct Stream::Record {
    int descriptor = -1; ///< of a file that is written, otherwise -1
    int error = 0;
    Guard *guard = nullptr;
    std::string text; ///< reading: the whole file; writing: a block, empty before the first text
    std::size_t position =
        0; ///< in the text: what is before it has been read, or is not yet written

    Record() = default;
    Record(Record const &) = delete;
    Record &operator=(Record const &) = delete;
    ~Record() { Close(); }

    /// After a failure text is dropped: a file with a hole would look whole.
    void Put(std::string_view whole) {
        if (descriptor < 0 || error != 0)
            return;
        error = WriteAll(descriptor, whole, guard);
        if (error != 0 && guard)
            guard->Failed();
    }
    void Flush() {
        if (std::size_t const count = std::exchange(position, 0); count > 0)
            Put(std::string_view(text).substr(0, count));
    }
    int Close() {
        if (descriptor >= 0) {
            Flush();
            // The descriptor is closed even if a signal interrupts the call; a second call could
            // close the file of another thread.
            if (::close(descriptor) != 0 && error == 0 && errno != EINTR)
                error = errno;
            descriptor = -1;
        }
        return error;
    }
};

Stream::Stream(Record *opened) : record(opened) {}

Stream::~Stream() { delete record; }

Stream &Stream::operator<<(char const *text) { return Write(text ? text : ""); }

/// Collects text in a block, so that a line of a netlist is no call of the system.
Stream &Stream::Write(std::string_view text) {
    if (record->descriptor < 0) // a stream for reading, or one that is closed
        return *this;
    if (text.size() > record->text.size() - record->position) {
        record->Flush();
        record->text.resize(BLOCK);
        if (text.size() > BLOCK) { // would not fit into a block: it goes to the file as it is
            record->Put(text);
            return *this;
        }
    }
    text.copy(record->text.data() + record->position, text.size());
    record->position += text.size();
    return *this;
}

Stream &Stream::flush() {
    if (record->descriptor >= 0)
        record->Flush();
    return *this;
}

int Stream::GetError() const { return record->error; }
void Stream::SetGuard(Guard *guard) { record->guard = guard; }

Stream::Guard::~Guard() = default;

bool Stream::ReadLine(std::string_view &line) {
    if (record->descriptor >= 0 || record->position >= record->text.size())
        return false;
    std::string_view const rest = std::string_view(record->text).substr(record->position);
    std::size_t const end = rest.find('\n');
    line = rest.substr(0, end);
    record->position += end == std::string_view::npos ? rest.size() : end + 1;
    if (end != std::string_view::npos && !line.empty() && line.back() == '\r')
        line.remove_suffix(1);
    return true;
}

Stream *File::open(char const *name, Stream::Access access, bool) {
    int const flags = access == Stream::ACCESS_READ     ? O_RDONLY
                      : access == Stream::ACCESS_APPEND ? O_WRONLY | O_CREAT | O_APPEND
                                                        : O_WRONLY | O_CREAT | O_TRUNC;
    auto record = std::make_unique<Stream::Record>();
    // Opening a pipe waits for its other end, and a signal may interrupt that.
    do
        record->descriptor = ::open(OrEmpty(name), flags | O_CLOEXEC, 0666);
    while (record->descriptor < 0 && errno == EINTR);
    if (record->descriptor < 0)
        return nullptr;
    if (access == Stream::ACCESS_READ) {
        int error = ENOMEM;
        try {
            error = ReadAll(record->descriptor, record->text) ? 0 : errno;
        } catch (std::exception const &) { // more than the memory holds, as from an endless device
        }
        // The file is closed before the first line runs: one that fails leaves no descriptor open.
        ::close(record->descriptor);
        record->descriptor = -1;
        if (error != 0) {
            errno = error;
            return nullptr;
        }
    }
    auto *const stream = new Stream(record.get());
    record.release();
    return stream;
}

Stream *File::adopt(int descriptor) {
    if (descriptor < 0) {
        errno = EBADF;
        return nullptr;
    }
    auto record = std::make_unique<Stream::Record>();
    auto *const stream = new Stream(record.get());
    record.release()->descriptor = descriptor; // last: on a failure it stays the caller's
    return stream;
}

bool File::close(Stream *stream) {
    if (!stream)
        return true;
    int const error = stream->record->Close();
    delete stream;
    if (error != 0)
        errno = error;
    return error == 0;
}

FileInit::FileInit() = default;
FileInit::~FileInit() = default;

FileName::FileName(char const *name) : path(name) {}
FileName::~FileName() = default;

StringBase<char> FileName::GetTail() const {
    unsigned int const slash = path.GetIndexOfLastChar('/', 0);
    return slash == NOT_FOUND ? path : StringBase<char>(path.View().substr(slash + 1));
}

} // namespace Basis
