#pragma once

#include <cstdint>

#include "vesk_hdl/Api.h"

namespace Basis {

/// True if the whole text matches the pattern, in which `*` stands for any run of characters, also
/// an empty one, and every other character for itself. strimatch ignores case.
VESK_HDL_API bool strmatch(char const *text, char const *pattern);
VESK_HDL_API bool strimatch(char const *text, char const *pattern);

/// 0 if equal, not 0 otherwise, ignoring case; strnicmp looks at the first `count` characters.
VESK_HDL_API int stricmp(char const *a, char const *b);
VESK_HDL_API int strnicmp(char const *a, char const *b, std::uint64_t count);

/// True if the text is an optional sign and decimal digits that fit a long, which then goes into
/// `value`; otherwise `value` stays as it was.
VESK_HDL_API bool strtol(char const *text, long &value);

} // namespace Basis

/// printf into a buffer of the thread's own, valid until the thread's next call.
VESK_HDL_API char *orvform(char const *format, ...) __attribute__((format(printf, 1, 2)));
