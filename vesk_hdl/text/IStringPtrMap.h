#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

/// The untyped map under IStringPtrMap: from a name, without regard to case, to a pointer.
///
/// The map owns copies of its names and none of the objects: who removes a value or ends the map
/// leaves the object to its owner. It offers no walk, so that nothing that is written can depend on
/// the order of a hash table. A null name counts as the empty one, which is a legal key. A map that
/// never held anything costs no allocation. If memory runs out (std::bad_alloc), Add leaves the map
/// as it was.
class VESK_HDL_API IStringPtrMapBase {
public:
    /// An empty map.
    IStringPtrMapBase();
    /// A map with the same names and pointers. The objects are not copied.
    IStringPtrMapBase(IStringPtrMapBase &other);
    /// Frees the names and leaves the objects alone.
    virtual ~IStringPtrMapBase();
    /// Removes all entries, then adds those of `other`. Assigning a map to itself changes nothing.
    IStringPtrMapBase &operator=(IStringPtrMapBase &other);

protected:
    /// Maps `key` to `value`. If the key is present in whatever case, its spelling stays and only
    /// the value is replaced; the former value is neither deleted nor reported.
    void Add(char const *key, void *value);
    /// The same; the map shares the text of the key in place of copying it.
    void Add(Basis::StringBase<char> const &key, void *value);
    /// The value of a key; null if the key is absent, and if null is its value.
    void *Get(char const *key) const;
    /// The same for a text without NUL.
    void *Get(std::string_view key) const;
    /// Whether the key is present, also with a null value.
    bool Contains(char const *key) const;
    /// Removes the entry of a key. Does nothing if it is absent.
    void Remove(char const *key);
    /// Whether there are no entries.
    bool IsEmpty() const;
    /// Removes all entries.
    void Empty();

private:
    struct Record;
    Record *record;
};

/// The map with values of the pointer type `T`: a pointer to an object or to a function. See
/// IStringPtrMapBase for ownership and for the meaning of each operation.
template <class T> class IStringPtrMap : public IStringPtrMapBase {
public:
    /// Maps `key` to `value`, which the map does not own.
    void Add(char const *key, T value) {
        IStringPtrMapBase::Add(key, reinterpret_cast<void *>(value));
    }
    /// The same; the map shares the text of the key.
    void Add(Basis::StringBase<char> const &key, T value) {
        IStringPtrMapBase::Add(key, reinterpret_cast<void *>(value));
    }
    /// The value of a key; null if the key is absent.
    T Get(char const *key) const { return reinterpret_cast<T>(IStringPtrMapBase::Get(key)); }
    /// The same for a text without NUL.
    T Get(std::string_view key) const { return reinterpret_cast<T>(IStringPtrMapBase::Get(key)); }
    using IStringPtrMapBase::Contains;
    using IStringPtrMapBase::Empty;
    using IStringPtrMapBase::IsEmpty;
    using IStringPtrMapBase::Remove;
};

} // namespace Vesk_Hdl
