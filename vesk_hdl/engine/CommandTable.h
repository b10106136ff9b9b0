#pragma once

#include <span>

#include "vesk_hdl/engine/CommandHelp.h"
#include "vesk_hdl/engine/HdlCmd.h"

namespace Vesk_Hdl {

/// The texts for one kind of owner, which the help of the attribute and comment families is filled
/// with.
struct CommandOwner {
    ArgumentKind kind;   ///< how a line names it; NONE for the design, which is not named
    char const *keyword; ///< its word in keywords
    char const *article; ///< "a component"
    char const *unknown; ///< the refusal of an owner that does not exist
    char const *name;    ///< the name of one in the examples, with a blank after it
    char const *lines;   ///< the lines of an example that make that one
};

/// The texts of CommandHelp beyond keyword and arguments. "{keyword}" in them is replaced by that
/// of the command; "{OWNER}", "{owner}", "{unknown}", "{name}" and "{lines}" by the texts of the
/// owner.
struct CommandTexts {
    char const *summary = "";
    char const *refused = "";
    char const *notes = "";
    char const *example = "";
    char const *wrong = "";
    char const *message = "{keyword}: Invalid Arguments."; ///< the refusal of `wrong`
};

/// A row of the table: one command of the language.
struct CommandSpec {
    static constexpr int MAX_ARGUMENTS = 4;

    char const *keyword;
    CommandCreator create;
    Argument arguments[MAX_ARGUMENTS]; ///< places without an argument have kind NONE
    CommandTexts texts;
    CommandOwner const *owner; ///< null unless the texts are those of a family
};

/// The whole command language, in the order of registration. The factory, the help, the completion
/// of the shell and the diagnostics read it.
std::span<CommandSpec const> CommandTable();

} // namespace Vesk_Hdl
