// Output streams and their two destinations: a file with indentation and folding, and memory
// without.

#include "vesk_hdl/text/OutStream.h"

#include <cerrno>
#include <charconv>
#include <new>
#include <string>
#include <utility>

#include "vesk_hdl/text/FoldingLine.h"

StreamDst::StreamDst() : indentLevel(0) {}
StreamDst::StreamDst(StreamDst const &other) = default;
StreamDst &StreamDst::operator=(StreamDst const &other) = default;
StreamDst::~StreamDst() = default;
void StreamDst::Flush() {}
void StreamDst::WriteNewLine() { Write("\n"); }
void StreamDst::Indent() { ++indentLevel; }
void StreamDst::Unindent() { indentLevel -= indentLevel > 0 ? 1 : 0; }
int StreamDst::GetIndentLevel() { return indentLevel; }

namespace {

using Basis::File;
using Basis::Stream;
using Vesk_Hdl::FoldingLine;

/// Writes text into a file, a line at a time. While no file is open, text is dropped: a write to a
/// path that cannot be opened is no error of the commands.
class TextFileDst : public StreamDst {
public:
    explicit TextFileDst(char const *name) : fileName(name) {}
    TextFileDst(TextFileDst const &) = delete;
    TextFileDst &operator=(TextFileDst const &) = delete;
    ~TextFileDst() override {
        try {
            Close();
        } catch (std::bad_alloc const &) { // a destructor must not throw; the file is closed anyway
        }
    }

    void Flush() override {
        if (!file)
            return;
        if (!line.IsEmpty())
            line.Break(*file, Indentation());
        file->flush();
    }

    void WriteNewLine() override {
        if (file)
            EndLine();
        else
            Drop();
    }

    void Write(char const *text) override {
        if (!file)
            Drop();
        else if (!line.AppendShort(text))
            WriteAny(text);
    }
    void Write(int value) override {
        char digits[16] = {};
        std::to_chars(digits, digits + sizeof digits - 1, value); // the last byte stays NUL
        Write(digits);
    }

    bool Open(char const *name, bool append) {
        Close();
        return Take(append ? File::open(name, Stream::ACCESS_APPEND, false)
                           : File::open(name, Stream::ACCESS_REPLACE, true));
    }

    bool Adopt(int descriptor) {
        int const callersError = errno; // Close may change it
        Close();
        bool const taken = Take(File::adopt(descriptor));
        if (!taken)
            error = callersError;
        return taken;
    }

    void Close() {
        if (!file)
            return;
        // Closes the file also when the flush throws, as a guard may.
        struct Closing {
            TextFileDst &dst;
            ~Closing() {
                if (!File::close(std::exchange(dst.file, nullptr)))
                    dst.error = errno;
            }
        } const closing{*this};
        Flush();
    }

    void SetGuard(Stream::Guard *wanted) {
        guard = wanted;
        if (file)
            file->SetGuard(guard);
    }

    bool IsOpen() const { return file != nullptr; }
    int GetError() const { return file ? file->GetError() : error; }
    Basis::StringBase<char> const &GetFileName() const { return fileName; }

private:
    bool Take(Stream *opened) {
        file = opened;
        error = file ? 0 : errno;
        if (file)
            file->SetGuard(guard);
        return file != nullptr;
    }

    /// Any text. What comes before a "\n" in the same piece ends its line and is not folded. It is
    /// kept out of line so that the short way in Write need not save the registers that this one
    /// uses.
    [[gnu::noinline]] void WriteAny(char const *text) {
        while (*text != '\0') {
            IndentNewLine();
            text = line.Append(text);
            if (*text == '\0')
                return line.FoldIfTooLong(*file, Indentation());
            EndLine();
            ++text;
        }
    }

    /// Called with text while no file is open.
    [[gnu::noinline]] void Drop() {
        if (guard)
            guard->Failed();
    }

    std::size_t Indentation() { return 3 * static_cast<std::size_t>(GetIndentLevel()); }

    void IndentNewLine() {
        if (line.IsEmpty())
            line.Indent(Indentation());
    }

    void EndLine() {
        IndentNewLine();
        line.End(*file);
    }

    Stream *file = nullptr; ///< owned; null while no file is open
    FoldingLine line; ///< what is not in the file yet; Close leaves the blanks of a fold in it
    Basis::StringBase<char> fileName; ///< given to the constructor; Open does not change it
    int error = 0;                    ///< of the last file; an open one has its own
    Stream::Guard *guard = nullptr;
};

/// Collects text in memory as it comes. Levels of nesting are counted and have no effect.
class TextMemDst : public StreamDst {
public:
    explicit TextMemDst(char const *text) : value(text) {}
    void Write(char const *text) override { value += text; }
    void Write(int number) override { value += std::to_string(number); }

    Basis::StringBase<char> value;
};

} // namespace

namespace Vesk_Hdl {

// The casts of `dst` below are safe: a stream of these classes makes its own destination, and
// nothing replaces it.

OutStream::OutStream(StreamDst *destination) : dst(destination) {}
OutStream::~OutStream() { delete dst; }

OutStream &OutStream::operator<<(Operand operand) {
    if (operand == NEW_LINE)
        dst->WriteNewLine();
    else if (operand == FLUSH)
        dst->Flush();
    return *this;
}

OutStream &OutStream::operator<<(int value) {
    dst->Write(value);
    return *this;
}

OutStream &OutStream::operator<<(char const *text) {
    dst->Write(text ? text : "");
    return *this;
}

OutStream &OutStream::operator<<(Basis::StringBase<char> const &text) {
    dst->Write(text.GetText());
    return *this;
}

void OutStream::Indent() { dst->Indent(); }
void OutStream::Unindent() { dst->Unindent(); }

TextFileOutStream::TextFileOutStream(char const *fileName, bool append)
    : OutStream(new TextFileDst(fileName)) {
    if (fileName)
        Open(fileName, append);
}

TextFileOutStream::TextFileOutStream(char const *fileName) : OutStream(new TextFileDst(fileName)) {}

bool TextFileOutStream::Open(char const *fileName, bool append) {
    return static_cast<TextFileDst *>(dst)->Open(fileName, append);
}

bool TextFileOutStream::Adopt(int descriptor) {
    return static_cast<TextFileDst *>(dst)->Adopt(descriptor);
}

void TextFileOutStream::Close() { static_cast<TextFileDst *>(dst)->Close(); }

bool TextFileOutStream::IsOpen() const { return static_cast<TextFileDst *>(dst)->IsOpen(); }

Basis::StringBase<char> TextFileOutStream::GetFileName() const {
    return static_cast<TextFileDst *>(dst)->GetFileName();
}

int TextFileOutStream::GetError() const { return static_cast<TextFileDst *>(dst)->GetError(); }

void TextFileOutStream::SetGuard(Stream::Guard *guard) {
    static_cast<TextFileDst *>(dst)->SetGuard(guard);
}

TextMemOutStream::TextMemOutStream(char const *value) : OutStream(new TextMemDst(value)) {}

Basis::StringBase<char> TextMemOutStream::GetValue() const {
    return static_cast<TextMemDst *>(dst)->value;
}

void TextMemOutStream::SetValue(char const *value) {
    static_cast<TextMemDst *>(dst)->value = value;
}

} // namespace Vesk_Hdl
