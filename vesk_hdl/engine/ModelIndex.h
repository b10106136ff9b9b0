#pragma once

#include <string>
#include <unordered_map>

#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/netlist/NetlistEdit.h"
#include "vesk_hdl/text/basis/Ascii.h"

namespace Vesk_Hdl {

/// Finds the first model of a name, in any case, among those of an engine, as a walk over them does.
/// Clients may rename models without a word to the engine: each model counts its renames here, and
/// the index is then made anew at the next question.
class ModelIndex {
public:
    Model *Find(PtrArray<Model *> const &models, char const *name) {
        Basis::StringBase<char> const wanted(name);
        if (models.GetSize() <= MAX_WALK) {
            for (int i = 0; i < models.GetSize(); ++i)
                if (Basis::Ascii::EqualIgnoringCase(NameOf(*models.GetAt(i)), wanted.View()))
                    return models.GetAt(i);
            return nullptr;
        }
        if (indexedRenames != renames)
            MakeAnew(models);
        auto const found = index.find(Fold(wanted.View()));
        return found == index.end() ? nullptr : found->second;
    }
    void Add(Model &model) {
        NetlistEdit(*model.GetNetlist()).CountRenames(renames);
        index.try_emplace(Fold(NameOf(model)), &model);
    }
    /// A model that is going to be deleted. Another one of its name may be found instead.
    void Remove(Model const &model) {
        auto const found = index.find(Fold(NameOf(model)));
        if (found != index.end() && found->second == &model && !hasEqualNames)
            index.erase(found);
        else
            ++renames;
    }

private:
    static constexpr int MAX_WALK = 8; ///< a walk over fewer models is as fast

    static std::string_view NameOf(Model const &model) {
        return model.GetNetlist()->GetNameRef().View();
    }
    static std::string Fold(std::string_view name) {
        std::string folded(name);
        for (char &c : folded)
            c = Basis::Ascii::ToUpper(c);
        return folded;
    }
    void MakeAnew(PtrArray<Model *> const &models) {
        index.clear();
        hasEqualNames = false;
        for (int i = 0; i < models.GetSize(); ++i)
            hasEqualNames |= !index.try_emplace(Fold(NameOf(*models.GetAt(i))), models.GetAt(i)).second;
        indexedRenames = renames;
    }

    std::unordered_map<std::string, Model *> index;
    unsigned long renames = 0;        ///< of all models so far
    unsigned long indexedRenames = 0; ///< when the index was made
    bool hasEqualNames = false;       ///< only clients give two models one name
};

} // namespace Vesk_Hdl
