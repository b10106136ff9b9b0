#pragma once

#include "vesk_hdl/text/basis/File.h"
#include "vesk_hdl/text/basis/StringBase.h"

/// The destination of the text of an OutStream. A client that wants the text elsewhere than in a
/// file or in memory derives one of its own.
class VESK_HDL_API StreamDst {
public:
    /// A destination at level 0.
    StreamDst();
    /// Copies the level.
    StreamDst(StreamDst const &other);
    /// Copies the level.
    StreamDst &operator=(StreamDst const &other);

    /// Called by the stream that owns the destination.
    virtual ~StreamDst();
    /// Called for OutStream::FLUSH. Does nothing unless overridden.
    virtual void Flush();
    /// Called for OutStream::NEW_LINE. Writes "\n" unless overridden.
    virtual void WriteNewLine();
    /// Called with each piece of text, which is never null and valid during the call only. It may
    /// hold line ends.
    virtual void Write(char const *text) = 0;
    /// Called with each number.
    virtual void Write(int value) = 0;

    /// One level of nesting more. What a level looks like is up to the destination.
    void Indent();
    /// One level less. At level 0 nothing changes.
    void Unindent();
    /// The number of levels, from 0.
    int GetIndentLevel();

private:
    int indentLevel;
};

namespace Vesk_Hdl {

/// All text output goes through this class. A stream says what is written and how deep it is
/// nested; its destination decides what that looks like. A stream is for one thread.
class VESK_HDL_API OutStream {
public:
    /// What can be done besides writing text.
    enum Operand : int {
        NEW_LINE = 0, ///< ends the line
        FLUSH = 1     ///< passes on what the destination has collected
    };

    /// Takes over the destination, which must not be null and is deleted with the stream.
    OutStream(StreamDst *destination);
    /// Deletes the destination.
    virtual ~OutStream();
    OutStream(OutStream const &) = delete;
    OutStream &operator=(OutStream const &) = delete;

    /// Ends the line or flushes. A value that is no Operand does nothing.
    OutStream &operator<<(Operand operand);
    /// Writes a number in decimal digits, as one piece.
    OutStream &operator<<(int value);
    /// Writes a text as one piece, the unit that folding works with: two calls with half a text
    /// each may give other lines than one call. Null is the empty text.
    OutStream &operator<<(char const *text);
    /// The same for a string.
    OutStream &operator<<(Basis::StringBase<char> const &text);

    /// Lines that begin from now on are nested one level deeper.
    void Indent();
    /// Takes one level back. At level 0 nothing changes.
    void Unindent();

protected:
    /// The destination, owned. Never null.
    StreamDst *dst;
};

/// A stream into a file.
///
/// Each line begins with three blanks for each level. A piece that would make its line longer than
/// 80 columns folds the line: it ends at its last blank, else at its last comma, else where it is,
/// and continues six blanks deeper on the next line. Two things are never folded: a line that holds
/// "/" or "--", since it may be a comment, and the text before a "\n" in the same piece.
///
/// Lines end in "\n". While no file is open, text is dropped and nothing is reported.
class VESK_HDL_API TextFileOutStream : public OutStream {
public:
    /// Keeps the name and opens the file as Open does. With null no file is opened.
    TextFileOutStream(char const *fileName, bool append);
    /// Keeps the name and opens no file.
    explicit TextFileOutStream(char const *fileName);

    /// Closes an open file as Close does, then opens the named one: at its end with `append`,
    /// otherwise what it held is lost. True if the file is open; false otherwise, see GetError. The
    /// error of the former file is lost, unless Close is called first. GetFileName still returns
    /// the name given to the constructor.
    bool Open(char const *fileName, bool append);
    /// The same with a descriptor that is open for writing, which the stream then owns and closes.
    /// False for a negative one; GetError then returns the `errno` that the caller found.
    bool Adopt(int descriptor);
    /// Writes what is left with a line end after it, and closes the file. Does nothing if none is
    /// open. Text after it is dropped until the next Open.
    void Close();
    /// Whether a file is open. It stays open after a failed write.
    bool IsOpen() const;
    /// The name given to the constructor, empty for null.
    Basis::StringBase<char> GetFileName() const;
    /// What kept the text since the last opening from reaching the file: the `errno` of the first
    /// failure to open, write or close, 0 if there was none so far. Call it after Close: text that
    /// is still collected has not failed yet.
    int GetError() const;
    /// Sets the guard that decides for each block of the file, also of files that are opened later;
    /// null, the initial state, for none. While no file is open, each piece of text calls
    /// Guard::Failed. The guard is not owned and must live until it is replaced or the stream ends.
    void SetGuard(Basis::Stream::Guard *guard);
};

/// A stream into memory. It neither indents nor folds: the text is exactly what was written.
class VESK_HDL_API TextMemOutStream : public OutStream {
public:
    /// A stream whose text begins with a copy of `value`, or empty for null.
    TextMemOutStream(char const *value = nullptr);
    /// A copy of the text so far.
    Basis::StringBase<char> GetValue() const;
    /// Replaces the text by a copy of `value`. Null makes it empty.
    void SetValue(char const *value);
};

} // namespace Vesk_Hdl
