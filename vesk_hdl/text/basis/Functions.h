#pragma once

#include <cstdint>

#include "vesk_hdl/Api.h"

namespace Basis {

// Functions on texts that end in NUL. Case means that of the ASCII letters, whatever the locale of
// the program. A null text counts as empty.

/// Whether the whole text matches the pattern, where `*` matches any run of characters, also an
/// empty one, and every other character matches itself. Case counts. The time is bounded by the
/// product of both lengths.
VESK_HDL_API bool strmatch(char const *text, char const *pattern);
/// The same, with case ignored. The command language tests its prefixes, such as "-TYPE=", with it.
VESK_HDL_API bool strimatch(char const *text, char const *pattern);

/// 0 if the texts are equal but for case, otherwise another value, whose sign says nothing.
VESK_HDL_API int stricmp(char const *a, char const *b);
/// The same for the first `count` characters at most. Texts that end earlier are compared whole.
VESK_HDL_API int strnicmp(char const *a, char const *b, std::uint64_t count);

/// Reads a decimal integer: an optional sign and digits, which must be the whole text and fit a
/// long. True if it is one and `value` holds it, otherwise false, and `value` is as it was.
VESK_HDL_API bool strtol(char const *text, long &value);

} // namespace Basis

/// Formats as printf does, to any length, into a buffer that belongs to the calling thread. The
/// result is valid until the thread's next call, and the caller does not free it.
VESK_HDL_API char *orvform(char const *format, ...) __attribute__((format(printf, 1, 2)));
