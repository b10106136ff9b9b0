#pragma once

#include <memory>
#include <unordered_map>

#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/text/TextIndex.h"

namespace Vesk_Hdl {

/// The objects of one class that a netlist finds by name. As IStringPtrMap, but it takes a key that
/// was rewritten and hashed before, since a command asks several tables for one name.
template <class T> class NameTable {
public:
    T *Get(Names::Key const &key) const {
        TextIndex::Node const *const node = table.Find(key.View(), key.GetHash());
        return node ? static_cast<T *>(node->value) : nullptr;
    }

    /// The table shares the name's text. The newer object of a name is the one that is found.
    void Add(Basis::StringBase<char> const &name, T *object) {
        if (formerNames)
            formerNames->emplace(object, name);
        table.Put(name, object);
    }

    /// The object is about to be destroyed, and nothing finds it any more: its former names are of
    /// no use.
    void Forget(T const *object) {
        if (formerNames)
            formerNames->erase(object);
    }

    /// Takes away what the name finds, and the object: if it was renamed since it was added, it is
    /// still found by its former name, and nobody must find what is gone.
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

    std::unique_ptr<FormerNames> formerNames; ///< null until somebody removes a renamed object
    TextIndex table{TextIndex::CASE_IGNORED};
};

} // namespace Vesk_Hdl
