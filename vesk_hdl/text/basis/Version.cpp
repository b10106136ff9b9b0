// The version of the library, for clients and for the header of written files.

#include "vesk_hdl/text/basis/Version.h"

namespace Basis {

/// VESK_HDL_VERSION comes from the build and is defined for this source alone, so that a new
/// version recompiles nothing else.
StringBase<char> Version::getValue(char const *property) {
    return StringBase<char>(property) == "version" ? VESK_HDL_VERSION : "";
}

} // namespace Basis
