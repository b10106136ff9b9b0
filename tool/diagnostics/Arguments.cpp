// Matches the tokens of a line with the arguments of its command. The library only says that
// arguments are invalid; the tool finds out which one, from the same tables that the commands are
// made from.

#include "tool/diagnostics/Arguments.h"

#include <algorithm>

#include "tool/diagnostics/Words.h"

using namespace Vesk_Hdl;
using enum ArgumentKind;

namespace {

bool IsPin(ArgumentKind kind) { return kind == COMPONENT_PIN || kind == INSTANCE_PIN; }
bool IsName(ArgumentKind kind) { return kind == UPPERCASE_NAMES || kind == LOWERCASE_NAMES; }

/// The point must be followed by the name of a pin: "u1." names none.
bool NamesPin(std::string_view token) {
    std::size_t const point = FindPinPoint(token);
    return point != token.npos && point + 1 < token.size();
}

/// Whether one of the choices allows the token. What follows a prefix is judged by the model.
bool IsChosen(std::span<Vocabulary::Choice const> choices, std::string_view token) {
    return std::any_of(choices.begin(), choices.end(), [token](Vocabulary::Choice const &choice) {
        return *choice.prefix ? BeginsWith(token, choice.prefix)
                              : Vocabulary::IndexOf(choice.words, std::string(token).c_str()) >= 0;
    });
}

bool Fits(ArgumentKind kind, std::string_view token) {
    if (kind == NONE)
        return false;
    if (IsPin(kind))
        return NamesPin(token);
    // Polarities are matched by their beginnings, so that no list of words can hold them all.
    if (kind == POLARITY)
        return Polarity::GetValue(std::string(token).c_str()) != Polarity::INVALID;
    if (ArgumentHelp const &help = CommandReference::GetArgument(kind); help.fixed)
        return IsChosen(help.choices, token);
    // The library takes an empty value and an empty comment, but no empty name.
    return !token.empty() || kind == VALUE || kind == TEXT;
}

} // namespace

std::vector<GivenArgument> MatchArguments(CommandHelp const &command, StringArray const &tokens) {
    // An optional argument is taken as given if enough tokens are left for the required ones after
    // it. An attribute type is recognized by its words instead, because the name that follows it
    // may be followed by a value or not.
    auto required = std::count_if(command.arguments.begin(), command.arguments.end(),
                                  [](Argument const &argument) { return !argument.optional; });
    std::vector<GivenArgument> given;
    int token = command.words;
    for (Argument const &argument : command.arguments) {
        if (!argument.optional)
            --required;
        else if (argument.kind == ATTRIBUTE_TYPE ? !Fits(argument, tokens.At(token).View())
                                                 : tokens.GetSize() - token <= required)
            continue;
        given.push_back({argument, token < tokens.GetSize() ? token : -1});
        ++token;
    }
    return given;
}

bool Fits(Argument const &argument, std::string_view token) {
    return Fits(argument.kind, token) || Fits(argument.alternative, token);
}

std::string HintForUnfit(CommandHelp const &command, Argument const &argument,
                         std::string_view token) {
    ArgumentHelp const &help = CommandReference::GetArgument(argument.kind);
    if (argument.kind == POLARITY && SameIgnoringCase(token, "inout"))
        return "the word for both directions is BiDirectional, or any beginning of it";
    if (IsPin(argument.kind))
        return std::string("a pin is named with its owner, ") + help.word;
    if (!help.fixed)
        return "";
    if (!IsName(argument.kind))
        return std::string("a ") + help.word + " is " + help.meaning;
    // UPPERCASE takes "siganl" and LOWERCASE takes "signal": each refuses the word of the other.
    Vocabulary::Words const words = help.choices[0].words;
    for (ArgumentKind const kind : {UPPERCASE_NAMES, LOWERCASE_NAMES})
        if (IsChosen(CommandReference::GetArgument(kind).choices, token))
            return std::string("the word for signals that ") + command.keyword + " wants is " +
                   Quoted(words[1]);
    return "the words are " + Quoted(words[0]) + ", " + Quoted(words[1]) + " and " +
           Quoted(words[2]);
}

std::vector<NamePart> NamesIn(Argument const &argument, std::string_view token) {
    std::vector<NamePart> names;
    for (ArgumentKind const kind : {argument.kind, argument.alternative}) {
        if (kind != NONE && !IsPin(kind))
            names.push_back({kind, 0, token.size()});
        if (IsPin(kind) && NamesPin(token)) {
            std::size_t const point = FindPinPoint(token);
            names.push_back({kind == COMPONENT_PIN ? COMPONENT : INSTANCE, 0, point});
            names.push_back({PIN, point + 1, token.size() - point - 1});
        }
        // The name of a bundle names its members too: the library may refuse one of them.
        if (kind == SIGNAL) {
            Basis::StringBase<char> const text(token);
            Basis_Range member = {1, 0};
            while (text.NextTokenRange(member, ",\\", text.PARSE_SKIPPING_EMPTY))
                names.push_back({kind, member.first, member.last + 1 - member.first});
        }
    }
    return names;
}
