#pragma once

namespace Vesk_Hdl {

/// Throws an Exception from line `line` of `sourceFile` with a printf-formatted description.
[[noreturn]] void Raise(char const *sourceFile, int line, char const *format, ...)
    __attribute__((format(printf, 3, 4)));

} // namespace Vesk_Hdl

/// A throw site: VESK_HDL_RAISE("HdlModel", Messages::INVALID_NAME).
#define VESK_HDL_RAISE(sourceFile, ...) ::Vesk_Hdl::Raise(sourceFile, __LINE__, __VA_ARGS__)
