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
    /// No models, none current.
    Engine();
    /// Deletes the models, the last first.
    ~Engine();
    Engine(Engine const &) = delete;
    Engine &operator=(Engine const &) = delete;

    /// False if the name is taken. The new model is not made current.
    bool CreateAndAddModel(char const *name, char const *sourceFileName);
    /// Makes a model current; false if there is none of that name, the current one staying.
    bool UseModel(char const *name);
    /// Deletes a model; false if there is none. If it was current, none is afterwards.
    bool RemoveModel(char const *name);
    /// The model of that name, which the engine goes on owning, or null.
    Model *GetModel(char const *name) const;
    /// The model on which Execute(line) runs, or null.
    Model *GetCurrentModel() const;

    /// Runs a line on the current or on the named model; raises "Missing Model.\n" if there is
    /// none. Null is the empty line, which runs nothing.
    void Execute(char const *line);
    void Execute(char const *modelName, char const *line);
    /// Runs a file's lines on the named model, which is made if there is none, with the file as its
    /// source, and not made current. False if the file cannot be read.
    bool ReadCommandFile(char const *modelName, char const *fileName);
    /// Model::Write, which writes nothing; false if there is no model of that name.
    bool WriteCommandFile(char const *modelName, char const *fileName);

    /// Whether the word is reserved in VHDL (IEEE 1076-1993), in any case, or a keyword of Verilog
    /// (IEEE 1364-1995 without "force"), in exact case.
    static bool IsVhdlKeyword(char const *word);
    static bool IsVerilogKeyword(char const *word);

    /// Writes a file that holds the vendor header alone, see NetlistHeader. Null is an empty field.
    static void WriteOrvaneHeader(char const *application, char const *command,
                                  char const *designName, char const *device, char const *purpose,
                                  char const *reference, bool isVhdl, char const *fileName);

private:
    struct Record;
    std::unique_ptr<Record> record;
};

} // namespace Vesk_Hdl
