#include "vesk_hdl/engine/WriteCommands.h"

#include "vesk_hdl/hdl/VerilogNetlister.h"
#include "vesk_hdl/hdl/VhdlNetlister.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/model/HdlOptions.h"
#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/netlist/Vocabulary.h"
#include "vesk_hdl/text/OutStream.h"

namespace Vesk_Hdl::Commands {

namespace {

/// Writes the model's netlist. A file that cannot be written raises nothing: the model remembers
/// what became of the write.
template <class Write>
void WriteFile(Model &model, WriteArguments const &arguments, Write writeNetlist) {
    TextFileOutStream stream(arguments.fileName);
    if (WriteOpener *const opener = model.GetWriteOpener())
        stream.Adopt(opener->Open(arguments.fileName, arguments.append));
    else
        stream.Open(arguments.fileName, arguments.append);
    model.GetOptions()->writeHeader = arguments.writeHeader;
    writeNetlist(stream, model.GetNetlist(), *model.GetOptions());
    stream.Close();
    model.SetLastWrite(arguments.fileName, stream.GetError());
}

} // namespace

bool WriteArguments::Parse(StringArray const &tokens, int first) {
    int const given = tokens.GetSize() - first;
    int const options = given == 2 || given == 3 ? given - 1 : 0;
    for (int i = first; i < first + options; ++i) {
        // Required: "-OVERWRITE" is known and changes nothing, and any other word is dropped.
        int const option = Vocabulary::IndexOf(Vocabulary::WRITE_OPTIONS, tokens.At(i));
        append |= option == Vocabulary::WRITE_APPEND;
        writeHeader &= option != Vocabulary::WRITE_NOHEADER;
    }
    fileName = tokens.At(first + options);
    return !fileName.IsEmpty();
}

void WriteVerilog::Run(Model &model) const {
    WriteFile(model, *this, [](OutStream &stream, Netlist *netlist, HdlOptions const &options) {
        VerilogNetlister(stream).WriteNetlist(netlist, options);
    });
}

void WriteVhdl::Run(Model &model) const {
    WriteFile(model, *this, [](OutStream &stream, Netlist *netlist, HdlOptions const &options) {
        VhdlNetlister(stream).WriteNetlist(netlist, &options);
    });
}

} // namespace Vesk_Hdl::Commands
