#include "vesk_hdl/netlist/NetlistEdit.h"

#include <cassert>
#include <new>
#include <typeinfo>
#include <utility>

#include "vesk_hdl/netlist/As.h"
#include "vesk_hdl/netlist/BusRecord.h"
#include "vesk_hdl/netlist/NetlistRecord.h"
#include "vesk_hdl/netlist/SignalRecord.h"
#include "vesk_hdl/text/ForEachAhead.h"

namespace Vesk_Hdl {

bool NetlistEdit::IsNameUsed(Names::Key const &key) const {
    return FindComponent(key) || FindInstance(key) || FindSignal(key);
}
Signal *NetlistEdit::FindSignal(Names::Key const &key) const {
    return netlist.record->signalMap.Get(key);
}
Instance *NetlistEdit::FindInstance(Names::Key const &key) const {
    return netlist.record->instanceMap.Get(key);
}
Component *NetlistEdit::FindComponent(Names::Key const &key) const {
    return netlist.record->componentMap.Get(key);
}
Bus *NetlistEdit::FindBus(Names::Key const &key) const {
    return static_cast<Bus *>(netlist.record->busMap.Get(key));
}

Bus *NetlistEdit::Widen(Bus *bus, char const *name) {
    Netlist::Record &record = *netlist.record;
    // What needs memory comes first, so that a failure leaves the netlist as it was.
    std::unique_ptr<Bus> wide = std::make_unique<Bus>(name);
    std::unique_ptr<BusSlice> made(new BusSlice(bus->GetNameRef(), nullptr));
    ParentCell *const cell = bus->ShareCell();
    made->cell = cell;
    bus->record->busSlices.Prepend(bus);
    Bus *const result = wide.get();
    try {
        record.widenedSlices.Add(bus);
        netlist.Add(wide.release());
    } catch (...) {
        if (record.widenedSlices.GetTail() == bus)
            record.widenedSlices.RemoveTail();
        bus->RemoveBusSlice(bus);
        throw;
    }
    record.busMap.Forget(bus);
    record.signals.Remove(bus);
    record.signalMap.Remove(bus->GetNameRef(), bus);
    result->record->busSlices.ExchangeElements(bus->record->busSlices);
    result->record->cell = std::exchange(bus->record->cell, nullptr);
    cell->bus = result;

    bool const isPlain = typeid(*bus) == typeid(Bus); // not a class that a client derived
    BusSlice *const slice =
        isPlain ? PutSliceInPlaceOf(bus, *made) : RepointToSlice(bus, std::move(made));
    if (Signal::Record *const own = slice->Find())
        ForEach(own->pins, [slice](Pin *pin) { pin->Connect(slice); });
    return result;
}

/// Moves the lists of a bus to a new slice. The constant value ends: it was one of the whole bus.
void NetlistEdit::TakeLists(Bus &bus, BusSlice &made) {
    Signal::Record *const lists = bus.Signal::record.exchange(nullptr);
    if (lists)
        lists->constantValue = BitVectorValue();
    assert(!made.Find());
    made.Signal::record = lists;
}

/// A bus and a slice are of one size: a pointer at the one is a pointer at the other.
BusSlice *NetlistEdit::PutSliceInPlaceOf(Bus *bus, BusSlice &made) {
    static_assert(sizeof(Bus) == sizeof(BusSlice) && alignof(Bus) == alignof(BusSlice));
    TakeLists(*bus, made);
    bus->~Bus();
    return new (static_cast<void *>(bus)) BusSlice(std::move(made));
}

/// A client's class may have any size: whatever points at the bus from inside the netlist is looked
/// for. Nothing but the bus itself is looked into that may be gone.
BusSlice *NetlistEdit::RepointToSlice(Bus *bus, std::unique_ptr<BusSlice> made) {
    Netlist::Record &record = *netlist.record;
    BusSlice *const slice = made.release();
    TakeLists(*bus, *slice);
    auto const replace = [bus, slice](PtrArray<Signal *> &signals) {
        for (int i = 0; i < signals.GetSize(); ++i)
            if (signals.GetAt(i) == bus)
                signals.SetAt(i, slice);
    };
    auto const replaceIn = [&](Signal *signal) {
        if (Signal::Record *const own = signal->Find()) {
            replace(own->signals);
            own->index.reset();
        }
        if (auto *const compound = As<CompoundBus>(signal))
            for (int i = 0; i < compound->GetSize(); ++i)
                if (compound->GetAt(i) == bus)
                    compound->SetAt(i, slice);
    };
    replace(record.widenedSlices);
    replace(slice->cell->bus->record->busSlices);
    ForEachAhead(record.signals.Get(), replaceIn);
    ForEach(record.widenedSlices, replaceIn);
    ForEachAhead(record.instances.Get(), [bus, slice](Instance const *instance) {
        ForEach(instance->GetPinIterator(), [bus, slice](Pin *pin) {
            if (pin->GetSignal() == bus)
                pin->Connect(slice);
        });
    });
    delete bus;
    return slice;
}

} // namespace Vesk_Hdl
