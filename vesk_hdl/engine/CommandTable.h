#pragma once

/// The whole command language on one page: each row is a keyword, as GetKeyword tells it, and the
/// class of its command. Rows are registered in this order. Keywords match in any case.
#define VESK_HDL_COMMANDS(ROW)                                                                     \
    ROW("NOOP", NoOperationCommand)                                                                \
    ROW("SET NETLIST NAME", SetNetlistNameCommand)                                                 \
    ROW("SET SOURCE FILE", SetSourceFileCommand)                                                   \
    ROW("ADD COMPONENT", AddComponentCommand)                                                      \
    ROW("ADD PIN", AddPinCommand)                                                                  \
    ROW("ADD INSTANCE", AddInstanceCommand)                                                        \
    ROW("ADD PORT", AddPortCommand)                                                                \
    ROW("ADD SIGNAL", AddSignalCommand)                                                            \
    ROW("CONNECT SIGNAL", ConnectSignalCommand)                                                    \
    ROW("ASSIGN CONSTANT", AssignConstantCommand)                                                  \
    ROW("WRITE VERILOG", WriteVerilogCommand)                                                      \
    ROW("ADD INCLUDE", AddIncludeCommand)                                                          \
    ROW("SET SYNTHESIS", SetSynthesisCommand)                                                      \
    ROW("UPPERCASE", UppercaseCommand)                                                             \
    ROW("LOWERCASE", LowercaseCommand)                                                             \
    ROW("WRITE VHDL", WriteVhdlCommand)                                                            \
    ROW("FLATTEN BUS", FlattenBusCommand)                                                          \
    ROW("SUPPRESS CONFIGURATION", SuppressConfigurationCommand)                                    \
    ROW("SUPPRESS COMPONENT", SuppressComponentCommand)                                            \
    ROW("USE DEFAULT LIBRARY", UseDefaultLibraryCommand)                                           \
    ROW("ADD LIBRARY", AddLibraryCommand)                                                          \
    ROW("ADD USE LIBRARY", AddUseLibraryCommand)                                                   \
    ROW("ADD NOTES", AddNotesCommand)                                                              \
    ROW("SET PORT ONEPERLINE", SetPortOnePerLineCommand)                                           \
    ROW("ADD MODULE COMMENT", AddModuleCommentCommand)                                             \
    ROW("ADD COMPONENT COMMENT", AddComponentCommentCommand)                                       \
    ROW("ADD INSTANCE COMMENT", AddInstanceCommentCommand)                                         \
    ROW("ADD SIGNAL COMMENT", AddSignalCommentCommand)                                             \
    ROW("ADD COMPONENT PIN COMMENT", AddComponentPinCommentCommand)                                \
    ROW("ADD INSTANCE PIN COMMENT", AddInstancePinCommentCommand)                                  \
    ROW("ADD MODULE ATTRIBUTE", AddModuleAttrCommand)                                              \
    ROW("ADD COMPONENT ATTRIBUTE", AddComponentAttrCommand)                                        \
    ROW("ADD INSTANCE ATTRIBUTE", AddInstanceAttrCommand)                                          \
    ROW("ADD SIGNAL ATTRIBUTE", AddSignalAttrCommand)                                              \
    ROW("ADD COMPONENT PIN ATTRIBUTE", AddComponentPinAttrCommand)                                 \
    ROW("ADD INSTANCE PIN ATTRIBUTE", AddInstancePinAttrCommand)                                   \
    ROW("SET MODULE ATTRIBUTE VALUE", SetModuleAttrValueCommand)                                   \
    ROW("SET COMPONENT ATTRIBUTE VALUE", SetComponentAttrValueCommand)                             \
    ROW("SET INSTANCE ATTRIBUTE VALUE", SetInstanceAttrValueCommand)                               \
    ROW("SET SIGNAL ATTRIBUTE VALUE", SetSignalAttrValueCommand)                                   \
    ROW("SET COMPONENT PIN ATTRIBUTE VALUE", SetComponentPinAttrValueCommand)                      \
    ROW("SET INSTANCE PIN ATTRIBUTE VALUE", SetInstancePinAttrValueCommand)                        \
    ROW("SET MODULE ATTRIBUTE USERTYPE", SetModuleAttrUserTypeCommand)                             \
    ROW("SET COMPONENT ATTRIBUTE USERTYPE", SetComponentAttrUserTypeCommand)                       \
    ROW("SET INSTANCE ATTRIBUTE USERTYPE", SetInstanceAttrUserTypeCommand)                         \
    ROW("SET SIGNAL ATTRIBUTE USERTYPE", SetSignalAttrUserTypeCommand)                             \
    ROW("SET COMPONENT PIN ATTRIBUTE USERTYPE", SetComponentPinAttrUserTypeCommand)                \
    ROW("SET INSTANCE PIN ATTRIBUTE USERTYPE", SetInstancePinAttrUserTypeCommand)                  \
    ROW("SET MODULE ATTRIBUTE OPTION", SetModuleAttrOptionCommand)                                 \
    ROW("SET COMPONENT ATTRIBUTE OPTION", SetComponentAttrOptionCommand)                           \
    ROW("SET INSTANCE ATTRIBUTE OPTION", SetInstanceAttrOptionCommand)                             \
    ROW("SET SIGNAL ATTRIBUTE OPTION", SetSignalAttrOptionCommand)                                 \
    ROW("SET COMPONENT PIN ATTRIBUTE OPTION", SetComponentPinAttrOptionCommand)                    \
    ROW("SET INSTANCE PIN ATTRIBUTE OPTION", SetInstancePinAttrOptionCommand)                      \
    ROW("Use AttrType", UseAttrTypeCommand)                                                        \
    ROW("Set Application", SetApplicationCommand)                                                  \
    ROW("Set Command", SetCommandStrCommand)                                                       \
    ROW("Set Device", SetDeviceCommand)                                                            \
    ROW("Set Purpose", SetPurposeCommand)                                                          \
    ROW("Set Reference", SetReferenceCommand)                                                      \
    ROW("Set Open Pin", SetOpenPinCommand)
