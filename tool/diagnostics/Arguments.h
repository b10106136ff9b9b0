#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "vesk_hdl/Vesk_Hdl.h"

// How the tokens of a line are the arguments of its command.

/// An argument and the token that gives it; of one that takes all further words the first of them.
struct GivenArgument {
    Vesk_Hdl::Argument argument;
    int token; ///< -1: it is missing
};

/// In the order of the line. An optional argument that is left out is not listed.
std::vector<GivenArgument> MatchArguments(Vesk_Hdl::CommandHelp const &command,
                                          Vesk_Hdl::StringArray const &tokens);

/// Whether the command accepts the token for that argument, as far as the design plays no part.
bool Fits(Vesk_Hdl::Argument const &argument, std::string_view token);

/// What would fit where that token does not; "" if there is nothing to say.
std::string HintForUnfit(Vesk_Hdl::CommandHelp const &command, Vesk_Hdl::Argument const &argument,
                         std::string_view token);

/// A name that a token holds, and of what.
struct NamePart {
    Vesk_Hdl::ArgumentKind kind;
    std::size_t offset;
    std::size_t length;
};

/// The names in a token that gives that argument: of a pin also its holder's, of a bundle of
/// signals also those of its members.
std::vector<NamePart> NamesIn(Vesk_Hdl::Argument const &argument, std::string_view token);
