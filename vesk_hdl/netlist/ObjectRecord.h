#pragma once

#include <atomic>
#include <memory>

#include "vesk_hdl/netlist/Object.h"
#include "vesk_hdl/netlist/Values.h"

namespace Vesk_Hdl {

/// What an object shares with its copies until one of them changes. A pin's polarity and default
/// value stand here as well: the pins of a million instances are what their components' pins are,
/// and so cost their signal alone.
struct Object::Record {
    /// What few objects have.
    struct Rare {
        Basis::StringBase<char> comment;
        BitVectorValue defaultValue;
    };

    Record() = default;
    Record(Record const &other)
        : name(other.name), rare(other.rare ? std::make_unique<Rare>(*other.rare) : nullptr),
          objectType(other.objectType), polarity(other.polarity) {}

    Basis::StringBase<char> const &GetComment() const { return GetRare().comment; }
    BitVectorValue const &GetDefaultValue() const { return GetRare().defaultValue; }
    Rare &OwnRare() {
        if (!rare)
            rare = std::make_unique<Rare>();
        return *rare;
    }
    bool IsSamePin(Record const &other) const {
        return polarity == other.polarity && GetDefaultValue().IsEmpty() &&
               other.GetDefaultValue().IsEmpty();
    }

    Basis::StringBase<char> name;
    std::unique_ptr<Rare> rare; ///< null while there is nothing rare
    std::atomic<unsigned int> owners{1};
    short objectType = 0;               ///< an ObjectType
    short polarity = Polarity::INVALID; ///< of a pin, a Polarity::Value

private:
    Rare const &GetRare() const {
        static Rare const none;
        return rare ? *rare : none;
    }
};

} // namespace Vesk_Hdl
