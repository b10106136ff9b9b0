#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

/// A position in the exact table of a StringSet, valid until the set changes or ends. One that the
/// default constructor makes is at no position: it reads as the empty string and does not move.
class VESK_HDL_API StringSetIterator {
public:
    /// An iterator at no position.
    StringSetIterator();
    /// For StringSet, whose position it takes over. A client can only pass null, for no position.
    StringSetIterator(void *cell);
    /// An iterator at the same position, which moves on its own.
    StringSetIterator(StringSetIterator const &other);
    /// Leaves the set alone.
    ~StringSetIterator();
    /// Goes to the position of the other iterator.
    StringSetIterator &operator=(StringSetIterator const &other);

    /// Whether both are at the same string, both at an end, or both at no position.
    bool operator==(StringSetIterator const &other) const;
    /// The opposite of operator==.
    bool operator!=(StringSetIterator const &other) const;
    /// Goes to the next string. The iterator must not be at the end.
    StringSetIterator &operator++();
    /// The same, without a result.
    void operator++(int);
    /// A copy of the string at this position. The iterator must not be at the end.
    Basis::StringBase<char> operator*() const;

private:
    struct Cell;
    friend class StringSet;
    Cell *cell;
};

/// Strings in two tables: one holds each spelling, the other each string without regard to case.
///
/// The tables follow separate rules on purpose: Empty and operator= clear only one of them. The
/// passes before a write rely on it: after Empty, IContains still knows the names that an earlier
/// pass handled, and so keeps them out of the later passes. A null string counts as empty.
class VESK_HDL_API StringSet {
public:
    /// An empty set.
    StringSet();
    /// An empty set, then operator=: names that only IContains of `other` knows are not copied.
    StringSet(StringSet &other);
    /// Frees the strings; iterators are no longer valid.
    ~StringSet();
    /// Clears the table of IContains, then adds the strings of the exact table of `other` to both
    /// tables, in its order. Strings that Contains knew before stay. Assigning a set to itself
    /// changes nothing.
    StringSet &operator=(StringSet &other);

    /// Adds the string to each table that does not hold it by its own rule: "a" and "A" are two
    /// strings of the exact table and one of the other.
    void Add(char const *string);
    /// The same; the set shares the text.
    void Add(Basis::StringBase<char> const &string);
    /// Whether a string that is equal but for case was added and not removed.
    bool IContains(char const *string) const;
    /// The same for a text without NUL.
    bool IContains(std::string_view string) const;
    /// Whether exactly this string is in the exact table.
    bool Contains(char const *string) const;
    /// Removes exactly this string from the exact table, and the one that is equal but for case
    /// from the other table.
    void Remove(char const *string);
    /// Whether the exact table is empty.
    bool IsEmpty() const;
    /// Clears the exact table only: IContains still returns true for all that was added before. A
    /// caller that wants neither uses a new set.
    void Empty();

    /// The first position of a walk over the exact table. The order of the walk depends on nothing
    /// but the strings and the order in which they were added; the dummy signals of a written
    /// netlist follow it.
    StringSetIterator GetBeginPos();
    /// The position after the last string.
    StringSetIterator GetEndPos();

private:
    struct Record;
    Record *record;
};

} // namespace Vesk_Hdl
