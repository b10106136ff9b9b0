// The class CompoundBus and what is computed over its members.

#include <limits>

#include "vesk_hdl/netlist/CompoundWalk.h"
#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/text/LentPtrArray.h"
#include "vesk_hdl/text/basis/Tokens.h"

namespace Vesk_Hdl {

using Basis::StringBase;

namespace {

/// The dummy names of the members, joined by commas. A comma comes before a member only if the
/// compound has some text already: required, and visible with members whose names are empty.
class DummyName {
public:
    void Enter(CompoundBus const &) {
        if (!begins.empty())
            Separate();
        begins.push_back(name.GetLength());
    }
    void Leave(CompoundBus const &) { begins.pop_back(); }
    void Visit(Signal const &member) {
        Separate();
        name += member.GetDummySignalName();
    }
    StringBase<char> const &Get() const { return name; }

private:
    void Separate() {
        if (name.GetLength() > begins.back())
            name += ',';
    }

    StringBase<char> name;
    std::vector<unsigned int> begins; ///< where the text of each compound of the path begins
};

} // namespace

/// Most compounds hold no other one, and their sum needs neither the table nor the path of Get.
bool CompoundWidths::Find(CompoundBus const &compound, long long &width) const {
    if (auto const known = widths.find(&compound); known != widths.end()) {
        width = known->second;
        return true;
    }
    width = 0;
    for (int i = 0; i < compound.GetSize(); ++i) {
        Signal const *const member = compound.GetAt(i);
        if (As<CompoundBus>(member))
            return false;
        width += member ? member->GetWidth() : 0;
    }
    return true;
}

/// Adds up from the inside out, without recursion: clients may nest compounds as deep as they like.
int CompoundWidths::Get(CompoundBus const &compound) {
    constexpr long long MAX_WIDTH = std::numeric_limits<int>::max();
    long long width = 0;
    if (Find(compound, width))
        return static_cast<int>(std::min(width, MAX_WIDTH));
    std::vector<Step> path = {{&compound, 0, 0}};
    widths[&compound] = 0; // in case it is inside of itself
    for (;;) {
        Step &step = path.back();
        if (step.next < step.compound->GetSize()) {
            Signal const *const member = step.compound->GetAt(step.next++);
            auto const *const inner = As<CompoundBus>(member);
            if (inner && !Find(*inner, width)) {
                widths[inner] = 0;
                path.push_back({inner, 0, 0}); // its width is added when it is left
            } else if (member) {
                step.width = std::min(step.width + (inner ? width : member->GetWidth()), MAX_WIDTH);
            }
            continue;
        }
        width = widths[step.compound] = step.width;
        path.pop_back();
        if (path.empty())
            return static_cast<int>(width);
        path.back().width = std::min(path.back().width + width, MAX_WIDTH);
    }
}

/// Four members have room in the record, as many as most compounds have.
struct CompoundBus::Record {
    InlinePtrArray<Signal *, 4> members; ///< not owned
};

CompoundBus::CompoundBus(char const *name) : Signal(name), record(std::make_unique<Record>()) {}

CompoundBus::CompoundBus(char const *name, PtrArray<Signal *> const &members) : CompoundBus(name) {
    for (int i = 0; i < members.GetSize(); ++i)
        AddBusMember(members.GetAt(i));
}

CompoundBus::~CompoundBus() = default;

Signal::SignalType CompoundBus::GetSignalType() const { return SIGNAL_COMPOUND_BUS; }

/// Visits each compound once, since setting a polarity again changes nothing. That also ends a
/// circle.
void CompoundBus::SetPortPolarity(Polarity const &polarity) {
    std::unordered_set<CompoundBus const *> found = {this};
    std::vector<CompoundBus const *> toDo = {this};
    while (!toDo.empty()) {
        CompoundBus const *const compound = toDo.back();
        toDo.pop_back();
        ForEach(compound->record->members, [&](Signal *member) {
            auto const *const inner = As<CompoundBus>(member);
            if (!inner)
                member->SetPortPolarity(polarity);
            else if (found.insert(inner).second)
                toDo.push_back(inner);
        });
    }
}

void CompoundBus::AcceptSignal(SignalVisitor &visitor) {
    visitor.VisitCompoundBus(this);
    visitor.VisitSignal(this);
}

/// Follows first members through compounds until one is no compound.
Polarity CompoundBus::GetPortPolarity() const {
    std::unordered_set<Signal const *> found;
    CompoundBus const *compound = this;
    for (;;) {
        Signal const *const first = compound->GetSize() < 2 ? nullptr : compound->GetAt(0);
        compound = As<CompoundBus>(first);
        if (!compound)
            return first ? first->GetPortPolarity() : Polarity();
        if (compound == this || !found.insert(compound).second)
            return {}; // a circle of first members has no polarity
    }
}

int CompoundBus::GetWidth() const { return CompoundWidths().Get(*this); }

bool CompoundBus::IsPort() const { return false; }
bool CompoundBus::IsNeededToDeclared() const { return false; }

StringBase<char> CompoundBus::GetDummySignalName() const {
    DummyName name;
    WalkCompound(const_cast<CompoundBus &>(*this), name);
    return name.Get();
}

void CompoundBus::AddBusMember(Signal *signal) { record->members.Add(signal); }
void CompoundBus::SetAt(int index, Signal *signal) { record->members.SetAt(index, signal); }
Signal *CompoundBus::GetAt(int index) const { return record->members.GetAt(index); }
int CompoundBus::GetSize() const { return record->members.GetSize(); }

Iterator<Signal *> CompoundBus::GetBusMemberIterator() const {
    return Iterator<Signal *>(&record->members);
}

CompoundBus *CompoundBus::CreateDummySignal() const {
    return new CompoundBus(GetDummySignalName());
}

bool CompoundBus::IsCompoundBusName(StringBase<char> const &name) {
    return Names::IsCompoundBusName(name.View());
}

void CompoundBus::ParseCompoundBusName(StringBase<char> const &name, StringArray &members,
                                       bool expandBuses) {
    if (!IsCompoundBusName(name))
        return;
    // No member holds either separator, so that one walk gives what a walk for each separator
    // would.
    for (Basis_Range range = {1, 0}; Basis::NextToken(name.View(), range, ",\\", true);) {
        StringBase<char> const member(Basis::TokenIn(name.View(), range));
        if (!expandBuses || !Bus::ParseBusName(member, members))
            members.Add(member);
    }
}

} // namespace Vesk_Hdl
