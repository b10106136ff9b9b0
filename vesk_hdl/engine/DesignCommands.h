#pragma once

#include <string>

#include "vesk_hdl/engine/CommandOf.h"
#include "vesk_hdl/engine/PinReference.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/netlist/Signal.h"

// The commands that declare and connect a design. Each reads its tokens by index, where a missing
// one reads as empty, and calls one operation of Model, which refuses what is wrong with the
// design. Required: tokens after the last one that it reads are ignored.

namespace Vesk_Hdl::Commands {

using Text = Basis::StringBase<char>;

/// Required: the one command that runs without a model.
class NoOperationCommand : public Command {
public:
    static constexpr char const *KEYWORD = "NOOP";

    using Command::Command;
    bool ParseArguments(StringArray const &) override { return true; }
    void Execute() override {}
    char const *GetKeyword() const override { return KEYWORD; }
};

/// name, which must not be empty.
template <auto OPERATION> struct SetName {
    Text name;

    bool Parse(StringArray const &tokens, int first) {
        name = tokens.At(first);
        return !name.IsEmpty();
    }
    void Run(Model &model) const { (model.*OPERATION)(name); }
};
using SetNetlistNameCommand = CommandOf<"SET NETLIST NAME", SetName<&Model::SetName>>;
using SetSourceFileCommand = CommandOf<"SET SOURCE FILE", SetName<&Model::SetSourceFileName>>;
using AddComponentCommand = CommandOf<"ADD COMPONENT", SetName<&Model::AddComponent>>;

/// component pin polarity [value]. Required: the component comes first on the line, and last in
/// Model.
struct AddPin {
    Text componentName;
    Text pinName;
    Polarity polarity;
    Text initialValue;

    bool Parse(StringArray const &tokens, int first) {
        if (tokens.GetSize() < first + 3)
            return false;
        componentName = tokens.At(first);
        pinName = tokens.At(first + 1);
        polarity.SetValue(tokens.At(first + 2).GetText());
        initialValue = tokens.At(first + 3);
        return polarity != Polarity::INVALID;
    }
    void Run(Model &model) const { model.AddPin(pinName, polarity, componentName, initialValue); }
};
using AddPinCommand = CommandOf<"ADD PIN", AddPin>;

/// component instance
struct AddInstance {
    Text componentName;
    Text instanceName;

    bool Parse(StringArray const &tokens, int first) {
        componentName = tokens.At(first);
        instanceName = tokens.At(first + 1);
        return tokens.GetSize() >= first + 2;
    }
    void Run(Model &model) const { model.AddInstance(instanceName, componentName); }
};
using AddInstanceCommand = CommandOf<"ADD INSTANCE", AddInstance>;

/// signal polarity. The one command that makes a port.
struct AddPort {
    Text name;
    Polarity polarity;

    bool Parse(StringArray const &tokens, int first) {
        name = tokens.At(first);
        polarity.SetValue(tokens.At(first + 1).GetText());
        return tokens.GetSize() >= first + 2 && polarity != Polarity::INVALID;
    }
    void Run(Model &model) const {
        if (!model.AddSignal(name))
            return;
        if (Signal *const port = model.GetSignal(name))
            port->SetPortPolarity(polarity);
    }
};
using AddPortCommand = CommandOf<"ADD PORT", AddPort>;

/// signal [polarity]. Required: the polarity is checked and has no effect, and the signal is no
/// port.
struct AddSignal {
    Text name;

    bool Parse(StringArray const &tokens, int first) {
        name = tokens.At(first);
        return tokens.GetSize() == first + 1 ||
               (tokens.GetSize() > first + 1 &&
                Polarity::GetValue(tokens.At(first + 1)) != Polarity::INVALID);
    }
    void Run(Model &model) const { model.AddSignal(name); }
};
using AddSignalCommand = CommandOf<"ADD SIGNAL", AddSignal>;

/// What a line connects or ties: a signal, or a pin of an instance. A name without a point is
/// always a signal.
struct Target {
    Text signal;
    std::string instance;
    std::string pin;
    bool isPin = false;

    void Parse(Text const &token) {
        isPin = SplitPinReference(token.View(), instance, pin);
        if (!isPin)
            signal = token;
    }
};

/// signal (signal | instance.pin)
struct ConnectSignal {
    Text signalName;
    Target target;

    bool Parse(StringArray const &tokens, int first) {
        if (tokens.GetSize() < first + 2)
            return false;
        signalName = tokens.At(first);
        target.Parse(tokens.At(first + 1));
        return true;
    }
    void Run(Model &model) const {
        if (target.isPin)
            model.ConnectSignalToPin(signalName, target.instance.c_str(), target.pin.c_str());
        else
            model.ConnectSignals(signalName, target.signal);
    }
};
using ConnectSignalCommand = CommandOf<"CONNECT SIGNAL", ConnectSignal>;

/// (signal | instance.pin) value
struct AssignConstant {
    Target target;
    Text value;

    bool Parse(StringArray const &tokens, int first) {
        if (tokens.GetSize() < first + 2)
            return false;
        target.Parse(tokens.At(first));
        value = tokens.At(first + 1);
        return true;
    }
    void Run(Model &model) const {
        if (target.isPin)
            model.AssignConstantToPin(target.instance.c_str(), target.pin.c_str(), value);
        else
            model.AssignConstantToSignal(target.signal, value);
    }
};
using AssignConstantCommand = CommandOf<"ASSIGN CONSTANT", AssignConstant>;

} // namespace Vesk_Hdl::Commands
