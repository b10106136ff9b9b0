// Nets and components: what drives and reads them, bit by bit, and what is there for nothing.

#include "tool/check/Design.h"

using namespace Vesk_Hdl;

namespace Checks {

namespace {

/// A use of some bits of a net.
struct BitUse {
    Range bits;
    Use use;
    Signal const *through; ///< the net itself or a part of it
};

/// The bits that some uses cover, as ranges apart from each other: a bus of any width costs as much
/// as it has parts that are used.
class Cover {
public:
    explicit Cover(std::vector<Range> parts) {
        std::sort(parts.begin(), parts.end(),
                  [](Range const &a, Range const &b) { return a.Low() < b.Low(); });
        for (Range const &part : parts) {
            if (!ranges.empty() && part.Low() <= ranges.back().right + 1)
                ranges.back().right = std::max(ranges.back().right, part.High());
            else
                ranges.push_back({part.Low(), part.High()});
        }
    }

    /// The lowest bit of `bits` that is not covered; false if there is none.
    bool FindGap(Range const &bits, long long &gap) const {
        auto const after =
            std::upper_bound(ranges.begin(), ranges.end(), bits.Low(),
                             [](long long low, Range const &range) { return low < range.left; });
        bool const inside = after != ranges.begin() && std::prev(after)->right >= bits.Low();
        gap = inside ? std::prev(after)->right + 1 : bits.Low();
        return gap <= bits.High();
    }

private:
    std::vector<Range> ranges; ///< from left up to right
};

class NetChecker {
public:
    NetChecker(Design const &checked, Signal const &checkedNet)
        : design(checked), net(checkedNet), isBus(GetRange(checkedNet.GetNameRef(), whole)) {
        AddUses(net, whole);
        if (auto const *const bus = dynamic_cast<Bus const *>(&net))
            ForEach(bus->GetBusSliceIterator(), [this](Signal const *part) { AddPart(*part); });
    }

    void Run() {
        Polarity const polarity = net.GetPortPolarity();
        bool const isInner = polarity == Polarity::INVALID;
        bool const isDriven = Has(Use::DRIVES);
        bool const isRead = Has(Use::READS);
        if (polarity == Polarity::BIDIRECTIONAL || Has(Use::EITHER)) {
            CheckDrivers();
            return;
        }
        if (isInner && !isDriven && !isRead)
            Add(Id::UNUSED_NET);
        else if (isInner && !isRead)
            Add(Id::NEVER_READ);
        if (polarity == Polarity::OUTPUT)
            uses.push_back({whole, {Use::READS, nullptr, nullptr}, &net});
        if (polarity != Polarity::INPUT && (isRead || !isInner))
            CheckUndriven();
        CheckDrivers();
    }

private:
    void AddUses(Signal const &signal, Range const &bits) {
        auto const add = [&](Use const &use) { uses.push_back({bits, use, &signal}); };
        Design::ForEachPinOn(signal, [&](Pin const *pin) { add(Design::UseOf(pin)); });
        for (Use const &use : design.FurtherUses(&signal))
            add(use);
        if (signal.HasConstantValue())
            add({Use::DRIVES, nullptr, nullptr});
    }

    void AddPart(Signal const &part) {
        Range bits;
        if (!GetRange(part.GetNameRef(), bits))
            return;
        if (!whole.Holds(bits) && design.IsWritten(part))
            design.findings.Add({Id::OUTSIDE_BUS,
                                 design.NetAt(part),
                                 NetName(part),
                                 {{&net, "the bus is " + Quoted(net.GetNameRef().View())}}});
        AddUses(part, bits);
    }

    bool Has(Use::Kind kind) const {
        return std::any_of(uses.begin(), uses.end(),
                           [kind](BitUse const &use) { return use.use.kind == kind; });
    }

    std::string BitName(long long bit) const {
        return isBus ? std::string(BaseOf(net)) + "(" + std::to_string(bit) + ")" : "";
    }

    void Add(Id id, std::string detail = {}, std::vector<Related> related = {}) {
        design.findings.Add(
            {id, design.NetAt(net), NetName(net), std::move(related), BOTH, std::move(detail)});
    }

    void CheckUndriven() {
        std::vector<Range> driven;
        for (BitUse const &use : uses)
            if (use.use.kind == Use::DRIVES)
                driven.push_back(use.bits);
        Cover const cover(std::move(driven));
        for (BitUse const &use : uses) {
            long long gap = 0;
            if (use.use.kind == Use::READS && cover.FindGap(use.bits, gap) &&
                whole.Holds({gap, gap}))
                return Add(Id::NO_DRIVER, BitName(gap), WhoDoes(use));
        }
    }

    /// The first bit with two drivers and all who drive it.
    void CheckDrivers() {
        std::vector<BitUse> drivers;
        for (BitUse const &use : uses)
            if (use.use.kind == Use::DRIVES)
                drivers.push_back(use);
        if (net.GetPortPolarity() == Polarity::INPUT && !drivers.empty())
            drivers.push_back({whole, {Use::DRIVES, nullptr, nullptr}, nullptr});
        std::sort(drivers.begin(), drivers.end(),
                  [](BitUse const &a, BitUse const &b) { return a.bits.Low() < b.bits.Low(); });
        BitUse const *highest = nullptr;
        for (BitUse const &driver : drivers) {
            bool const same = highest && driver.use.pin && driver.use.pin == highest->use.pin &&
                              driver.through == highest->through;
            if (highest && !same && driver.bits.Low() <= highest->bits.High())
                return AddDrivers(drivers, driver.bits.Low());
            if (!highest || driver.bits.High() > highest->bits.High())
                highest = &driver;
        }
    }

    void AddDrivers(std::vector<BitUse> const &drivers, long long bit) {
        constexpr std::size_t MOST_SHOWN = 8;
        std::vector<Related> related;
        for (BitUse const &driver : drivers)
            if (driver.bits.Holds({bit, bit}) && related.size() < MOST_SHOWN)
                for (Related &one : WhoDoes(driver))
                    related.push_back(std::move(one));
        Add(Id::SEVERAL_DRIVERS, BitName(bit), std::move(related));
    }

    /// Who drives or reads.
    std::vector<Related> WhoDoes(BitUse const &bitUse) const {
        std::string const verb = bitUse.use.kind == Use::READS ? "read by " : "driven by ";
        if (Pin const *const pin = bitUse.use.pin) {
            Instance const *const owner = design.OwnerOf(pin);
            std::string const name = owner ? PinName(*owner, *pin) : "a pin";
            return {{pin, verb + name, LocationMap::CONNECTED}};
        }
        if (!bitUse.through)
            return {{&net, "driven from outside, being an in port"}};
        if (Signal const *const source = bitUse.use.source)
            return {{bitUse.through, "assigned from " + Quoted(source->GetNameRef().View()),
                     LocationMap::ASSIGNED}};
        return bitUse.use.kind == Use::READS
                   ? std::vector<Related>()
                   : std::vector<Related>{
                         {bitUse.through, "given a constant", LocationMap::CONSTANT}};
    }

    Design const &design;
    Signal const &net;
    Range whole;
    bool isBus;
    std::vector<BitUse> uses;
};

/// Whether a scalar has one driver and a reader, or is a port that needs no more than it has: most
/// nets of a design, about which there is nothing to say.
bool IsPlain(Design const &design, Signal const &net) {
    if (net.GetSignalType() != Signal::SIGNAL_SCALAR || net.HasConstantValue() ||
        !design.FurtherUses(&net).empty())
        return false;
    int drivers = 0;
    int readers = 0;
    bool hasEither = false;
    Design::ForEachPinOn(net, [&](Pin const *pin) {
        Use::Kind const kind = Design::UseOf(pin).kind;
        ++(kind == Use::DRIVES ? drivers : readers);
        hasEither |= kind == Use::EITHER;
    });
    Polarity const polarity = net.GetPortPolarity();
    if (hasEither || polarity == Polarity::BIDIRECTIONAL)
        return false;
    return polarity == Polarity::INPUT ? drivers == 0
                                       : drivers == 1 && (readers > 0 || net.IsPort());
}

} // namespace

void CheckNets(Design const &design) {
    bool hasPorts = false;
    design.ForEachSignal([&](Signal const *signal) {
        hasPorts |= signal->IsPort() && signal->IsNeededToDeclared();
        if (signal->IsNeededToDeclared() && !IsPlain(design, *signal))
            NetChecker(design, *signal).Run();
    });
    if (!hasPorts)
        design.findings.Add({Id::NO_PORTS, design.MadeAt(&design.netlist),
                             "design " + Quoted(design.netlist.GetNameRef().View())});
    ForEach(design.netlist.GetComponentIterator(), [&](Component const *component) {
        if (!design.IsUsed(component))
            design.findings.Add({Id::UNUSED_COMPONENT, design.MadeAt(component),
                                 "component " + Quoted(component->GetNameRef().View())});
    });
}

} // namespace Checks
