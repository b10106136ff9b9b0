// The life of a Model, its identity, and how it runs lines. The operations that commands call are
// in model/. This part is here because it uses commands, which model/ does not know.

#include <memory>
#include <utility>

#include "vesk_hdl/engine/HdlCmd.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/model/HdlOptions.h"
#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/text/basis/File.h"

namespace Vesk_Hdl {

using Basis::StringBase;

/// Members end in reverse order: the done commands, the options, the netlist. Commands of a client
/// may use the model in their destructors.
struct Model::Record {
    explicit Record(CommandFactory *factory) : netlist(nullptr), commandFactory(factory) {}

    bool modified = false;
    WriteStatus lastWrite;
    WriteOpener *writeOpener = nullptr;
    Netlist netlist;
    HdlOptions options;
    CommandManager commandManager;
    CommandFactory *commandFactory;
    std::unique_ptr<StringArray> spareTokens; ///< of the last line; null while a line runs
};

Model::Model(CommandFactory *factory) : record(std::make_unique<Record>(factory)) {}
Model::~Model() = default;

bool Model::IsModified() const { return record->modified; }
void Model::SetModifiedFlag(bool modified) { record->modified = modified; }
CommandFactory *Model::GetCommandFactory() const { return record->commandFactory; }
HdlOptions *Model::GetOptions() const { return &record->options; }
Netlist *Model::GetNetlist() const { return &record->netlist; }
CommandManager *Model::GetCommandManager() const { return &record->commandManager; }

void Model::SetName(char const *name) {
    record->netlist.SetName(name ? name : Netlist::DEFAULT_NETLIST_NAME);
}
StringBase<char> Model::GetName() const { return record->netlist.GetName(); }
void Model::SetSourceFileName(char const *fileName) { record->netlist.SetSourceFileName(fileName); }
StringBase<char> Model::GetSourceFileName() const { return record->netlist.GetSourceFileName(); }

bool Model::Execute(StringArray const &tokens) {
    return tokens.IsEmpty() ||
           record->commandManager.CreateAndExecute(tokens, this, record->commandFactory);
}

/// The array of tokens is kept for the next line, which uses its memory again. A command of a
/// client may run another line on this model: that one finds none and makes its own.
bool Model::Execute(char const *line) {
    std::unique_ptr<StringArray> tokens = std::move(record->spareTokens);
    if (!tokens)
        tokens = std::make_unique<StringArray>();
    tokens->ParseLine(line, nullptr);
    bool const result = Execute(*tokens);
    record->spareTokens = std::move(tokens);
    return result;
}

/// Required: the file is not closed here. It need not be: a stream for reading holds the text and
/// no descriptor, so that none leaks, whether the lines run to the end or one of them is refused.
bool Model::Read(char const *fileName) {
    std::unique_ptr<Basis::Stream> const file(
        Basis::File::open(fileName, Basis::Stream::ACCESS_READ, true));
    bool result = file != nullptr;
    if (file) {
        StringBase<char> line;
        while (line.ReadLine(file.get()))
            result = Execute(line.GetText());
    }
    record->modified = false;
    return result;
}

/// Required: there is no writer of command files, and the design counts as saved.
bool Model::Write(char const *) {
    record->modified = false;
    return true;
}

WriteStatus const &Model::GetLastWrite() const { return record->lastWrite; }

void Model::SetLastWrite(char const *fileName, int error) {
    SetLastWrite({0, fileName, error, {}});
}

void Model::SetLastWrite(WriteStatus const &status) {
    int const number = record->lastWrite.number + 1;
    record->lastWrite = status;
    record->lastWrite.number = number;
}

WriteOpener::~WriteOpener() = default;
int WriteOpener::Allow(std::size_t) { return 0; }
void WriteOpener::Finish(WriteStatus &) {}
void Model::SetWriteOpener(WriteOpener *opener) { record->writeOpener = opener; }
WriteOpener *Model::GetWriteOpener() const { return record->writeOpener; }

} // namespace Vesk_Hdl
