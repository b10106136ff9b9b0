// What the library does with a netlist and clients cannot. docs/architecture.md, "Widening",
// explains the replacement of a bus.

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
    // All that needs memory comes first, so that a failure leaves the netlist as it was. The bus
    // becomes the first part of itself here, since the slice at its address will be the first part
    // of the new bus.
    std::unique_ptr<Bus> wide = std::make_unique<Bus>(name);
    std::unique_ptr<BusSlice> made(new BusSlice(bus->GetNameRef(), nullptr));
    made->parentRecord = Bus::Record::Join(bus->record);
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
    // The table of buses finds the new bus by the common base name already.
    assert(record.busMap.Get(Names::Key(Names::BaseName(result->GetNameRef().View()))) == result &&
           "the new bus is not found by its base name");
    record.busMap.Forget(bus);
    record.signals.Remove(bus);
    record.signalMap.Remove(bus->GetNameRef(), bus);
    std::swap(result->record, bus->record);
    std::swap(result->record->portPolarity, bus->record->portPolarity);
    result->record->bus = result; // all parts, old and new, now find the new bus

    bool const isPlain = typeid(*bus) == typeid(Bus); // a class that a client derived may be larger
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
    assert(!made.Find() && "a new slice is connected to nothing");
    made.Signal::record = lists;
}

/// Ends the bus and makes the slice at its address. Both classes have the same size, and a signal
/// is reached through its base class, so that every pointer to the bus is then a pointer to the
/// slice. Nothing has to be searched, however many signals, compounds and pins point there.
BusSlice *NetlistEdit::PutSliceInPlaceOf(Bus *bus, BusSlice &made) {
    static_assert(sizeof(Bus) == sizeof(BusSlice) && alignof(Bus) == alignof(BusSlice));
    TakeLists(*bus, made);
    bus->~Bus();
    return new (static_cast<void *>(bus)) BusSlice(std::move(made));
}

/// For a bus of a client's class, which may have any size: all that points at the bus from inside
/// the netlist is searched and made to point at the slice. Listed signals are compared by address
/// only, since they may be gone.
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
    replace(slice->parentRecord->busSlices);
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
