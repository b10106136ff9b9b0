#pragma once

#include <string_view>
#include <vector>

// What `vesk-hdl check` looks for: one table, from which the code, the list and the page in docs/
// take names, sentences and hints.

namespace Checks {

/// Sets of the two languages.
using Languages = unsigned;
constexpr Languages NO_LANGUAGE = 0;
constexpr Languages VHDL = 1;
constexpr Languages VERILOG = 2;
constexpr Languages BOTH = VHDL | VERILOG;

char const *NameOf(Languages languages);

/// In the order of the table.
enum class Id {
    ILLEGAL_NAME,
    NEGATIVE_BOUND,
    RESERVED_WORD,
    NEWER_RESERVED_WORD,
    STANDARD_NAME,
    LIBRARY_NAME,
    HIDDEN_LIBRARY,
    OPEN_NAME,
    ONE_BIT_DECLARATION,
    BIT_WITHOUT_BUS,
    BRACKETED_BIT,
    NET_BESIDE_BUS,
    INSTANCE_NAMED_LIKE_BUS,
    COMPONENT_NAMED_LIKE_BUS,
    NETLIST_NAMED_LIKE_COMPONENT,
    ATTRIBUTE_NAMED_LIKE_NET,
    DUMMY_NAME_TAKEN,
    DUMMY_OF_DUMMY,
    OPEN_NET_NAME,
    CASE_DIFFERS,
    BIT_IN_OTHER_CASE,
    WIDENED_SLICE_CASE,

    NO_PORTS,
    NO_DRIVER,
    NEVER_READ,
    UNUSED_NET,
    SEVERAL_DRIVERS,
    OUTSIDE_BUS,
    UNUSED_COMPONENT,

    ONE_BIT_PIN,
    BRACKETED_PIN,
    REPEATED_PIN,
    LATE_PIN,
    OPEN_INPUT,
    PIN_WIDTH,
    ONE_BIT_SLICE,
    REVERSED_SLICE,

    ASSIGNED_IN_PORT,
    READ_OUT_PORT,
    COMPOUND_ASSIGNMENT,
    BIT_ASSIGNMENT,
    ASSIGNMENT_WIDTH,
    SELF_ASSIGNMENT,
    OUT_PORT_IN_COMPOUND,
    IN_PORT_IN_COMPOUND,
    INOUT_IN_COMPOUND,
    BYPASSED_DUMMY,
    PIN_RETURNS,

    CONSTANT_ON_PART,
    CONSTANT_WIDTH,
    CONSTANT_DIGIT,
    CONSTANT_WITHOUT_BASE,
    SHARED_CONSTANT,
    UNDECLARED_ATTRIBUTE,
    ATTRIBUTE_TYPE,
    ATTRIBUTE_WITHOUT_TYPE,
    ATTRIBUTE_VALUE,
    UNWRITTEN_ATTRIBUTE,
    UNKNOWN_GENERIC,
    GENERIC_TYPE,
    QUOTED_VALUE,
    FOLDED_VALUE,
    HANDED_INIT,
    DOUBLE_DEFPARAM,

    ILLEGAL_LIBRARY,
    UNKNOWN_LIBRARY,
    NO_STD_LOGIC,
    ILLEGAL_TYPE,
    UNKNOWN_TYPE,

    TEXT_CHARACTER,
    DIRECTIVE_COMMENT,
    COMMENT_END,
    INCLUDE_PATH,

    PIN_MOVED,
    WIDENED_BUS,
    WRITE_FILE_NAME,
    WRITE_OPTION,
};

struct Row {
    Id id;
    char const *name;
    Languages languages;  ///< that it can concern; a finding may concern fewer
    char const *sentence; ///< follows the name of what was found
    char const *hint;
};

std::vector<Row> const &All();
Row const &Get(Id id);
/// Null if there is none.
Row const *Find(std::string_view name);

} // namespace Checks
