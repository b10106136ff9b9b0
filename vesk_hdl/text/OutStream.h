#pragma once

#include "vesk_hdl/text/basis/File.h"
#include "vesk_hdl/text/basis/StringBase.h"

/// Where the text of an OutStream goes. A client may derive one of its own.
class VESK_HDL_API StreamDst {
public:
    StreamDst();
    StreamDst(StreamDst const &other);
    StreamDst &operator=(StreamDst const &other);

    virtual ~StreamDst();
    /// Does nothing by default.
    virtual void Flush();
    /// Writes "\n" by default.
    virtual void WriteNewLine();
    virtual void Write(char const *text) = 0;
    virtual void Write(int value) = 0;

    void Indent();
    /// One level less; level 0 stays.
    void Unindent();
    int GetIndentLevel();

private:
    int indentLevel;
};

namespace Vesk_Hdl {

/// All text output. A stream says what is written and how deep it nests; its destination decides
/// what that looks like. For one thread.
class VESK_HDL_API OutStream {
public:
    enum Operand : int { NEW_LINE = 0, FLUSH = 1 };

    /// Takes over the destination, which must not be null.
    OutStream(StreamDst *destination);
    virtual ~OutStream();
    OutStream(OutStream const &) = delete;
    OutStream &operator=(OutStream const &) = delete;

    /// Each call is one piece of text, the unit that folding works with. Null is the empty text; a
    /// value that is no Operand writes nothing.
    OutStream &operator<<(Operand operand);
    OutStream &operator<<(int value);
    OutStream &operator<<(char const *text);
    OutStream &operator<<(Basis::StringBase<char> const &text);

    void Indent();
    void Unindent();

protected:
    StreamDst *dst;
};

/// A stream into a file.
///
/// Each line begins with three blanks a level of nesting. A piece that would make a line longer
/// than 80 columns folds it: the line ends at its last blank, else at its last comma, else where it
/// is, and goes on six blanks deeper. Neither a line that holds "/" or "--" folds nor the text in
/// front of a "\n" in the same piece.
class VESK_HDL_API TextFileOutStream : public OutStream {
public:
    /// Keeps the name and opens the file as Open does; with null nothing is opened.
    TextFileOutStream(char const *fileName, bool append);
    /// Keeps the name and opens nothing.
    explicit TextFileOutStream(char const *fileName);

    /// Closes an open file as Close does, then opens the named one, at its end with `append`,
    /// otherwise replacing it. False if that fails; what is then written is dropped in silence.
    /// GetFileName goes on telling the name given to the constructor. Close first to learn about
    /// the former file from GetError.
    bool Open(char const *fileName, bool append);
    /// As Open, into a descriptor open for writing, which the stream closes in the end. False for a
    /// negative one; the error is then the `errno` that the caller found.
    bool Adopt(int descriptor);
    /// Writes what is left, with an end of line, and closes the file.
    void Close();
    bool IsOpen() const;
    Basis::StringBase<char> GetFileName() const;
    /// What kept the text from reaching the disk whole since the last opening: the `errno` of the
    /// first failure to open, write, flush or close, 0 for none so far. Ask after Close.
    int GetError() const;
    /// Who decides about the blocks of the file, also of one that is opened later; null, as at
    /// first, for nobody. While no file is open, each piece of text calls Guard::Failed. Not owned.
    void SetGuard(Basis::Stream::Guard *guard);
};

/// A stream into memory, without indentation or folding.
class VESK_HDL_API TextMemOutStream : public OutStream {
public:
    /// Begins with `value`, or with nothing if that is null.
    TextMemOutStream(char const *value = nullptr);
    Basis::StringBase<char> GetValue() const;
    void SetValue(char const *value);
};

} // namespace Vesk_Hdl
