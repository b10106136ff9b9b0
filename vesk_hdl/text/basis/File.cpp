#include "vesk_hdl/text/basis/File.h"

#include <cerrno>
#include <fcntl.h>
#include <memory>
#include <string>
#include <unistd.h>

namespace Basis {

namespace {

constexpr std::size_t BLOCK = 64 * 1024;

/// Reads all there is behind a descriptor; false with errno set if reading breaks off.
bool ReadAll(int descriptor, std::string &text) {
    for (std::size_t room = BLOCK;; room = text.size()) {
        std::size_t const old = text.size();
        text.resize(old + room);
        ssize_t const got = ::read(descriptor, text.data() + old, room);
        if (got < 0 && errno == EINTR) {
            text.resize(old);
            continue;
        }
        text.resize(old + static_cast<std::size_t>(got > 0 ? got : 0));
        if (got <= 0)
            return got == 0;
        if (text.empty())
            return true;
    }
}

int WriteAll(int descriptor, std::string_view text) {
    while (!text.empty()) {
        ssize_t const put = ::write(descriptor, text.data(), text.size());
        if (put < 0 && errno != EINTR)
            return errno;
        if (put > 0)
            text.remove_prefix(static_cast<std::size_t>(put));
    }
    return 0;
}

} // namespace

struct Stream::Record {
    int descriptor = -1; ///< of a file that is written, otherwise -1
    int error = 0;
    std::string text; ///< written: what is not yet in the file; read: the whole file
    std::size_t position = 0;

    void Flush() {
        if (descriptor >= 0 && error == 0)
            error = WriteAll(descriptor, text);
        text.clear();
    }
    int Close() {
        if (descriptor >= 0) {
            Flush();
            if (::close(descriptor) != 0 && error == 0 && errno != EINTR)
                error = errno;
            descriptor = -1;
        }
        return error;
    }
};

Stream::Stream(Record *opened) : record(opened) {}

Stream::~Stream() {
    record->Close();
    delete record;
}

Stream &Stream::operator<<(char const *text) { return Write(text ? text : ""); }

Stream &Stream::Write(std::string_view text) {
    if (record->descriptor < 0)
        return *this;
    record->text.append(text);
    if (record->text.size() >= BLOCK)
        record->Flush();
    return *this;
}

Stream &Stream::flush() {
    if (record->descriptor >= 0)
        record->Flush();
    return *this;
}

int Stream::GetError() const { return record->error; }

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
    int const descriptor = ::open(name ? name : "", flags | O_CLOEXEC, 0666);
    if (descriptor < 0)
        return nullptr;
    if (access == Stream::ACCESS_READ) {
        bool whole = false;
        int error = ENOMEM;
        try {
            whole = ReadAll(descriptor, record->text);
            error = errno;
        } catch (...) {
            ::close(descriptor);
            throw;
        }
        ::close(descriptor);
        if (!whole) {
            errno = error;
            return nullptr;
        }
    } else {
        record->descriptor = descriptor;
    }
    return new Stream(record.release());
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
