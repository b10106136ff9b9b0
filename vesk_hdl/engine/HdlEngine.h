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
/// Refused lines raise Vesk_Hdl::Exception. Model names ignore case; a null name counts as the
/// empty string, which is a legal name. One engine is for one thread; several engines may be used
/// from several threads at once.
class VESK_HDL_API Engine {
public:
    /// An engine without models; none is current.
    Engine();
    /// Deletes the models, the last one first.
    ~Engine();
    Engine(Engine const &) = delete;
    Engine &operator=(Engine const &) = delete;

    /// Adds an empty model, which the engine owns. It does not become the current one. False if a
    /// model has that name; nothing changes then. A null file name is empty.
    bool CreateAndAddModel(char const *name, char const *sourceFileName);
    /// Makes the model of that name current. False if there is none; nothing changes then.
    bool UseModel(char const *name);
    /// Deletes the model of that name and all that it holds. False if there is none. If the model
    /// was current, none is current afterwards.
    bool RemoveModel(char const *name);
    /// The model of that name, null if there is none. The engine owns it: the pointer is valid
    /// until RemoveModel deletes it or the engine dies.
    Model *GetModel(char const *name) const;
    /// The model on which Execute(line) runs, null if there is none. Valid as that of GetModel.
    Model *GetCurrentModel() const;

    /// Runs a line on the current model, or on the named one. Raises the refusal of the line, and
    /// "Missing Model.\n" if there is no such model. An empty line runs nothing; null is one.
    void Execute(char const *line);
    void Execute(char const *modelName, char const *line);
    /// Runs the lines of a file on the named model. If there is no such model, one is added whose
    /// source file is this one; it does not become current. False if the file cannot be opened.
    /// The first refused line raises its refusal and ends the reading; earlier lines stay done.
    bool ReadCommandFile(char const *modelName, char const *fileName);
    /// Calls Model::Write, which writes nothing. False if there is no model of that name.
    bool WriteCommandFile(char const *modelName, char const *fileName);

    /// Whether the word is reserved in VHDL (IEEE 1076-1993), in any case, or a keyword of Verilog
    /// (IEEE 1364-1995 without "force"), in exact case.
    static bool IsVhdlKeyword(char const *word);
    static bool IsVerilogKeyword(char const *word);

    /// Writes a file that holds nothing but the vendor header, see NetlistHeader. Null is an empty
    /// field. A file that cannot be written raises nothing.
    static void WriteOrvaneHeader(char const *application, char const *command,
                                  char const *designName, char const *device, char const *purpose,
                                  char const *reference, bool isVhdl, char const *fileName);

private:
    struct Record;
    std::unique_ptr<Record> record;
};

} // namespace Vesk_Hdl
