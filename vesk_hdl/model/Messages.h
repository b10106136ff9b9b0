#pragma once

#include "vesk_hdl/text/Raise.h"

/// The messages of the library, each with its kind of refusal. The texts are part of the interface:
/// clients compare them. So they stay as they are, also where one text serves several kinds, and
/// where a text is misspelled or lacks a full stop.
namespace Vesk_Hdl::Messages {

using E = Exception;

// Command lines.
inline constexpr Message MISSING_MODEL = {"Missing Model.\n", E::MISSING_MODEL};
inline constexpr Message UNKNOWN_COMMAND = {"Command not find.\n", E::UNKNOWN_COMMAND};
inline constexpr Message INVALID_ARGUMENTS = {"%s: Invalid Arguments.\n", E::INVALID_ARGUMENTS};

// Declarations.
inline constexpr Message INVALID_NAME = {"Invalid Name.\n", E::INVALID_NAME};
inline constexpr Message NAME_TAKEN = {"Identifier \"%s\" already defined.\n", E::NAME_TAKEN};
inline constexpr Message INSTANCE_EXISTS = {"Instance \"%s\" already exist\n", E::NAME_TAKEN};
inline constexpr Message BUS_DECLARED = {"Signal \"%s\" already declared.\n", E::BUS_DECLARED};
inline constexpr Message PIN_TAKEN = {"Component \"%s\" already has pin \"%s\".\n", E::PIN_TAKEN};
inline constexpr Message COMPONENT_NOT_FOUND = {"Component \"%s\" not found.\n",
                                                E::COMPONENT_NOT_FOUND};

// Connections. A missing instance is reported as a signal. One operation reports a missing pin
// together with its instance, the other by its name alone.
inline constexpr Message SIGNAL_NOT_FOUND = {"Signal \"%s\" not found.\n", E::SIGNAL_NOT_FOUND};
inline constexpr Message CONNECTED_INSTANCE_NOT_FOUND = {"Signal \"%s\" not found.\n",
                                                         E::INSTANCE_NOT_FOUND};
inline constexpr Message PIN_NOT_FOUND = {"Pin \"%s\" not found.\n", E::PIN_NOT_FOUND};
inline constexpr Message INSTANCE_PIN_NOT_FOUND = {"Pin \"%s.%s\" not found.\n", E::PIN_NOT_FOUND};

// Owners of attributes and comments. A missing owner of a pin is reported as the pin, and a missing
// instance whose attribute gets an option as the attribute. The name of the owner itself is passed
// last, which makes it the subject of the exception.
inline constexpr Message COMPONENT_MISSING = {"\"%s\" not found.\n", E::COMPONENT_NOT_FOUND};
inline constexpr Message INSTANCE_MISSING = {"\"%s\" not found.\n", E::INSTANCE_NOT_FOUND};
inline constexpr Message SIGNAL_MISSING = {"\"%s\" not found.\n", E::SIGNAL_NOT_FOUND};
inline constexpr Message COMPONENT_OF_PIN_MISSING = {PIN_NOT_FOUND.text, E::COMPONENT_NOT_FOUND};
inline constexpr Message INSTANCE_OF_PIN_MISSING = {PIN_NOT_FOUND.text, E::INSTANCE_NOT_FOUND};
inline constexpr Message INSTANCE_OF_ATTRIBUTE_MISSING = {"Attribute \"%s\" not found.\n",
                                                          E::INSTANCE_NOT_FOUND};

// Attributes. One text serves both options.
inline constexpr Message ATTRIBUTE_NOT_FOUND = {"Attribute \"%s\" not found.\n",
                                                E::ATTRIBUTE_NOT_FOUND};
inline constexpr Message INVALID_ATTRIBUTE_TYPE = {"Invalid attribute type.\n",
                                                   E::INVALID_ATTRIBUTE_TYPE};
inline constexpr Message NOT_A_USER_ATTRIBUTE = {"Invalid attribute type.\n",
                                                 E::NOT_A_USER_ATTRIBUTE};
inline constexpr Message INVALID_GENERIC_WORD = {"Invalid generic value.\n",
                                                 E::INVALID_GENERIC_WORD};
inline constexpr Message INVALID_SYNTHESIS_WORD = {"Invalid generic value.\n",
                                                   E::INVALID_SYNTHESIS_WORD};

} // namespace Vesk_Hdl::Messages
