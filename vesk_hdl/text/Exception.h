#pragma once

#include "vesk_hdl/text/basis/Exception.h"

namespace Vesk_Hdl {

/// The one exception that the library throws, apart from std::bad_alloc and std::length_error when
/// memory or a count runs out.
///
/// Its description is the message of a refusal, which ends in a line feed and has no prefix. The
/// module is "DesignEntry". The class adds no data to its base: a Basis::Exception that is caught
/// by reference is the same object.
class VESK_HDL_API Exception : public Basis::Exception {
public:
    /// What getKind() returns for an exception of the library, so that a client need not compare
    /// messages: several kinds share one message, such as that of a missing signal and of a missing
    /// instance in a connection. Beside each kind is what getSubject() returns, as the caller
    /// spelled it.
    enum Kind : int {
        OTHER = 0,              ///< not thrown by the library; no subject
        MISSING_MODEL,          ///< no subject
        UNKNOWN_COMMAND,        ///< no subject
        INVALID_ARGUMENTS,      ///< the keyword as it was registered
        INVALID_NAME,           ///< null where a name is required; no subject
        NAME_TAKEN,             ///< the name, which a component, an instance or a signal has
        BUS_DECLARED,           ///< the name of a bus; one of that base name exists
        PIN_TAKEN,              ///< the name of the pin, which the component has already
        COMPONENT_NOT_FOUND,    ///< the name of the component
        INSTANCE_NOT_FOUND,     ///< the name of the instance
        SIGNAL_NOT_FOUND,       ///< the name of the signal
        PIN_NOT_FOUND,          ///< the name of the pin, without its component or instance
        ATTRIBUTE_NOT_FOUND,    ///< the name of the attribute
        INVALID_ATTRIBUTE_TYPE, ///< the word for the type
        NOT_A_USER_ATTRIBUTE,   ///< the name of an attribute, which is not of type User
        INVALID_GENERIC_WORD,   ///< the word for the generic option
        INVALID_SYNTHESIS_WORD  ///< the word for the synthesis option
    };

    /// Copies description, place, kind and subject. A client command builds a Basis::Exception and
    /// throws an exception of this class made from it, which the library treats as a refusal.
    Exception(Basis::Exception const &other);
    /// An independent copy. Each level of the library that cleans up throws such a copy on.
    Exception(Exception const &other);
    /// Copies everything. Assigning an exception to itself changes nothing.
    Exception &operator=(Exception const &other);
    /// Frees the texts.
    ~Exception() override;
};

} // namespace Vesk_Hdl
