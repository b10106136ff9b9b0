// The commands that end a design's road: they open the file, say whether it gets a header, and hand
// netlist and options to a writer.

#include "vesk_hdl/engine/Commands.h"
#include "vesk_hdl/hdl/VerilogNetlister.h"
#include "vesk_hdl/hdl/VhdlNetlister.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/model/HdlOptions.h"
#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/text/OutStream.h"
#include "vesk_hdl/text/basis/Functions.h"

namespace Vesk_Hdl {

namespace {

/// What every write command reads: WRITE language [option [option]] file.
struct WriteArguments {
    Basis::StringBase<char> fileName;
    bool append = false;
    bool writeHeader = true;

    /// The number of tokens alone tells where the file name stands: with more than two options
    /// there are none, and the file is called after the first of them.
    bool Parse(StringArray const &tokens) {
        int const options =
            tokens.GetSize() == 4 || tokens.GetSize() == 5 ? tokens.GetSize() - 3 : 0;
        for (int i = 2; i < 2 + options; ++i) {
            // "-OVERWRITE" is known and changes nothing, and any other word is dropped.
            if (Basis::stricmp(tokens.At(i), "-APPEND") == 0)
                append = true;
            else if (Basis::stricmp(tokens.At(i), "-NOHEADER") == 0)
                writeHeader = false;
        }
        fileName = tokens.At(2 + options);
        return !fileName.IsEmpty();
    }
};

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

VESK_HDL_COMMAND(WriteVerilogCommand, WriteArguments)

bool WriteVerilogCommand::ParseArguments(StringArray const &tokens) {
    return arguments.Parse(tokens);
}

void WriteVerilogCommand::Execute() {
    WriteFile(RequireModel(), arguments,
              [](OutStream &stream, Netlist *netlist, HdlOptions const &options) {
                  VerilogNetlister(stream).WriteNetlist(netlist, options);
              });
}

VESK_HDL_COMMAND(WriteVhdlCommand, WriteArguments)

bool WriteVhdlCommand::ParseArguments(StringArray const &tokens) { return arguments.Parse(tokens); }

void WriteVhdlCommand::Execute() {
    WriteFile(RequireModel(), arguments,
              [](OutStream &stream, Netlist *netlist, HdlOptions const &options) {
                  VhdlNetlister(stream).WriteNetlist(netlist, &options);
              });
}

} // namespace Vesk_Hdl
