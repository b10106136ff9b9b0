// Command files that are made to be slow. Each kind repeats one thing; the names say which.

#include "bench/hostile_kinds.h"

#include <algorithm>
#include <cctype>
#include <ostream>
#include <sstream>
#include <stdexcept>

#include "vesk_hdl/Vesk_Hdl.h"

namespace {

using Part = HostileKind::Part;

Part Once(std::string text) { return {Part::ONCE, std::move(text)}; }
Part Each(std::string text) { return {Part::EACH, std::move(text)}; }
Part EachHundredth(std::string text) { return {Part::EACH_HUNDREDTH, std::move(text)}; }

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

/// What a placeholder stands for.
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

// Lines that many kinds begin with.
std::string const BUFFER = "ADD COMPONENT C\nADD PIN C I in\nADD PIN C O out\n";
std::string const ONE_BUFFER = BUFFER + "ADD INSTANCE C U\n";
std::string const VECTOR = "ADD COMPONENT V\nADD PIN V I(7:0) in\nADD PIN V O(7:0) out\n";
std::string const ONE_VECTOR = VECTOR + "ADD INSTANCE V W\n";
std::string const WRITE = "WRITE VHDL -NOHEADER /dev/null\nWRITE VERILOG -NOHEADER /dev/null\n";
std::string const BLANKS = "\"two words of a value that is long enough to end behind column 80, "
                           "where lines are folded\"";

constexpr char ALIGNED[] = "each line is padded to the longest name";
constexpr char WRITTEN_OFTEN[] = "the whole design is asked for n times";
constexpr char REPEATED[] = "Verilog repeats it at each instance";
constexpr char COPIED[] = "each instance has a copy of each pin";

std::vector<HostileKind> const ROWS = {
    // One line.
    {"line-new-nets",
     "nets that one line names first",
     {Once(ONE_VECTOR + "CONNECT SIGNAL a"), Each(",n{i}"), Once(" W.I(7:0)\n")}},
    {"line-new-bits",
     "bits without a bus that one line names first",
     {Once(ONE_VECTOR + "CONNECT SIGNAL a"), Each(",B({i})"), Once(" W.I(7:0)\n")}},
    {"line-new-bits-of-bus",
     "bits of a bus that one line names first",
     {Once(ONE_VECTOR + "ADD PORT B({n}:0) in\nCONNECT SIGNAL a"), Each(",B({i})"),
      Once(" W.I(7:0)\n")}},
    {"line-new-buses",
     "buses that one line names first",
     {Once(ONE_VECTOR + "CONNECT SIGNAL a"), Each(",B{i}(3:0)"), Once(" W.I(7:0)\n")}},
    {"line-new-slices",
     "slices of a bus that one line names first",
     {Once(ONE_VECTOR + "ADD SIGNAL B({n}:0)\nCONNECT SIGNAL a"), Each(",B({i+1}:{i})"),
      Once(" W.I(7:0)\n")}},
    {"line-reversed-slices",
     "slices against the direction of their bus in one line",
     {Once(ONE_VECTOR + "ADD SIGNAL B({n}:0)\nCONNECT SIGNAL a"), Each(",B({i}:{i+1})"),
      Once(" W.I(7:0)\n")}},
    {"line-clashing-nets",
     "nets with one hash in one line",
     {Once(ONE_VECTOR + "CONNECT SIGNAL a"), Each(",{clash}"), Once(" W.I(7:0)\n")}},
    {"line-one-net",
     "times that one line names one net",
     {Once(ONE_VECTOR + "CONNECT SIGNAL a"), Each(",a"), Once(" W.I(7:0)\n")}},
    {"line-refused", "words of a refused line", {Once("ADD PIN"), Each(" C{i}"), Once("\n")}},
    {"line-refused-keyword", "letters of an unknown command, times 16", {Once("FOO {long} x\n")}},
    {"line-refused-compound",
     "nets that a refused line names first",
     {Once("CONNECT SIGNAL a"), Each(",n{i}"), Once(" nobody.I\n")}},
    {"line-refused-pin",
     "members of a compound beside a pin that is unknown",
     {Once(ONE_BUFFER + "CONNECT SIGNAL a"), Each(",n{i}"), Once(" U.X\n")}},
    {"line-tokens", "words that nobody reads", {Once("NOOP"), Each(" w{i}"), Once("\n")}},
    {"line-quoted-tokens", "quoted words", {Once("ADD NOTES"), Each(" \"w {i}\""), Once("\n")}},
    {"line-open-quotes",
     "quotes that are never closed",
     {Once("ADD NOTES"), Each(" \"w{i}'"), Once("\n")}},
    {"line-blanks", "blanks", {Once("NOOP"), Each("                "), Once("x\n")}},
    {"line-commas",
     "empty members of a compound",
     {Once("CONNECT SIGNAL a"), Each(",,"), Once("b nobody.I\n")}},
    {"line-brackets", "brackets of a name", {Once("ADD SIGNAL a"), Each("([<"), Once("\n")}},
    {"line-colons", "colons of a range", {Once("ADD SIGNAL a("), Each("1:--"), Once(")\n")}},
    {"line-points", "points of a pin", {Once("CONNECT SIGNAL a U"), Each("....."), Once("\n")}},
    {"line-digits", "digits of a bound", {Once("ADD SIGNAL a("), Each("00000000"), Once("7:0)\n")}},
    {"line-backslashes", "backslashes", {Once("ADD SIGNAL a"), Each("\\\\,"), Once("\n")}},
    {"line-comment-marks",
     "comment marks in a note",
     {Once("ADD NOTES"), Each(" -- /* // */"), Once("\n")}},
    {"line-constant",
     "digits of a constant, times 16",
     {Once("ADD SIGNAL a(7:0)\nASSIGN CONSTANT a(7:0) 8:h:{long}\n")}},
    {"line-bit-vector",
     "digits of a value, times 16",
     {Once("ADD MODULE ATTRIBUTE -TYPE=BitVector A 8:h:{long}\n"
           "SET MODULE ATTRIBUTE OPTION A -GENERIC=SYN\n")}},
    {"line-one-bit-slices",
     "slices of one bit in one line",
     {Once(ONE_VECTOR + "ADD SIGNAL B({n}:0)\nCONNECT SIGNAL a"), Each(",B({i}:{i})"),
      Once(" W.I(7:0)\n")}},
    {"lines-empty", "empty lines", {Each("\n\n\n\n\n\n\n\n")}},
    {"lines-refused", "lines that no command begins", {Each("ADD COMPONET x{i}\n")}},
    {"lines-refused-nets", "lines with an unknown bit", {Each("ASSIGN CONSTANT x({i}) 1\n")}},
    {"lines-taken-names",
     "lines with a name that is taken",
     {Once("ADD SIGNAL S\n"), Each("ADD COMPONENT s\n")}},
    {"lines-refused-options",
     "lines with a word that no option has",
     {Once("ADD SIGNAL S\nADD SIGNAL ATTRIBUTE S A v\n"),
      Each("SET SIGNAL ATTRIBUTE OPTION S A -GENERIC=x{i}\n")}},

    // Compounds, buses and their widening.
    {"compound-in-ports",
     "in ports in a compound that an inner net leads",
     {Once(VECTOR), Each("ADD PORT p{i} in\n"), Once("ADD INSTANCE V W\nCONNECT SIGNAL n"),
      Each(",p{i}"), Once(" W.O(7:0)\n")}},
    {"compound-out-ports",
     "out ports in a compound that is read",
     {Once(VECTOR), Each("ADD PORT p{i} out\n"), Once("ADD INSTANCE V W\nCONNECT SIGNAL n"),
      Each(",p{i}"), Once(" W.I(7:0)\n")}},
    {"compounds-in-port",
     "compounds with one in port, all driven",
     {Once(VECTOR + "ADD PORT p in\n"),
      Each("ADD INSTANCE V W{i}\nCONNECT SIGNAL n{i},p W{i}.O(7:0)\n")}},
    {"compounds-read-ports",
     "compounds with an out port each, all ports read back",
     {Once(BUFFER + VECTOR),
      Each("ADD PORT p{i} out\nADD INSTANCE C U{i}\nCONNECT SIGNAL p{i} U{i}.I\n"
           "ADD INSTANCE V W{i}\nCONNECT SIGNAL p{i},n{i} W{i}.I(7:0)\n")},
     16000},
    {"compound-read-ports",
     "out ports read back, all in one compound",
     {Once(BUFFER + VECTOR),
      Each("ADD PORT p{i} out\nADD INSTANCE C U{i}\nCONNECT SIGNAL p{i} U{i}.I\n"),
      Once("ADD INSTANCE V W\nCONNECT SIGNAL p0"), Each(",p{i}"), Once(" W.I(7:0)\n")},
     32000},
    {"compound-widens-bus",
     "members of one compound that widen one bus",
     {Once(ONE_VECTOR + "CONNECT SIGNAL a"), Each(",D({i+1}:0)"), Once(" W.I(7:0)\n")}},
    {"compounds-share-widened-bus",
     "compounds that share a bus and widen it",
     {Once(VECTOR), Each("ADD INSTANCE V W{i}\nCONNECT SIGNAL a{i},D({i+1}:0) W{i}.I(7:0)\n")}},
    {"widen",
     "lines that widen one bus",
     {Once(ONE_VECTOR), Each("CONNECT SIGNAL D({i+1}:0) W.I(7:0)\n")}},
    {"widen-own-pins",
     "lines that widen one bus, each with a pin of its own",
     {Once(VECTOR), Each("ADD INSTANCE V W{i}\nCONNECT SIGNAL D({i+1}:0) W{i}.I(7:0)\n")}},
    {"widen-under-bits",
     "bits on pins, then as many lines that widen their bus",
     {Once(BUFFER + ONE_VECTOR + "ADD SIGNAL D(1:0)\n"),
      Each("ADD INSTANCE C U{i}\nCONNECT SIGNAL D({i}) U{i}.I\n"),
      Each("CONNECT SIGNAL D({i+1}:0) W.I(7:0)\n")},
     32000},
    {"widen-under-slices",
     "slices on pins, then as many lines that widen their bus",
     {Once(VECTOR + "ADD SIGNAL D(2:0)\n"),
      Each("ADD INSTANCE V U{i}\nCONNECT SIGNAL D({i+1}:{i}) U{i}.I(7:0)\n"),
      Once("ADD INSTANCE V W\n"), Each("CONNECT SIGNAL D({i+1}:0) W.I(7:0)\n")},
     32000},
    {"widen-under-pins",
     "pins on one bus, then as many lines that widen it",
     {Once(VECTOR + "ADD SIGNAL D(7:0)\n"),
      Each("ADD INSTANCE V U{i}\nCONNECT SIGNAL D(7:0) U{i}.I(7:0)\n"), Once("ADD INSTANCE V W\n"),
      Each("CONNECT SIGNAL D({i+1}:0) W.I(7:0)\n")},
     32000},
    {"widen-tied",
     "tied buses of pins that are widened",
     {Once(VECTOR), Each("ADD INSTANCE V U{i}\nASSIGN CONSTANT U{i}.I(7:0) 8:h:5A\n"),
      Each("CONNECT SIGNAL U{i}_I_CONST_SIGNAL(15:0) n{i}\n")},
     32000},
    {"widen-buses",
     "buses that are widened once",
     {Each("ADD SIGNAL D{i}(3:0)\n"), Each("CONNECT SIGNAL D{i}(7:0) n{i}\n")}},
    {"widen-assigned",
     "assignments to a bus, then as many lines that widen it",
     {Once(ONE_VECTOR + "ADD SIGNAL D(7:0)\n"), Each("CONNECT SIGNAL D(7:0) s{i}(7:0)\n"),
      Each("CONNECT SIGNAL D({i+1}:0) W.I(7:0)\n")},
     32000},
    {"widen-assigning",
     "assignments from a bus, then as many lines that widen it",
     {Once(ONE_VECTOR + "ADD SIGNAL D(7:0)\n"), Each("CONNECT SIGNAL s{i}(7:0) D(7:0)\n"),
      Each("CONNECT SIGNAL D({i+1}:0) W.I(7:0)\n")},
     32000},
    {"moved-pins-widened",
     "pins that are moved between nets, then buses that are widened",
     {Once(BUFFER), Each("ADD INSTANCE C U{i}\nCONNECT SIGNAL a U{i}.I\nCONNECT SIGNAL b U{i}.I\n"),
      Each("ADD SIGNAL D{i}(3:0)\nCONNECT SIGNAL D{i}(7:0) n{i}\n")},
     16000},
    {"moved-bus-pins-widened",
     "pins that leave a bus, which is widened as often",
     {Once(VECTOR + "ADD SIGNAL D(7:0)\n"),
      Each("ADD INSTANCE V U{i}\nCONNECT SIGNAL D(7:0) U{i}.I(7:0)\n"
           "CONNECT SIGNAL E{i}(7:0) U{i}.I(7:0)\n"),
      Once("ADD INSTANCE V W\n"), Each("CONNECT SIGNAL D({i+1}:0) W.I(7:0)\n")},
     16000},
    {"bus-bit-by-bit",
     "bits of one bus, each on a pin and read",
     {Once(BUFFER + "ADD PORT D({n}:0) out\n"),
      Each("ADD INSTANCE C U{i}\nCONNECT SIGNAL D({i}) U{i}.I\n")}},
    {"bits-outside",
     "bits outside of their bus",
     {Once(BUFFER + "ADD SIGNAL D(1:0)\n"),
      Each("ADD INSTANCE C U{i}\nCONNECT SIGNAL D({i+1}) U{i}.I\n")}},
    {"bits-case",
     "bits in another case than their bus",
     {Once(BUFFER + "ADD SIGNAL D({n}:0)\n"),
      Each("ADD INSTANCE C U{i}\nCONNECT SIGNAL d({i}) U{i}.I\n")}},
    {"bits-constant",
     "bits of one bus with a constant each",
     {Once("ADD SIGNAL D({n}:0)\n"), Each("ASSIGN CONSTANT D({i}) 1\n")}},
    {"bits-assigned",
     "bits of one bus that are assigned from bits of another",
     {Once("ADD SIGNAL D({n}:0)\nADD SIGNAL E({n}:0)\n"), Each("CONNECT SIGNAL D({i}) E({i})\n")}},
    {"slices-on-pins",
     "overlapping slices of one bus on pins",
     {Once(VECTOR + "ADD SIGNAL D({n}:0)\n"),
      Each("ADD INSTANCE V U{i}\nCONNECT SIGNAL D({i+1}:{i}) U{i}.O(7:0)\n")},
     32000},
    {"wide-slices-on-pins",
     "slices of one bus, each one bit longer, on pins",
     {Once(VECTOR + "ADD SIGNAL D({n}:0)\n"),
      Each("ADD INSTANCE V U{i}\nCONNECT SIGNAL D({i+1}:1) U{i}.O(7:0)\n")},
     32000},
    {"bits-then-net",
     "scalars with brackets beside a bus",
     {Each("ADD SIGNAL D({i})\n"), Once("ADD SIGNAL D({n}:0)\n")}},
    {"two-range-buses",
     "buses and as many nets of their base name",
     {Each("ADD SIGNAL D{i}(3:0)\nADD SIGNAL D{i}\n")}},

    // Pins and nets.
    {"net-readers",
     "pins that read one net",
     {Once(BUFFER), Each("ADD INSTANCE C U{i}\n"
                         "CONNECT SIGNAL a U{i}.I\n")}},
    {"net-drivers",
     "pins that drive one net",
     {Once(BUFFER), Each("ADD INSTANCE C U{i}\n"
                         "CONNECT SIGNAL a U{i}.O\n")}},
    {"port-drivers",
     "pins that drive one in port",
     {Once(BUFFER + "ADD PORT a in\n"), Each("ADD INSTANCE C U{i}\nCONNECT SIGNAL a U{i}.O\n")}},
    {"port-readers",
     "pins that read one out port",
     {Once(BUFFER + "ADD PORT a out\n"), Each("ADD INSTANCE C U{i}\nCONNECT SIGNAL a U{i}.I\n")}},
    {"pin-again",
     "lines that connect one pin to one net again",
     {Once(ONE_BUFFER), Each("CONNECT SIGNAL a U.I\n")}},
    {"pin-moves",
     "nets that one pin moves on to",
     {Once(ONE_BUFFER), Each("CONNECT SIGNAL a{i} U.I\n")}},
    {"pin-swings",
     "lines that move one pin between two nets",
     {Once(ONE_BUFFER), Each("CONNECT SIGNAL a U.I\nCONNECT SIGNAL b U.I\n")}},
    {"pins-move",
     "pins that move from an out port, which is read",
     {Once(BUFFER + "ADD PORT a out\n"),
      Each("ADD INSTANCE C U{i}\nCONNECT SIGNAL a U{i}.I\nCONNECT SIGNAL b{i} U{i}.I\n")},
     32000},
    {"pins-move-twice",
     "pins that move from in to out ports",
     {Once(BUFFER), Each("ADD PORT p{i} out\nADD PORT q{i} in\nADD INSTANCE C U{i}\n"
                         "CONNECT SIGNAL p{i} U{i}.I\nCONNECT SIGNAL q{i} U{i}.O\n"
                         "CONNECT SIGNAL q{i} U{i}.I\nCONNECT SIGNAL p{i} U{i}.O\n")},
     16000},
    {"component-pins",
     "pins of one component and its instance",
     {Once("ADD COMPONENT C\n"), Each("ADD PIN C P{i} in\n"), Once("ADD INSTANCE C U\n"),
      Each("CONNECT SIGNAL n{i} U.P{i}\n")}},
    {"component-pins-backwards",
     "pins, declared and connected in falling order",
     {Once("ADD COMPONENT C\n"), Each("ADD PIN C P{n-i} in\n"), Once("ADD INSTANCE C U\n"),
      Each("CONNECT SIGNAL n{i} U.P{n-i}\n")}},
    {"component-bit-pins",
     "bits of one bus as pins of a component",
     {Once("ADD COMPONENT C\n"), Each("ADD PIN C P({i}) in\n"), Once("ADD INSTANCE C U\n"),
      Each("CONNECT SIGNAL n{i} U.P({i})\n")}},
    {"pins-after-write",
     "pins that a write sorts before they are connected",
     {Once("ADD COMPONENT C\n"), Each("ADD PIN C P{n-i} in\n"), Once("ADD INSTANCE C U\n" + WRITE),
      Each("CONNECT SIGNAL n{i} U.P{i+1}\n")}},
    {"tied-pins-after-write",
     "pins that a write sorts before they are tied",
     {Once("ADD COMPONENT C\n"), Each("ADD PIN C P{n-i} in\n"), Once("ADD INSTANCE C U\n" + WRITE),
      Each("ASSIGN CONSTANT U.P{i+1} 1\n")}},
    {"late-pins",
     "instances of a component with n/100 pins, and as many pins that come later",
     {Once("ADD COMPONENT C\n"), EachHundredth("ADD PIN C P{i} in\n"),
      Each("ADD INSTANCE C U{i}\n"), Each("ADD PIN C Q{i} in\n")},
     8000,
     COPIED},
    {"late-pins-of-bare",
     "instances of a component without pins, and as many pins that come later",
     {Once("ADD COMPONENT C\n"), Each("ADD INSTANCE C U{i}\n"), Each("ADD PIN C Q{i} in\n")}},
    {"late-pins-in-turn",
     "pins and instances of one component in turn",
     {Once("ADD COMPONENT C\n"), Each("ADD PIN C Q{i} in\nADD INSTANCE C U{i}\n")},
     8000,
     COPIED},
    {"open-pins",
     "open pins that a write gives nets, and a line behind it",
     {Once(BUFFER + "Set Open Pin false\n"), Each("ADD INSTANCE C U{i}\n"),
      Once(WRITE + "ADD SIGNAL z\n" + WRITE)}},
    {"unknown-pins",
     "unknown pins of an instance with n pins",
     {Once("ADD COMPONENT C\n"), Each("ADD PIN C P{i} in\n"), Once("ADD INSTANCE C U\n"),
      Each("CONNECT SIGNAL a U.Q{i}\n")}},
    {"unknown-component-pins",
     "comments for unknown pins of a component with n pins",
     {Once("ADD COMPONENT C\n"), Each("ADD PIN C P{i} in\n"),
      Each("ADD COMPONENT PIN COMMENT C.Q{i} text\n")}},
    {"unknown-pins-tied",
     "unknown pins to be tied, of an instance with n pins",
     {Once("ADD COMPONENT C\n"), Each("ADD PIN C P{i} in\n"), Once("ADD INSTANCE C U\n"),
      Each("ASSIGN CONSTANT U.Q{i} 1\n")}},
    {"pin-widths",
     "pins that differ in width from their net",
     {Once(BUFFER), Each("ADD INSTANCE C U{i}\nCONNECT SIGNAL D(7:0) U{i}.I\n")}},
    {"ties", "tied pins", {Once(BUFFER), Each("ADD INSTANCE C U{i}\nASSIGN CONSTANT U{i}.I 1\n")}},
    {"tie-again",
     "constants for one pin",
     {Once(ONE_BUFFER), Each("ASSIGN CONSTANT U.I 1\nASSIGN CONSTANT U.I 0\n")}},
    {"ties-shared",
     "instances whose ties have one name",
     {Once("ADD COMPONENT C\nADD PIN C B_I in\nADD COMPONENT D\nADD PIN D I in\n"),
      Each("ADD INSTANCE C A{i}\nADD INSTANCE D A{i}_B\nASSIGN CONSTANT A{i}.B_I 1\n"
           "ASSIGN CONSTANT A{i}_B.I 0\n")},
     32000},
    {"assigned-net", "nets that one net is assigned from", {Each("CONNECT SIGNAL a b{i}\n")}},
    {"assigning-net", "nets that are assigned from one net", {Each("CONNECT SIGNAL b{i} a\n")}},
    {"assigned-chain",
     "nets that are assigned from the one before",
     {Each("CONNECT SIGNAL b{i+1} b{i}\n")}},
    {"assigned-again",
     "times that one net is assigned from another",
     {Each("CONNECT SIGNAL a b\n")}},
    {"assigned-itself",
     "nets that are assigned from themselves",
     {Each("CONNECT SIGNAL a{i} a{i}\n")}},
    {"dummies",
     "out ports that are read, after a write and again",
     {Once(BUFFER), Each("ADD PORT p{i} out\nADD INSTANCE C U{i}\nCONNECT SIGNAL p{i} U{i}.I\n"),
      Once(WRITE), Each("CONNECT SIGNAL p{i} U{i}.O\n"), Once(WRITE)},
     16000},
    {"dummy-names",
     "out ports called ..._DUMMY that are read",
     {Once(BUFFER), Each("ADD PORT p{i}_DUMMY out\nADD INSTANCE C U{i}\n"
                         "CONNECT SIGNAL p{i}_DUMMY U{i}.I\n")},
     32000},
    {"dummy-taken",
     "out ports that are read, with the names of their dummies taken",
     {Once(BUFFER), Each("ADD PORT p{i} out\nADD SIGNAL p{i}_DUMMY\nADD INSTANCE C U{i}\n"
                         "CONNECT SIGNAL p{i} U{i}.I\n")},
     32000},
    {"other-spelling",
     "nets that are spelled in two ways",
     {Once(BUFFER), Each("ADD INSTANCE C U{i}\nCONNECT SIGNAL ab{i} U{i}.I\n"
                         "CONNECT SIGNAL AB{i} U{i}.O\n")},
     32000},
    {"bracketed-bits",
     "bits in brackets that make scalars",
     {Once("ADD SIGNAL D({n}:0)\n"), Each("CONNECT SIGNAL D[{i}] a\n")}},
    {"reserved-names",
     "components with a pin that has a reserved name",
     {Each("ADD COMPONENT C{i}\nADD PIN C{i} signal in\nADD INSTANCE C{i} U{i}\n")},
     32000},
    {"illegal-names", "nets with illegal names", {Each("ADD SIGNAL 1{i}$\n")}},

    // Names that are long, or equal up to their end.
    {"long-name-beside",
     "nets beside one with a name as long as all of them",
     {Once("ADD SIGNAL {long}\n"), Each("ADD SIGNAL n{i}\n")},
     16000,
     ALIGNED},
    {"long-names-sorted",
     "names with 100 letters in common",
     {Each("ADD SIGNAL " + std::string(100, 'a') + "{i}\n")}},
    {"long-compounds",
     "pins on one compound with a long name of its own",
     {Once(VECTOR + "ADD INSTANCE V W\nCONNECT SIGNAL a"), Each(",n{i}"), Once(" W.I(7:0)\n"),
      Each("ADD INSTANCE V W{i}\n")}},
    {"long-instance-findings",
     "open inputs of an instance with a long name",
     {Once("ADD COMPONENT C\n"), Each("ADD PIN C P{i} in\n"), Once("ADD INSTANCE C {long}\n")},
     8000,
     "each finding names its pin with the instance"},

    // Names with one hash.
    {"clashing-nets", "nets with one hash", {Each("ADD SIGNAL {clash}\n")}},
    {"clashing-buses", "buses with one hash", {Each("ADD SIGNAL {clash}(3:0)\n")}},
    {"clashing-components",
     "components with one hash",
     {Each("ADD COMPONENT {clash}\nADD INSTANCE {clash} U{i}\n")}},
    {"clashing-instances",
     "instances with one hash",
     {Once(BUFFER), Each("ADD INSTANCE C {clash}\nCONNECT SIGNAL n{i} {clash}.I\n")}},
    {"clashing-pins",
     "pins with one hash",
     {Once("ADD COMPONENT C\n"), Each("ADD PIN C {clash} in\n"), Once("ADD INSTANCE C U\n"),
      Each("CONNECT SIGNAL n{i} U.{clash}\n")}},
    {"clashing-bus-pins",
     "pins of several bits with one hash",
     {Once("ADD COMPONENT C\n"), Each("ADD PIN C {clash}(1:0) in\n"), Once("ADD INSTANCE C U\n"),
      Each("CONNECT SIGNAL n{i}(1:0) U.{clash}(1:0)\n")}},
    {"clashing-ports",
     "out ports with one hash that are read",
     {Once(BUFFER), Each("ADD PORT {clash} out\nADD INSTANCE C U{i}\n"
                         "CONNECT SIGNAL {clash} U{i}.I\n")},
     32000},
    {"clashing-bus-ports",
     "out ports of several bits with one hash that are read",
     {Once(VECTOR), Each("ADD PORT {clash}(7:0) out\nADD INSTANCE V U{i}\n"
                         "CONNECT SIGNAL {clash}(7:0) U{i}.I(7:0)\n")},
     32000},
    {"clashing-attributes",
     "attributes with one hash that are declared",
     {Each("ADD SIGNAL s{i}\nADD SIGNAL ATTRIBUTE s{i} {clash} v\n"
           "SET SIGNAL ATTRIBUTE OPTION s{i} {clash} -SYNATTR=ASSIGN\n")},
     32000},
    {"clashing-attributes-of-one",
     "attributes with one hash of one net",
     {Once("ADD SIGNAL S\n"), Each("ADD SIGNAL ATTRIBUTE S {clash} v\n"
                                   "SET SIGNAL ATTRIBUTE OPTION S {clash} -SYNATTR=ASSIGN\n")},
     32000},
    {"clashing-generics",
     "generics with one hash of a component with an instance",
     {Once(ONE_BUFFER), Each("ADD COMPONENT ATTRIBUTE C {clash} v\n"
                             "SET COMPONENT ATTRIBUTE OPTION C {clash} -GENERIC=SYN\n")},
     32000},
    {"clashing-refused", "unknown names with one hash", {Each("ADD INSTANCE {clash} u{i}\n")}},

    // Attributes, comments and options.
    {"generics-blanks",
     "generics of the design with blanks in their values",
     {Each("ADD MODULE ATTRIBUTE A{i} " + BLANKS +
           "\nSET MODULE ATTRIBUTE OPTION A{i} -GENERIC=SYN\n")},
     32000},
    {"component-generics-blanks",
     "generics of a component with blanks in their values",
     {Once(ONE_BUFFER), Each("ADD COMPONENT ATTRIBUTE C A{i} " + BLANKS +
                             "\nSET COMPONENT ATTRIBUTE OPTION C A{i} -GENERIC=NOSYN\n")},
     32000},
    {"instance-attributes-blanks",
     "generics of an instance with blanks in their values",
     {Once(ONE_BUFFER), Each("ADD INSTANCE ATTRIBUTE U A{i} " + BLANKS +
                             "\nSET INSTANCE ATTRIBUTE OPTION U A{i} -GENERIC=SYN\n")},
     32000},
    {"net-attributes-blanks",
     "attributes of a net with blanks in their values",
     {Once("ADD SIGNAL S\n"), Each("ADD SIGNAL ATTRIBUTE S A{i} " + BLANKS +
                                   "\nSET SIGNAL ATTRIBUTE OPTION S A{i} -SYNATTR=ASSIGN\n")},
     32000},
    {"generics-and-pins",
     "generics and as many pins of one component",
     {Once("ADD COMPONENT C\n"), Each("ADD PIN C P{i} in\n"),
      Each(
          "ADD COMPONENT ATTRIBUTE C A{i} v\nSET COMPONENT ATTRIBUTE OPTION C A{i} -GENERIC=SYN\n"),
      Once("ADD INSTANCE C U\n")},
     32000},
    {"generics-and-instances",
     "generics of a component and as many instances",
     {Once(BUFFER),
      Each("ADD COMPONENT ATTRIBUTE C A{i} v\n"
           "SET COMPONENT ATTRIBUTE OPTION C A{i} -GENERIC=SYN\n"),
      Each("ADD INSTANCE C U{i}\n")},
     4000,
     REPEATED},
    {"attributes-unwritten",
     "component attributes that are not written, and as many instances",
     {Once(BUFFER), Each("ADD COMPONENT ATTRIBUTE C A{i} v\n"), Each("ADD INSTANCE C U{i}\n")},
     32000},
    {"attributes-unwritten-own",
     "the same with an attribute on each instance",
     {Once(BUFFER), Each("ADD COMPONENT ATTRIBUTE C A{i} v\n"),
      Each("ADD INSTANCE C U{i}\nADD INSTANCE ATTRIBUTE U{i} A{i} w\n"
           "SET INSTANCE ATTRIBUTE OPTION U{i} A{i} -GENERIC=SYN\n")},
     32000},
    {"attributes-hidden",
     "generics of a component and of each of two instances",
     {Once(ONE_BUFFER + "ADD INSTANCE C T\n"),
      Each("ADD COMPONENT ATTRIBUTE C A{i} v\nSET COMPONENT ATTRIBUTE OPTION C A{i} -GENERIC=SYN\n"
           "ADD INSTANCE ATTRIBUTE U A{i} v\nSET INSTANCE ATTRIBUTE OPTION U A{i} -GENERIC=SYN\n"
           "ADD INSTANCE ATTRIBUTE T A{i} w\nSET INSTANCE ATTRIBUTE OPTION T A{i} -GENERIC=SYN\n")},
     16000},
    {"attributes-inherited",
     "attributes of instances with the values of their component",
     {Once(BUFFER + "ADD COMPONENT ATTRIBUTE C A v\n"
                    "SET COMPONENT ATTRIBUTE OPTION C A -SYNATTR=ASSIGN\n"),
      Each("ADD INSTANCE C U{i}\nADD INSTANCE ATTRIBUTE U{i} A v\n"
           "SET INSTANCE ATTRIBUTE OPTION U{i} A -SYNATTR=ASSIGN\n")},
     32000},
    {"attributes-copied",
     "attributes that the instances copy from their component",
     {Once(BUFFER + "ADD COMPONENT ATTRIBUTE C A v\n"),
      Each("ADD INSTANCE C U{i}\nSET INSTANCE ATTRIBUTE VALUE U{i} A w\n")}},
    {"pin-attributes",
     "attributes of a pin and as many instances",
     {Once("ADD COMPONENT C\nADD PIN C I in\n"), Each("ADD COMPONENT PIN ATTRIBUTE C.I A{i} v\n"),
      Each("ADD INSTANCE C U{i}\n")},
     4000,
     "each instance has a copy of each attribute of a pin"},
    {"attributes-without-type",
     "attributes of a type without a name",
     {Once("ADD SIGNAL S\nUse AttrType\n"),
      Each("ADD SIGNAL ATTRIBUTE S -TYPE=User A{i} v\n"
           "SET SIGNAL ATTRIBUTE OPTION S A{i} -SYNATTR=ASSIGN\n")},
     32000},
    {"attributes-like-nets",
     "attributes called like nets",
     {Each("ADD SIGNAL s{i}\nADD SIGNAL ATTRIBUTE s{i} s{i} v\n"
           "SET SIGNAL ATTRIBUTE OPTION s{i} s{i} -SYNATTR=ASSIGN\n")},
     32000},
    {"macro-init",
     "instances with an INIT in a macro",
     {Once("SET NETLIST NAME MORVANE_x\nADD MODULE ATTRIBUTE INIT v\n"
           "SET MODULE ATTRIBUTE OPTION INIT -GENERIC=SYN\n" +
           BUFFER),
      Each("ADD INSTANCE C U{i}\nADD INSTANCE ATTRIBUTE U{i} INIT v\n"
           "SET INSTANCE ATTRIBUTE OPTION U{i} INIT -GENERIC=NOSYN\n")},
     32000},
    {"component-comments",
     "comments of a component and as many instances",
     {Once(BUFFER), Each("ADD COMPONENT COMMENT C c{i}\n"), Each("ADD INSTANCE C U{i}\n")},
     4000,
     REPEATED},
    {"box-types",
     "components of the vendor's library",
     {Each("ADD COMPONENT C{i}\nADD COMPONENT ATTRIBUTE C{i} Level ORVANE\nADD INSTANCE C{i} "
           "U{i}\n")},
     32000},
    {"libraries-and-name",
     "libraries and a design called like the last one",
     {Each("ADD LIBRARY L{i}\n"), Once("SET NETLIST NAME L{n}\n")}},
    {"libraries-and-nets",
     "libraries and as many nets called like them",
     {Each("ADD LIBRARY L{i}\nADD USE LIBRARY L{i}.all\n"), Each("ADD PORT L{i} in\n")}},
    {"name-cases",
     "changes of the case of n names",
     {Each("ADD SIGNAL s{i}\n"),
      Once("UPPERCASE siganl\n" + WRITE + "LOWERCASE signal\n" + WRITE)}},

    // Writes and changes in turn.
    {"writes",
     "writes of a small design",
     {Once(ONE_BUFFER + "CONNECT SIGNAL a U.I\n"), Each(WRITE)},
     4000},
    {"writes-and-noops",
     "writes of a small design and lines that change nothing",
     {Once(ONE_BUFFER + "CONNECT SIGNAL a U.I\n"), Each(WRITE + "NOOP\n")},
     4000},
    {"writes-and-changes",
     "writes, each with a line before it",
     {Each("ADD SIGNAL s{i}\n" + WRITE)},
     1000,
     WRITTEN_OFTEN},
    {"changes-and-writes-back",
     "writes of a small design, its pin moved between them",
     {Once(ONE_BUFFER), Each("CONNECT SIGNAL a U.I\n" + WRITE + "CONNECT SIGNAL b U.I\n" + WRITE)},
     2000},
    {"ports-read-after-writes",
     "writes of a design with a port that is read again each time",
     {Once(ONE_BUFFER + "ADD PORT p out\n"), Each("CONNECT SIGNAL p U.I\n" + WRITE)},
     1000,
     "each write makes another dummy signal, and all are written"},
};

// Kinds that follow from the grammar: each command n times on one object, on n objects, and with
// one long word.

struct Placeholder {
    char const *begin; ///< of the word in the grammar
    char const *text;  ///< {o} is the number of the object, or nothing
};

/// The first one that fits counts.
constexpr Placeholder PLACEHOLDERS[] = {
    {"component.pin", "C{o}.P"},
    {"instance.pin", "U{o}.P"},
    {"component", "C{o}"},
    {"instance|siganl", "signal"},
    {"instance|signal", "signal"},
    {"instance", "U{o}"},
    {"signal|instance.pin", "U{o}.P"},
    {"signal", "S{o}"},
    {"[-TYPE", "-TYPE=User"},
    {"attribute", "A"},
    {"setting", "-GENERIC=SYN"},
    {"[setting", "-SYNATTR=ASSIGN"},
    {"polarity", "in"},
    {"[polarity", "in"},
    {"pin", "P"},
    {"[flag", "true"},
    {"[option", ""},
    {"tool", "SYNOPSYS"},
    {"", "v{i}"},
};

std::vector<std::string> WordsOf(std::string const &text) {
    std::istringstream stream(text);
    std::vector<std::string> words;
    for (std::string word; stream >> word;)
        words.push_back(word);
    return words;
}

void Replace(std::string &text, std::string_view mark, std::string_view with) {
    for (std::size_t at = text.find(mark); at != std::string::npos; at = text.find(mark, at))
        text.replace(at, mark.size(), with);
}

/// The words of the command's line. A name that it makes is new in each line, as is the attribute.
std::vector<std::string> LineOf(Vesk_Hdl::CommandHelp const &command) {
    std::string const keyword = command.keyword;
    bool const writes = keyword.rfind("WRITE ", 0) == 0;
    std::vector<std::string> words = {keyword};
    for (std::string const &word : WordsOf(command.grammar))
        for (Placeholder const &placeholder : PLACEHOLDERS)
            if (word.rfind(placeholder.begin, 0) == 0) {
                if (*placeholder.text)
                    words.emplace_back(writes ? "/dev/null" : placeholder.text);
                break;
            }
    std::string const adds = keyword.rfind("ADD ", 0) == 0 ? keyword.substr(4) : "";
    if (adds == "PIN")
        words[2] = "N{i}";
    else if (adds == "INSTANCE")
        words[2] = "N{i}";
    else if (adds == "PORT" || adds == "SIGNAL" || adds == "COMPONENT")
        words[1] = "N{i}";
    else if (adds.find("ATTRIBUTE") != std::string::npos)
        words[words.size() - 2] = "A{i}";
    return words;
}

/// What has to be there for the line to run.
std::string ObjectsFor(Vesk_Hdl::CommandHelp const &command) {
    std::string lines = "ADD COMPONENT C{o}\nADD PIN C{o} P in\nADD INSTANCE C{o} U{o}\n"
                        "ADD SIGNAL S{o}\n";
    std::string const keyword = command.keyword;
    std::size_t const at = keyword.find(" ATTRIBUTE ");
    if (at == std::string::npos)
        return lines;
    std::vector<std::string> const words = LineOf(command);
    bool const ofModule = keyword.find("MODULE") != std::string::npos;
    return lines + "ADD" + keyword.substr(3, at - 3) + " ATTRIBUTE " +
           (ofModule ? "" : words[1] + " ") + "-TYPE=User A v\n";
}

std::string Joined(std::vector<std::string> const &words) {
    std::string line;
    for (std::string const &word : words)
        line += (line.empty() ? "" : " ") + word;
    return line + "\n";
}

void AddKindsOf(Vesk_Hdl::CommandHelp const &command, std::vector<HostileKind> &kinds) {
    std::string name;
    for (char const *c = command.keyword; *c; ++c)
        name += *c == ' ' ? '-' : static_cast<char>(std::tolower(*c));
    std::string const what = std::string("lines ") + command.keyword;
    bool const writes = name.rfind("write-", 0) == 0;
    std::vector<std::string> const words = LineOf(command);
    std::string const objects = ObjectsFor(command);

    std::string one = Joined(words);
    Replace(one, "{o}", "");
    std::string oneObject = objects;
    Replace(oneObject, "{o}", "");
    kinds.push_back({name + ".one",
                     what + " for one object",
                     {Once(oneObject), Each(one)},
                     writes ? 4000L : 64000L});

    std::string many = Joined(words);
    Replace(many, "{o}", "{i}");
    std::string manyObjects = objects;
    Replace(manyObjects, "{o}", "{i}");
    kinds.push_back({name + ".many",
                     what + " for n objects",
                     {Each(manyObjects), Each(many)},
                     writes ? 1000L : 16000L,
                     writes ? WRITTEN_OFTEN : nullptr});

    std::string longest = oneObject;
    for (std::size_t at = 1; at < words.size(); ++at) {
        std::vector<std::string> longWords = words;
        longWords[at] = (longWords[at][0] == '-' ? longWords[at] : "L") + "{long}";
        longest += Joined(longWords);
    }
    Replace(longest, "{o}", "");
    if (words.size() > 1)
        kinds.push_back({name + ".long", what + " with a long word, times 16", {Once(longest)}});
}

std::vector<HostileKind> AllKinds() {
    std::vector<HostileKind> kinds = ROWS;
    for (int i = 0; i < Vesk_Hdl::CommandReference::GetCount(); ++i)
        AddKindsOf(*Vesk_Hdl::CommandReference::GetAt(i), kinds);
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
