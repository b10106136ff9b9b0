#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

class OutStream;

/// The comment block at the head of a written file: divider, copyright, a drawing with five fields,
/// then command, design, device, purpose and reference of the run. The languages differ in the
/// comment mark alone.
class VESK_HDL_API NetlistHeader {
public:
    /// Copies the texts and points at the stream, which must outlive the header. Of `fileName`, a
    /// path, the last component is shown. An empty device, purpose or reference leaves its lines
    /// out.
    NetlistHeader(Basis::StringBase<char> const &application,
                  Basis::StringBase<char> const &fileName, Basis::StringBase<char> const &command,
                  Basis::StringBase<char> const &designName, Basis::StringBase<char> const &device,
                  Basis::StringBase<char> const &purpose, Basis::StringBase<char> const &reference,
                  bool isVhdl, OutStream &stream);
    ~NetlistHeader();
    NetlistHeader(NetlistHeader const &) = delete;
    NetlistHeader &operator=(NetlistHeader const &) = delete;

    /// Writes the block with the present local time.
    void Write();
    /// Writes it with that text in the place of the time.
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
