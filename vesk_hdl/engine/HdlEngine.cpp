#include "vesk_hdl/engine/HdlEngine.h"

#include "vesk_hdl/engine/Keywords.h"
#include "vesk_hdl/hdl/NetlistHeader.h"
#include "vesk_hdl/model/HdlOptions.h"
#include "vesk_hdl/model/Messages.h"
#include "vesk_hdl/netlist/Netlist.h"
#include "vesk_hdl/text/OutStream.h"
#include "vesk_hdl/text/basis/File.h"

namespace Vesk_Hdl {

using Basis::StringBase;

// The shell of Model: its life and how it runs lines. What lines do stands in model/.

/// Members die in reverse order: the done commands, the options, the netlist.
struct Model::Record {
    explicit Record(CommandFactory *factory) : netlist(nullptr), commandFactory(factory) {}

    bool modified = false;
    WriteStatus lastWrite;
    WriteOpener *writeOpener = nullptr;
    Netlist netlist;
    HdlOptions options;
    CommandManager commandManager;
    CommandFactory *commandFactory;
    std::unique_ptr<StringArray> spareTokens;
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

/// The tokens of a line serve for the next one; a line that a command runs meanwhile makes its own.
bool Model::Execute(char const *line) {
    std::unique_ptr<StringArray> tokens = std::move(record->spareTokens);
    if (!tokens)
        tokens = std::make_unique<StringArray>();
    tokens->ParseLine(line, nullptr);
    bool const result = Execute(*tokens);
    record->spareTokens = std::move(tokens);
    return result;
}

/// The stream is never closed here, and need not be: a stream opened for reading holds the text and
/// no descriptor, so that none piles up, whether the lines run to the end or one of them fails.
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

bool Model::Write(char const *) {
    record->modified = false;
    return true;
}

WriteStatus const &Model::GetLastWrite() const { return record->lastWrite; }

void Model::SetLastWrite(char const *fileName, int error) {
    record->lastWrite = {record->lastWrite.number + 1, fileName, error};
}

WriteOpener::~WriteOpener() = default;
void Model::SetWriteOpener(WriteOpener *opener) { record->writeOpener = opener; }
WriteOpener *Model::GetWriteOpener() const { return record->writeOpener; }

struct Engine::Record {
    CommandFactory factory; ///< outlives the models, which point at it
    OwnPtrArray<Model *> models;
    Model *currentModel = nullptr;
};

Engine::Engine() : record(std::make_unique<Record>()) {}
Engine::~Engine() = default;

Model *Engine::GetModel(char const *name) const {
    StringBase<char> const wanted(name);
    for (int i = 0; i < record->models.GetSize(); ++i) {
        Model *const model = record->models.GetAt(i);
        if (model->GetName().Compare(wanted, StringBase<char>::COMPARE_IGNORING_CASE) == 0)
            return model;
    }
    return nullptr;
}

Model *Engine::GetCurrentModel() const { return record->currentModel; }

bool Engine::CreateAndAddModel(char const *name, char const *sourceFileName) {
    if (GetModel(name))
        return false;
    std::unique_ptr<Model> model(record->factory.CreateModel());
    model->SetName(name ? name : "");
    model->SetSourceFileName(sourceFileName);
    record->models.Add(model.get());
    model.release();
    return true;
}

bool Engine::UseModel(char const *name) {
    Model *const model = GetModel(name);
    if (!model)
        return false;
    record->currentModel = model;
    return true;
}

bool Engine::RemoveModel(char const *name) {
    Model *const model = GetModel(name);
    if (!model)
        return false;
    if (record->currentModel == model)
        record->currentModel = nullptr;
    record->models.Remove(model);
    delete model;
    return true;
}

namespace {

void ExecuteOn(Model *model, char const *line) {
    if (!model)
        VESK_HDL_RAISE("HdlEngine", Messages::MISSING_MODEL);
    model->Execute(line);
}

} // namespace

void Engine::Execute(char const *line) { ExecuteOn(record->currentModel, line); }

void Engine::Execute(char const *modelName, char const *line) {
    ExecuteOn(GetModel(modelName), line);
}

bool Engine::ReadCommandFile(char const *modelName, char const *fileName) {
    if (!GetModel(modelName))
        CreateAndAddModel(modelName, fileName);
    return GetModel(modelName)->Read(fileName);
}

bool Engine::WriteCommandFile(char const *modelName, char const *fileName) {
    Model *const model = GetModel(modelName);
    return model && model->Write(fileName);
}

bool Engine::IsVhdlKeyword(char const *word) { return VhdlKeywords().IContains(word); }
bool Engine::IsVerilogKeyword(char const *word) { return VerilogKeywords().Contains(word); }

void Engine::WriteOrvaneHeader(char const *application, char const *command, char const *designName,
                               char const *device, char const *purpose, char const *reference,
                               bool isVhdl, char const *fileName) {
    TextFileOutStream stream(fileName, false);
    NetlistHeader(application, fileName, command, designName, device, purpose, reference, isVhdl,
                  stream)
        .Write();
}

} // namespace Vesk_Hdl
