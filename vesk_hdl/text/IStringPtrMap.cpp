// A map from names to pointers, without regard to case: a TextIndex with a stable interface.

#include "vesk_hdl/text/IStringPtrMap.h"

#include "vesk_hdl/text/TextIndex.h"
#include "vesk_hdl/text/basis/OrEmpty.h"

namespace Vesk_Hdl {

using Basis::ViewOf;

/// Made with the first entry: most maps of a design, such as that of a component's attributes, stay
/// empty.
struct IStringPtrMapBase::Record {
    TextIndex table{TextIndex::CASE_IGNORED};
};

IStringPtrMapBase::IStringPtrMapBase() : record(nullptr) {}

IStringPtrMapBase::IStringPtrMapBase(IStringPtrMapBase &other) : IStringPtrMapBase() {
    *this = other;
}

IStringPtrMapBase::~IStringPtrMapBase() { delete record; }

IStringPtrMapBase &IStringPtrMapBase::operator=(IStringPtrMapBase &other) {
    if (this == &other)
        return *this;
    Empty();
    if (!other.record)
        return *this;
    // The order of the entries has no meaning: the map offers no walk.
    for (TextIndex::Node const &node : other.record->table)
        Add(node.key, node.value);
    return *this;
}

void IStringPtrMapBase::Add(char const *key, void *value) {
    Add(Basis::StringBase<char>(key), value);
}

void IStringPtrMapBase::Add(Basis::StringBase<char> const &key, void *value) {
    if (!record)
        record = new Record;
    record->table.Put(key, value);
}

void *IStringPtrMapBase::Get(char const *key) const { return Get(ViewOf(key)); }

void *IStringPtrMapBase::Get(std::string_view key) const {
    TextIndex::Node const *const node = record ? record->table.Find(key) : nullptr;
    return node ? node->value : nullptr;
}

bool IStringPtrMapBase::Contains(char const *key) const {
    return record && record->table.Find(ViewOf(key));
}

void IStringPtrMapBase::Remove(char const *key) {
    if (record)
        record->table.Remove(ViewOf(key));
}

bool IStringPtrMapBase::IsEmpty() const { return !record || record->table.GetCount() == 0; }

void IStringPtrMapBase::Empty() {
    if (record)
        record->table.Empty();
}

} // namespace Vesk_Hdl
