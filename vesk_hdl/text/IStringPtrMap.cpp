#include "vesk_hdl/text/IStringPtrMap.h"

#include "vesk_hdl/text/StringTable.h"
#include "vesk_hdl/text/basis/OrEmpty.h"

namespace Vesk_Hdl {

using Basis::ViewOf;

namespace {

/// Nobody sees a map's order, so that it need not begin as large as a set: attributes come with a
/// map for each owner that has any.
constexpr std::uint32_t FIRST_BUCKETS = 7;

} // namespace

struct IStringPtrMapBase::Record {
    StringTable table{StringTable::CASE_IGNORED, FIRST_BUCKETS, StringTable::ORDER_FREE};
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
    StringTable const &source = other.record->table;
    for (StringTable::Node const *node = source.GetFirst(); node; node = source.GetNext(node))
        Add(node->key, node->value);
    return *this;
}

void IStringPtrMapBase::Add(char const *key, void *value) {
    Add(Basis::StringBase<char>(key), value);
}

void IStringPtrMapBase::Add(Basis::StringBase<char> const &key, void *value) {
    if (!record)
        record = new Record;
    if (StringTable::Node *const node = record->table.Find(key.View())) {
        node->value = value;
        return;
    }
    record->table.GrowForOneMore();
    record->table.Insert(key, value);
}

void *IStringPtrMapBase::Get(char const *key) const { return Get(ViewOf(key)); }

void *IStringPtrMapBase::Get(std::string_view key) const {
    StringTable::Node const *const node = record ? record->table.Find(key) : nullptr;
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
