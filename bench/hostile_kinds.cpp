// Command files that are made to be slow. Each kind repeats one thing; the names say which.

#include "bench/hostile_kinds.h"

#include <algorithm>
#include <ostream>
#include <stdexcept>

#include "bench/hostile_parts.h"

namespace {

using Part = HostileKind::Part;

/// A name that writes a number in pairs of letters. The tables of the library hash a text as 33
/// times the hash before plus the letter, in upper case, and both pairs add the same to it.
std::string CollidingName(long number) {
    static_assert('A' * 33 + 'Y' == 'B' * 33 + '8');
    constexpr int DIGITS = 20;
    std::string name = "N";
    for (int digit = 0; digit < DIGITS; ++digit, number /= 2)
        name += number % 2 == 0 ? "AY" : "B8";
    return name;
}

constexpr int LETTERS = 16; ///< of a long name for each of n

/// Writes what a placeholder is replaced by.
void WriteMark(std::ostream &lines, std::string_view mark, long i, long n) {
    if (mark == "i")
        lines << i;
    else if (mark == "i+1")
        lines << i + 1;
    else if (mark == "n")
        lines << n;
    else if (mark == "n-i")
        lines << n - i;
    else if (mark == "i%100")
        lines << i % 100;
    else if (mark == "clash")
        lines << CollidingName(i);
    else if (mark == "long")
        lines << std::string(static_cast<std::size_t>(n) * LETTERS, 'x');
    else
        throw std::invalid_argument("no such mark: " + std::string(mark));
}

void WriteText(std::ostream &lines, std::string_view text, long i, long n) {
    while (!text.empty()) {
        std::size_t const open = std::min(text.find('{'), text.size());
        lines << text.substr(0, open);
        text.remove_prefix(open);
        if (text.empty())
            return;
        std::size_t const close = text.find('}');
        WriteMark(lines, text.substr(1, close - 1), i, n);
        text.remove_prefix(close + 1);
    }
}

std::vector<HostileKind> AllKinds() {
    std::vector<HostileKind> kinds = NetKinds();
    for (std::vector<HostileKind> const &more : {TextKinds(), CommandKinds()})
        kinds.insert(kinds.end(), more.begin(), more.end());
    return kinds;
}

} // namespace

std::vector<HostileKind> const &GetHostileKinds() {
    static std::vector<HostileKind> const kinds = AllKinds();
    return kinds;
}

HostileKind const *FindHostileKind(std::string_view name) {
    std::vector<HostileKind> const &kinds = GetHostileKinds();
    auto const found = std::find_if(kinds.begin(), kinds.end(),
                                    [name](HostileKind const &kind) { return kind.name == name; });
    return found == kinds.end() ? nullptr : &*found;
}

void WriteHostile(std::ostream &lines, HostileKind const &kind, long n) {
    for (Part const &part : kind.parts) {
        long const times = part.times == Part::ONCE ? 1 : part.times == Part::EACH ? n : n / 100;
        for (long i = 0; i < times; ++i)
            WriteText(lines, part.text, i, n);
    }
}
