#include "vesk_hdl/text/basis/Version.h"

namespace Basis {

StringBase<char> Version::getValue(char const *property) {
    return StringBase<char>(property) == "version" ? VESK_HDL_VERSION : "";
}

} // namespace Basis
