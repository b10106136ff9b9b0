#pragma once

#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/netlist/NetlistEdit.h"
#include "vesk_hdl/text/TextIndex.h"
#include "vesk_hdl/text/basis/Ascii.h"

namespace Vesk_Hdl {

/// Finds the first model of a name, in any case, among those of an engine: the result is that of a
/// walk over them. Clients may rename a model without the engine knowing. So each model counts its
/// renames here, and after one the index is made anew at the next question.
class ModelIndex {
public:
    Model *Find(PtrArray<Model *> const &models, char const *name) {
        Basis::StringBase<char> const wanted(name);
        if (models.GetSize() <= MAX_WALK) {
            for (int i = 0; i < models.GetSize(); ++i)
                if (Basis::Ascii::EqualIgnoringCase(NameOf(*models.GetAt(i)).View(), wanted.View()))
                    return models.GetAt(i);
            return nullptr;
        }
        if (indexedRenames != renames)
            MakeAnew(models);
        TextIndex::Node const *const found = index.Find(wanted.View());
        return found ? static_cast<Model *>(found->value) : nullptr;
    }
    /// Adds a model whose name no other has.
    void Add(Model &model) {
        NetlistEdit(*model.GetNetlist()).CountRenames(renames);
        index.Put(NameOf(model), &model);
    }
    /// Removes a model that is about to be deleted. Another one of its name may then be the first.
    void Remove(Model const &model) {
        TextIndex::Node const *const found = index.Find(NameOf(model).View());
        if (found && found->value == &model && !hasEqualNames)
            index.Remove(NameOf(model).View());
        else
            ++renames; // have the index made anew
    }

private:
    static constexpr int MAX_WALK = 8; ///< a walk over fewer models is as fast

    static Basis::StringBase<char> const &NameOf(Model const &model) {
        return model.GetNetlist()->GetNameRef();
    }
    void MakeAnew(PtrArray<Model *> const &models) {
        index.Empty();
        hasEqualNames = false;
        for (int i = 0; i < models.GetSize(); ++i) {
            Basis::StringBase<char> const &name = NameOf(*models.GetAt(i));
            if (index.Find(name.View()))
                hasEqualNames = true; // the first of them is the one that is found
            else
                index.Put(name, models.GetAt(i));
        }
        indexedRenames = renames;
    }

    TextIndex index{TextIndex::CASE_IGNORED};
    unsigned long renames = 0;        ///< how often models were renamed so far
    unsigned long indexedRenames = 0; ///< that number when the index was made
    bool hasEqualNames = false;       ///< only clients give two models one name
};

} // namespace Vesk_Hdl
