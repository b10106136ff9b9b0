// A set of strings in two tables with separate rules; see the header for who relies on them.

#include "vesk_hdl/text/StringSet.h"

#include "vesk_hdl/text/OrderedTextTable.h"
#include "vesk_hdl/text/TextIndex.h"
#include "vesk_hdl/text/basis/OrEmpty.h"

namespace Vesk_Hdl {

using Basis::ViewOf;

namespace {

/// Asks for the first prime of the series that is not below it, 193. It is part of the visible
/// order.
constexpr std::uint32_t FIRST_BUCKETS = 100;

} // namespace

/// A position. An iterator points at it, so that the class has the size of one pointer for clients.
struct StringSetIterator::Cell {
    OrderedTextTable const *table;
    OrderedTextTable::Node const *node; ///< null at the end
};

StringSetIterator::StringSetIterator() : cell(nullptr) {}
StringSetIterator::StringSetIterator(void *position) : cell(static_cast<Cell *>(position)) {}
StringSetIterator::StringSetIterator(StringSetIterator const &other)
    : cell(other.cell ? new Cell(*other.cell) : nullptr) {}
StringSetIterator::~StringSetIterator() { delete cell; }

StringSetIterator &StringSetIterator::operator=(StringSetIterator const &other) {
    if (this != &other) {
        Cell *const copy = other.cell ? new Cell(*other.cell) : nullptr;
        delete cell;
        cell = copy;
    }
    return *this;
}

bool StringSetIterator::operator==(StringSetIterator const &other) const {
    if (!cell || !other.cell)
        return cell == other.cell;
    return cell->node == other.cell->node;
}

bool StringSetIterator::operator!=(StringSetIterator const &other) const {
    return !(*this == other);
}

StringSetIterator &StringSetIterator::operator++() {
    if (cell && cell->node)
        cell->node = cell->table->GetNext(cell->node);
    return *this;
}

void StringSetIterator::operator++(int) { ++*this; }

Basis::StringBase<char> StringSetIterator::operator*() const {
    return cell && cell->node ? cell->node->key : Basis::StringBase<char>();
}

struct StringSet::Record {
    TextIndex insensitiveTable{TextIndex::CASE_IGNORED}; ///< never walked; its values are null
    OrderedTextTable sensitiveTable{FIRST_BUCKETS};      ///< walked in the required order
};

StringSet::StringSet() : record(new Record) {}
StringSet::StringSet(StringSet &other) : StringSet() { *this = other; }
StringSet::~StringSet() { delete record; }

StringSet &StringSet::operator=(StringSet &other) {
    if (this == &other)
        return *this;
    // Required: only one table is cleared, and what the exact table held before stays.
    record->insensitiveTable.Empty();
    OrderedTextTable &source = other.record->sensitiveTable;
    for (OrderedTextTable::Node const *node = source.GetFirst(); node; node = source.GetNext(node))
        Add(node->key);
    return *this;
}

void StringSet::Add(char const *string) { Add(Basis::StringBase<char>(string)); }

void StringSet::Add(Basis::StringBase<char> const &string) {
    record->insensitiveTable.Put(string, nullptr);
    record->sensitiveTable.Add(string);
}

bool StringSet::IContains(char const *string) const { return IContains(ViewOf(string)); }

bool StringSet::IContains(std::string_view string) const {
    return record->insensitiveTable.Find(string) != nullptr;
}

bool StringSet::Contains(char const *string) const {
    return record->sensitiveTable.Contains(ViewOf(string));
}

void StringSet::Remove(char const *string) {
    record->insensitiveTable.Remove(ViewOf(string));
    record->sensitiveTable.Remove(ViewOf(string));
}

bool StringSet::IsEmpty() const { return record->sensitiveTable.GetCount() == 0; }

/// Required: the other table keeps its names. The passes before a write rely on it.
void StringSet::Empty() { record->sensitiveTable.Empty(); }

StringSetIterator StringSet::GetBeginPos() {
    OrderedTextTable &table = record->sensitiveTable;
    return StringSetIterator(new StringSetIterator::Cell{&table, table.GetFirst()});
}

StringSetIterator StringSet::GetEndPos() {
    return StringSetIterator(new StringSetIterator::Cell{&record->sensitiveTable, nullptr});
}

} // namespace Vesk_Hdl
