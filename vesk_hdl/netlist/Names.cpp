// The grammar of names, as scanners: names are tested with each command, and a regular expression
// would cost more than the rest of the command.

#include "vesk_hdl/netlist/Names.h"

#include <array>
#include <cassert>
#include <charconv>
#include <climits>
#include <limits>

#include "vesk_hdl/text/basis/Ascii.h"
#include "vesk_hdl/text/basis/Tokens.h"

namespace Vesk_Hdl::Names {

using Basis::NextToken;
using Basis::StringBase;
using Basis::TokenIn;
using namespace Basis::Ascii;

namespace {

constexpr std::string_view::size_type NPOS = std::string_view::npos;

/// The characters that rewriting leaves as they are. A table, since every name of every command is
/// tested.
constexpr std::array<bool, 256> FindNormalCharacters() {
    std::array<bool, 256> isNormal = {};
    isNormal.fill(true);
    for (unsigned char const c : {'[', ']', '{', '}', '<', '>', '-'})
        isNormal[c] = false;
    return isNormal;
}
constexpr std::array<bool, 256> IS_NORMAL = FindNormalCharacters();

/// Whether a token is a member of a compound name.
bool IsMember(std::string_view token) {
    std::string_view base;
    std::string_view index;
    return IsBaseName(token) || IsBusName(token) || SplitBusIndexName(token, base, index);
}

} // namespace

bool IsBaseName(std::string_view text) {
    if (text.empty() || !(IsLetter(text[0]) || text[0] == '_' || text[0] == '\''))
        return false;
    for (char const c : text.substr(1))
        if (!IsLetter(c) && !IsDigit(c) && c != '_')
            return false;
    return true;
}

bool IsInteger(std::string_view text) {
    if (!text.empty() && (text[0] == '+' || text[0] == '-'))
        text.remove_prefix(1);
    for (char const c : text)
        if (!IsDigit(c))
            return false;
    return !text.empty();
}

int ToInt(std::string_view integer) {
    assert(IsInteger(integer) && "the sign or the digits would be read wrongly");
    bool const negative = integer.starts_with('-');
    if (integer.starts_with('+'))
        integer.remove_prefix(1);
    long value = 0;
    auto const result = std::from_chars(integer.data(), integer.data() + integer.size(), value);
    if (result.ec == std::errc::result_out_of_range)
        value = negative ? LONG_MIN : LONG_MAX;
    return static_cast<int>(value); // required: atoi converts like this
}

/// The first of each mark decides, and the tests come in the order that is cheapest for other
/// names.
bool IsBusName(std::string_view name) {
    if (!name.ends_with(')'))
        return false;
    std::size_t const open = name.find('(');
    std::size_t const close = name.find(')');
    std::size_t const colon = name.find(':');
    if (open == NPOS || close == NPOS || colon == NPOS || close + 1 != name.size() || colon < open)
        return false;
    return IsBaseName(name.substr(0, open)) && IsInteger(name.substr(open + 1, colon - open - 1)) &&
           IsInteger(name.substr(colon + 1, close - colon - 1));
}

/// Token by token, where a run of separators counts as one: "A(:3:0)" is a bus name here and none
/// for IsBusName.
bool SplitBusName(std::string_view name, BusParts &parts) {
    Basis_Range range = {1, 0};
    if (!NextToken(name, range, "(", true))
        return false;
    std::string_view const base = TokenIn(name, range);
    if (!NextToken(name, range, ":", true))
        return false;
    std::string_view const left = TokenIn(name, range);
    if (!NextToken(name, range, ")", true))
        return false;
    std::string_view const right = TokenIn(name, range);
    if (std::size_t{range.last} + 2 != name.size())
        return false;
    if (!IsBaseName(base) || !IsInteger(left) || !IsInteger(right))
        return false;
    parts = {base, left, right};
    return true;
}

bool SplitBusIndexName(std::string_view name, std::string_view &base, std::string_view &index) {
    if (!name.ends_with(')'))
        return false; // the walk below would find the same: no token ends before a last ")"
    Basis_Range range = {1, 0};
    if (!NextToken(name, range, "(", true))
        return false;
    std::string_view const first = TokenIn(name, range);
    if (!NextToken(name, range, ")", true))
        return false;
    std::string_view const second = TokenIn(name, range);
    if (std::size_t{range.last} + 2 != name.size())
        return false;
    if (!IsBaseName(first) || !IsInteger(second))
        return false;
    base = first;
    index = second;
    return true;
}

bool IsCompoundBusName(std::string_view name) {
    int members = 0;
    for (Basis_Range range = {1, 0}; NextToken(name, range, ",\\", true); ++members)
        if (!IsMember(TokenIn(name, range)))
            return false;
    return members >= 2;
}

bool ParseBounds(std::string_view name, Bounds &bounds) {
    BusParts parts;
    if (!SplitBusName(name, parts))
        return false;
    bounds = {ToInt(parts.left), ToInt(parts.right)};
    return true;
}

bool ParseBus(std::string_view name, std::string_view &base, Bounds &bounds) {
    BusParts parts;
    if (!IsBusName(name) || !SplitBusName(name, parts))
        return false;
    base = parts.base;
    bounds = {ToInt(parts.left), ToInt(parts.right)};
    return true;
}

int BusWidth(std::string_view name) {
    Bounds bounds;
    if (!ParseBounds(name, bounds))
        return 0;
    constexpr auto MAX_WIDTH = static_cast<unsigned int>(std::numeric_limits<int>::max());
    return static_cast<int>(std::min(bounds.Distance(), MAX_WIDTH - 1) + 1);
}

bool IsOneBitBus(std::string_view name) {
    std::string_view base;
    Bounds bounds;
    return ParseBus(name, base, bounds) && bounds.Distance() == 0;
}

namespace {

/// The decimal text of a number, without an allocation.
struct Digits {
    explicit Digits(int number) : end(std::to_chars(text, text + sizeof text, number).ptr) {}
    std::string_view View() const { return {text, static_cast<std::size_t>(end - text)}; }

    char text[16];
    char *end;
};

} // namespace

StringBase<char> BitName(std::string_view base, int index) {
    return BitName(base, Digits(index).View());
}

StringBase<char> BitName(std::string_view base, std::string_view index) {
    StringBase<char> name(base);
    name += '(';
    name += index;
    name += ')';
    return name;
}

StringBase<char> BusName(std::string_view base, int left, int right) {
    return BusName(base, Digits(left).View(), Digits(right).View());
}

StringBase<char> BusName(std::string_view base, std::string_view left, std::string_view right) {
    StringBase<char> name(base);
    name += '(';
    name += left;
    name += ':';
    name += right;
    name += ')';
    return name;
}

/// Without a branch for each character: nearly all names are normal and have to be read to the end
/// anyway.
bool IsNormal(std::string_view name) {
    bool isNormal = true;
    for (char const c : name)
        isNormal &= IS_NORMAL[static_cast<unsigned char>(c)];
    return isNormal;
}

void Normalize(StringBase<char> &name) {
    if (IsNormal(name.View()))
        return;
    for (char const open : {'[', '{', '<'})
        name.ReplaceChars(open, '(');
    for (char const close : {']', '}', '>'})
        name.ReplaceChars(close, ')');
    name.ReplaceChars('-', ':');
}

/// Required: the order of the brackets is not tested, and a comma anywhere makes the name whole,
/// since it is that of a compound.
std::string_view BaseName(std::string_view name) {
    std::size_t const open = name.find('(');
    bool const ranged = open != NPOS && name.find(')') != NPOS && name.find(',') == NPOS;
    return ranged ? name.substr(0, open) : name;
}

StringBase<char> PinSignalBase(std::string_view instance, std::string_view pinBase,
                               std::string_view tag) {
    StringBase<char> name(instance);
    name += '_';
    name += pinBase;
    name += tag;
    return name;
}

bool EndsInDummyTag(std::string_view name) { return EndsWithIgnoringCase(name, DUMMY_TAG); }

} // namespace Vesk_Hdl::Names
