#pragma once

#include "vesk_hdl/netlist/Names.h"
#include "vesk_hdl/text/StringTable.h"

namespace Vesk_Hdl {

/// The objects of one class that a netlist finds by name. As IStringPtrMap, but it takes a key that
/// was rewritten and hashed before, since a command asks several tables for one name.
template <class T> class NameTable {
public:
    T *Get(Names::Key const &key) const {
        StringTable::Node const *const node = table.Find(key.View(), key.GetHash());
        return node ? static_cast<T *>(node->value) : nullptr;
    }

    /// The table shares the name's text. The newer object of a name is the one that is found.
    void Add(Basis::StringBase<char> const &name, T *object) {
        std::uint32_t const hash = StringTable::HashIgnoringCase(name.View());
        if (StringTable::Node *const node = table.Find(name.View(), hash)) {
            node->value = object;
            return;
        }
        table.GrowForOneMore();
        table.Insert(name, hash, object);
    }

    void Remove(Basis::StringBase<char> const &name) { table.Remove(name.View()); }

private:
    StringTable table{StringTable::CASE_IGNORED, 7, StringTable::ORDER_FREE};
};

} // namespace Vesk_Hdl
