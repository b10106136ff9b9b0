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

/// Text into a file, a line at a time. Writes nothing while no file is open.
class TextFileDst : public StreamDst {
public:
    explicit TextFileDst(char const *name) : fileName(name) {}
    TextFileDst(TextFileDst const &) = delete;
    TextFileDst &operator=(TextFileDst const &) = delete;
    ~TextFileDst() override {
        try {
            Close();
        } catch (std::bad_alloc const &) { // it is closed all the same
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
        std::to_chars(digits, digits + sizeof digits - 1, value);
        Write(digits);
    }

    bool Open(char const *name, bool append) {
        Close();
        return Take(append ? File::open(name, Stream::ACCESS_APPEND, false)
                           : File::open(name, Stream::ACCESS_REPLACE, true));
    }

    bool Adopt(int descriptor) {
        int const callersError = errno;
        Close();
        bool const taken = Take(File::adopt(descriptor));
        if (!taken)
            error = callersError;
        return taken;
    }

    void Close() {
        if (!file)
            return;
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

    /// What stands in front of a "\n" in one piece ends the line unfolded. Apart, so that the short
    /// way need not save what this one does with registers.
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

    /// Text that has no file to go to.
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

    Stream *file = nullptr;
    FoldingLine line;
    Basis::StringBase<char> fileName;
    int error = 0;
    Stream::Guard *guard = nullptr;
};

class TextMemDst : public StreamDst {
public:
    explicit TextMemDst(char const *text) : value(text) {}
    void Write(char const *text) override { value += text; }
    void Write(int number) override { value += std::to_string(number); }

    Basis::StringBase<char> value;
};

} // namespace

namespace Vesk_Hdl {

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
