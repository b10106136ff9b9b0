#pragma once

#include "vesk_hdl/text/basis/Exception.h"

namespace Vesk_Hdl {

/// The one exception that the library throws. Its description is the message, ending in a line
/// feed, with nothing in front. Module tag "DesignEntry". It adds nothing to its base.
class VESK_HDL_API Exception : public Basis::Exception {
public:
    /// What getKind() says of an exception of the library. Several kinds share a message: one text
    /// serves a missing signal and a missing instance of a connection. getSubject() is the name or
    /// word given for each kind, as the caller spelled it.
    enum Kind : int {
        OTHER = 0,              ///< not made by the library; no subject
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

    Exception(Basis::Exception const &other);
    Exception(Exception const &other);
    Exception &operator=(Exception const &other);
    ~Exception() override;
};

} // namespace Vesk_Hdl
