#pragma once

#include <memory>

#include "vesk_hdl/netlist/NetlistFwd.h"
#include "vesk_hdl/netlist/Values.h"
#include "vesk_hdl/text/Exception.h"
#include "vesk_hdl/text/PtrArray.h"
#include "vesk_hdl/text/StringArray.h"

namespace Vesk_Hdl {

class CommandFactory;
class CommandManager;
class HdlOptions;

/// The outcome of a write command.
struct WriteStatus {
    /// The ordinal of this write among those of the model, from 1; 0 before the first.
    int number = 0;
    /// The name of the file as the command spelled it.
    Basis::StringBase<char> fileName;
    /// The `errno` of the first failure to open, write or close the file, 0 if all text is in it,
    /// and ECANCELED if an exception ended the command.
    int error = 0;
    /// What the opener says about the failure, without a line end; empty if `error` says all.
    Basis::StringBase<char> reason;
};

/// Opens the files of a model's write commands in place of the library. A client derives a class
/// from it to confine, redirect or capture what is written, see Model::SetWriteOpener.
///
/// Each write command calls Open, then Allow for each block, then Finish, all in the thread that
/// runs the command.
class VESK_HDL_API WriteOpener {
public:
    /// The model does not own its opener.
    virtual ~WriteOpener();
    /// Opens a file for writing, at its end with `append`, and returns the descriptor, which the
    /// library owns and closes. -1 with `errno` set if it cannot be opened; text is then dropped.
    /// `fileName` is what the command spelled and is never null. An exception ends the command.
    virtual int Open(char const *fileName, bool append) = 0;
    /// Called before each block of text with its size in bytes. 0, which is the default, lets it
    /// pass; any other value is the `errno` that the write fails with, and no more text is made.
    /// Called with 0 bytes when a signal interrupted a write that had to wait. It must not throw.
    virtual int Allow(std::size_t bytes);
    /// Called once after each Open, when the descriptor is closed. The file holds all the text
    /// unless the status has an error. The opener may set an error and a reason, for instance if it
    /// could not move the file to its place. By default it does nothing. It must not throw.
    virtual void Finish(WriteStatus &status);
};

/// One design, and the object that commands run on: every change by name goes through it.
///
/// Operations check first and change afterwards. A refusal is an Exception; its kind is given with
/// each operation, and what was there before stays as it was. There is one exception to that: a
/// signal that was made on demand stays, even if the operation is refused later. Names match in any
/// case. A null name counts as the empty string, which is a legal name, except where INVALID_NAME
/// is given as a refusal. If memory runs out (std::bad_alloc), the design is whole and the
/// operation may be half done.
///
/// The model owns its netlist, and the netlist owns all objects of the design. Pointers to them are
/// valid until Netlist::Remove, or until a line widens a bus, see Bus. A model is for one thread.
///
/// Sources: engine/ModelShell.cpp (life, identity, running of lines), HdlModel.cpp (declarations),
/// HdlModel_connections.cpp, HdlModel_attributes.cpp.
class VESK_HDL_API Model {
public:
    /// A model with an empty netlist, which is called "hdlNetlist", and default options. The
    /// factory makes the commands; it is not owned and must outlive the model. Without one each
    /// line is refused: UNKNOWN_COMMAND.
    Model(CommandFactory *factory = nullptr);
    /// Deletes the commands that ran, the options and the netlist.
    virtual ~Model();
    Model(Model const &) = delete;
    Model &operator=(Model const &) = delete;

    // Identity and parts. The model stays the owner of what it returns, which is valid as long as
    // the model.

    /// Whether the design changed since the last Read or Write. Names, options, comments and write
    /// commands do not count as changes.
    bool IsModified() const;
    /// Sets what IsModified returns.
    void SetModifiedFlag(bool modified);
    /// The factory given to the constructor, may be null. The model does not own it.
    CommandFactory *GetCommandFactory() const;
    /// The options of the writers. The client may change them. Never null.
    HdlOptions *GetOptions() const;
    /// The design. The client may change it, with the care that Netlist asks for. Never null.
    Netlist *GetNetlist() const;
    /// The commands that ran. They are kept until the client clears them: one that feeds a large
    /// design calls `GetCommandManager()->Clear()` after each line, which changes nothing else. The
    /// next line then uses the memory of the last one, which is fastest. Never null.
    CommandManager *GetCommandManager() const;
    /// Sets the name of the model, which is that of its netlist. Null means "HDL_NETLIST".
    void SetName(char const *name);
    /// A copy of that name.
    Basis::StringBase<char> GetName() const;
    /// Stores the name of the file that the design comes from, see Netlist::SetSourceFileName.
    void SetSourceFileName(char const *fileName);
    /// A copy of that name.
    Basis::StringBase<char> GetSourceFileName() const;

    // Running of lines.

    /// Runs a command line that is split into tokens already, and returns true. No tokens run
    /// nothing. Throws what CommandManager::CreateAndExecute throws.
    bool Execute(StringArray const &tokens);
    /// Splits a line at blanks, with the quotes " and ', runs it and returns true. Null is an empty
    /// line. Throws as the other form.
    bool Execute(char const *line);
    /// Runs the lines of a file, and returns true; an empty file is one. False if the file cannot
    /// be read. The first refused line ends the reading with its exception, which names neither
    /// file nor line; what earlier lines did stays. IsModified is false after the whole file, also
    /// if it could not be read.
    bool Read(char const *fileName);
    /// Writes nothing, whatever the argument, and returns true: there is no writer of command
    /// files. IsModified is false afterwards.
    bool Write(char const *fileName);

    /// The outcome of the last write command. A file that cannot be written raises nothing, so that
    /// a client asks here. The reference stays valid and shows the next write after that.
    WriteStatus const &GetLastWrite() const;
    /// Called by write commands: stores the outcome of one more write. `error` is an `errno`, 0 for
    /// none.
    void SetLastWrite(char const *fileName, int error);
    /// The same. The number of `status` is ignored and counted here.
    void SetLastWrite(WriteStatus const &status);
    /// Sets the opener of the files of write commands; null, the initial state, lets the library
    /// open them. The opener is not owned: it must live until it is replaced or the model ends.
    void SetWriteOpener(WriteOpener *opener);
    /// The opener, null if there is none.
    WriteOpener *GetWriteOpener() const;

    // Declarations. Each returns true.

    /// Declares a component. Refused: null (INVALID_NAME); a name that a component, an instance or
    /// a signal has (NAME_TAKEN).
    bool AddComponent(char const *name);
    /// Adds a pin to a component. Instances that were made before do not get it. Its class follows
    /// from the name, see Component::AddPin. A null initial value is the empty one. Refused: a null
    /// pin name (INVALID_NAME); an unknown component (COMPONENT_NOT_FOUND); a pin that it has
    /// (PIN_TAKEN).
    bool AddPin(char const *pinName, Polarity const &polarity, char const *componentName,
                char const *initialValue);
    /// Places a component. Refused: a null instance name (INVALID_NAME); a name that is taken
    /// (NAME_TAKEN); an unknown component (COMPONENT_NOT_FOUND).
    bool AddInstance(char const *instanceName, char const *componentName);
    /// Declares a bus if the rewritten name is a bus name, otherwise a single net, also for the
    /// name of a bit or a compound. Refused: null (INVALID_NAME); a name that is taken
    /// (NAME_TAKEN); a bus whose base name another bus has, whatever the ranges (BUS_DECLARED).
    bool AddSignal(char const *name);

    // Lookups. Null when absent; nothing is raised.

    /// The component of a name.
    Component *GetComponent(char const *name) const;
    /// The instance of a name.
    Instance *GetInstance(char const *name) const;
    /// The signal of a name.
    Signal *GetSignal(char const *name) const;
    /// The pin of a component, see Component::GetPin; null also for a null component.
    Pin *GetPin(char const *name, Component const *component) const;
    /// The pin of an instance, see Instance::GetPin; null also for a null instance.
    Pin *GetPin(char const *name, Instance const *instance) const;
    /// The attribute of a holder, see AttributeHolder::GetAttr; null also for a null holder.
    Attribute *GetAttr(char const *name, AttributeHolder const *holder) const;

    // Connections. Each returns true. Signals that are named and do not exist are made: a single
    // net; one bit of a bus that exists; a slice of a bus, or the whole bus if there is none; a
    // compound and its members. A range that is as wide as its bus or wider replaces the bus, see
    // Bus.
    //
    // Refused wherever a signal is named: a bit of an unknown bus (SIGNAL_NOT_FOUND), except as a
    // member of a compound, where it becomes a single net; a new name that a component or an
    // instance has (NAME_TAKEN).

    /// Puts a pin of an instance on a signal. A former signal of the pin still lists it. Refused
    /// besides: an unknown instance (INSTANCE_NOT_FOUND, with the message of a signal); an unknown
    /// pin (PIN_NOT_FOUND).
    bool ConnectSignalToPin(char const *signalName, char const *instanceName, char const *pinName);
    /// Assigns the signal `right` to the signal `left`, which then lists it.
    bool ConnectSignals(char const *left, char const *right);
    /// Ties a pin to the signal INSTANCE_PIN_CONST_SIGNAL, which gets the constant of a text, see
    /// BitVectorValue. A second call replaces the constant. The signal does not list the pin.
    /// Refused: an unknown instance or pin, as in ConnectSignalToPin; a name of the new signal that
    /// is taken (NAME_TAKEN, BUS_DECLARED).
    bool AssignConstantToPin(char const *instanceName, char const *pinName, char const *value);
    /// Gives a signal the constant of a text in place of a former one.
    bool AssignConstantToSignal(char const *signalName, char const *value);

    // Attributes: the base operations. A null holder does nothing. Other nulls count as empty.

    /// Sets the value of the attribute of that name, which keeps its type, or adds one. A null type
    /// means "String". Refused: an unknown word for the type (INVALID_ATTRIBUTE_TYPE).
    void AddAttr(AttributeHolder *holder, char const *name, char const *value, char const *type);
    /// Sets the generic option, see Attribute::SetGeneric. Refused: an unknown attribute
    /// (ATTRIBUTE_NOT_FOUND); an unknown word (INVALID_GENERIC_WORD).
    void SetGenericAttrValue(AttributeHolder *holder, char const *name, char const *word);
    /// Sets the synthesis option, see Attribute::SetSynAttr. Refused: an unknown attribute
    /// (ATTRIBUTE_NOT_FOUND); an unknown word (INVALID_SYNTHESIS_WORD, with the message of the
    /// generic option).
    void SetSynAttrValue(AttributeHolder *holder, char const *name, char const *word);
    /// Sets the value, which no attribute refuses. Refused: an unknown attribute
    /// (ATTRIBUTE_NOT_FOUND).
    void SetAttrValue(AttributeHolder *holder, char const *name, char const *value);
    /// Sets the name of the type of a user attribute. Refused: an unknown attribute
    /// (ATTRIBUTE_NOT_FOUND); one of another class (NOT_A_USER_ATTRIBUTE).
    void SetUserType(AttributeHolder *holder, char const *name, char const *userType);

    // The same operations by the name of the owner, in blocks for the module, components,
    // instances, signals and the pins of both. Refused besides: a null attribute name in an Add
    // operation (INVALID_NAME); an owner that does not exist (COMPONENT_NOT_FOUND,
    // INSTANCE_NOT_FOUND, SIGNAL_NOT_FOUND, PIN_NOT_FOUND).

    /// See AddAttr. The owner is the netlist.
    void AddModuleAttr(char const *name, char const *value, char const *type);
    /// See SetGenericAttrValue.
    void SetModuleGenericAttrValue(char const *name, char const *word);
    /// See SetSynAttrValue.
    void SetModuleSynAttrValue(char const *name, char const *word);
    /// See SetAttrValue.
    void SetModuleAttrValue(char const *name, char const *value);
    /// See SetUserType.
    void SetModuleUserType(char const *name, char const *userType);

    /// See AddAttr.
    void AddComponentAttr(char const *component, char const *name, char const *value,
                          char const *type);
    /// See SetGenericAttrValue.
    void SetComponentGenericAttrValue(char const *component, char const *name, char const *word);
    /// See SetSynAttrValue.
    void SetComponentSynAttrValue(char const *component, char const *name, char const *word);
    /// See SetAttrValue.
    void SetComponentAttrValue(char const *component, char const *name, char const *value);
    /// See SetUserType.
    void SetComponentUserType(char const *component, char const *name, char const *userType);

    // An instance inherits the attributes of its component. The first Set operation on such an
    // attribute gives the instance a clone of it, so that other instances keep the component's. The
    // clone stays, even if the operation is then refused.

    /// See AddAttr. It does not look at the component: an inherited attribute is not changed but
    /// added.
    void AddInstanceAttr(char const *instance, char const *name, char const *value,
                         char const *type);
    /// See SetGenericAttrValue. An unknown instance has the message of an unknown attribute.
    void SetInstanceGenericAttrValue(char const *instance, char const *name, char const *word);
    /// See SetSynAttrValue. An unknown instance has the message of an unknown attribute.
    void SetInstanceSynAttrValue(char const *instance, char const *name, char const *word);
    /// See SetAttrValue.
    void SetInstanceAttrValue(char const *instance, char const *name, char const *value);
    /// See SetUserType.
    void SetInstanceUserType(char const *instance, char const *name, char const *userType);

    /// See AddAttr.
    void AddSignalAttr(char const *signal, char const *name, char const *value, char const *type);
    /// See SetGenericAttrValue.
    void SetSignalGenericAttrValue(char const *signal, char const *name, char const *word);
    /// See SetSynAttrValue.
    void SetSignalSynAttrValue(char const *signal, char const *name, char const *word);
    /// See SetAttrValue.
    void SetSignalAttrValue(char const *signal, char const *name, char const *value);
    /// See SetUserType.
    void SetSignalUserType(char const *signal, char const *name, char const *userType);

    // For both kinds of pins an unknown owner has the message of an unknown pin.

    /// See AddAttr. Pins of instances that were made before do not get it.
    void AddComponentPinAttr(char const *component, char const *pin, char const *name,
                             char const *value, char const *type);
    /// See SetGenericAttrValue.
    void SetComponentPinGenericAttrValue(char const *component, char const *pin, char const *name,
                                         char const *word);
    /// See SetSynAttrValue.
    void SetComponentPinSynAttrValue(char const *component, char const *pin, char const *name,
                                     char const *word);
    /// See SetAttrValue.
    void SetComponentPinAttrValue(char const *component, char const *pin, char const *name,
                                  char const *value);
    /// See SetUserType.
    void SetComponentPinUserType(char const *component, char const *pin, char const *name,
                                 char const *userType);

    /// See AddAttr. The pin has attributes of its own, copied when the instance was made.
    void AddInstancePinAttr(char const *instance, char const *pin, char const *name,
                            char const *value, char const *type);
    /// See SetGenericAttrValue.
    void SetInstancePinGenericAttrValue(char const *instance, char const *pin, char const *name,
                                        char const *word);
    /// See SetSynAttrValue.
    void SetInstancePinSynAttrValue(char const *instance, char const *pin, char const *name,
                                    char const *word);
    /// See SetAttrValue.
    void SetInstancePinAttrValue(char const *instance, char const *pin, char const *name,
                                 char const *value);
    /// See SetUserType.
    void SetInstancePinUserType(char const *instance, char const *pin, char const *name,
                                char const *userType);

    // Comments: lines that the writers put before the object, see Object::AddComment. A null text
    // does nothing, also for an unknown owner; otherwise that is refused as for attributes.
    // IsModified does not change.

    /// Adds a line to the comment of the module, which follows the header of a file.
    void AddNotes(char const *text);
    /// Adds a line to that of a component. Verilog repeats it at each instance.
    void AddComponentComment(char const *component, char const *text);
    /// Adds a line to that of an instance.
    void AddInstanceComment(char const *instance, char const *text);
    /// Adds a line to that of a signal.
    void AddSignalComment(char const *signal, char const *text);
    /// Adds a line to that of a component's pin. The writers do not show it.
    void AddComponentPinComment(char const *component, char const *pin, char const *text);
    /// Adds a line to that of an instance's pin. The writers do not show it.
    void AddInstancePinComment(char const *instance, char const *pin, char const *text);

private:
    bool IsNamedUsed(char const *name);
    Signal *GetOrCreateSignal(char const *name);
    Signal *CreateAndAddBusIndexSignal(char const *name);
    Signal *CreateAndAddBusSliceSignal(char const *name);
    Signal *CreateAndAddCompundSignal(char const *name);
    bool Connect(Signal *signal, Pin *pin);
    bool Connect(Signal *left, Signal *right);
    bool AssignConstant(Signal *signal, char const *value);
    bool AssignConstant(Pin *pin, char const *value, char const *instanceName);
    Attribute *GetInstanceOrComponentAttr(char const *name, Instance *instance) const;

    struct Record;
    std::unique_ptr<Record> record;
};

} // namespace Vesk_Hdl
