#pragma once

#include <atomic>

#include "vesk_hdl/netlist/Object.h"
#include "vesk_hdl/netlist/Values.h"

namespace Vesk_Hdl {

/// Set once any pin got another name or polarity, which only a client does: from then on nobody
/// trusts an index or an order of pins that was found before.
inline std::atomic<bool> somePinHasChanged{false};

/// What an object shares with its copies until one of them changes. A pin's polarity and default
/// value stand here as well: the pins of a million instances are what their components' pins are,
/// and so cost their signal alone.
///
/// A record stands in the block of its name's text, behind the characters. Who changes the name
/// makes another record; the block goes when the record and all copies of the text are gone.
struct Object::Record {
    Record() = default;
    /// All but the name.
    explicit Record(Record const &model) : polarity(model.polarity), objectType(model.objectType) {}

    /// For a record that is about to change.
    void NoteChange() const {
        if (objectType == OBJECT_PIN)
            somePinHasChanged = true;
    }

    Basis::StringBase<char> const &GetComment() const;
    BitVectorValue const &GetDefaultValue() const;
    bool IsSamePin(Record const &other) const {
        return polarity == other.polarity && GetDefaultValue().IsEmpty() &&
               other.GetDefaultValue().IsEmpty();
    }

    Basis::StringBase<char> name;
    std::atomic<unsigned int> owners{1};
    short polarity = Polarity::INVALID; ///< of a pin, a Polarity::Value
    signed char objectType = 0;         ///< an ObjectType
    bool isRare = false;                ///< whether it is a RareRecord
};

/// A record with what few objects have.
struct Object::RareRecord : Object::Record {
    explicit RareRecord(Record const &model)
        : Record(model), comment(model.GetComment()), defaultValue(model.GetDefaultValue()) {
        isRare = true;
    }

    Basis::StringBase<char> comment;
    BitVectorValue defaultValue;
};

inline Basis::StringBase<char> const &Object::Record::GetComment() const {
    static Basis::StringBase<char> const none;
    return isRare ? static_cast<RareRecord const *>(this)->comment : none;
}

inline BitVectorValue const &Object::Record::GetDefaultValue() const {
    static BitVectorValue const none;
    return isRare ? static_cast<RareRecord const *>(this)->defaultValue : none;
}

} // namespace Vesk_Hdl
