#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

namespace Basis {

/// Properties that are fixed when the library is built.
class VESK_HDL_API Version {
public:
    /// The version of the library, such as "1.2.3", for the property "version" in exactly this
    /// spelling. Any other property, and null, gives the empty string.
    static StringBase<char> getValue(char const *property);
};

} // namespace Basis
