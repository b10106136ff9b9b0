#pragma once

#include <string>
#include <utility>
#include <vector>

#include "bench/hostile_kinds.h"

// What the tables of hostile kinds are made of.

inline HostileKind::Part Once(std::string text) {
    return {HostileKind::Part::ONCE, std::move(text)};
}
inline HostileKind::Part Each(std::string text) {
    return {HostileKind::Part::EACH, std::move(text)};
}
inline HostileKind::Part EachHundredth(std::string text) {
    return {HostileKind::Part::EACH_HUNDREDTH, std::move(text)};
}

// Lines that many kinds begin with.
inline std::string const BUFFER = "ADD COMPONENT C\nADD PIN C I in\nADD PIN C O out\n";
inline std::string const ONE_BUFFER = BUFFER + "ADD INSTANCE C U\n";
inline std::string const VECTOR = "ADD COMPONENT V\nADD PIN V I(7:0) in\nADD PIN V O(7:0) out\n";
inline std::string const ONE_VECTOR = VECTOR + "ADD INSTANCE V W\n";
inline std::string const WRITE =
    "WRITE VHDL -NOHEADER /dev/null\nWRITE VERILOG -NOHEADER /dev/null\n";

// Why an output grows faster than the file.
inline constexpr char ALIGNED[] = "each line is padded to the longest name";
inline constexpr char WRITTEN_OFTEN[] = "the whole design is asked for n times";
inline constexpr char REPEATED[] = "Verilog repeats it at each instance";
inline constexpr char COPIED[] = "each instance has a copy of each pin";

/// Many things in one line, compounds, buses that are widened, pins and nets.
std::vector<HostileKind> NetKinds();
/// Long names, names with one hash, attributes, comments, options, and writes in turn with changes.
std::vector<HostileKind> TextKinds();
/// Each command n times on one object, on n objects, and with one long word.
std::vector<HostileKind> CommandKinds();
