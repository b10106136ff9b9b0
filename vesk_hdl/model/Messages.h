#pragma once

/// The messages of refused operations on a Model, as printf formats. They are part of the
/// interface: clients compare them. "Signal ... not found" is also what a missing instance of a
/// connection is told by, and the generic value what a bad synthesis word is told by; kept as they
/// stand, like "already exist" without its full stop.
namespace Vesk_Hdl::Messages {

inline constexpr char INVALID_NAME[] = "Invalid Name.\n";
inline constexpr char IDENTIFIER_DEFINED[] = "Identifier \"%s\" already defined.\n";
inline constexpr char COMPONENT_NOT_FOUND[] = "Component \"%s\" not found.\n";
inline constexpr char COMPONENT_HAS_PIN[] = "Component \"%s\" already has pin \"%s\".\n";
inline constexpr char INSTANCE_EXISTS[] = "Instance \"%s\" already exist\n";
inline constexpr char SIGNAL_DECLARED[] = "Signal \"%s\" already declared.\n";
inline constexpr char SIGNAL_NOT_FOUND[] = "Signal \"%s\" not found.\n";
inline constexpr char PIN_NOT_FOUND[] = "Pin \"%s\" not found.\n";
inline constexpr char OWNER_NOT_FOUND[] = "\"%s\" not found.\n";
inline constexpr char ATTRIBUTE_NOT_FOUND[] = "Attribute \"%s\" not found.\n";
inline constexpr char INVALID_ATTRIBUTE_TYPE[] = "Invalid attribute type.\n";
inline constexpr char INVALID_GENERIC_VALUE[] = "Invalid generic value.\n";

} // namespace Vesk_Hdl::Messages
