#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

namespace Basis {

/// An open file, made by File::open or File::adopt and ended by File::close.
///
/// A stream for writing collects text into blocks of 64 kB. A stream for reading holds the whole
/// text of the file in memory and no descriptor, so that one that a client forgets costs memory
/// only. A stream is for one thread.
class VESK_HDL_API Stream {
public:
    /// How a file is opened. The values are part of the interface.
    enum Access : int {
        ACCESS_READ = 1,    ///< for reading
        ACCESS_REPLACE = 2, ///< for writing from the start; what the file held is lost
        ACCESS_APPEND = 6   ///< for writing at the end
    };

    /// Decides for each block whether it may go to a file. A client may derive one of its own, for
    /// instance to limit how much is written.
    class VESK_HDL_API Guard {
    public:
        /// The stream does not own its guard. A guard that ends before its stream has to be removed
        /// with SetGuard(nullptr) first.
        virtual ~Guard();
        /// Called before each block with its size in bytes. 0 lets the block pass; any other value
        /// is the `errno` that the write then fails with. Called with 0 bytes when a signal
        /// interrupted a write that had to wait, so that the client can give up. It must not throw.
        virtual int Allow(std::size_t bytes) = 0;
        /// Called at the first failure, a refused block included. It may throw to end what is being
        /// written, unless the stream is being closed or destroyed.
        virtual void Failed() = 0;
    };

    /// Writes text that is not in the file yet and closes the file. A failure at this point is
    /// lost: only File::close reports it.
    ~Stream();
    Stream(Stream const &) = delete;
    Stream &operator=(Stream const &) = delete;

    /// Appends text up to its NUL. Null writes nothing. After a failure, and on a stream for
    /// reading, text is dropped.
    Stream &operator<<(char const *text);
    /// Appends text of a known length, with all its bytes. Otherwise like operator<<.
    Stream &Write(std::string_view text);
    /// Hands collected text to the system. It does not ask the system to reach the disk.
    Stream &flush();
    /// The `errno` of the first failed write, 0 as long as there is none. Text that is still
    /// collected has not failed yet: flush first.
    int GetError() const;
    /// Sets the guard of a stream for writing; null, the initial state, for none. The guard is not
    /// owned and must live until it is replaced or the stream ends.
    void SetGuard(Guard *guard);

    /// Reads the next line, without its end ("\n" or "\r\n"). The view is valid until the stream
    /// ends. A last line without an end counts as a line. False, and `line` as it was, when no line
    /// is left and on a stream for writing.
    bool ReadLine(std::string_view &line);

private:
    friend class File;
    struct Record;
    explicit Stream(Record *opened);
    Record *record;
};

/// Opens and closes files. Paths go to the system unchanged: no byte is converted, no variable
/// expanded.
class VESK_HDL_API File {
public:
    /// Opens a file and returns a new stream, which the caller ends with close. ACCESS_REPLACE and
    /// ACCESS_APPEND create a missing file. Null with `errno` set if the file cannot be opened, and
    /// with ACCESS_READ also if reading breaks off (a folder) or the text does not fit into memory
    /// (ENOMEM). A null name counts as empty. `fromStart` accompanies the access (true except for
    /// ACCESS_APPEND) and has no effect.
    static Stream *open(char const *name, Stream::Access access, bool fromStart);
    /// A new stream that writes to a descriptor which is open for writing. The stream owns the
    /// descriptor and closes it. Null with `errno` EBADF for a negative one. If it throws for lack
    /// of memory, the descriptor is still the caller's.
    static Stream *adopt(int descriptor);
    /// Writes what is left, closes the file and deletes the stream, also if a write fails. True if
    /// all text reached the file, otherwise false with the `errno` of the first failure. Null is
    /// ignored and gives true.
    static bool close(Stream *stream);
};

/// Represents the start and end of the file layer, which on this platform need no work.
class VESK_HDL_API FileInit {
public:
    /// Does nothing: files can be used before an object of this class exists.
    FileInit();
    /// Does nothing: open streams stay open.
    ~FileInit();
};

/// The path of a file. It is only text: the file need not exist.
class VESK_HDL_API FileName {
public:
    /// Copies the path. Null counts as empty.
    FileName(char const *name);
    /// Frees the copy.
    virtual ~FileName();
    /// An independent copy.
    FileName(FileName const &) = default;
    /// Replaces the path by that of another object.
    FileName &operator=(FileName const &) = default;
    /// The last component: what follows the last "/", or the whole path if there is none. A drive
    /// prefix or a backslash is ordinary text.
    StringBase<char> GetTail() const;

private:
    StringBase<char> path;
};

} // namespace Basis
