#pragma once

#include "vesk_hdl/engine/CommandOf.h"
#include "vesk_hdl/engine/JoinTokens.h"
#include "vesk_hdl/model/HdlModel.h"
#include "vesk_hdl/model/HdlOptions.h"
#include "vesk_hdl/netlist/Vocabulary.h"

// The commands that set a field of the model's HdlOptions and do nothing else: IsModified does not
// change. The template of a family reads the tokens; a member is an instance of it with the field
// that it sets. Required: tokens after the last one that is read are ignored.

namespace Vesk_Hdl::Commands {

using Text = Basis::StringBase<char>;
using Options = HdlOptions;
using Vhdl = HdlOptions::VhdlOption;
using Verilog = HdlOptions::VerilogOption;

// A field of the model's options, whichever part of them it is in.
template <class T> T &FieldOf(Model &model, T Options::*field) {
    return model.GetOptions()->*field;
}
template <class T> T &FieldOf(Model &model, T Vhdl::*field) {
    return model.GetOptions()->vhdlOption.*field;
}
template <class T> T &FieldOf(Model &model, T Verilog::*field) {
    return model.GetOptions()->verilogOption.*field;
}

/// Reads nothing and sets the flag to true. Required: no command sets it to false.
template <auto FIELD> struct TurnOn {
    bool Parse(StringArray const &, int) { return true; }
    void Run(Model &model) const { FieldOf(model, FIELD) = true; }
};
using SetPortOnePerLineCommand = CommandOf<"SET PORT ONEPERLINE", TurnOn<&Options::portOnePerLine>>;
using UseAttrTypeCommand = CommandOf<"Use AttrType", TurnOn<&Vhdl::useAttrType>>;

/// [flag]. Required: "false" in any case is false, and anything else is true, also a missing word.
template <auto FIELD> struct SetFlag {
    bool flag = true;

    bool Parse(StringArray const &tokens, int first) {
        flag = Basis::stricmp(tokens.At(first), Vocabulary::BOOLEANS[false]) != 0;
        return true;
    }
    void Run(Model &model) const { FieldOf(model, FIELD) = flag; }
};
using SetOpenPinCommand = CommandOf<"Set Open Pin", SetFlag<&Vhdl::openPin>>;
using FlattenBusCommand = CommandOf<"FLATTEN BUS", SetFlag<&Vhdl::flattenBus>>;
using SuppressConfigurationCommand =
    CommandOf<"SUPPRESS CONFIGURATION", SetFlag<&Vhdl::suppressConfiguration>>;
using SuppressComponentCommand = CommandOf<"SUPPRESS COMPONENT", SetFlag<&Vhdl::suppressComponent>>;
using UseDefaultLibraryCommand =
    CommandOf<"USE DEFAULT LIBRARY", SetFlag<&Vhdl::useDefaultLibrary>>;

/// One word, which must not be empty.
struct OneWord {
    Text word;

    bool Parse(StringArray const &tokens, int first) {
        word = tokens.At(first);
        return !word.IsEmpty();
    }
};

/// name, which replaces the field.
template <auto FIELD> struct SetWord : OneWord {
    void Run(Model &model) const { FieldOf(model, FIELD) = word; }
};
using SetApplicationCommand = CommandOf<"Set Application", SetWord<&Options::application>>;
using SetDeviceCommand = CommandOf<"Set Device", SetWord<&Options::device>>;

/// library, or file, which is appended to a list. Required: duplicates are not looked for.
template <auto FIELD> struct AddWord : OneWord {
    void Run(Model &model) const { FieldOf(model, FIELD).Add(word); }
};
using AddLibraryCommand = CommandOf<"ADD LIBRARY", AddWord<&Vhdl::libraries>>;
using AddUseLibraryCommand = CommandOf<"ADD USE LIBRARY", AddWord<&Vhdl::useLibraries>>;
using AddIncludeCommand = CommandOf<"ADD INCLUDE", AddWord<&Verilog::includes>>;

/// tool. Required: any word is accepted, and an unknown one means the first tool.
struct SetSynthesis : OneWord {
    void Run(Model &model) const { model.GetOptions()->verilogOption.SetSynthesisType(word); }
};
using SetSynthesisCommand = CommandOf<"SET SYNTHESIS", SetSynthesis>;

/// text... Required: all words to the end of the line, joined by single blanks.
template <auto FIELD> struct SetText {
    Text text;

    bool Parse(StringArray const &tokens, int first) {
        text = JoinTokens(tokens, first);
        return tokens.GetSize() > first;
    }
    void Run(Model &model) const { FieldOf(model, FIELD) = text; }
};
using SetCommandStrCommand = CommandOf<"Set Command", SetText<&Options::commandStr>>;
using SetPurposeCommand = CommandOf<"Set Purpose", SetText<&Options::purpose>>;
using SetReferenceCommand = CommandOf<"Set Reference", SetText<&Options::reference>>;

/// The word for the kind of names that are written in that case. Required: the two commands have
/// different words for signals, see Vocabulary::UPPERCASE_NAMES.
template <Verilog::CaseType CASE, auto const &WORDS> struct SetCase {
    int which = 0;

    bool Parse(StringArray const &tokens, int first) {
        which = Vocabulary::IndexOf(WORDS, tokens.At(first));
        return which >= 0;
    }
    void Run(Model &model) const {
        static constexpr Verilog::CaseType Verilog::*FIELDS[] = {
            &Verilog::instanceCase, &Verilog::signalCase, &Verilog::componentCase};
        FieldOf(model, FIELDS[which]) = CASE;
    }
};
using UppercaseCommand =
    CommandOf<"UPPERCASE", SetCase<Verilog::CASE_UPPER, Vocabulary::UPPERCASE_NAMES>>;
using LowercaseCommand =
    CommandOf<"LOWERCASE", SetCase<Verilog::CASE_LOWER, Vocabulary::LOWERCASE_NAMES>>;

} // namespace Vesk_Hdl::Commands
