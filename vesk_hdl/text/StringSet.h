#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

/// A position in a StringSet, valid until the set changes or dies. One made by the default
/// constructor stands nowhere: it reads as the empty string and does not move.
class VESK_HDL_API StringSetIterator {
public:
    StringSetIterator();
    /// For StringSet: takes over a position. Null, all that a client can pass, stands nowhere.
    StringSetIterator(void *cell);
    StringSetIterator(StringSetIterator const &other);
    ~StringSetIterator();
    StringSetIterator &operator=(StringSetIterator const &other);

    /// Equal are an iterator and itself, two that stand nowhere, and two at the same string or end.
    bool operator==(StringSetIterator const &other) const;
    bool operator!=(StringSetIterator const &other) const;
    /// To the next string. Not allowed at the end.
    StringSetIterator &operator++();
    void operator++(int);
    /// A copy of the string here. Not allowed at the end.
    Basis::StringBase<char> operator*() const;

private:
    struct Cell;
    friend class StringSet;
    Cell *cell;
};

/// Strings, held once by exact spelling and once without regard to case, in two tables.
///
/// The two are kept by separate rules on purpose: Empty and operator= each clear one of them. The
/// rewriting before a write counts on it: a name that one of its stages handled stays known to
/// IContains after Empty, and so out of the later stages.
class VESK_HDL_API StringSet {
public:
    StringSet();
    StringSet(StringSet &other);
    ~StringSet();
    /// Clears what IContains knows, then adds the strings of the exact table of `other` to both
    /// tables, in its order. What Contains knew stays. Assigning a set to itself changes nothing.
    StringSet &operator=(StringSet &other);

    /// Adds to each table unless that table holds the string by its own rule.
    void Add(char const *string);
    void Add(Basis::StringBase<char> const &string);
    /// True if a string equal but for case was added.
    bool IContains(char const *string) const;
    bool IContains(std::string_view string) const;
    /// True if this very string is held.
    bool Contains(char const *string) const;
    /// Removes the string that equals this one but for case from what IContains knows, and this
    /// very string from what Contains knows.
    void Remove(char const *string);
    /// True if the exact table holds nothing.
    bool IsEmpty() const;
    /// Clears the exact table alone: IContains still answers true for all that was added before.
    void Empty();

    /// The walk over the exact table, in an order that depends on the strings and on the order of
    /// their addition alone.
    StringSetIterator GetBeginPos();
    StringSetIterator GetEndPos();

private:
    struct Record;
    Record *record;
};

} // namespace Vesk_Hdl
