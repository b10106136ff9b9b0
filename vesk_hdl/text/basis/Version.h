#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

namespace Basis {

/// Properties of the build.
class VESK_HDL_API Version {
public:
    /// "version" gives the library's version, such as "1.2.3"; anything else the empty string.
    static StringBase<char> getValue(char const *property);
};

} // namespace Basis
