#pragma once

#include <span>

#include "vesk_hdl/Api.h"
#include "vesk_hdl/netlist/Vocabulary.h"

namespace Vesk_Hdl {

class StringArray;

/// What may be given for an argument of a command. ArgumentHelp says what each of them is.
enum class ArgumentKind {
    NONE, ///< no argument
    ATTRIBUTE,
    ATTRIBUTE_TYPE,
    COMPONENT,
    COMPONENT_PIN,
    FILE_NAME,
    FLAG,
    INSTANCE,
    INSTANCE_PIN,
    LIBRARY,
    LOWERCASE_NAMES,
    NAME,
    PIN,
    POLARITY,
    SETTING,
    SIGNAL,
    SYNTHESIS_TOOL,
    TEXT,
    UPPERCASE_NAMES,
    USER_TYPE,
    VALUE,
    WRITE_OPTION
};
inline constexpr int ARGUMENT_KINDS = static_cast<int>(ArgumentKind::WRITE_OPTION) + 1;

/// An argument of a command.
struct Argument {
    ArgumentKind kind = ArgumentKind::NONE;
    /// Whether it may be left out. It is given if the line has more words than the other arguments
    /// need; one of kind ATTRIBUTE_TYPE if its prefix is there. Of optional arguments in a row the
    /// earlier ones are given first.
    bool optional = false;
    bool declares = false; ///< it is the name of something new
    /// What may be given in its place; NONE if nothing else.
    ArgumentKind alternative = ArgumentKind::NONE;
};

/// The description of a kind of argument. All texts last as long as the library and are never null.
struct ArgumentHelp {
    char const *word = "";    ///< as grammars show it
    char const *meaning = ""; ///< what may be given, a phrase; "" if the word says it
    /// The words that may be given, if there are fixed ones; each choice has a prefix of its own.
    std::span<Vocabulary::Choice const> choices = {};
    bool fixed = false;    ///< any word but those of the choices is refused
    bool repeated = false; ///< it takes all words up to the end of the line
};

/// The description of one command for its users. All texts last as long as the library and are
/// never null.
struct CommandHelp {
    char const *keyword = ""; ///< as registered; matches in any case
    /// What follows the keyword: words to be replaced, `[` `]` around what may be missing, `|`
    /// between alternatives, `...` for words up to the end of the line. It shows `arguments`.
    char const *grammar = "";
    char const *summary = ""; ///< what it does, a sentence
    /// What is refused besides a line with too few words, separated by "; ".
    char const *refused = "";
    char const *notes = "";   ///< what else is worth knowing, sentences
    char const *example = ""; ///< lines, "\n" between them, that an empty design accepts
    char const *wrong = "";   ///< a line that is refused after the example; may be empty
    char const *message = ""; ///< with which message, without its end of line
    /// What follows the keyword, in order.
    std::span<Argument const> arguments = {};
    /// The number of words in the keyword, which is the index of the first argument among the
    /// tokens of a line.
    int words = 0;
};

/// The commands of the library, in the order of their registration.
class VESK_HDL_API CommandReference {
public:
    /// The number of commands.
    static int GetCount();
    /// The command of that index; null for an index outside of 0 to GetCount() - 1.
    static CommandHelp const *GetAt(int index);
    /// By keyword in any case, its words separated by single blanks; null if there is none.
    static CommandHelp const *Find(char const *keyword);
    /// The command of a line's tokens, found as CommandFactory finds it; null if there is none.
    static CommandHelp const *FindFor(StringArray const &tokens);
    /// What an argument of that kind is.
    static ArgumentHelp const &GetArgument(ArgumentKind kind);
};

} // namespace Vesk_Hdl
