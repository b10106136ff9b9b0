// The folding file stream against one that treats each line as a plain string. A byte of the input
// says what is done, the pieces of text stand between such bytes.

#include "fuzz/Fuzz.h"
#include "tests/support/MemoryFile.h"
#include "tests/support/NaiveFile.h"

using Vesk_Hdl::OutStream;

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    static MemoryFile file;
    file.Take();
    Vesk_Hdl::TextFileOutStream stream(nullptr);
    FUZZ_EXPECT(stream.Adopt(file.Open()), "opening");
    NaiveFile naive;

    std::string piece;
    for (std::size_t i = 0; i < size; ++i) {
        switch (data[i]) {
        case '>':
            naive.level < 100 ? (naive.Indent(), stream.Indent()) : void();
            break;
        case '<':
            naive.Unindent();
            stream.Unindent();
            break;
        case '!':
            naive.Flush();
            stream << OutStream::FLUSH;
            break;
        case '7':
            naive.Write("-123");
            stream << -123;
            break;
        case '\0':
        case '|':
            naive.Write(piece);
            stream << piece.c_str();
            piece.clear();
            break;
        default:
            piece += static_cast<char>(data[i]);
        }
    }
    naive.Flush();
    stream.Close();
    FUZZ_EXPECT(stream.GetError() == 0, "%d", stream.GetError());
    std::string const text = file.Take();
    FUZZ_EXPECT(text == naive.file, "\n%s\nis not\n%s", text.c_str(), naive.file.c_str());
    return 0;
}
