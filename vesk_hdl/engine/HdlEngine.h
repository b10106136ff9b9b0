#pragma once

#include "vesk_hdl/engine/HdlCmd.h"
#include "vesk_hdl/model/HdlModel.h"

namespace Vesk_Hdl {

/// The front of the library: it owns named models and runs command lines and files on them.
///
///     Vesk_Hdl::Engine engine;
///     engine.CreateAndAddModel("top", nullptr);
///     engine.UseModel("top");
///     engine.Execute("ADD COMPONENT AND2");
///
/// A refused line throws a Vesk_Hdl::Exception, see its Kind. Names of models match in any case; a
/// null name counts as the empty string, which is a legal name. One engine and all that it owns are
/// for one thread at a time; several engines may be used from several threads at once.
class VESK_HDL_API Engine {
public:
    /// An engine without models; none is current.
    Engine();
    /// Deletes the models, the last one first. Pointers to models and to anything in them are no
    /// longer valid.
    ~Engine();
    Engine(Engine const &) = delete;
    Engine &operator=(Engine const &) = delete;

    /// Adds an empty model, which the engine owns. It does not become the current one. False, and
    /// no change, if a model has that name. A null file name counts as empty.
    bool CreateAndAddModel(char const *name, char const *sourceFileName);
    /// Makes the model of that name current. False, and no change, if there is none.
    bool UseModel(char const *name);
    /// Deletes the model of that name and all that it owns. False if there is none. If the model
    /// was current, none is current afterwards.
    bool RemoveModel(char const *name);
    /// The model of that name, null if there is none. The engine stays the owner: the pointer is
    /// valid until RemoveModel deletes the model or the engine ends. Of two models that a client
    /// gave one name the first one is found.
    Model *GetModel(char const *name) const;
    /// The model on which Execute(line) runs, null if there is none. Valid as long as that of
    /// GetModel.
    Model *GetCurrentModel() const;

    /// Runs a line on the current model. An empty line, and null, run nothing. Throws an Exception:
    /// MISSING_MODEL if no model is current, also for an empty line; otherwise the refusal of the
    /// line, see CommandManager::CreateAndExecute.
    void Execute(char const *line);
    /// The same on the named model, which does not become current. MISSING_MODEL if there is none.
    void Execute(char const *modelName, char const *line);
    /// Runs the lines of a file on the named model, see Model::Read. If there is no such model, one
    /// is added whose source file is this one, even if the file cannot be read; it does not become
    /// current. False if the file cannot be read. The first refused line throws its refusal and
    /// ends the reading; earlier lines stay done.
    bool ReadCommandFile(char const *modelName, char const *fileName);
    /// Calls Model::Write, which writes no file, and returns true. False if there is no model of
    /// that name.
    bool WriteCommandFile(char const *modelName, char const *fileName);

    /// Whether the word is reserved in VHDL (IEEE 1076-1993, 13.9), in any case. Null counts as
    /// empty.
    static bool IsVhdlKeyword(char const *word);
    /// Whether the word is a keyword of Verilog (IEEE 1364-1995, annex B), in exact case. "force"
    /// is missing, which clients rely on. Null counts as empty.
    static bool IsVerilogKeyword(char const *word);

    /// Writes a file that has only the vendor header, see NetlistHeader, in place of what it held.
    /// A null field counts as empty. A file that cannot be written raises nothing and is not
    /// reported.
    static void WriteOrvaneHeader(char const *application, char const *command,
                                  char const *designName, char const *device, char const *purpose,
                                  char const *reference, bool isVhdl, char const *fileName);

private:
    struct Record;
    std::unique_ptr<Record> record;
};

} // namespace Vesk_Hdl
