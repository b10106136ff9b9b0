// The write commands. Their arguments are read in an odd way that is required, see
// WriteArguments::Parse.

#include "vesk_hdl/engine/WriteCommands.h"

#include <cerrno>
#include <new>
#include <unistd.h>
#include <utility>

#include "vesk_hdl/hdl/VerilogNetlister.h"
#include "vesk_hdl/hdl/VhdlNetlister.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/model/HdlOptions.h"
#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/netlist/Vocabulary.h"
#include "vesk_hdl/text/OutStream.h"

namespace Vesk_Hdl {

bool WriteArguments::Parse(StringArray const &tokens, int first) {
    int const given = tokens.GetSize() - first;
    int const options = given == 2 || given == 3 ? given - 1 : 0;
    for (int i = first; i < first + options; ++i) {
        // Required: "-OVERWRITE" is known and changes nothing, and any other word is dropped.
        int const option = Vocabulary::IndexOf(Vocabulary::WRITE_OPTIONS, tokens.At(i));
        append |= option == Vocabulary::WRITE_APPEND;
        writeHeader &= option != Vocabulary::WRITE_NOHEADER;
    }
    fileToken = first + options;
    fileName = tokens.At(fileToken);
    return !fileName.IsEmpty();
}

namespace Commands {

namespace {

/// Thrown inside a writer when text cannot reach the file, to end the generation of more. A test
/// between statements would not do: one statement may have a port map of 2^31 bits.
struct TextIsLost {};

/// The file of a write command, from its opening to the report to the opener. Whatever ends the
/// command, the file is closed and Finish called once.
class CommandFile : private Basis::Stream::Guard {
public:
    CommandFile(Model &model, WriteArguments const &arguments)
        : opener(model.GetWriteOpener()), stream(arguments.fileName) {
        status.fileName = arguments.fileName;
        status.error = ECANCELED; // what the opener sees if an exception ends the command
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
        } catch (std::bad_alloc const &) { // a destructor must not throw
        }
        Finish();
    }

    /// Calls `write` with the stream, closes the file and reports. Exceptions of `write` pass
    /// through, but TextIsLost ends here: a file that cannot be written is no refusal. The netlist
    /// is rewritten before the first text, so that it is the same after a failed write.
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
    /// Closing may fail, too, and must not throw: only a writer is interrupted.
    void Failed() override {
        if (generating)
            throw TextIsLost();
    }

    void Adopt(int descriptor) {
        try {
            stream.Adopt(descriptor);
        } catch (...) {
            ::close(descriptor); // the stream did not get it
            Finish();
            throw;
        }
    }
    void Finish() {
        if (WriteOpener *const asked = std::exchange(opener, nullptr))
            asked->Finish(status);
    }

    WriteOpener *opener; ///< null if there is none, and after Finish
    TextFileOutStream stream;
    WriteStatus status;
    bool generating = false; ///< a writer is running
};

/// Writes the model's netlist. Required: a file that cannot be written raises nothing. Clients ask
/// Model::GetLastWrite.
template <class Write>
void WriteFile(Model &model, WriteArguments const &arguments, Write writeNetlist) {
    CommandFile file(model, arguments);
    model.GetOptions()->writeHeader = arguments.writeHeader;
    model.SetLastWrite(file.Run([&model, writeNetlist](OutStream &stream) {
        writeNetlist(stream, model.GetNetlist(), *model.GetOptions());
    }));
}

} // namespace

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

} // namespace Commands
} // namespace Vesk_Hdl
