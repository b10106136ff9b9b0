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

/// What became of a write command.
struct WriteStatus {
    int number = 0;                   ///< the how many-th write of the model it was, from 1
    Basis::StringBase<char> fileName; ///< as the command named it
    int error = 0; ///< `errno` of the first failure to open, write or close, or 0
    /// What the opener says of the failure, without an end of line; empty if `error` says it all.
    Basis::StringBase<char> reason;
};

/// Opens the files of a model's write commands in place of the library: derived by a client that
/// confines, redirects or captures what is written.
class VESK_HDL_API WriteOpener {
public:
    virtual ~WriteOpener();
    /// A descriptor open for writing, which the library closes; or -1 with `errno` set, and the
    /// text is dropped as for a file that cannot be opened. The name is as the command gave it.
    virtual int Open(char const *fileName, bool append) = 0;
    /// Asked before each block of text goes to the file: 0 to let so many bytes pass, as by
    /// default, or the `errno` that the write fails with. The generation of the text then ends.
    /// Asked with 0 bytes when a signal interrupted a write that had to wait. It must not throw.
    virtual int Allow(std::size_t bytes);
    /// Called once after each Open, when the descriptor is closed: the text is in the file whole
    /// unless the status has an error, which is ECANCELED when an exception ends the command. The
    /// opener may set an error and a reason; by default it does nothing. It must not throw.
    virtual void Finish(WriteStatus &status);
};

/// One design, and the object that commands run against: every change by name goes through it.
///
/// Operations check first and change afterwards. A refusal is an Exception, and what was there
/// before stays; a signal that came into being on demand stays too. Names ignore case. A null name
/// counts as the empty string, which is a legal name, but where "Invalid Name.\n" is told. All
/// objects are owned by the netlist, which the model owns. For one thread.
///
/// Sources: engine/HdlEngine.cpp (life, identity, running of lines), HdlModel.cpp (declarations),
/// HdlModel_connections.cpp, HdlModel_attributes.cpp.
class VESK_HDL_API Model {
public:
    /// The factory makes the commands; it is not owned and must outlive the model. Without one no
    /// line can run: each raises "Command not find.\n".
    Model(CommandFactory *factory = nullptr);
    virtual ~Model();
    Model(Model const &) = delete;
    Model &operator=(Model const &) = delete;

    // Identity and parts. The model stays the owner of what it gives out.

    /// Whether the design changed since the last Read or Write.
    bool IsModified() const;
    void SetModifiedFlag(bool modified);
    CommandFactory *GetCommandFactory() const;
    HdlOptions *GetOptions() const;
    Netlist *GetNetlist() const;
    /// The commands that ran. They are kept until somebody clears them: a client that feeds a large
    /// design calls `GetCommandManager()->Clear()` after each line, which changes nothing else. The
    /// next line then takes the memory of the last one, which costs least.
    CommandManager *GetCommandManager() const;
    /// The model's name is its netlist's. Null means "HDL_NETLIST".
    void SetName(char const *name);
    Basis::StringBase<char> GetName() const;
    void SetSourceFileName(char const *fileName);
    Basis::StringBase<char> GetSourceFileName() const;

    // Running of lines.

    /// Runs a command line that is split already; true. No tokens run nothing.
    bool Execute(StringArray const &tokens);
    /// Splits a line at blanks, with the quotes " and ', and runs it; true.
    bool Execute(char const *line);
    /// Runs the lines of a file up to the first that fails, whose exception passes on. False if the
    /// file cannot be read. At the end of the file the model counts as not modified.
    bool Read(char const *fileName);
    /// Writes nothing, whatever the argument: the model merely counts as not modified. True.
    bool Write(char const *fileName);

    /// What the last write command did. A file that cannot be written raises nothing: ask here.
    WriteStatus const &GetLastWrite() const;
    /// For write commands. The second form takes everything but the number, which is counted here.
    void SetLastWrite(char const *fileName, int error);
    void SetLastWrite(WriteStatus const &status);
    /// Who opens the files of write commands; null, as at first, for the library itself. Not owned.
    void SetWriteOpener(WriteOpener *opener);
    WriteOpener *GetWriteOpener() const;

    // Declarations. Each returns true.

    /// Refused: null ("Invalid Name.\n"); a name that a component, instance or signal has.
    bool AddComponent(char const *name);
    /// Refused: null pin name; an unknown component; a pin that the component has. Instances made
    /// before do not get the pin. A null initial value is the empty one.
    bool AddPin(char const *pinName, Polarity const &polarity, char const *componentName,
                char const *initialValue);
    /// Refused: null instance name; a name that is taken; an unknown component.
    bool AddInstance(char const *instanceName, char const *componentName);
    /// Declares a bus if the rewritten name is a bus name, otherwise a scalar. Refused: null; a
    /// name that is taken; a bus whose base name another bus has.
    bool AddSignal(char const *name);

    // Lookups. Null when absent; nothing is raised.

    Component *GetComponent(char const *name) const;
    Instance *GetInstance(char const *name) const;
    Signal *GetSignal(char const *name) const;
    Pin *GetPin(char const *name, Component const *component) const;
    Pin *GetPin(char const *name, Instance const *instance) const;
    Attribute *GetAttr(char const *name, AttributeHolder const *holder) const;

    // Connections. Each returns true and makes the signals it names on demand: a scalar, one bit of
    // a bus that exists, a slice of a bus or the whole bus (a slice as wide as the bus or wider
    // replaces it), a compound and its members.

    /// Puts a pin of an instance on a signal. A former signal of the pin goes on listing it.
    /// Refused: a bit of an unknown bus; an unknown instance ("Signal ... not found.\n", as it
    /// stands); an unknown pin.
    bool ConnectSignalToPin(char const *signalName, char const *instanceName, char const *pinName);
    /// Records that `left` is assigned from `right`. Refused: a bit of an unknown bus.
    bool ConnectSignals(char const *left, char const *right);
    /// Ties a pin to a signal INSTANCE_PIN_CONST_SIGNAL with that constant, see BitVectorValue. The
    /// signal does not list the pin.
    bool AssignConstantToPin(char const *instanceName, char const *pinName, char const *value);
    /// Gives a signal a constant in place of a former one.
    bool AssignConstantToSignal(char const *signalName, char const *value);

    // Attributes and comments: the base operations. A null holder does nothing.

    /// Sets the value of the attribute of that name, which keeps its type, or adds one. Null type:
    /// "String". Refused: an unknown type word.
    void AddAttr(AttributeHolder *holder, char const *name, char const *value, char const *type);
    /// Sets the generic option, see Attribute. Refused: an unknown attribute; an unknown word.
    void SetGenericAttrValue(AttributeHolder *holder, char const *name, char const *word);
    /// Sets the synthesis option. Refused as the generic option, with the same message.
    void SetSynAttrValue(AttributeHolder *holder, char const *name, char const *word);
    /// Sets the value. Refused: an unknown attribute.
    void SetAttrValue(AttributeHolder *holder, char const *name, char const *value);
    /// Sets the type of a user attribute, also to the empty one. Refused: an unknown attribute; one
    /// of another class.
    void SetUserType(AttributeHolder *holder, char const *name, char const *userType);

    // The same by name of the owner. The Add operations refuse a null attribute name; an owner or
    // pin that does not exist is refused.

    void AddModuleAttr(char const *name, char const *value, char const *type);
    void SetModuleGenericAttrValue(char const *name, char const *word);
    void SetModuleSynAttrValue(char const *name, char const *word);
    void SetModuleAttrValue(char const *name, char const *value);
    void SetModuleUserType(char const *name, char const *userType);

    void AddComponentAttr(char const *component, char const *name, char const *value,
                          char const *type);
    void SetComponentGenericAttrValue(char const *component, char const *name, char const *word);
    void SetComponentSynAttrValue(char const *component, char const *name, char const *word);
    void SetComponentAttrValue(char const *component, char const *name, char const *value);
    void SetComponentUserType(char const *component, char const *name, char const *userType);

    // An instance inherits the attributes of its component. The first Set of such an attribute
    // gives the instance a copy of its own, which stays even if the Set is then refused. Add does
    // not look at the component.

    void AddInstanceAttr(char const *instance, char const *name, char const *value,
                         char const *type);
    void SetInstanceGenericAttrValue(char const *instance, char const *name, char const *word);
    void SetInstanceSynAttrValue(char const *instance, char const *name, char const *word);
    void SetInstanceAttrValue(char const *instance, char const *name, char const *value);
    void SetInstanceUserType(char const *instance, char const *name, char const *userType);

    void AddSignalAttr(char const *signal, char const *name, char const *value, char const *type);
    void SetSignalGenericAttrValue(char const *signal, char const *name, char const *word);
    void SetSignalSynAttrValue(char const *signal, char const *name, char const *word);
    void SetSignalAttrValue(char const *signal, char const *name, char const *value);
    void SetSignalUserType(char const *signal, char const *name, char const *userType);

    void AddComponentPinAttr(char const *component, char const *pin, char const *name,
                             char const *value, char const *type);
    void SetComponentPinGenericAttrValue(char const *component, char const *pin, char const *name,
                                         char const *word);
    void SetComponentPinSynAttrValue(char const *component, char const *pin, char const *name,
                                     char const *word);
    void SetComponentPinAttrValue(char const *component, char const *pin, char const *name,
                                  char const *value);
    void SetComponentPinUserType(char const *component, char const *pin, char const *name,
                                 char const *userType);

    // The pin of an instance has attributes of its own, copied when the instance was made.

    void AddInstancePinAttr(char const *instance, char const *pin, char const *name,
                            char const *value, char const *type);
    void SetInstancePinGenericAttrValue(char const *instance, char const *pin, char const *name,
                                        char const *word);
    void SetInstancePinSynAttrValue(char const *instance, char const *pin, char const *name,
                                    char const *word);
    void SetInstancePinAttrValue(char const *instance, char const *pin, char const *name,
                                 char const *value);
    void SetInstancePinUserType(char const *instance, char const *pin, char const *name,
                                char const *userType);

    // Comments. A null text does nothing; an unknown owner is refused. A comment does not count as
    // a change of the design.

    void AddNotes(char const *text); ///< of the module
    void AddComponentComment(char const *component, char const *text);
    void AddInstanceComment(char const *instance, char const *text);
    void AddSignalComment(char const *signal, char const *text);
    void AddComponentPinComment(char const *component, char const *pin, char const *text);
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
