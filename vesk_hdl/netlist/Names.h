#pragma once

#include <cassert>
#include <string_view>

#include "vesk_hdl/text/SeededHash.h"
#include "vesk_hdl/text/basis/StringBase.h"

/// The grammar of names: what makes a bus, index or compound name, its parts, and how such a name
/// is built. All classes and writers use these functions, which depend on no class. All but the
/// rewriting work on rewritten names, and return pieces of the given text without a copy.
///
/// There are two readings of a bus name, which differ on odd texts such as "A(:3:0)": IsBusName
/// looks for the first of each mark, SplitBusName reads token by token. Both are required, and each
/// caller uses the one that its rule names.
namespace Vesk_Hdl::Names {

/// The parts of a bus name, BASE(LEFT:RIGHT).
struct BusParts {
    std::string_view base;
    std::string_view left;  ///< as it was typed, with sign and leading zeros
    std::string_view right; ///< likewise
};

/// A letter, "_" or an apostrophe, then letters, digits and "_": the whole-string match of
/// "[A-Za-z'_][A-Za-z0-9_]*", as a scanner.
bool IsBaseName(std::string_view text);
/// The whole-string match of "[+-]?[0-9]+", as a scanner.
bool IsInteger(std::string_view text);
/// The number that `atoi` makes of such a text: a number beyond int is converted as from a long.
int ToInt(std::string_view integer);

/// Whether the name is BASE(LEFT:RIGHT).
bool IsBusName(std::string_view name);
/// Takes a bus name apart; false, and `parts` as they were, if it is none.
bool SplitBusName(std::string_view name, BusParts &parts);
/// Takes an index name, BASE(INDEX), apart; false, and both as they were, if it is none.
bool SplitBusIndexName(std::string_view name, std::string_view &base, std::string_view &index);
/// Whether the name is two or more base, bus or index names with "," or a backslash between them.
bool IsCompoundBusName(std::string_view name);

/// The bounds of a bus name as numbers; both 0 if the name is none.
struct Bounds {
    int left = 0;
    int right = 0;

    bool IsDownTo() const { return left > right; }
    /// The number of bits less one. The number itself may not fit: a bus over all int values has
    /// 2^32 bits.
    unsigned int Distance() const {
        return left > right ? static_cast<unsigned int>(left) - static_cast<unsigned int>(right)
                            : static_cast<unsigned int>(right) - static_cast<unsigned int>(left);
    }
    /// The index of the bit at a position counted from the left bound.
    int IndexAt(unsigned int position) const {
        assert(position <= Distance() && "the bit is outside the bus");
        auto const from = static_cast<unsigned int>(left);
        return static_cast<int>(left > right ? from - position : from + position);
    }
};
/// Reads the bounds of a bus name by SplitBusName; false, and `bounds` as they were, if it is none.
bool ParseBounds(std::string_view name, Bounds &bounds);
/// The base and the bounds of a name that is a bus name by both readings; false otherwise.
bool ParseBus(std::string_view name, std::string_view &base, Bounds &bounds);
/// The width in bits of a bus name by SplitBusName, at most INT_MAX; 0 if it is none.
int BusWidth(std::string_view name);
/// Whether the name is a bus of exactly one bit, D(3:3), by IsBusName.
bool IsOneBitBus(std::string_view name);

/// "BASE(INDEX)".
Basis::StringBase<char> BitName(std::string_view base, int index);
/// The same with the text of an index as it was typed.
Basis::StringBase<char> BitName(std::string_view base, std::string_view index);
/// "BASE(LEFT:RIGHT)".
Basis::StringBase<char> BusName(std::string_view base, int left, int right);
/// The same with the texts of bounds as they were typed.
Basis::StringBase<char> BusName(std::string_view base, std::string_view left,
                                std::string_view right);

/// Whether the text is in rewritten form: it holds no square, curly or angle bracket and no hyphen.
bool IsNormal(std::string_view name);
/// The rewriting: square, curly and angle brackets become parentheses, every hyphen a colon.
void Normalize(Basis::StringBase<char> &name);
/// The text before the first "(" of a rewritten name that has both brackets and no comma, else all.
std::string_view BaseName(std::string_view name);

/// The end of the base name of a dummy signal.
inline constexpr char const *DUMMY_TAG = "_DUMMY";
/// Whether the name ends in it, in any case.
bool EndsInDummyTag(std::string_view name);

/// The end of the base name of the signal that ties a pin to a constant.
inline constexpr char const *CONSTANT_TAG = "_CONST_SIGNAL";
/// The end of the base name of the signal of an open input pin.
inline constexpr char const *OPEN_TAG = "_openSignal";
/// The base name of such a signal: INSTANCE_PIN and the tag.
Basis::StringBase<char> PinSignalBase(std::string_view instance, std::string_view pinBase,
                                      std::string_view tag);

/// A name in rewritten form: the given text if it has that form already, which most names have,
/// otherwise a rewritten copy. Null counts as empty. Valid as long as this object and the given
/// text.
class NormalName {
public:
    explicit NormalName(char const *name) : NormalName(std::string_view(name ? name : "")) {}
    explicit NormalName(std::string_view name) : view(name) {
        if (IsNormal(name))
            return;
        rewritten = Basis::StringBase<char>(name);
        Normalize(rewritten);
        view = rewritten.View();
    }
    NormalName(NormalName const &) = delete;
    NormalName &operator=(NormalName const &) = delete;
    std::string_view View() const { return view; }

private:
    Basis::StringBase<char> rewritten;
    std::string_view view;
};

/// A name as the tables of a netlist look it up: rewritten, and with its hash, which is made once
/// for all tables that a command asks.
class Key : public NormalName {
public:
    explicit Key(char const *name) : Key(std::string_view(name ? name : "")) {}
    explicit Key(std::string_view name) : NormalName(name), hash(SeededHashIgnoringCase(View())) {}
    std::uint32_t GetHash() const { return hash; }

private:
    std::uint32_t hash;
};

} // namespace Vesk_Hdl::Names
