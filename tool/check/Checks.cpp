#include "tool/check/Checks.h"

#include <algorithm>

namespace Checks {

namespace {

std::vector<Row> const ROWS = {
    // Names.
    {Id::ILLEGAL_NAME, "illegal-name", BOTH, "has a name that is no legal identifier",
     "use letters, digits and single underscores, with a letter first and no underscore last"},
    {Id::NEGATIVE_BOUND, "negative-bound", BOTH,
     "has a negative bound, and the minus sign becomes a second colon, as every hyphen in a name "
     "does",
     "number the bits from 0 on"},
    {Id::RESERVED_WORD, "reserved-word", BOTH, "is called by a reserved word",
     "choose another name"},
    {Id::NEWER_RESERVED_WORD, "newer-reserved-word", BOTH,
     "is called by a word that later versions of the language reserve",
     "choose another name, or have the file read as VHDL-93 or Verilog-1995"},
    {Id::STANDARD_NAME, "standard-name", VHDL,
     "hides the type of that name, which later declarations need", "choose another name"},
    {Id::LIBRARY_NAME, "library-name", VHDL,
     "is called like a library, which the file names before it",
     "rename the design with SET NETLIST NAME"},
    {Id::HIDDEN_LIBRARY, "hidden-library", VHDL,
     "is called like a library, so that readers refuse the configuration",
     "choose another name, or write SUPPRESS CONFIGURATION true"},
    {Id::OPEN_NAME, "open-name", BOTH,
     "is called open: VHDL reserves the word, and Verilog pins on this net are written empty",
     "choose another name; to leave a pin open, connect nothing to it"},
    {Id::ONE_BIT_DECLARATION, "one-bit-declaration", BOTH,
     "is declared as one bit of a bus, which becomes a scalar with brackets in its name",
     "declare the bus with both bounds; a bit of it needs no declaration"},
    {Id::BIT_WITHOUT_BUS, "bit-without-bus", BOTH,
     "is in a compound as one bit of a bus that does not exist, and becomes a scalar with "
     "brackets in its name",
     "declare the bus first: ADD SIGNAL BASE(LEFT:RIGHT)"},
    {Id::BRACKETED_BIT, "bracketed-bit", BOTH,
     "was typed with other brackets than round ones and became a scalar beside the bus",
     "name bits, slices and compounds with round brackets in CONNECT and ASSIGN lines"},
    {Id::NET_BESIDE_BUS, "net-beside-bus", BOTH,
     "has the base name of a bus, so that one name is declared twice", "rename one of the two"},
    {Id::INSTANCE_NAMED_LIKE_BUS, "instance-named-like-bus", BOTH,
     "has the base name of a bus, so that one name is declared twice", "rename one of the two"},
    {Id::COMPONENT_NAMED_LIKE_BUS, "component-named-like-bus", VHDL,
     "has the base name of a bus, so that one name is declared twice", "rename one of the two"},
    {Id::NETLIST_NAMED_LIKE_COMPONENT, "netlist-named-like-component", BOTH,
     "is called like a component that it uses, and so contains itself",
     "rename the design with SET NETLIST NAME"},
    {Id::ATTRIBUTE_NAMED_LIKE_NET, "attribute-named-like-net", BOTH,
     "is called like something else that is declared in the same place", "rename one of the two"},
    {Id::DUMMY_NAME_TAKEN, "dummy-name-taken", BOTH,
     "is read or driven inside against its direction and gets a dummy signal, whose name is taken",
     "rename what is called ..._DUMMY; after a WRITE line connect to the dummy signal itself"},
    {Id::DUMMY_OF_DUMMY, "dummy-of-dummy", BOTH,
     "is read or driven inside against its direction, and its dummy signal gets the very same name",
     "give the port a name that does not end in _DUMMY"},
    {Id::OPEN_NET_NAME, "open-net-name", BOTH,
     "is open and gets a net of its own, whose name is taken or no legal identifier",
     "connect the pin, or rename what leads to that name"},
    {Id::CASE_DIFFERS, "case-differs", BOTH,
     "is one net in two spellings: names ignore case here and in VHDL, not in Verilog",
     "spell the name alike everywhere, or give the other net another name"},
    {Id::BIT_IN_OTHER_CASE, "bit-in-other-case", VERILOG,
     "is written in another case than its bus, which Verilog takes for another name",
     "spell bits and slices like the bus"},
    {Id::WIDENED_SLICE_CASE, "widened-slice-case", VERILOG,
     "is left of a bus that was widened and keeps its case, while all other names change theirs",
     "declare the bus in its full width, or in the case that is asked for"},

    // Nets.
    {Id::NO_PORTS, "no-ports", VHDL, "has no ports, which makes an empty port clause in VHDL",
     "add a port with ADD PORT"},
    {Id::NO_DRIVER, "no-driver", BOTH, "is read, and nothing drives it",
     "connect an output pin, make it an in port, or assign a signal or constant"},
    {Id::NEVER_READ, "never-read", BOTH, "is driven, and nothing reads it",
     "connect an input pin, make it an out port, or leave the output open"},
    {Id::UNUSED_NET, "unused-net", BOTH, "is connected to nothing", "connect it or leave it out"},
    {Id::SEVERAL_DRIVERS, "several-drivers", BOTH, "has several drivers",
     "leave one of them; if the drivers take turns, switch this check off"},
    {Id::OUTSIDE_BUS, "outside-bus", BOTH, "lies outside of its bus",
     "correct the index, or declare the bus with bounds that hold it"},
    {Id::UNUSED_COMPONENT, "unused-component", BOTH, "has no instances and is not written",
     "leave it out or add an instance"},

    // Pins.
    {Id::ONE_BIT_PIN, "one-bit-pin", VHDL,
     "is declared as one bit of a bus, which no component declaration may do",
     "declare the bus as one pin, or write SUPPRESS COMPONENT true if a package declares the "
     "component"},
    {Id::BRACKETED_PIN, "bracketed-pin", BOTH,
     "was typed with other brackets than round ones and became a scalar pin with brackets in its "
     "name",
     "declare bus pins with round brackets"},
    {Id::REPEATED_PIN, "repeated-pin", BOTH, "has the base name of another pin of its component",
     "declare the bus as one pin"},
    {Id::LATE_PIN, "late-pin", BOTH,
     "was added when the component had instances, which go without it: VHDL refuses an input that "
     "is missing in a port map",
     "declare all pins before the first instance"},
    {Id::OPEN_INPUT, "open-input", VHDL, "is open, which VHDL does not allow an input",
     "connect it, tie it with ASSIGN CONSTANT, or write Set Open Pin false"},
    {Id::PIN_WIDTH, "pin-width", BOTH,
     "differs from its net in width: VHDL refuses that, Verilog cuts or fills up",
     "connect a slice or a compound of the pin's width"},
    {Id::ONE_BIT_SLICE, "one-bit-slice", VHDL,
     "is a slice of one bit, which VHDL does not take here", "name the bit with one index"},
    {Id::REVERSED_SLICE, "reversed-slice", BOTH, "runs against the direction of its bus",
     "turn the bounds round, or name the bits one by one"},

    // Assignments and what the dummy signals do.
    {Id::ASSIGNED_IN_PORT, "assigned-in-port", BOTH, "is an in port, and the design assigns it",
     "make it an out port or assign another net"},
    {Id::READ_OUT_PORT, "read-out-port", VHDL,
     "is an out port, and an assignment reads it, which VHDL-93 does not allow",
     "assign both from an inner net that the driver is connected to"},
    {Id::COMPOUND_ASSIGNMENT, "compound-assignment", BOTH,
     "is a compound, which can be on pins but not in an assignment",
     "assign its members one by one"},
    {Id::BIT_ASSIGNMENT, "bit-assignment", VERILOG,
     "is one bit in an assignment, and keeps its round brackets in Verilog",
     "assign the whole bus, or connect the pin itself to the bit"},
    {Id::ASSIGNMENT_WIDTH, "assignment-width", BOTH,
     "is assigned from a net of another width or kind", "assign slices of equal width"},
    {Id::SELF_ASSIGNMENT, "self-assignment", BOTH, "is assigned from itself", "leave the line out"},
    {Id::OUT_PORT_IN_COMPOUND, "out-port-in-compound", VHDL,
     "holds an out port that an input pin reads; only a compound that begins with an out port is "
     "cured of that",
     "read an inner net instead and assign the port from it"},
    {Id::IN_PORT_IN_COMPOUND, "in-port-in-compound", BOTH,
     "mixes ports so that an in port is driven or an out port is read",
     "connect the ports of one direction through inner nets"},
    {Id::INOUT_IN_COMPOUND, "inout-in-compound", BOTH,
     "cuts an inout port off from its pins: what gets a dummy signal is joined to it in one "
     "direction only",
     "connect the inout port to pins of its own, or put an inner net in place of the first port"},
    {Id::BYPASSED_DUMMY, "bypassed-dummy", BOTH,
     "stays on a net whose readers get a dummy signal, which nothing drives",
     "drive an inner net and assign this one from it with CONNECT SIGNAL"},
    {Id::PIN_RETURNS, "pin-returns", BOTH,
     "was moved away from its first net and will come back to it",
     "connect each pin once, to its last net"},

    // Values.
    {Id::CONSTANT_ON_PART, "constant-on-part", VERILOG,
     "is a part of a bus with a constant, which drives the whole bus in Verilog",
     "tie the pins with ASSIGN CONSTANT INSTANCE.PIN, or use a net of its own"},
    {Id::CONSTANT_WIDTH, "constant-width", BOTH, "has a constant of another width than its own",
     "write WIDTH:BASE:DIGITS with as many digits as the width needs; binary fits every width"},
    {Id::CONSTANT_DIGIT, "constant-digit", BOTH,
     "has a constant with a digit that its base does not have",
     "write WIDTH:BASE:DIGITS, the base b, o or h"},
    {Id::CONSTANT_WITHOUT_BASE, "constant-without-base", BOTH,
     "has a constant without a base: bits in VHDL, a decimal number in Verilog",
     "write WIDTH:b:DIGITS"},
    {Id::SHARED_CONSTANT, "shared-constant", BOTH,
     "shares the signal of its constant with another pin, and the last value holds for both",
     "rename an instance so that INSTANCE_PIN is another name"},
    {Id::UNDECLARED_ATTRIBUTE, "undeclared-attribute", VHDL,
     "is assigned as ASSIGNNODEC, and nothing declares it",
     "use -SYNATTR=ASSIGN, or add the package that declares it with ADD USE LIBRARY"},
    {Id::ATTRIBUTE_TYPE, "attribute-type", VHDL,
     "has another type than the attribute of that name that is declared",
     "use the same -TYPE for all attributes of one name, or do without Use AttrType"},
    {Id::ATTRIBUTE_WITHOUT_TYPE, "attribute-without-type", VHDL,
     "has a type of the user's without a name", "name it with SET ... ATTRIBUTE USERTYPE"},
    {Id::ATTRIBUTE_VALUE, "attribute-value", BOTH,
     "has a value that its type does not have, or that Verilog reads as another",
     "write a finite number, or for bits WIDTH:BASE:DIGITS, the base b, o or h"},
    {Id::UNWRITTEN_ATTRIBUTE, "unwritten-attribute", BOTH,
     "has a -SYNATTR option where no attribute is written",
     "put the attribute on a whole net, an instance or a component"},
    {Id::UNKNOWN_GENERIC, "unknown-generic", VHDL,
     "is a generic of an instance that its component does not have",
     "give the component the attribute with the same -GENERIC option"},
    {Id::GENERIC_TYPE, "generic-type", VHDL,
     "has another type than the component's generic of that name",
     "use the same -TYPE for the component and its instances"},
    {Id::QUOTED_VALUE, "quoted-value", BOTH,
     "has a quote or a backslash in its value that ends, breaks or changes the written string",
     "leave the character out of the value"},
    {Id::FOLDED_VALUE, "folded-value", BOTH,
     "has a value with blanks on a line that passes 80 columns, and the string is broken in two",
     "shorten the value or the names, or write the value without blanks"},
    {Id::HANDED_INIT, "handed-init", VHDL,
     "gets the INIT of the macro, which only a generic of the same type takes",
     "give it the option -GENERIC=SYN and the -TYPE of the macro's INIT"},
    {Id::DOUBLE_DEFPARAM, "double-defparam", VERILOG,
     "is an INIT of option NOSYN in a macro and gets two defparam lines", "give it the option SYN"},

    // Library and use clauses.
    {Id::ILLEGAL_LIBRARY, "illegal-library", VHDL, "makes a clause that VHDL does not take",
     "give ADD LIBRARY the name of a library, and ADD USE LIBRARY one like LIBRARY.PACKAGE.all"},
    {Id::UNKNOWN_LIBRARY, "unknown-library", VHDL,
     "begins with a library that no library clause before it names",
     "name the library with ADD LIBRARY, also one of the default clauses, which come later"},
    {Id::NO_STD_LOGIC, "no-std-logic", VHDL, "needs std_logic, and no use clause makes it visible",
     "leave out USE DEFAULT LIBRARY false, or write ADD LIBRARY ieee and ADD USE LIBRARY "
     "ieee.std_logic_1164.all"},
    {Id::ILLEGAL_TYPE, "illegal-type", VHDL, "has a type that VHDL does not take there",
     "name one type; only a generic may have a range of it"},
    {Id::UNKNOWN_TYPE, "unknown-type", VHDL,
     "has a type that neither VHDL nor a package of ieee that the file uses declares",
     "correct the type, or name its package with ADD LIBRARY and ADD USE LIBRARY"},

    // Texts.
    {Id::TEXT_CHARACTER, "text-character", BOTH,
     "has a character that cannot be in a comment or string of the language",
     "leave out control characters; VHDL-93 is Latin-1 and takes no bytes 80 to 9F, which some "
     "letters have in UTF-8, and no tabs in strings"},
    {Id::DIRECTIVE_COMMENT, "directive-comment", BOTH,
     "begins a line like a directive, which other tools obey", "begin it with another word"},
    {Id::COMMENT_END, "comment-end", VERILOG,
     "has */ in its name or value, which ends the comment that the attribute is written in",
     "leave it out, or write for another tool with SET SYNTHESIS"},
    {Id::INCLUDE_PATH, "include-path", VERILOG,
     "has a quote in its path, or makes a line that is folded at 80 columns, which readers refuse",
     "use a shorter path without quotes"},

    // What happens while lines run.
    {Id::PIN_MOVED, "pin-moved", BOTH, "was taken off another net", "remove one of the two lines"},
    {Id::WIDENED_BUS, "widened-bus", BOTH,
     "gave way to a bus as wide or wider, which does not take over all it had",
     "declare the bus with its final bounds"},
    {Id::WRITE_FILE_NAME, "write-file-name", BOTH, "is taken for the name of the file to write",
     "write the options in front of the file name"},
    {Id::WRITE_OPTION, "write-option", BOTH, "is no option of WRITE and is ignored",
     "the options are -APPEND, -OVERWRITE and -NOHEADER, at most two of them"},
};

} // namespace

char const *NameOf(Languages languages) {
    return languages == VHDL ? "vhdl" : languages == VERILOG ? "verilog" : "both";
}

std::vector<Row> const &All() { return ROWS; }

Row const &Get(Id id) { return ROWS[static_cast<std::size_t>(id)]; }

Row const *Find(std::string_view name) {
    auto const found =
        std::find_if(ROWS.begin(), ROWS.end(), [name](Row const &row) { return row.name == name; });
    return found == ROWS.end() ? nullptr : &*found;
}

} // namespace Checks
