#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

/// The untyped map under IStringPtrMap: from a name, in any case, to a pointer that it does not
/// own. It offers no walk. A map that never held anything costs no allocation.
class VESK_HDL_API IStringPtrMapBase {
public:
    IStringPtrMapBase();
    /// Copies pointers, not what they point at.
    IStringPtrMapBase(IStringPtrMapBase &other);
    virtual ~IStringPtrMapBase();
    IStringPtrMapBase &operator=(IStringPtrMapBase &other);

protected:
    /// Maps `key` to `value`. A key that is present in whatever case keeps its text; only the value
    /// is replaced, and the former one is neither deleted nor reported.
    void Add(char const *key, void *value);
    /// The same, and the map shares the key's text.
    void Add(Basis::StringBase<char> const &key, void *value);
    /// The value, null when absent.
    void *Get(char const *key) const;
    void *Get(std::string_view key) const;
    /// True when present, also with a null value.
    bool Contains(char const *key) const;
    /// Removes the entry, if there is one, and leaves the value alone.
    void Remove(char const *key);
    bool IsEmpty() const;
    void Empty();

private:
    struct Record;
    Record *record;
};

/// The map with values of the pointer type `T`.
template <class T> class IStringPtrMap : public IStringPtrMapBase {
public:
    void Add(char const *key, T value) {
        IStringPtrMapBase::Add(key, reinterpret_cast<void *>(value));
    }
    void Add(Basis::StringBase<char> const &key, T value) {
        IStringPtrMapBase::Add(key, reinterpret_cast<void *>(value));
    }
    T Get(char const *key) const { return reinterpret_cast<T>(IStringPtrMapBase::Get(key)); }
    T Get(std::string_view key) const { return reinterpret_cast<T>(IStringPtrMapBase::Get(key)); }
    using IStringPtrMapBase::Contains;
    using IStringPtrMapBase::Empty;
    using IStringPtrMapBase::IsEmpty;
    using IStringPtrMapBase::Remove;
};

} // namespace Vesk_Hdl
