#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

class OutStream;

/// The comment block at the head of a written file: a divider, a copyright line, a drawing with
/// five fields beside it, then command, design name, device, purpose and reference of the run. The
/// two languages differ only in the comment mark, "--" or "//".
class VESK_HDL_API NetlistHeader {
public:
    /// Copies the texts and refers to the stream, which must outlive this object. Of `fileName`, a
    /// path, only the last component is shown. An empty device, purpose or reference leaves its
    /// lines out; the other fields are always shown. Purpose and reference are wrapped at 79
    /// columns between words, and a "\n" in them begins a new line. A "\n" in another field is
    /// written as it is and ends the comment there.
    NetlistHeader(Basis::StringBase<char> const &application,
                  Basis::StringBase<char> const &fileName, Basis::StringBase<char> const &command,
                  Basis::StringBase<char> const &designName, Basis::StringBase<char> const &device,
                  Basis::StringBase<char> const &purpose, Basis::StringBase<char> const &reference,
                  bool isVhdl, OutStream &stream);
    /// Leaves the stream alone.
    ~NetlistHeader();
    NetlistHeader(NetlistHeader const &) = delete;
    NetlistHeader &operator=(NetlistHeader const &) = delete;

    /// Writes the block with the present local time. It can be called again and then writes it
    /// again.
    void Write();
    /// Writes the block with this text in the place of the time.
    void Write(Basis::StringBase<char> const &timestamp);

private:
    void WriteHead();
    void WriteFields();
    void WriteDivider();
    void WriteCopyright();
    void WriteLogo(Basis::StringBase<char> const &application,
                   Basis::StringBase<char> const &fileName);
    void WriteLogo(Basis::StringBase<char> const &application,
                   Basis::StringBase<char> const &fileName,
                   Basis::StringBase<char> const &timestamp);
    void WriteCommand();
    void WriteDesignName();
    void WriteDevice();
    void WritePurpose();
    void WriteReference();
    void WriteWord(Basis::StringBase<char> const &word, int &column);
    void WriteSentences(Basis::StringBase<char> const &text);

    Basis::StringBase<char> application;
    Basis::StringBase<char> fileName;
    Basis::StringBase<char> command;
    Basis::StringBase<char> designName;
    Basis::StringBase<char> device;
    Basis::StringBase<char> purpose;
    Basis::StringBase<char> reference;
    Basis::StringBase<char> commentPrefix;
    OutStream &stream;
};

} // namespace Vesk_Hdl
