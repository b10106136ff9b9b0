#pragma once

/// The whole command language on one page. Each row is a keyword, as GetKeyword tells it; the class
/// of its command; and what follows the keyword, for people and for messages: words to be replaced,
/// `[` `]` around what may be missing, `|` between alternatives, `...` for words up to the end of
/// the line. Rows are registered in this order. Keywords match in any case.
#define VESK_HDL_COMMANDS(ROW)                                                                     \
    ROW("NOOP", NoOperationCommand, "")                                                            \
    ROW("SET NETLIST NAME", SetNetlistNameCommand, "name")                                         \
    ROW("SET SOURCE FILE", SetSourceFileCommand, "file")                                           \
    ROW("ADD COMPONENT", AddComponentCommand, "component")                                         \
    ROW("ADD PIN", AddPinCommand, "component pin polarity [value]")                                \
    ROW("ADD INSTANCE", AddInstanceCommand, "component instance")                                  \
    ROW("ADD PORT", AddPortCommand, "signal polarity")                                             \
    ROW("ADD SIGNAL", AddSignalCommand, "signal [polarity]")                                       \
    ROW("CONNECT SIGNAL", ConnectSignalCommand, "signal signal|instance.pin")                      \
    ROW("ASSIGN CONSTANT", AssignConstantCommand, "signal|instance.pin value")                     \
    ROW("WRITE VERILOG", WriteVerilogCommand, "[option [option]] file")                            \
    ROW("ADD INCLUDE", AddIncludeCommand, "file")                                                  \
    ROW("SET SYNTHESIS", SetSynthesisCommand, "tool")                                              \
    ROW("UPPERCASE", UppercaseCommand, "instance|siganl|component")                                \
    ROW("LOWERCASE", LowercaseCommand, "instance|signal|component")                                \
    ROW("WRITE VHDL", WriteVhdlCommand, "[option [option]] file")                                  \
    ROW("FLATTEN BUS", FlattenBusCommand, "[flag]")                                                \
    ROW("SUPPRESS CONFIGURATION", SuppressConfigurationCommand, "[flag]")                          \
    ROW("SUPPRESS COMPONENT", SuppressComponentCommand, "[flag]")                                  \
    ROW("USE DEFAULT LIBRARY", UseDefaultLibraryCommand, "[flag]")                                 \
    ROW("ADD LIBRARY", AddLibraryCommand, "library")                                               \
    ROW("ADD USE LIBRARY", AddUseLibraryCommand, "library")                                        \
    ROW("ADD NOTES", AddNotesCommand, "text...")                                                   \
    ROW("SET PORT ONEPERLINE", SetPortOnePerLineCommand, "")                                       \
    ROW("ADD MODULE COMMENT", AddModuleCommentCommand, "text...")                                  \
    ROW("ADD COMPONENT COMMENT", AddComponentCommentCommand, "component text...")                  \
    ROW("ADD INSTANCE COMMENT", AddInstanceCommentCommand, "instance text...")                     \
    ROW("ADD SIGNAL COMMENT", AddSignalCommentCommand, "signal text...")                           \
    ROW("ADD COMPONENT PIN COMMENT", AddComponentPinCommentCommand, "component.pin text...")       \
    ROW("ADD INSTANCE PIN COMMENT", AddInstancePinCommentCommand, "instance.pin text...")          \
    ROW("ADD MODULE ATTRIBUTE", AddModuleAttrCommand, "[-TYPE=type] attribute [value]")            \
    ROW("ADD COMPONENT ATTRIBUTE", AddComponentAttrCommand,                                        \
        "component [-TYPE=type] attribute [value]")                                                \
    ROW("ADD INSTANCE ATTRIBUTE", AddInstanceAttrCommand,                                          \
        "instance [-TYPE=type] attribute [value]")                                                 \
    ROW("ADD SIGNAL ATTRIBUTE", AddSignalAttrCommand, "signal [-TYPE=type] attribute [value]")     \
    ROW("ADD COMPONENT PIN ATTRIBUTE", AddComponentPinAttrCommand,                                 \
        "component.pin [-TYPE=type] attribute [value]")                                            \
    ROW("ADD INSTANCE PIN ATTRIBUTE", AddInstancePinAttrCommand,                                   \
        "instance.pin [-TYPE=type] attribute [value]")                                             \
    ROW("SET MODULE ATTRIBUTE VALUE", SetModuleAttrValueCommand, "attribute value")                \
    ROW("SET COMPONENT ATTRIBUTE VALUE", SetComponentAttrValueCommand,                             \
        "component attribute value")                                                               \
    ROW("SET INSTANCE ATTRIBUTE VALUE", SetInstanceAttrValueCommand, "instance attribute value")   \
    ROW("SET SIGNAL ATTRIBUTE VALUE", SetSignalAttrValueCommand, "signal attribute value")         \
    ROW("SET COMPONENT PIN ATTRIBUTE VALUE", SetComponentPinAttrValueCommand,                      \
        "component.pin attribute value")                                                           \
    ROW("SET INSTANCE PIN ATTRIBUTE VALUE", SetInstancePinAttrValueCommand,                        \
        "instance.pin attribute value")                                                            \
    ROW("SET MODULE ATTRIBUTE USERTYPE", SetModuleAttrUserTypeCommand, "attribute type")           \
    ROW("SET COMPONENT ATTRIBUTE USERTYPE", SetComponentAttrUserTypeCommand,                       \
        "component attribute type")                                                                \
    ROW("SET INSTANCE ATTRIBUTE USERTYPE", SetInstanceAttrUserTypeCommand,                         \
        "instance attribute type")                                                                 \
    ROW("SET SIGNAL ATTRIBUTE USERTYPE", SetSignalAttrUserTypeCommand, "signal attribute type")    \
    ROW("SET COMPONENT PIN ATTRIBUTE USERTYPE", SetComponentPinAttrUserTypeCommand,                \
        "component.pin attribute type")                                                            \
    ROW("SET INSTANCE PIN ATTRIBUTE USERTYPE", SetInstancePinAttrUserTypeCommand,                  \
        "instance.pin attribute type")                                                             \
    ROW("SET MODULE ATTRIBUTE OPTION", SetModuleAttrOptionCommand, "attribute setting [setting]")  \
    ROW("SET COMPONENT ATTRIBUTE OPTION", SetComponentAttrOptionCommand,                           \
        "component attribute setting [setting]")                                                   \
    ROW("SET INSTANCE ATTRIBUTE OPTION", SetInstanceAttrOptionCommand,                             \
        "instance attribute setting [setting]")                                                    \
    ROW("SET SIGNAL ATTRIBUTE OPTION", SetSignalAttrOptionCommand,                                 \
        "signal attribute setting [setting]")                                                      \
    ROW("SET COMPONENT PIN ATTRIBUTE OPTION", SetComponentPinAttrOptionCommand,                    \
        "component.pin attribute setting [setting]")                                               \
    ROW("SET INSTANCE PIN ATTRIBUTE OPTION", SetInstancePinAttrOptionCommand,                      \
        "instance.pin attribute setting [setting]")                                                \
    ROW("Use AttrType", UseAttrTypeCommand, "")                                                    \
    ROW("Set Application", SetApplicationCommand, "name")                                          \
    ROW("Set Command", SetCommandStrCommand, "text...")                                            \
    ROW("Set Device", SetDeviceCommand, "name")                                                    \
    ROW("Set Purpose", SetPurposeCommand, "text...")                                               \
    ROW("Set Reference", SetReferenceCommand, "text...")                                           \
    ROW("Set Open Pin", SetOpenPinCommand, "[flag]")
