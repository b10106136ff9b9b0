#include "tool/check/Rewriting.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

using VerilogOption = HdlOptions::VerilogOption;

template <class Objects> void SetCase(Objects objects, VerilogOption::CaseType nameCase) {
    if (nameCase != VerilogOption::CASE_DEFAULT)
        ForEach(objects, [nameCase](Object *object) {
            Text name = object->GetName();
            if (nameCase == VerilogOption::CASE_UPPER)
                name.MakeUpper();
            else
                name.MakeLower();
            object->SetName(name);
        });
}

} // namespace

void Rewrite(Model &model, Design const &design, Places &places, Languages language) {
    // A dummy signal was made where its port was.
    std::vector<std::pair<Text, Spot>> dummyNames;
    auto const note = [&](Signal const &signal) {
        dummyNames.emplace_back(signal.GetDummySignalName(), design.NetAt(signal));
    };
    for (auto const &[signal, dummy] : design.dummies) {
        note(*signal);
        if (auto const *const bus = dynamic_cast<Bus const *>(signal))
            ForEach(bus->GetBusSliceIterator(), [&](Signal const *part) { note(*part); });
    }
    Netlist &netlist = *model.GetNetlist();
    netlist.CreateVhdlDummySignals();
    for (auto const &[name, spot] : dummyNames)
        if (Signal const *const made = netlist.GetSignal(name))
            places.Put(Places::MADE, made, spot);
    if (language != VERILOG)
        return;
    VerilogOption const &verilog = design.options.verilogOption;
    SetCase(netlist.GetSignalIterator(), verilog.signalCase);
    SetCase(netlist.GetComponentIterator(), verilog.componentCase);
    SetCase(netlist.GetInstanceIterator(), verilog.instanceCase);
}

} // namespace Checks
