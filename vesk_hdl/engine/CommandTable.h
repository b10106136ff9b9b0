#pragma once

/// The whole command language. Each row is a keyword, as GetKeyword tells it; the class of its
/// command; what follows the keyword; and what else CommandHelp says of it. Rows are registered in
/// this order. Keywords match in any case.
///
/// Comments and attributes are five families of commands with the same words for six owners. What
/// differs stands in the owner: its word in keywords, how the grammar names it, how people call it,
/// which one may be unknown, the one of the examples and the lines that make that one.
#define VESK_HDL_COMPONENT_LINES "ADD COMPONENT AND2\nADD PIN AND2 I0 input\n"
#define VESK_HDL_INSTANCE_LINES VESK_HDL_COMPONENT_LINES "ADD INSTANCE AND2 U1\n"

#define VESK_HDL_MODULE "MODULE", "", "the design", "", "", ""
#define VESK_HDL_COMPONENT                                                                         \
    "COMPONENT", "component ", "a component", "an unknown component; ", "AND2 ",                   \
        VESK_HDL_COMPONENT_LINES
#define VESK_HDL_INSTANCE                                                                          \
    "INSTANCE", "instance ", "an instance", "an unknown instance; ", "U1 ", VESK_HDL_INSTANCE_LINES
#define VESK_HDL_SIGNAL                                                                            \
    "SIGNAL", "signal ", "a signal", "an unknown signal; ", "NET ", "ADD SIGNAL NET\n"
#define VESK_HDL_COMPONENT_PIN                                                                     \
    "COMPONENT PIN", "component.pin ", "a pin of a component", "an unknown component or pin; ",    \
        "AND2.I0 ", VESK_HDL_COMPONENT_LINES
#define VESK_HDL_INSTANCE_PIN                                                                      \
    "INSTANCE PIN", "instance.pin ", "a pin of an instance", "an unknown instance or pin; ",       \
        "U1.I0 ", VESK_HDL_INSTANCE_LINES

// An owner is one argument here and six there.
#define VESK_HDL_COMMENT(owner) VESK_HDL_COMMENT_OF(owner)
#define VESK_HDL_ATTRIBUTE(owner) VESK_HDL_ATTRIBUTE_OF(owner)
#define VESK_HDL_VALUE(owner) VESK_HDL_VALUE_OF(owner)
#define VESK_HDL_USERTYPE(owner) VESK_HDL_USERTYPE_OF(owner)
#define VESK_HDL_OPTION(owner) VESK_HDL_OPTION_OF(owner)

#define VESK_HDL_COMMENT_OF(word, grammar, people, unknown, name, lines)                           \
    grammar "text...",                                                                             \
        .summary = "Adds a line of comment to " people ".", .refused = unknown "a missing text",   \
        .notes = "The words are joined by single blanks; a quoted text keeps its own. Lines are "  \
                 "added, none is ever replaced.",                                                  \
        .example = lines "ADD " word " COMMENT " name "placed by hand",                            \
        .wrong = "ADD " word " COMMENT", .message = "ADD " word " COMMENT: Invalid Arguments."
#define VESK_HDL_ATTRIBUTE_OF(word, grammar, people, unknown, name, lines)                         \
    grammar "[-TYPE=type] attribute [value]",                                                      \
        .summary = "Gives " people " an attribute, or a value to one that it has.",                \
        .refused = unknown "an unknown type",                                                      \
        .notes = "An attribute that is there keeps its type.",                                     \
        .example = lines "ADD " word " ATTRIBUTE " name "-TYPE=Integer WIDTH 8",                   \
        .wrong = "ADD " word " ATTRIBUTE " name "-TYPE=Number DEPTH 4",                            \
        .message = "Invalid attribute type."
#define VESK_HDL_VALUE_OF(word, grammar, people, unknown, name, lines)                             \
    grammar "attribute value",                                                                     \
        .summary = "Sets the value of an attribute of " people ".",                                \
        .refused = unknown "an unknown attribute",                                                 \
        .notes = "An instance inherits the attributes of its component; the first SET gives it a " \
                 "copy of its own.",                                                               \
        .example = lines "ADD " word " ATTRIBUTE " name "WIDTH 8\nSET " word                       \
                         " ATTRIBUTE VALUE " name "WIDTH 16",                                      \
        .wrong = "SET " word " ATTRIBUTE VALUE " name "DEPTH 4",                                   \
        .message = "Attribute \"DEPTH\" not found."
#define VESK_HDL_USERTYPE_OF(word, grammar, people, unknown, name, lines)                          \
    grammar "attribute usertype",                                                                  \
        .summary = "Names the type of a user attribute of " people ".",                            \
        .refused = unknown "an unknown attribute; an attribute that is not of type User",          \
        .notes = "The name is what VHDL declares the attribute with when Use AttrType is on.",     \
        .example = lines "ADD " word " ATTRIBUTE " name "-TYPE=User MODE fast\nSET " word          \
                         " ATTRIBUTE USERTYPE " name "MODE SPEED",                                 \
        .wrong = "SET " word " ATTRIBUTE USERTYPE " name "DEPTH SPEED",                            \
        .message = "Attribute \"DEPTH\" not found."
#define VESK_HDL_OPTION_OF(word, grammar, people, unknown, name, lines)                            \
    grammar "attribute setting [setting]",                                                         \
        .summary = "Chooses how an attribute of " people " is written.",                           \
        .refused = unknown "an unknown attribute; an unknown word",                                \
        .notes = "-GENERIC= takes NONE, SYN or NOSYN: whether the attribute is written as a "      \
                 "generic, and whether synthesis sees that. -SYNATTR= takes NONE, ASSIGN or "      \
                 "ASSIGNNODEC: whether it is written as an attribute, and whether with its "       \
                 "declaration. The generic setting is done first, whatever the order.",            \
        .example = lines "ADD " word " ATTRIBUTE " name "WIDTH 8\nSET " word                       \
                         " ATTRIBUTE OPTION " name "WIDTH -GENERIC=SYN",                           \
        .wrong = "SET " word " ATTRIBUTE OPTION " name "WIDTH -GENERIC=YES",                       \
        .message = "Invalid generic value."

#define VESK_HDL_COMMANDS(ROW)                                                                     \
    ROW("NOOP", NoOperationCommand, "", .summary = "Does nothing.",                                \
        .notes = "It takes any arguments.", .example = "NOOP")                                     \
    ROW("SET NETLIST NAME", SetNetlistNameCommand, "name",                                         \
        .summary = "Names the design: the entity of the VHDL, the module of the Verilog.",         \
        .refused = "a missing name", .example = "SET NETLIST NAME top",                            \
        .wrong = "SET NETLIST NAME", .message = "SET NETLIST NAME: Invalid Arguments.")            \
    ROW("SET SOURCE FILE", SetSourceFileCommand, "file",                                           \
        .summary = "Remembers which file the design comes from.", .refused = "a missing name",     \
        .notes = "The name stands in no written file.", .example = "SET SOURCE FILE top.sch",      \
        .wrong = "SET SOURCE FILE", .message = "SET SOURCE FILE: Invalid Arguments.")              \
    ROW("ADD COMPONENT", AddComponentCommand, "component",                                         \
        .summary = "Declares a component, a kind of block that can be placed.",                    \
        .refused = "a name that a component, an instance or a signal has",                         \
        .example = "ADD COMPONENT AND2", .wrong = "ADD COMPONENT and2",                            \
        .message = "Identifier \"and2\" already defined.")                                         \
    ROW("ADD PIN", AddPinCommand, "component pin polarity [value]",                                \
        .summary = "Gives a component a pin.",                                                     \
        .refused = "an unknown component; a pin that it has; a word that is no polarity",          \
        .notes = "Instances made before do not get the pin. D(7:0) makes a pin of eight bits; "    \
                 "D[7:0], in other brackets, makes a pin of one bit with an odd name.",            \
        .example = "ADD COMPONENT AND2\nADD PIN AND2 I0 input", .wrong = "ADD PIN AND2 i0 output", \
        .message = "Component \"AND2\" already has pin \"i0\".")                                   \
    ROW("ADD INSTANCE", AddInstanceCommand, "component instance",                                  \
        .summary = "Places a component: a new instance with pins of its own.",                     \
        .refused = "an unknown component; a name that a component, an instance or a signal has",   \
        .example = VESK_HDL_COMPONENT_LINES "ADD INSTANCE AND2 U1",                                \
        .wrong = "ADD INSTANCE OR2 U2", .message = "Component \"OR2\" not found.")                 \
    ROW("ADD PORT", AddPortCommand, "signal polarity",                                             \
        .summary = "Declares a signal that is a port of the design.",                              \
        .refused = "a name that is taken; a word that is no polarity",                             \
        .example = "ADD PORT DATA(7:0) input", .wrong = "ADD PORT data(3:0) input",                \
        .message = "Signal \"data(3:0)\" already declared.")                                       \
    ROW("ADD SIGNAL", AddSignalCommand, "signal [polarity]",                                       \
        .summary = "Declares a signal: a bus if its name has a range, otherwise a single net.",    \
        .refused = "a name that is taken, also by a bus of another range",                         \
        .notes = "A polarity is read and then dropped: ADD PORT makes ports.",                     \
        .example = "ADD SIGNAL DATA(7:0)", .wrong = "ADD SIGNAL DATA(3:0)",                        \
        .message = "Signal \"DATA(3:0)\" already declared.")                                       \
    ROW("CONNECT SIGNAL", ConnectSignalCommand, "signal signal|instance.pin",                      \
        .summary = "Puts a pin on a signal, or assigns the second signal to the first one.",       \
        .refused = "a bit of a bus that is not declared; an unknown instance or pin",              \
        .notes = "Signals come into being when a name first demands them: a single net, a "        \
                 "part of a bus, a bundle A,D(3:0). A range as wide as its bus or wider "          \
                 "widens the bus. An unknown instance is told as a signal that is not found.",     \
        .example = VESK_HDL_INSTANCE_LINES "CONNECT SIGNAL A U1.I0\n"                              \
                                           "CONNECT SIGNAL B A",                                   \
        .wrong = "CONNECT SIGNAL D(3) U1.I0", .message = "Signal \"D(3)\" not found.")             \
    ROW("ASSIGN CONSTANT", AssignConstantCommand, "signal|instance.pin value",                     \
        .summary = "Ties a signal or a pin to a constant.",                                        \
        .refused = "an unknown instance or pin; a bit of a bus that is not declared",              \
        .notes = "A value is WIDTH:BASE:DIGITS, the base b, o or h, or digits alone. A width "     \
                 "that the digits do not give is not noticed.",                                    \
        .example = VESK_HDL_INSTANCE_LINES "ASSIGN CONSTANT U1.I0 1\n"                             \
                                           "ASSIGN CONSTANT D(7:0) 8:h:A5",                        \
        .wrong = "ASSIGN CONSTANT U1.I0", .message = "ASSIGN CONSTANT: Invalid Arguments.")        \
    ROW("WRITE VERILOG", WriteVerilogCommand, "[option [option]] file",                            \
        .summary = "Writes the design as Verilog.", .refused = "a missing file",                   \
        .notes = "The options are -NOHEADER, -APPEND and -OVERWRITE, which changes nothing; "      \
                 "other words are dropped. The file name comes last: `WRITE VERILOG a.v "          \
                 "-APPEND` writes a file called -APPEND. A write rewrites the design for "         \
                 "good, so that the text is legal.",                                               \
        .example = "WRITE VERILOG -NOHEADER top.v", .wrong = "WRITE VERILOG",                      \
        .message = "WRITE VERILOG: Invalid Arguments.")                                            \
    ROW("ADD INCLUDE", AddIncludeCommand, "file",                                                  \
        .summary = "Adds an include line to the head of the Verilog.",                             \
        .refused = "a missing name", .example = "ADD INCLUDE cells.v", .wrong = "ADD INCLUDE",     \
        .message = "ADD INCLUDE: Invalid Arguments.")                                              \
    ROW("SET SYNTHESIS", SetSynthesisCommand, "tool",                                              \
        .summary = "Chooses the tool whose syntax attributes are written in, in Verilog.",         \
        .refused = "a missing word",                                                               \
        .notes = "The words are QRT, EXEMPLAR, SYNPLICITY, SYNOPSYS, VERILOG2001 and "             \
                 "PRECISION; any other word means QRT.",                                           \
        .example = "SET SYNTHESIS SYNPLICITY", .wrong = "SET SYNTHESIS",                           \
        .message = "SET SYNTHESIS: Invalid Arguments.")                                            \
    ROW("UPPERCASE", UppercaseCommand, "instance|siganl|component",                                \
        .summary = "Writes names of one kind in upper case, in Verilog.",                          \
        .refused = "any other word",                                                               \
        .notes = "The word for signals is \"siganl\", spelled so; LOWERCASE wants \"signal\".",    \
        .example = "UPPERCASE siganl", .wrong = "UPPERCASE signal",                                \
        .message = "UPPERCASE: Invalid Arguments.")                                                \
    ROW("LOWERCASE", LowercaseCommand, "instance|signal|component",                                \
        .summary = "Writes names of one kind in lower case, in Verilog.",                          \
        .refused = "any other word", .example = "LOWERCASE signal", .wrong = "LOWERCASE siganl",   \
        .message = "LOWERCASE: Invalid Arguments.")                                                \
    ROW("WRITE VHDL", WriteVhdlCommand, "[option [option]] file",                                  \
        .summary = "Writes the design as VHDL.", .refused = "a missing file",                      \
        .notes = "The options are -NOHEADER, -APPEND and -OVERWRITE, which changes nothing; "      \
                 "other words are dropped. The file name comes last: `WRITE VHDL a.vhd "           \
                 "-APPEND` writes a file called -APPEND. A write rewrites the design for "         \
                 "good, so that the text is legal.",                                               \
        .example = "WRITE VHDL -NOHEADER top.vhd", .wrong = "WRITE VHDL",                          \
        .message = "WRITE VHDL: Invalid Arguments.")                                               \
    ROW("FLATTEN BUS", FlattenBusCommand, "[flag]",                                                \
        .summary = "Remembers whether buses are to be flattened.",                                 \
        .notes = "Anything but \"false\" means yes, also nothing. No writer looks at it.",         \
        .example = "FLATTEN BUS")                                                                  \
    ROW("SUPPRESS CONFIGURATION", SuppressConfigurationCommand, "[flag]",                          \
        .summary = "Leaves the configuration out of the VHDL.",                                    \
        .notes = "Anything but \"false\" means yes, also nothing.",                                \
        .example = "SUPPRESS CONFIGURATION")                                                       \
    ROW("SUPPRESS COMPONENT", SuppressComponentCommand, "[flag]",                                  \
        .summary = "Leaves the component declarations out of the VHDL.",                           \
        .notes = "Anything but \"false\" means yes, also nothing.",                                \
        .example = "SUPPRESS COMPONENT")                                                           \
    ROW("USE DEFAULT LIBRARY", UseDefaultLibraryCommand, "[flag]",                                 \
        .summary = "Whether the VHDL begins with the default library clauses.",                    \
        .notes = "Anything but \"false\" means yes, also nothing. They are written unless "        \
                 "this is turned off.",                                                            \
        .example = "USE DEFAULT LIBRARY false")                                                    \
    ROW("ADD LIBRARY", AddLibraryCommand, "library",                                               \
        .summary = "Adds a library clause to the VHDL.", .refused = "a missing name",              \
        .example = "ADD LIBRARY cells", .wrong = "ADD LIBRARY",                                    \
        .message = "ADD LIBRARY: Invalid Arguments.")                                              \
    ROW("ADD USE LIBRARY", AddUseLibraryCommand, "library",                                        \
        .summary = "Adds a use clause to the VHDL.", .refused = "a missing name",                  \
        .example = "ADD USE LIBRARY cells.gates.all", .wrong = "ADD USE LIBRARY",                  \
        .message = "ADD USE LIBRARY: Invalid Arguments.")                                          \
    ROW("ADD NOTES", AddNotesCommand, "text...",                                                   \
        .summary = "Adds a line of comment to the design, as ADD MODULE COMMENT does.",            \
        .refused = "a missing text",                                                               \
        .notes = "The words are joined by single blanks; a quoted text keeps its own. Further "    \
                 "lines are added, none is replaced.",                                             \
        .example = "ADD NOTES made by hand", .wrong = "ADD NOTES",                                 \
        .message = "ADD NOTES: Invalid Arguments.")                                                \
    ROW("SET PORT ONEPERLINE", SetPortOnePerLineCommand, "", .summary = "Writes a port a line.",   \
        .notes = "It is so from the beginning, and no command turns it off.",                      \
        .example = "SET PORT ONEPERLINE")                                                          \
    ROW("ADD MODULE COMMENT", AddModuleCommentCommand, VESK_HDL_COMMENT(VESK_HDL_MODULE))          \
    ROW("ADD COMPONENT COMMENT", AddComponentCommentCommand, VESK_HDL_COMMENT(VESK_HDL_COMPONENT)) \
    ROW("ADD INSTANCE COMMENT", AddInstanceCommentCommand, VESK_HDL_COMMENT(VESK_HDL_INSTANCE))    \
    ROW("ADD SIGNAL COMMENT", AddSignalCommentCommand, VESK_HDL_COMMENT(VESK_HDL_SIGNAL))          \
    ROW("ADD COMPONENT PIN COMMENT", AddComponentPinCommentCommand,                                \
        VESK_HDL_COMMENT(VESK_HDL_COMPONENT_PIN))                                                  \
    ROW("ADD INSTANCE PIN COMMENT", AddInstancePinCommentCommand,                                  \
        VESK_HDL_COMMENT(VESK_HDL_INSTANCE_PIN))                                                   \
    ROW("ADD MODULE ATTRIBUTE", AddModuleAttrCommand, VESK_HDL_ATTRIBUTE(VESK_HDL_MODULE))         \
    ROW("ADD COMPONENT ATTRIBUTE", AddComponentAttrCommand,                                        \
        VESK_HDL_ATTRIBUTE(VESK_HDL_COMPONENT))                                                    \
    ROW("ADD INSTANCE ATTRIBUTE", AddInstanceAttrCommand, VESK_HDL_ATTRIBUTE(VESK_HDL_INSTANCE))   \
    ROW("ADD SIGNAL ATTRIBUTE", AddSignalAttrCommand, VESK_HDL_ATTRIBUTE(VESK_HDL_SIGNAL))         \
    ROW("ADD COMPONENT PIN ATTRIBUTE", AddComponentPinAttrCommand,                                 \
        VESK_HDL_ATTRIBUTE(VESK_HDL_COMPONENT_PIN))                                                \
    ROW("ADD INSTANCE PIN ATTRIBUTE", AddInstancePinAttrCommand,                                   \
        VESK_HDL_ATTRIBUTE(VESK_HDL_INSTANCE_PIN))                                                 \
    ROW("SET MODULE ATTRIBUTE VALUE", SetModuleAttrValueCommand, VESK_HDL_VALUE(VESK_HDL_MODULE))  \
    ROW("SET COMPONENT ATTRIBUTE VALUE", SetComponentAttrValueCommand,                             \
        VESK_HDL_VALUE(VESK_HDL_COMPONENT))                                                        \
    ROW("SET INSTANCE ATTRIBUTE VALUE", SetInstanceAttrValueCommand,                               \
        VESK_HDL_VALUE(VESK_HDL_INSTANCE))                                                         \
    ROW("SET SIGNAL ATTRIBUTE VALUE", SetSignalAttrValueCommand, VESK_HDL_VALUE(VESK_HDL_SIGNAL))  \
    ROW("SET COMPONENT PIN ATTRIBUTE VALUE", SetComponentPinAttrValueCommand,                      \
        VESK_HDL_VALUE(VESK_HDL_COMPONENT_PIN))                                                    \
    ROW("SET INSTANCE PIN ATTRIBUTE VALUE", SetInstancePinAttrValueCommand,                        \
        VESK_HDL_VALUE(VESK_HDL_INSTANCE_PIN))                                                     \
    ROW("SET MODULE ATTRIBUTE USERTYPE", SetModuleAttrUserTypeCommand,                             \
        VESK_HDL_USERTYPE(VESK_HDL_MODULE))                                                        \
    ROW("SET COMPONENT ATTRIBUTE USERTYPE", SetComponentAttrUserTypeCommand,                       \
        VESK_HDL_USERTYPE(VESK_HDL_COMPONENT))                                                     \
    ROW("SET INSTANCE ATTRIBUTE USERTYPE", SetInstanceAttrUserTypeCommand,                         \
        VESK_HDL_USERTYPE(VESK_HDL_INSTANCE))                                                      \
    ROW("SET SIGNAL ATTRIBUTE USERTYPE", SetSignalAttrUserTypeCommand,                             \
        VESK_HDL_USERTYPE(VESK_HDL_SIGNAL))                                                        \
    ROW("SET COMPONENT PIN ATTRIBUTE USERTYPE", SetComponentPinAttrUserTypeCommand,                \
        VESK_HDL_USERTYPE(VESK_HDL_COMPONENT_PIN))                                                 \
    ROW("SET INSTANCE PIN ATTRIBUTE USERTYPE", SetInstancePinAttrUserTypeCommand,                  \
        VESK_HDL_USERTYPE(VESK_HDL_INSTANCE_PIN))                                                  \
    ROW("SET MODULE ATTRIBUTE OPTION", SetModuleAttrOptionCommand,                                 \
        VESK_HDL_OPTION(VESK_HDL_MODULE))                                                          \
    ROW("SET COMPONENT ATTRIBUTE OPTION", SetComponentAttrOptionCommand,                           \
        VESK_HDL_OPTION(VESK_HDL_COMPONENT))                                                       \
    ROW("SET INSTANCE ATTRIBUTE OPTION", SetInstanceAttrOptionCommand,                             \
        VESK_HDL_OPTION(VESK_HDL_INSTANCE))                                                        \
    ROW("SET SIGNAL ATTRIBUTE OPTION", SetSignalAttrOptionCommand,                                 \
        VESK_HDL_OPTION(VESK_HDL_SIGNAL))                                                          \
    ROW("SET COMPONENT PIN ATTRIBUTE OPTION", SetComponentPinAttrOptionCommand,                    \
        VESK_HDL_OPTION(VESK_HDL_COMPONENT_PIN))                                                   \
    ROW("SET INSTANCE PIN ATTRIBUTE OPTION", SetInstancePinAttrOptionCommand,                      \
        VESK_HDL_OPTION(VESK_HDL_INSTANCE_PIN))                                                    \
    ROW("Use AttrType", UseAttrTypeCommand, "",                                                    \
        .summary = "Declares attributes with their own types in VHDL, not as strings.",            \
        .example = "Use AttrType")                                                                 \
    ROW("Set Application", SetApplicationCommand, "name",                                          \
        .summary = "Fills the field application of the header.", .refused = "a missing word",      \
        .notes = "One word counts: put a longer text in quotes.",                                  \
        .example = "Set Application \"any text\"", .wrong = "Set Application",                     \
        .message = "Set Application: Invalid Arguments.")                                          \
    ROW("Set Command", SetCommandStrCommand, "text...",                                            \
        .summary = "Fills the field command of the header.", .refused = "a missing text",          \
        .example = "Set Command all words of the line", .wrong = "Set Command",                    \
        .message = "Set Command: Invalid Arguments.")                                              \
    ROW("Set Device", SetDeviceCommand, "name",                                                    \
        .summary = "Fills the field device of the header.", .refused = "a missing word",           \
        .notes = "One word counts: put a longer text in quotes.",                                  \
        .example = "Set Device \"any text\"", .wrong = "Set Device",                               \
        .message = "Set Device: Invalid Arguments.")                                               \
    ROW("Set Purpose", SetPurposeCommand, "text...",                                               \
        .summary = "Fills the field purpose of the header.", .refused = "a missing text",          \
        .example = "Set Purpose all words of the line", .wrong = "Set Purpose",                    \
        .message = "Set Purpose: Invalid Arguments.")                                              \
    ROW("Set Reference", SetReferenceCommand, "text...",                                           \
        .summary = "Fills the field reference of the header.", .refused = "a missing text",        \
        .example = "Set Reference all words of the line", .wrong = "Set Reference",                \
        .message = "Set Reference: Invalid Arguments.")                                            \
    ROW("Set Open Pin", SetOpenPinCommand, "[flag]",                                               \
        .summary = "Whether open input pins stay open in VHDL.",                                   \
        .notes = "Anything but \"false\" means yes, also nothing. With false, each gets a "        \
                 "signal of its own: VHDL does not allow an open input without a default.",        \
        .example = "Set Open Pin false")
