#pragma once

#include <algorithm>
#include <string>
#include <string_view>

#include "tool/check/Checks.h"
#include "vesk_hdl/Vesk_Hdl.h"

namespace Checks {

/// The digits of a constant or of a value of bits, as they are going to be written.
class Digits {
public:
    explicit Digits(Vesk_Hdl::BitVectorValue const &value)
        : hasBase(value.HasBaseAndLength()), base(value.GetBase()), text(value.GetValue().View()) {}

    std::string const &GetText() const { return text; }

    /// The languages that do not take them. Without a base VHDL takes them as a string of bits,
    /// which may have `further` values, and Verilog as a decimal number.
    Languages RefusedIn(std::string_view further) const {
        if (!hasBase)
            return (text.empty() || AreAll("01", further) ? NO_LANGUAGE : VHDL) |
                   (AreAll("0123456789", "_") ? NO_LANGUAGE : VERILOG);
        std::string_view const known = base == 2   ? "01"
                                       : base == 8 ? "01234567"
                                                   : "0123456789abcdefABCDEF";
        return (AreAll(known, "_") ? NO_LANGUAGE : VHDL) |
               (AreAll(known, "_xXzZ?") ? NO_LANGUAGE : VERILOG);
    }

    /// How many bits they are in VHDL, with a base.
    std::size_t GetWidth() const {
        auto const dashes = std::count(text.begin(), text.end(), '_');
        return (text.size() - static_cast<std::size_t>(dashes)) * GetBitsOfDigit();
    }
    /// How many bits they need in Verilog, with a base.
    std::size_t GetLeastWidth() const {
        std::size_t const zeros = std::min(text.find_first_not_of("0_"), text.size());
        std::string_view const rest = std::string_view(text).substr(zeros);
        if (rest.empty())
            return 0;
        auto const dashes = std::count(rest.begin(), rest.end(), '_');
        std::size_t const further = rest.size() - static_cast<std::size_t>(dashes) - 1;
        char const first = rest.front();
        int const bits = first == '1' ? 1 : first <= '3' ? 2 : first <= '7' ? 3 : 4;
        return further * GetBitsOfDigit() +
               std::min(GetBitsOfDigit(), static_cast<std::size_t>(bits));
    }

private:
    std::size_t GetBitsOfDigit() const { return base == 2 ? 1 : base == 8 ? 3 : 4; }

    bool AreAll(std::string_view known, std::string_view further) const {
        return !text.empty() && text.front() != '_' &&
               std::all_of(text.begin(), text.end(), [&](char c) {
                   return known.find(c) != std::string_view::npos ||
                          further.find(c) != std::string_view::npos;
               });
    }

    bool hasBase;
    int base;
    std::string text;
};

} // namespace Checks
