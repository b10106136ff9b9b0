#pragma once

#include <string_view>

#include "vesk_hdl/text/SeededHash.h"
#include "vesk_hdl/text/basis/StringBase.h"

/// The grammar of names, in one place and free of all classes. Everything here but the rewriting
/// works on rewritten names and gives pieces of the text it was given, without a copy.
///
/// There are two readings of a bus name, and they answer differently on odd texts such as
/// "A(:3:0)": IsBusName looks for the first of each mark, SplitBusName walks from token to token.
/// Each caller uses the one that its rule names.
namespace Vesk_Hdl::Names {

/// The parts of a bus name, BASE(LEFT:RIGHT).
struct BusParts {
    std::string_view base;
    std::string_view left;
    std::string_view right;
};

/// A letter, "_" or an apostrophe, then letters, digits and "_": the whole-string match of
/// "[A-Za-z'_][A-Za-z0-9_]*", as a scanner.
bool IsBaseName(std::string_view text);
/// The whole-string match of "[+-]?[0-9]+", as a scanner.
bool IsInteger(std::string_view text);
/// What `atoi` makes of an integer text: values wrap as its conversion to int does.
int ToInt(std::string_view integer);

bool IsBusName(std::string_view name);
bool SplitBusName(std::string_view name, BusParts &parts);
bool SplitBusIndexName(std::string_view name, std::string_view &base, std::string_view &index);
bool IsCompoundBusName(std::string_view name);

/// A bus name's bounds as numbers; both 0 if the name is none.
struct Bounds {
    int left = 0;
    int right = 0;

    bool IsDownTo() const { return left > right; }
    /// The number of bits less one; a bus over the whole range of an int has more than an int says.
    unsigned int Distance() const {
        return left > right ? static_cast<unsigned int>(left) - static_cast<unsigned int>(right)
                            : static_cast<unsigned int>(right) - static_cast<unsigned int>(left);
    }
    /// The index of the bit at a position counted from the left bound.
    int IndexAt(unsigned int position) const {
        auto const from = static_cast<unsigned int>(left);
        return static_cast<int>(left > right ? from - position : from + position);
    }
};
bool ParseBounds(std::string_view name, Bounds &bounds);
/// The width in bits of a bus name by SplitBusName, at most INT_MAX; 0 if it is none.
int BusWidth(std::string_view name);
/// Whether the name is a bus of exactly one bit, D(3:3), by IsBusName.
bool IsOneBitBus(std::string_view name);

/// "BASE(INDEX)".
Basis::StringBase<char> BitName(std::string_view base, int index);
Basis::StringBase<char> BitName(std::string_view base, std::string_view index);
/// "BASE(LEFT:RIGHT)".
Basis::StringBase<char> BusName(std::string_view base, int left, int right);
Basis::StringBase<char> BusName(std::string_view base, std::string_view left,
                                std::string_view right);

/// Whether rewriting leaves the text as it is: it holds no square, curly or angle bracket and no
/// hyphen.
bool IsNormal(std::string_view name);
/// The rewriting: square, curly and angle brackets become parentheses, every hyphen a colon.
void Normalize(Basis::StringBase<char> &name);
/// The text before the first "(" of a rewritten name that has both brackets and no comma, else all.
std::string_view BaseName(std::string_view name);

/// Whether the name ends in the mark of dummy signals, in any case.
bool EndsInDummyTag(std::string_view name);
inline constexpr char const *DUMMY_TAG = "_DUMMY";

/// What ends the base name of a signal that the library makes for a pin.
inline constexpr char const *CONSTANT_TAG = "_CONST_SIGNAL";
inline constexpr char const *OPEN_TAG = "_openSignal";
/// The base name of that signal: INSTANCE_PIN and the tag.
Basis::StringBase<char> PinSignalBase(std::string_view instance, std::string_view pinBase,
                                      std::string_view tag);

/// A name as objects bear it: the text itself if it is normal, else a rewritten copy. Null counts
/// as empty. Valid as long as this object and the text.
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

/// A name as the tables know it, with its hash.
class Key : public NormalName {
public:
    explicit Key(char const *name) : Key(std::string_view(name ? name : "")) {}
    explicit Key(std::string_view name) : NormalName(name), hash(SeededHashIgnoringCase(View())) {}
    std::uint32_t GetHash() const { return hash; }

private:
    std::uint32_t hash;
};

} // namespace Vesk_Hdl::Names
