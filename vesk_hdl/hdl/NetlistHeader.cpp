// The header of written files.

#include "vesk_hdl/hdl/NetlistHeader.h"

#include "vesk_hdl/hdl/HdlUtilities.h"
#include "vesk_hdl/hdl/Pieces.h"
#include "vesk_hdl/text/StringArray.h"
#include "vesk_hdl/text/basis/File.h"

namespace Vesk_Hdl {

using Text = Basis::StringBase<char>;

namespace {

constexpr int FIRST_COLUMN = 6; ///< the columns of a comment mark and four blanks
constexpr int LAST_COLUMN = 79; ///< no word ends after it, unless it is longer than a line

} // namespace

NetlistHeader::NetlistHeader(Text const &applicationText, Text const &fileNameText,
                             Text const &commandText, Text const &designNameText,
                             Text const &deviceText, Text const &purposeText,
                             Text const &referenceText, bool isVhdl, OutStream &out)
    : application(applicationText), fileName(fileNameText), command(commandText),
      designName(designNameText), device(deviceText), purpose(purposeText),
      reference(referenceText), commentPrefix(isVhdl ? "--" : "//"), stream(out) {}

NetlistHeader::~NetlistHeader() = default;

void NetlistHeader::Write() {
    WriteHead();
    WriteLogo(application, fileName);
    WriteFields();
}

void NetlistHeader::Write(Text const &timestamp) {
    WriteHead();
    WriteLogo(application, fileName, timestamp);
    WriteFields();
}

void NetlistHeader::WriteHead() {
    WriteDivider();
    WriteCopyright();
    WriteDivider();
}

void NetlistHeader::WriteFields() {
    WriteCommand();
    WriteDesignName();
    WriteDevice();
    WritePurpose();
    WriteReference();
    Put(stream, commentPrefix, EOL);
}

/// Forty comment marks: 80 columns, which a line may have.
void NetlistHeader::WriteDivider() {
    for (int i = 0; i < 40; ++i)
        stream << commentPrefix;
    stream << EOL;
}

void NetlistHeader::WriteCopyright() {
    Put(stream, commentPrefix, " ", "Copyright (c) Orvane. All rights reserved.", EOL);
}

void NetlistHeader::WriteLogo(Text const &applicationText, Text const &fileNameText) {
    WriteLogo(applicationText, fileNameText, HdlUtilities::CurrentTimeString());
}

/// The drawing takes the 16 columns after the comment mark; the fields begin in column 17.
void NetlistHeader::WriteLogo(Text const &applicationText, Text const &fileNameText,
                              Text const &timestamp) {
    Text const &P = commentPrefix;
    Text const version = HdlUtilities::GetVersion();
    Text const tail = Basis::FileName(fileNameText).GetTail();
    Put(stream, P, "##          ##", EOL);
    Put(stream, P, "###        ###", EOL);
    Put(stream, P, " ###      ###   ", "Vendor: Orvane ", EOL);
    Put(stream, P, "  ###    ###    ", "Version : ", version, EOL);
    Put(stream, P, "   ###  ###     ", "Application : ", applicationText, EOL);
    Put(stream, P, "    ######      ", "Filename : ", tail, EOL);
    Put(stream, P, "     ####       ", "Timestamp : ", timestamp, EOL);
    Put(stream, P, "  ===========", EOL);
    Put(stream, P, " =============", EOL);
    Put(stream, P, EOL);
}

void NetlistHeader::WriteCommand() { Put(stream, commentPrefix, "Command: ", command, EOL); }

void NetlistHeader::WriteDesignName() {
    Put(stream, commentPrefix, "Design Name: ", designName, EOL);
}

void NetlistHeader::WriteDevice() {
    if (!device.IsEmpty())
        Put(stream, commentPrefix, "Device: ", device, EOL);
}

void NetlistHeader::WritePurpose() {
    if (purpose.IsEmpty())
        return;
    Put(stream, commentPrefix, "Purpose:", EOL);
    WriteSentences(purpose);
}

/// Required: the title has no colon, unlike that of the purpose.
void NetlistHeader::WriteReference() {
    if (reference.IsEmpty())
        return;
    Put(stream, commentPrefix, "Reference", EOL);
    WriteSentences(reference);
}

/// Writes a word and a blank. A word that holds line ends takes several lines. Required: its first
/// line has no blank at its end, and the others have one.
void NetlistHeader::WriteWord(Text const &word, int &column) {
    auto const writePart = [this, &column](Text const &part) {
        Put(stream, part, " ");
        column += static_cast<int>(part.GetLength()) + 1;
    };
    auto const breakLine = [this, &column] {
        Put(stream, EOL, commentPrefix, "    ");
        column = FIRST_COLUMN;
    };
    if (word.GetIndexOfFirstChar('\n', 0) == Basis::NOT_FOUND)
        return writePart(word);
    StringArray const parts(word, "\n", true, nullptr);
    stream << parts.At(0);
    breakLine();
    for (int i = 1; i < parts.GetSize(); ++i) {
        writePart(parts.At(i));
        if (i + 1 < parts.GetSize())
            breakLine();
    }
}

/// Wraps a free text at its blanks. Required: a word is measured as a whole, its line ends
/// included, and the first word is tested as well, so that a very long one leaves an empty comment
/// line before it.
void NetlistHeader::WriteSentences(Text const &text) {
    StringArray const words(text, " ", true, nullptr);
    Put(stream, commentPrefix, "    ");
    int column = FIRST_COLUMN;
    for (int i = 0; i < words.GetSize(); ++i) {
        Text const &word = words.At(i);
        if (static_cast<int>(word.GetLength()) + 1 + column > LAST_COLUMN) {
            Put(stream, EOL, commentPrefix, "    ");
            column = FIRST_COLUMN;
        }
        WriteWord(word, column);
    }
    stream << EOL;
}

} // namespace Vesk_Hdl
