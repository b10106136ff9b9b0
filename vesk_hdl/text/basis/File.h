#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

namespace Basis {

/// An open file. Text is written in large blocks; a file opened for reading is in memory whole, so
/// that a stream somebody forgets holds no descriptor. Made by File::open alone.
class VESK_HDL_API Stream {
public:
    enum Access : int { ACCESS_READ = 1, ACCESS_REPLACE = 2, ACCESS_APPEND = 6 };

    /// Decides block by block whether text may go to a file. A client may derive one of its own.
    class VESK_HDL_API Guard {
    public:
        virtual ~Guard();
        /// Asked before each block: 0 if so many bytes may be written, otherwise the `errno` that
        /// the write then fails with. Asked with 0 bytes when a signal interrupted a write that
        /// had to wait. It must not throw.
        virtual int Allow(std::size_t bytes) = 0;
        /// Called at the first failure, refused blocks included. It may throw to end what is being
        /// written, unless the stream is being closed or destroyed.
        virtual void Failed() = 0;
    };

    /// Releases what the stream holds. Text not yet flushed is still written, but a failure goes
    /// unseen: File::close tells it.
    ~Stream();
    Stream(Stream const &) = delete;
    Stream &operator=(Stream const &) = delete;

    /// Null writes nothing. After a failure further text is dropped.
    Stream &operator<<(char const *text);
    Stream &Write(std::string_view text);
    Stream &flush();
    /// The `errno` of the first failed write, 0 while there is none.
    int GetError() const;
    /// For a stream that is written; null, as at first, for no guard. Not owned.
    void SetGuard(Guard *guard);

    /// The next line without its end, valid as long as the stream; false when none is left.
    bool ReadLine(std::string_view &line);

private:
    friend class File;
    struct Record;
    explicit Stream(Record *opened);
    Record *record;
};

/// Opening and closing of files. Path texts are taken as they are.
class VESK_HDL_API File {
public:
    /// A new stream, owned by the caller, or null with `errno` set: also for a folder, and for a
    /// file whose reading breaks off. ACCESS_REPLACE and ACCESS_APPEND create a missing file.
    /// `fromStart` goes along with the access (true but for ACCESS_APPEND) and decides nothing.
    static Stream *open(char const *name, Stream::Access access, bool fromStart);
    /// A new stream, owned by the caller, that writes to a descriptor and closes it in the end.
    /// Null with `errno` EBADF for a negative one.
    static Stream *adopt(int descriptor);
    /// Flushes, closes and deletes the stream; null is ignored. True if all its text reached the
    /// file; otherwise false with the `errno` of the first failure.
    static bool close(Stream *stream);
};

/// Stands for the file layer's start-up, which on this platform needs no work.
class VESK_HDL_API FileInit {
public:
    FileInit();
    ~FileInit();
};

/// The name of a file as a path.
class VESK_HDL_API FileName {
public:
    FileName(char const *name);
    virtual ~FileName();
    FileName(FileName const &) = default;
    FileName &operator=(FileName const &) = default;
    /// What follows the last "/", or the whole path if there is none.
    StringBase<char> GetTail() const;

private:
    StringBase<char> path;
};

} // namespace Basis
