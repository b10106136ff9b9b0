#include "tool/check/Rewriting.h"

#include <fcntl.h>
#include <utility>

using namespace Vesk_Hdl;

namespace Checks {

namespace {

class Nowhere : public WriteOpener {
public:
    int Open(char const *, bool) override { return ::open("/dev/null", O_WRONLY | O_CLOEXEC); }
};

} // namespace

void Rewrite(Session &session, Design const &design, LocationMap &places, std::string const &line) {
    // A dummy signal was made where its port was.
    std::vector<std::pair<Text, CompactLocation>> dummyNames;
    auto const note = [&](Signal const &signal) {
        dummyNames.emplace_back(signal.GetDummySignalName(), design.NetAt(signal));
    };
    for (int i = 0; i < design.dummies.GetSize(); ++i) {
        Signal const *const net = design.dummies.GetAt(i).net;
        note(*net);
        if (auto const *const bus = dynamic_cast<Bus const *>(net))
            ForEach(bus->GetBusSliceIterator(), [&](Signal const *part) { note(*part); });
    }
    auto const &nets = *design.netlist.GetSignalIterator().GetArray();
    int const before = nets.GetSize();
    Nowhere nowhere;
    session.GetModel().SetWriteOpener(&nowhere);
    session.RunLine(line, {});
    session.GetModel().SetWriteOpener(nullptr);
    // The write sorted the nets and put those that it made after them.
    for (int i = before; i < nets.GetSize(); ++i)
        places.PutOpen(nets.GetAt(i));
    for (auto const &[name, spot] : dummyNames)
        if (Signal const *const made = design.netlist.GetSignal(name)) {
            places.TakeOpen(made);
            places.Put(LocationMap::MADE, made, spot);
        }
}

} // namespace Checks
