#pragma once

#include <span>

#include "vesk_hdl/engine/CommandHelp.h"
#include "vesk_hdl/engine/HdlCmd.h"

namespace Vesk_Hdl {

/// The owner of a member of the attribute and comment families, as its help names it.
struct CommandOwner {
    ArgumentKind kind;   ///< how a line names it; NONE for the design, which is not named
    char const *keyword; ///< its word in keywords
    char const *article; ///< "a component"
    char const *unknown; ///< what is refused if there is no such owner
    char const *name;    ///< its name in the examples, followed by a blank
    char const *lines;   ///< lines that make that one
};

/// What CommandHelp says beyond keyword and arguments. "{keyword}" is the command's, "{OWNER}",
/// "{owner}", "{unknown}", "{name}" and "{lines}" are those of the row's owner.
struct CommandTexts {
    char const *summary = "";
    char const *refused = "";
    char const *notes = "";
    char const *example = "";
    char const *wrong = "";
    char const *message = "{keyword}: Invalid Arguments."; ///< that refuses `wrong`
};

/// A command of the language.
struct CommandSpec {
    static constexpr int MAX_ARGUMENTS = 4;

    char const *keyword;
    CommandCreator create;
    Argument arguments[MAX_ARGUMENTS]; ///< those that are not there have kind NONE
    CommandTexts texts;
    CommandOwner const *owner;
};

/// The whole command language, in the order of registration.
std::span<CommandSpec const> CommandTable();

} // namespace Vesk_Hdl
