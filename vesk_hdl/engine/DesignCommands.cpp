// The commands that declare and connect a design. Each reads its tokens by index, keyword words
// counted, and calls one operation of Model. Tokens behind the last one named are ignored.

#include <string>

#include "vesk_hdl/engine/Commands.h"
#include "vesk_hdl/engine/PinReference.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/netlist/Signal.h"

namespace Vesk_Hdl {

using Text = Basis::StringBase<char>;

// NOOP

struct NoOperationArguments {};
VESK_HDL_COMMAND(NoOperationCommand, NoOperationArguments)

bool NoOperationCommand::ParseArguments(StringArray const &) { return true; }

void NoOperationCommand::Execute() {} // the one command that needs no model

// SET NETLIST NAME name

struct SetNetlistNameArguments {
    Text name;
};
VESK_HDL_COMMAND(SetNetlistNameCommand, SetNetlistNameArguments)

bool SetNetlistNameCommand::ParseArguments(StringArray const &tokens) {
    arguments.name = tokens.At(3);
    return !arguments.name.IsEmpty();
}

void SetNetlistNameCommand::Execute() { RequireModel().SetName(arguments.name); }

// SET SOURCE FILE file

struct SetSourceFileArguments {
    Text name;
};
VESK_HDL_COMMAND(SetSourceFileCommand, SetSourceFileArguments)

bool SetSourceFileCommand::ParseArguments(StringArray const &tokens) {
    arguments.name = tokens.At(3);
    return !arguments.name.IsEmpty();
}

void SetSourceFileCommand::Execute() { RequireModel().SetSourceFileName(arguments.name); }

// ADD COMPONENT name

struct AddComponentArguments {
    Text name;
};
VESK_HDL_COMMAND(AddComponentCommand, AddComponentArguments)

bool AddComponentCommand::ParseArguments(StringArray const &tokens) {
    arguments.name = tokens.At(2);
    return !arguments.name.IsEmpty();
}

void AddComponentCommand::Execute() { RequireModel().AddComponent(arguments.name); }

// ADD PIN component pin polarity [value]

struct AddPinArguments {
    Text componentName;
    Text pinName;
    Text initialValue;
    Polarity polarity;
};
VESK_HDL_COMMAND(AddPinCommand, AddPinArguments)

bool AddPinCommand::ParseArguments(StringArray const &tokens) {
    if (tokens.GetSize() < 5)
        return false;
    arguments.componentName = tokens.At(2);
    arguments.pinName = tokens.At(3);
    arguments.polarity.SetValue(tokens.At(4).GetText());
    if (tokens.GetSize() >= 6)
        arguments.initialValue = tokens.At(5);
    return arguments.polarity != Polarity::INVALID;
}

void AddPinCommand::Execute() {
    RequireModel().AddPin(arguments.pinName, arguments.polarity, arguments.componentName,
                          arguments.initialValue);
}

// ADD INSTANCE component instance

struct AddInstanceArguments {
    Text componentName;
    Text instanceName;
};
VESK_HDL_COMMAND(AddInstanceCommand, AddInstanceArguments)

bool AddInstanceCommand::ParseArguments(StringArray const &tokens) {
    arguments.componentName = tokens.At(2);
    arguments.instanceName = tokens.At(3);
    return tokens.GetSize() >= 4;
}

void AddInstanceCommand::Execute() {
    RequireModel().AddInstance(arguments.instanceName, arguments.componentName);
}

// ADD SIGNAL name [polarity]

struct AddSignalArguments {
    Text name;
    Polarity polarity; ///< checked and then dropped: a signal is no port
};
VESK_HDL_COMMAND(AddSignalCommand, AddSignalArguments)

bool AddSignalCommand::ParseArguments(StringArray const &tokens) {
    arguments.name = tokens.At(2);
    arguments.polarity.SetValue(tokens.At(3).GetText());
    return tokens.GetSize() == 3 ||
           (tokens.GetSize() > 3 && arguments.polarity != Polarity::INVALID);
}

void AddSignalCommand::Execute() { RequireModel().AddSignal(arguments.name); }

// ADD PORT name polarity

struct AddPortArguments {
    Text name;
    Polarity polarity;
};
VESK_HDL_COMMAND(AddPortCommand, AddPortArguments)

bool AddPortCommand::ParseArguments(StringArray const &tokens) {
    arguments.name = tokens.At(2);
    arguments.polarity.SetValue(tokens.At(3).GetText());
    return tokens.GetSize() >= 4 && arguments.polarity != Polarity::INVALID;
}

void AddPortCommand::Execute() {
    Model &model = RequireModel();
    if (!model.AddSignal(arguments.name))
        return;
    if (Signal *const port = model.GetSignal(arguments.name))
        port->SetPortPolarity(arguments.polarity);
}

// CONNECT SIGNAL signal (signal | instance.pin)

struct ConnectSignalArguments {
    Text signalName;
    Text targetSignal;
    std::string instanceName;
    std::string pinName;
    bool isPin = false;
};
VESK_HDL_COMMAND(ConnectSignalCommand, ConnectSignalArguments)

bool ConnectSignalCommand::ParseArguments(StringArray const &tokens) {
    if (tokens.GetSize() < 4)
        return false;
    arguments.signalName = tokens.At(2);
    Text const &target = tokens.At(3);
    arguments.isPin = IsPinReference(target.View());
    if (arguments.isPin)
        return SplitPinReference(target.View(), arguments.instanceName, arguments.pinName);
    arguments.targetSignal = target;
    return true;
}

void ConnectSignalCommand::Execute() {
    Model &model = RequireModel();
    if (arguments.isPin)
        model.ConnectSignalToPin(arguments.signalName, arguments.instanceName.c_str(),
                                 arguments.pinName.c_str());
    else
        model.ConnectSignals(arguments.signalName, arguments.targetSignal);
}

// ASSIGN CONSTANT (signal | instance.pin) value

struct AssignConstantArguments {
    Text signalName;
    std::string instanceName;
    std::string pinName;
    bool isPin = false;
    Text value;
};
VESK_HDL_COMMAND(AssignConstantCommand, AssignConstantArguments)

bool AssignConstantCommand::ParseArguments(StringArray const &tokens) {
    if (tokens.GetSize() < 4)
        return false;
    Text const &target = tokens.At(2);
    arguments.value = tokens.At(3);
    arguments.isPin = IsPinReference(target.View());
    if (arguments.isPin)
        return SplitPinReference(target.View(), arguments.instanceName, arguments.pinName);
    arguments.signalName = target;
    return true;
}

void AssignConstantCommand::Execute() {
    Model &model = RequireModel();
    if (arguments.isPin)
        model.AssignConstantToPin(arguments.instanceName.c_str(), arguments.pinName.c_str(),
                                  arguments.value);
    else
        model.AssignConstantToSignal(arguments.signalName, arguments.value);
}

} // namespace Vesk_Hdl
