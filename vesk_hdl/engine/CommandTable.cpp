// The table of commands: one row for each, with its class, its arguments and its help. What a
// command reads and does is in the header of its family.

#include "vesk_hdl/engine/CommandTable.h"

#include <algorithm>
#include <initializer_list>
#include <iterator>

#include "vesk_hdl/engine/AttributeCommands.h"
#include "vesk_hdl/engine/DesignCommands.h"
#include "vesk_hdl/engine/OptionCommands.h"
#include "vesk_hdl/engine/WriteCommands.h"

namespace Vesk_Hdl {

namespace {

using namespace Commands;
using enum ArgumentKind;

// Short forms for the rows.

constexpr Argument Optional(ArgumentKind kind) { return {.kind = kind, .optional = true}; }
constexpr Argument New(ArgumentKind kind) { return {.kind = kind, .declares = true}; }
constexpr Argument Either(ArgumentKind kind, ArgumentKind other) {
    return {.kind = kind, .alternative = other};
}

/// The creator of a command class. The tokens are read by ParseArguments.
template <class C> Command *Create(Model *model, StringArray const &) { return new C(model); }

/// A row of the table. The keyword is that of the class.
template <class C>
constexpr CommandSpec Row(std::initializer_list<Argument> arguments, CommandTexts texts,
                          CommandOwner const *owner = nullptr) {
    CommandSpec spec{C::KEYWORD, Create<C>, {}, texts, owner};
    std::copy(arguments.begin(), arguments.end(), spec.arguments);
    return spec;
}

// Comments and attributes are five families of commands for six kinds of owners. The texts of a
// family are written once, and those of an owner are filled in.

constexpr CommandOwner DESIGN = {NONE, "MODULE", "the design", "", "", ""};
constexpr CommandOwner COMPONENT_OWNER = {
    COMPONENT,     "COMPONENT",
    "a component", "an unknown component; ",
    "AND2 ",       "ADD COMPONENT AND2\nADD PIN AND2 I0 input\n"};
constexpr CommandOwner INSTANCE_OWNER = {
    INSTANCE,      "INSTANCE",
    "an instance", "an unknown instance; ",
    "U1 ",         "ADD COMPONENT AND2\nADD PIN AND2 I0 input\nADD INSTANCE AND2 U1\n"};
constexpr CommandOwner SIGNAL_OWNER = {SIGNAL, "SIGNAL",          "a signal", "an unknown signal; ",
                                       "NET ", "ADD SIGNAL NET\n"};
constexpr CommandOwner COMPONENT_PIN_OWNER = {
    COMPONENT_PIN, "COMPONENT PIN",      "a pin of a component", "an unknown component or pin; ",
    "AND2.I0 ",    COMPONENT_OWNER.lines};
constexpr CommandOwner INSTANCE_PIN_OWNER = {
    INSTANCE_PIN, "INSTANCE PIN",      "a pin of an instance", "an unknown instance or pin; ",
    "U1.I0 ",     INSTANCE_OWNER.lines};

/// What the members of a family have in common. Their arguments follow that of the owner.
struct Family {
    std::initializer_list<Argument> arguments;
    CommandTexts texts;
};

template <class C> constexpr CommandSpec Member(CommandOwner const &owner, Family const &family) {
    CommandSpec spec{C::KEYWORD, Create<C>, {{owner.kind}}, family.texts, &owner};
    std::copy(family.arguments.begin(), family.arguments.end(),
              spec.arguments + (owner.kind == NONE ? 0 : 1));
    return spec;
}

constexpr Family COMMENT = {
    {{TEXT}},
    {.summary = "Adds a line of comment to {owner}.",
     .refused = "{unknown}a missing text",
     .notes =
         "The words are joined by single blanks; a quoted text keeps its own. Lines are added, "
         "none is ever replaced.",
     .example = "{lines}{keyword} {name}placed by hand",
     .wrong = "{keyword}"}};

constexpr Family ADD_ATTRIBUTE = {
    {Optional(ATTRIBUTE_TYPE), New(ATTRIBUTE), Optional(VALUE)},
    {.summary = "Gives {owner} an attribute, or a value to one that it has.",
     .refused = "{unknown}an unknown type",
     .notes = "An attribute that is there keeps its type.",
     .example = "{lines}{keyword} {name}-TYPE=Integer WIDTH 8",
     .wrong = "{keyword} {name}-TYPE=Number DEPTH 4",
     .message = "Invalid attribute type."}};

constexpr Family SET_VALUE = {
    {{ATTRIBUTE}, {VALUE}},
    {.summary = "Sets the value of an attribute of {owner}.",
     .refused = "{unknown}an unknown attribute",
     .notes = "An instance inherits the attributes of its component; the first SET gives it a copy "
              "of its own.",
     .example = "{lines}ADD {OWNER} ATTRIBUTE {name}WIDTH 8\n{keyword} {name}WIDTH 16",
     .wrong = "{keyword} {name}DEPTH 4",
     .message = "Attribute \"DEPTH\" not found."}};

constexpr Family SET_USERTYPE = {
    {{ATTRIBUTE}, {USER_TYPE}},
    {.summary = "Names the type of a user attribute of {owner}.",
     .refused = "{unknown}an unknown attribute; an attribute that is not of type User",
     .notes = "The name is what VHDL declares the attribute with when Use AttrType is on.",
     .example = "{lines}ADD {OWNER} ATTRIBUTE {name}-TYPE=User MODE fast\n"
                "{keyword} {name}MODE SPEED",
     .wrong = "{keyword} {name}DEPTH SPEED",
     .message = "Attribute \"DEPTH\" not found."}};

constexpr Family SET_OPTION = {
    {{ATTRIBUTE}, {SETTING}, Optional(SETTING)},
    {.summary = "Chooses how an attribute of {owner} is written.",
     .refused = "{unknown}an unknown attribute; an unknown word",
     .notes = "-GENERIC= says whether the attribute is written as a generic, and whether synthesis "
              "sees that. -SYNATTR= says whether it is written as an attribute, and whether with "
              "its declaration. The generic setting is done first, whatever the order.",
     .example = "{lines}ADD {OWNER} ATTRIBUTE {name}WIDTH 8\n{keyword} {name}WIDTH -GENERIC=SYN",
     .wrong = "{keyword} {name}WIDTH -GENERIC=YES",
     .message = "Invalid generic value."}};

/// Required: the order of the rows is that of registration.
constexpr CommandSpec COMMANDS[] = {
    Row<NoOperationCommand>(
        {}, {.summary = "Does nothing.", .notes = "It takes any arguments.", .example = "NOOP"}),
    Row<SetNetlistNameCommand>(
        {{NAME}},
        {.summary = "Names the design: the entity of the VHDL, the module of the Verilog.",
         .refused = "a missing name",
         .example = "SET NETLIST NAME top",
         .wrong = "SET NETLIST NAME"}),
    Row<SetSourceFileCommand>({{FILE_NAME}},
                              {.summary = "Remembers which file the design comes from.",
                               .refused = "a missing name",
                               .notes = "The name is in no written file.",
                               .example = "SET SOURCE FILE top.sch",
                               .wrong = "SET SOURCE FILE"}),
    Row<AddComponentCommand>(
        {New(COMPONENT)}, {.summary = "Declares a component, a kind of block that can be placed.",
                           .refused = "a name that a component, an instance or a signal has",
                           .example = "ADD COMPONENT AND2",
                           .wrong = "ADD COMPONENT and2",
                           .message = "Identifier \"and2\" already defined."}),
    Row<AddPinCommand>(
        {{COMPONENT}, New(PIN), {POLARITY}, Optional(VALUE)},
        {.summary = "Gives a component a pin.",
         .refused = "an unknown component; a pin that it has; a word that is no polarity",
         .notes = "Instances made before do not get the pin. D(7:0) makes a pin of eight bits; "
                  "D[7:0], in other brackets, makes a pin of one bit with an odd name.",
         .example = "ADD COMPONENT AND2\nADD PIN AND2 I0 input",
         .wrong = "ADD PIN AND2 i0 output",
         .message = "Component \"AND2\" already has pin \"i0\"."}),
    Row<AddInstanceCommand>(
        {{COMPONENT}, New(INSTANCE)},
        {.summary = "Places a component: a new instance with pins of its own.",
         .refused = "an unknown component; a name that a component, an instance or a signal has",
         .example = "{lines}ADD INSTANCE AND2 U1",
         .wrong = "ADD INSTANCE OR2 U2",
         .message = "Component \"OR2\" not found."},
        &COMPONENT_OWNER),
    Row<AddPortCommand>({New(SIGNAL), {POLARITY}},
                        {.summary = "Declares a signal that is a port of the design.",
                         .refused = "a name that is taken; a word that is no polarity",
                         .example = "ADD PORT DATA(7:0) input",
                         .wrong = "ADD PORT data(3:0) input",
                         .message = "Signal \"data(3:0)\" already declared."}),
    Row<AddSignalCommand>(
        {New(SIGNAL), Optional(POLARITY)},
        {.summary = "Declares a signal: a bus if its name has a range, otherwise a single net.",
         .refused = "a name that is taken, also by a bus of another range",
         .notes = "A polarity is read and then dropped: ADD PORT makes ports.",
         .example = "ADD SIGNAL DATA(7:0)",
         .wrong = "ADD SIGNAL DATA(3:0)",
         .message = "Signal \"DATA(3:0)\" already declared."}),
    Row<ConnectSignalCommand>(
        {{SIGNAL}, Either(SIGNAL, INSTANCE_PIN)},
        {.summary = "Puts a pin on a signal, or assigns the second signal to the first one.",
         .refused = "a bit of a bus that is not declared; an unknown instance or pin",
         .notes = "A signal is made when a name first asks for it: a single net, a part of a bus, "
                  "a bundle A,D(3:0). A range as wide as its bus or wider widens the bus. An "
                  "unknown instance is reported as a signal that is not found.",
         .example = "{lines}CONNECT SIGNAL A U1.I0\nCONNECT SIGNAL B A",
         .wrong = "CONNECT SIGNAL D(3) U1.I0",
         .message = "Signal \"D(3)\" not found."},
        &INSTANCE_OWNER),
    Row<AssignConstantCommand>(
        {Either(SIGNAL, INSTANCE_PIN), {VALUE}},
        {.summary = "Ties a signal or a pin to a constant.",
         .refused = "an unknown instance or pin; a bit of a bus that is not declared",
         .notes = "A value is WIDTH:BASE:DIGITS, the base b, o or h, or digits alone. A width that "
                  "the digits do not give is not noticed.",
         .example = "{lines}ASSIGN CONSTANT U1.I0 1\nASSIGN CONSTANT D(7:0) 8:h:A5",
         .wrong = "ASSIGN CONSTANT U1.I0"},
        &INSTANCE_OWNER),
    Row<WriteVerilogCommand>(
        {Optional(WRITE_OPTION), Optional(WRITE_OPTION), {FILE_NAME}},
        {.summary = "Writes the design as Verilog.",
         .refused = "a missing file",
         .notes = "-OVERWRITE changes nothing; other words in its place are dropped. The file name "
                  "comes last: `WRITE VERILOG a.v -APPEND` writes a file called -APPEND. A write "
                  "rewrites the design for good, so that the text is legal.",
         .example = "WRITE VERILOG -NOHEADER top.v",
         .wrong = "WRITE VERILOG"}),
    Row<AddIncludeCommand>({{FILE_NAME}},
                           {.summary = "Adds an include line to the head of the Verilog.",
                            .refused = "a missing name",
                            .example = "ADD INCLUDE cells.v",
                            .wrong = "ADD INCLUDE"}),
    Row<SetSynthesisCommand>(
        {{SYNTHESIS_TOOL}},
        {.summary = "Chooses the tool whose syntax attributes are written in, in Verilog.",
         .refused = "a missing word",
         .example = "SET SYNTHESIS SYNPLICITY",
         .wrong = "SET SYNTHESIS"}),
    // The words of these two commands differ, see Vocabulary::UPPERCASE_NAMES. The help says so,
    // since it looks like a mistake of the user.
    Row<UppercaseCommand>(
        {{UPPERCASE_NAMES}},
        {.summary = "Writes names of one kind in upper case, in Verilog.",
         .refused = "any other word",
         .notes = "The word for signals is \"siganl\", spelled so; LOWERCASE wants \"signal\".",
         .example = "UPPERCASE siganl",
         .wrong = "UPPERCASE signal"}),
    Row<LowercaseCommand>({{LOWERCASE_NAMES}},
                          {.summary = "Writes names of one kind in lower case, in Verilog.",
                           .refused = "any other word",
                           .example = "LOWERCASE signal",
                           .wrong = "LOWERCASE siganl"}),
    Row<WriteVhdlCommand>(
        {Optional(WRITE_OPTION), Optional(WRITE_OPTION), {FILE_NAME}},
        {.summary = "Writes the design as VHDL.",
         .refused = "a missing file",
         .notes = "-OVERWRITE changes nothing; other words in its place are dropped. The file name "
                  "comes last: `WRITE VHDL a.vhd -APPEND` writes a file called -APPEND. A write "
                  "rewrites the design for good, so that the text is legal.",
         .example = "WRITE VHDL -NOHEADER top.vhd",
         .wrong = "WRITE VHDL"}),
    Row<FlattenBusCommand>({Optional(FLAG)},
                           {.summary = "Remembers whether buses are to be flattened.",
                            .notes = "No writer looks at it.",
                            .example = "FLATTEN BUS"}),
    Row<SuppressConfigurationCommand>({Optional(FLAG)},
                                      {.summary = "Leaves the configuration out of the VHDL.",
                                       .example = "SUPPRESS CONFIGURATION"}),
    Row<SuppressComponentCommand>({Optional(FLAG)},
                                  {.summary = "Leaves the component declarations out of the VHDL.",
                                   .example = "SUPPRESS COMPONENT"}),
    Row<UseDefaultLibraryCommand>(
        {Optional(FLAG)}, {.summary = "Whether the VHDL begins with the default library clauses.",
                           .notes = "They are written unless this is turned off.",
                           .example = "USE DEFAULT LIBRARY false"}),
    Row<AddLibraryCommand>({{LIBRARY}}, {.summary = "Adds a library clause to the VHDL.",
                                         .refused = "a missing name",
                                         .example = "ADD LIBRARY cells",
                                         .wrong = "ADD LIBRARY"}),
    Row<AddUseLibraryCommand>({{LIBRARY}},
                              {.summary = "Adds a use clause to the VHDL.",
                               .refused = "a missing name",
                               .notes = "The library itself wants an ADD LIBRARY.",
                               .example = "ADD LIBRARY cells\nADD USE LIBRARY cells.gates.all",
                               .wrong = "ADD USE LIBRARY"}),
    Row<AddNotesCommand>(
        {{TEXT}},
        {.summary = "Adds a line of comment to the design, as ADD MODULE COMMENT does.",
         .refused = "a missing text",
         .notes = "The words are joined by single blanks; a quoted text keeps its own. Further "
                  "lines are added, none is replaced.",
         .example = "ADD NOTES made by hand",
         .wrong = "ADD NOTES"}),
    Row<SetPortOnePerLineCommand>(
        {}, {.summary = "Writes a port a line.",
             .notes = "It is so from the beginning, and no command turns it off.",
             .example = "SET PORT ONEPERLINE"}),

    // The families, each with its members in one order of owners.

    Member<AddModuleCommentCommand>(DESIGN, COMMENT),
    Member<AddComponentCommentCommand>(COMPONENT_OWNER, COMMENT),
    Member<AddInstanceCommentCommand>(INSTANCE_OWNER, COMMENT),
    Member<AddSignalCommentCommand>(SIGNAL_OWNER, COMMENT),
    Member<AddComponentPinCommentCommand>(COMPONENT_PIN_OWNER, COMMENT),
    Member<AddInstancePinCommentCommand>(INSTANCE_PIN_OWNER, COMMENT),

    Member<AddModuleAttrCommand>(DESIGN, ADD_ATTRIBUTE),
    Member<AddComponentAttrCommand>(COMPONENT_OWNER, ADD_ATTRIBUTE),
    Member<AddInstanceAttrCommand>(INSTANCE_OWNER, ADD_ATTRIBUTE),
    Member<AddSignalAttrCommand>(SIGNAL_OWNER, ADD_ATTRIBUTE),
    Member<AddComponentPinAttrCommand>(COMPONENT_PIN_OWNER, ADD_ATTRIBUTE),
    Member<AddInstancePinAttrCommand>(INSTANCE_PIN_OWNER, ADD_ATTRIBUTE),

    Member<SetModuleAttrValueCommand>(DESIGN, SET_VALUE),
    Member<SetComponentAttrValueCommand>(COMPONENT_OWNER, SET_VALUE),
    Member<SetInstanceAttrValueCommand>(INSTANCE_OWNER, SET_VALUE),
    Member<SetSignalAttrValueCommand>(SIGNAL_OWNER, SET_VALUE),
    Member<SetComponentPinAttrValueCommand>(COMPONENT_PIN_OWNER, SET_VALUE),
    Member<SetInstancePinAttrValueCommand>(INSTANCE_PIN_OWNER, SET_VALUE),

    Member<SetModuleAttrUserTypeCommand>(DESIGN, SET_USERTYPE),
    Member<SetComponentAttrUserTypeCommand>(COMPONENT_OWNER, SET_USERTYPE),
    Member<SetInstanceAttrUserTypeCommand>(INSTANCE_OWNER, SET_USERTYPE),
    Member<SetSignalAttrUserTypeCommand>(SIGNAL_OWNER, SET_USERTYPE),
    Member<SetComponentPinAttrUserTypeCommand>(COMPONENT_PIN_OWNER, SET_USERTYPE),
    Member<SetInstancePinAttrUserTypeCommand>(INSTANCE_PIN_OWNER, SET_USERTYPE),

    Member<SetModuleAttrOptionCommand>(DESIGN, SET_OPTION),
    Member<SetComponentAttrOptionCommand>(COMPONENT_OWNER, SET_OPTION),
    Member<SetInstanceAttrOptionCommand>(INSTANCE_OWNER, SET_OPTION),
    Member<SetSignalAttrOptionCommand>(SIGNAL_OWNER, SET_OPTION),
    Member<SetComponentPinAttrOptionCommand>(COMPONENT_PIN_OWNER, SET_OPTION),
    Member<SetInstancePinAttrOptionCommand>(INSTANCE_PIN_OWNER, SET_OPTION),

    Row<UseAttrTypeCommand>(
        {}, {.summary = "Declares attributes with their own types in VHDL, not as strings.",
             .example = "Use AttrType"}),
    Row<SetApplicationCommand>({{NAME}}, {.summary = "Fills the field application of the header.",
                                          .refused = "a missing word",
                                          .notes = "One word counts: put a longer text in quotes.",
                                          .example = "Set Application \"any text\"",
                                          .wrong = "Set Application"}),
    Row<SetCommandStrCommand>({{TEXT}}, {.summary = "Fills the field command of the header.",
                                         .refused = "a missing text",
                                         .example = "Set Command all words of the line",
                                         .wrong = "Set Command"}),
    Row<SetDeviceCommand>({{NAME}}, {.summary = "Fills the field device of the header.",
                                     .refused = "a missing word",
                                     .notes = "One word counts: put a longer text in quotes.",
                                     .example = "Set Device \"any text\"",
                                     .wrong = "Set Device"}),
    Row<SetPurposeCommand>({{TEXT}}, {.summary = "Fills the field purpose of the header.",
                                      .refused = "a missing text",
                                      .example = "Set Purpose all words of the line",
                                      .wrong = "Set Purpose"}),
    Row<SetReferenceCommand>({{TEXT}}, {.summary = "Fills the field reference of the header.",
                                        .refused = "a missing text",
                                        .example = "Set Reference all words of the line",
                                        .wrong = "Set Reference"}),
    Row<SetOpenPinCommand>(
        {Optional(FLAG)},
        {.summary = "Whether open input pins stay open in VHDL.",
         .notes = "With false, each gets a signal of its own: VHDL does not allow an open input "
                  "without a default.",
         .example = "Set Open Pin false"}),
};

} // namespace

std::span<CommandSpec const> CommandTable() { return COMMANDS; }

} // namespace Vesk_Hdl
