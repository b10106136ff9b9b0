#pragma once

#include <memory>
#include <unordered_map>

#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/text/TextIndex.h"

namespace Vesk_Hdl {

/// The objects of one class that a netlist finds by name. It is like IStringPtrMap, but takes a key
/// that is rewritten and hashed already: a command asks up to four tables for one name.
///
/// Invariant: an object that was removed is found under no name, neither its own nor a former one.
/// See docs/architecture.md, "Storage and its invariants".
template <class T> class NameTable {
public:
    T *Get(Names::Key const &key) const {
        TextIndex::Node const *const node = table.Find(key.View(), key.GetHash());
        return node ? static_cast<T *>(node->value) : nullptr;
    }

    /// Files an object under a name, whose text the table shares. Of two objects of a name the
    /// newer one is found.
    void Add(Basis::StringBase<char> const &name, T *object) {
        if (formerNames)
            formerNames->emplace(object, name);
        table.Put(name, object);
    }

    /// Drops the former names of an object that no lookup finds any more and that is about to be
    /// deleted.
    void Forget(T const *object) {
        if (formerNames)
            formerNames->erase(object);
    }

    /// Removes what is filed under `name`, and `object` under whatever name it is filed: an object
    /// that was renamed after it was added is filed under its former name.
    void Remove(Basis::StringBase<char> const &name, T const *object) {
        TextIndex::Node const *const found = table.Find(name.View());
        bool const isFiledSo = found && found->value == object;
        table.Remove(name.View());
        if (isFiledSo && !formerNames)
            return;
        if (!formerNames)
            FindFormerNames();
        auto const [begin, end] = formerNames->equal_range(object);
        for (auto former = begin; former != end; ++former) {
            TextIndex::Node const *const node = table.Find(former->second.View());
            if (node && node->value == object)
                table.Remove(former->second.View());
        }
        formerNames->erase(begin, end);
    }

private:
    using FormerNames = std::unordered_multimap<void const *, Basis::StringBase<char>>;

    void FindFormerNames() {
        auto found = std::make_unique<FormerNames>();
        for (TextIndex::Node const &node : table)
            found->emplace(node.value, node.key);
        formerNames = std::move(found);
    }

    /// All names that objects were filed under; null until a renamed object is removed. From then
    /// on it is kept up to date, as a search through the table for each removal would cost its
    /// square.
    std::unique_ptr<FormerNames> formerNames;
    TextIndex table{TextIndex::CASE_IGNORED};
};

} // namespace Vesk_Hdl
