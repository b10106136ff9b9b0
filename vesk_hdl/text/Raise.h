#pragma once

#include <initializer_list>

#include "vesk_hdl/text/Exception.h"

namespace Vesk_Hdl {

/// A message of a refusal: its text, in which each "%s" is replaced by a name, and its kind. All
/// messages of the library are in model/Messages.h.
struct Message {
    char const *text;
    Exception::Kind kind;
};

/// Throws an Exception that names line `line` of `sourceFile`. The names replace the "%s" of the
/// text in order; null counts as an empty name. The last name is the subject of the exception, also
/// if the text does not show it: several messages name another thing than the one that is missing.
[[noreturn]] void Raise(char const *sourceFile, int line, Message const &message,
                        std::initializer_list<char const *> names);

} // namespace Vesk_Hdl

/// A throw site: VESK_HDL_RAISE("HdlModel", Messages::SIGNAL_NOT_FOUND, name).
#define VESK_HDL_RAISE(sourceFile, message, ...)                                                   \
    ::Vesk_Hdl::Raise(sourceFile, __LINE__, message, {__VA_ARGS__})
