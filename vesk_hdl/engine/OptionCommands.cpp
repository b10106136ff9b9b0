// The commands that fill the model's HdlOptions and do nothing else: a family a struct with a
// Parse, a command a row of the family's table. Tokens behind those named are ignored.

#include "vesk_hdl/engine/Commands.h"
#include "vesk_hdl/engine/JoinTokens.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/model/HdlOptions.h"
#include "vesk_hdl/text/basis/Functions.h"

namespace Vesk_Hdl {

using Text = Basis::StringBase<char>;

namespace {

/// No arguments.
struct NoArguments {
    bool Parse(StringArray const &, int) { return true; }
};

/// A word that is false for "false" in any case and true for anything else, also when missing.
struct FlagArguments {
    bool flag = true;
    bool Parse(StringArray const &tokens, int at) {
        flag = Basis::stricmp(tokens.At(at), "false") != 0;
        return true;
    }
};

/// One word that may not be empty.
struct NameArguments {
    Text name;
    bool Parse(StringArray const &tokens, int at) {
        name = tokens.At(at);
        return !name.IsEmpty();
    }
};

/// All words to the end of the line, at least one.
struct TextArguments {
    Text text;
    bool Parse(StringArray const &tokens, int at) {
        text = JoinTokens(tokens, at);
        return tokens.GetSize() > at;
    }
};

/// What names are to be written in one case: "instance", a word for signals, "component".
struct CaseArguments {
    Text which;

    bool Parse(StringArray const &tokens, char const *signalWord) {
        for (char const *const word : {"instance", signalWord, "component"})
            if (Basis::stricmp(tokens.At(1), word) == 0) {
                which = tokens.At(1);
                return true;
            }
        return false;
    }

    void Apply(HdlOptions::VerilogOption &verilog, HdlOptions::VerilogOption::CaseType type) const {
        if (Basis::stricmp(which, "instance") == 0)
            verilog.instanceCase = type;
        else if (Basis::stricmp(which, "component") == 0)
            verilog.componentCase = type;
        else
            verilog.signalCase = type;
    }
};

} // namespace

// A row: class, family, index of its first argument, what it does with the options.
#define OPTION(Class, Family, at, action)                                                          \
    VESK_HDL_COMMAND(Class, Family)                                                                \
    bool Class::ParseArguments(StringArray const &tokens) { return arguments.Parse(tokens, at); }  \
    void Class::Execute() {                                                                        \
        HdlOptions &options = *RequireModel().GetOptions();                                        \
        action;                                                                                    \
    }

OPTION(SetPortOnePerLineCommand, NoArguments, 3, options.portOnePerLine = true)
OPTION(UseAttrTypeCommand, NoArguments, 2, options.vhdlOption.useAttrType = true)

OPTION(SetOpenPinCommand, FlagArguments, 3, options.vhdlOption.openPin = arguments.flag)
OPTION(FlattenBusCommand, FlagArguments, 2, options.vhdlOption.flattenBus = arguments.flag)
OPTION(SuppressConfigurationCommand, FlagArguments, 2,
       options.vhdlOption.suppressConfiguration = arguments.flag)
OPTION(SuppressComponentCommand, FlagArguments, 2,
       options.vhdlOption.suppressComponent = arguments.flag)
OPTION(UseDefaultLibraryCommand, FlagArguments, 3,
       options.vhdlOption.useDefaultLibrary = arguments.flag)

OPTION(AddLibraryCommand, NameArguments, 2, options.vhdlOption.libraries.Add(arguments.name))
OPTION(AddUseLibraryCommand, NameArguments, 3, options.vhdlOption.useLibraries.Add(arguments.name))
OPTION(AddIncludeCommand, NameArguments, 2, options.verilogOption.includes.Add(arguments.name))
OPTION(SetSynthesisCommand, NameArguments, 2,
       options.verilogOption.SetSynthesisType(arguments.name))
OPTION(SetApplicationCommand, NameArguments, 2, options.application = arguments.name)
OPTION(SetDeviceCommand, NameArguments, 2, options.device = arguments.name)

OPTION(SetCommandStrCommand, TextArguments, 2, options.commandStr = arguments.text)
OPTION(SetPurposeCommand, TextArguments, 2, options.purpose = arguments.text)
OPTION(SetReferenceCommand, TextArguments, 2, options.reference = arguments.text)

// The two words for signals differ, and each command refuses the other's: "siganl" is meant.
OPTION(UppercaseCommand, CaseArguments, "siganl",
       arguments.Apply(options.verilogOption, HdlOptions::VerilogOption::CASE_UPPER))
OPTION(LowercaseCommand, CaseArguments, "signal",
       arguments.Apply(options.verilogOption, HdlOptions::VerilogOption::CASE_LOWER))

} // namespace Vesk_Hdl
