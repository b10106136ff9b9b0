// The commands that end a design's road: they open the file, say whether it gets a header, and hand
// netlist and options to a writer.

#include <cerrno>
#include <new>
#include <unistd.h>
#include <utility>

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

/// Thrown where text fails to reach the file, so that the writers do not go on for nothing. One
/// statement may hold a port map of 2^31 bits: no check between statements would do.
struct TextIsLost {};

/// The file of a write command, from the opening to the report to the opener.
class CommandFile : private Basis::Stream::Guard {
public:
    CommandFile(Model &model, WriteArguments const &arguments)
        : opener(model.GetWriteOpener()), stream(arguments.fileName) {
        status.fileName = arguments.fileName;
        status.error = ECANCELED; // until the text is written
        stream.SetGuard(this);
        if (opener)
            Adopt(opener->Open(arguments.fileName, arguments.append));
        else
            stream.Open(arguments.fileName, arguments.append);
    }
    CommandFile(CommandFile const &) = delete;
    CommandFile &operator=(CommandFile const &) = delete;
    ~CommandFile() override {
        try {
            stream.Close();
        } catch (std::bad_alloc const &) { // as what ends the command, most likely
        }
        Finish();
    }

    /// Calls `write` with the stream; what it throws passes on, but not TextIsLost. The netlist is
    /// rewritten before the first text is written, so that it is the same after a failed write.
    template <class Write> WriteStatus const &Run(Write write) {
        try {
            generating = true;
            write(stream);
        } catch (TextIsLost const &) {
        } catch (...) {
            generating = false;
            throw;
        }
        generating = false;
        stream.Close();
        status.error = stream.GetError();
        Finish();
        return status;
    }

private:
    int Allow(std::size_t bytes) override { return opener ? opener->Allow(bytes) : 0; }
    void Failed() override {
        if (generating)
            throw TextIsLost();
    }

    void Adopt(int descriptor) {
        try {
            stream.Adopt(descriptor);
        } catch (...) {
            ::close(descriptor);
            Finish();
            throw;
        }
    }
    void Finish() {
        if (WriteOpener *const asked = std::exchange(opener, nullptr))
            asked->Finish(status);
    }

    WriteOpener *opener; ///< null when there is none, or none to report to any more
    TextFileOutStream stream;
    WriteStatus status;
    bool generating = false;
};

/// Writes the model's netlist. A file that cannot be written raises nothing: the model remembers
/// what became of the write.
template <class Write>
void WriteFile(Model &model, WriteArguments const &arguments, Write writeNetlist) {
    CommandFile file(model, arguments);
    model.GetOptions()->writeHeader = arguments.writeHeader;
    model.SetLastWrite(file.Run([&model, writeNetlist](OutStream &stream) {
        writeNetlist(stream, model.GetNetlist(), *model.GetOptions());
    }));
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
