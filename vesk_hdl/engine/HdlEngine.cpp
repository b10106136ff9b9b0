// The class Engine: its models, and how a line reaches one of them.

#include "vesk_hdl/engine/HdlEngine.h"

#include "vesk_hdl/engine/Keywords.h"
#include "vesk_hdl/engine/ModelIndex.h"
#include "vesk_hdl/hdl/NetlistHeader.h"
#include "vesk_hdl/model/Messages.h"
#include "vesk_hdl/text/OutStream.h"

namespace Vesk_Hdl {

using Basis::StringBase;

struct Engine::Record {
    CommandFactory factory;      ///< declared before the models, which point at it
    ModelIndex index;            ///< likewise: the models count their renames in it
    OwnPtrArray<Model *> models; ///< in order of addition
    Model *currentModel = nullptr;
};

Engine::Engine() : record(std::make_unique<Record>()) {}
Engine::~Engine() = default;

Model *Engine::GetModel(char const *name) const { return record->index.Find(record->models, name); }

Model *Engine::GetCurrentModel() const { return record->currentModel; }

bool Engine::CreateAndAddModel(char const *name, char const *sourceFileName) {
    if (GetModel(name))
        return false;
    std::unique_ptr<Model> model(record->factory.CreateModel());
    model->SetName(name ? name : ""); // null would mean the default name
    model->SetSourceFileName(sourceFileName);
    record->models.Add(model.get());
    record->index.Add(*model.release()); // owned by the array now, whatever the index does
    return true;
}

bool Engine::UseModel(char const *name) {
    Model *const model = GetModel(name);
    if (!model)
        return false;
    record->currentModel = model;
    return true;
}

/// The index is asked while the model still has its name.
bool Engine::RemoveModel(char const *name) {
    Model *const model = GetModel(name);
    if (!model)
        return false;
    if (record->currentModel == model)
        record->currentModel = nullptr;
    record->models.Remove(model);
    record->index.Remove(*model);
    delete model;
    return true;
}

namespace {

/// Runs a line. Required: without a model even an empty line is refused.
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
    if (!GetModel(modelName)) // required: also if the file turns out to be unreadable
        CreateAndAddModel(modelName, fileName);
    return GetModel(modelName)->Read(fileName);
}

bool Engine::WriteCommandFile(char const *modelName, char const *fileName) {
    Model *const model = GetModel(modelName);
    return model && model->Write(fileName);
}

// The two languages treat case differently, so that the two tests do.

bool Engine::IsVhdlKeyword(char const *word) { return VhdlKeywords().IContains(word); }
bool Engine::IsVerilogKeyword(char const *word) { return VerilogKeywords().Contains(word); }

/// Required: a file that cannot be opened is no failure; its text is dropped.
void Engine::WriteOrvaneHeader(char const *application, char const *command, char const *designName,
                               char const *device, char const *purpose, char const *reference,
                               bool isVhdl, char const *fileName) {
    TextFileOutStream stream(fileName, false);
    NetlistHeader(application, fileName, command, designName, device, purpose, reference, isVhdl,
                  stream)
        .Write();
}

} // namespace Vesk_Hdl
