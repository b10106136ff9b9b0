#include "vesk_hdl/netlist/NaturalOrder.h"

#include "vesk_hdl/text/basis/Ascii.h"

namespace Vesk_Hdl {

using namespace Basis::Ascii;

int NaturalCompare(char const *a, char const *b) {
    while (ToUpper(*a) == ToUpper(*b)) {
        if (*a == '\0')
            return 0;
        ++a;
        ++b;
    }
    if (IsDigit(*a) != IsDigit(*b))
        return IsDigit(*a) ? 1 : -1;
    if (!IsDigit(*a))
        return static_cast<signed char>(ToUpper(*a)) < static_cast<signed char>(ToUpper(*b)) ? -1
                                                                                             : 1;

    // Runs of equal length compare by their first difference, which is where they stand now.
    int const difference = *a < *b ? -1 : 1;
    while (IsDigit(*a) && IsDigit(*b)) {
        ++a;
        ++b;
    }
    if (IsDigit(*a) != IsDigit(*b))
        return IsDigit(*a) ? 1 : -1;
    return difference;
}

} // namespace Vesk_Hdl
