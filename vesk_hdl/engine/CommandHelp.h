#pragma once

#include <span>

#include "vesk_hdl/Api.h"
#include "vesk_hdl/netlist/Vocabulary.h"

namespace Vesk_Hdl {

class StringArray;

/// The kinds of arguments of commands: what a line may have in a place. ArgumentHelp describes each
/// of them.
enum class ArgumentKind {
    NONE,            ///< no argument
    ATTRIBUTE,       ///< the name of an attribute
    ATTRIBUTE_TYPE,  ///< "-TYPE=" and the type of an attribute
    COMPONENT,       ///< the name of a component
    COMPONENT_PIN,   ///< a pin of a component, see SplitPinReference
    FILE_NAME,       ///< a path
    FLAG,            ///< "false", or any other word for true
    INSTANCE,        ///< the name of an instance
    INSTANCE_PIN,    ///< a pin of an instance
    LIBRARY,         ///< what a library or use clause names
    LOWERCASE_NAMES, ///< a kind of names for LOWERCASE
    NAME,            ///< any word
    PIN,             ///< the name of a pin, without its component
    POLARITY,        ///< a direction
    SETTING,         ///< an option of an attribute
    SIGNAL,          ///< the name of a net, a bus, a part of one, or a compound
    SYNTHESIS_TOOL,  ///< a tool in whose syntax attributes are written
    TEXT,            ///< all words to the end of the line
    UPPERCASE_NAMES, ///< a kind of names for UPPERCASE
    USER_TYPE,       ///< the name of a type
    VALUE,           ///< the value of an attribute or a constant
    WRITE_OPTION     ///< an option of a write command
};
/// How many kinds there are.
inline constexpr int ARGUMENT_KINDS = static_cast<int>(ArgumentKind::WRITE_OPTION) + 1;

/// One argument of a command.
struct Argument {
    /// What may be given.
    ArgumentKind kind = ArgumentKind::NONE;
    /// Whether it may be left out. It is given if the line has more words than the other arguments
    /// need; one of kind ATTRIBUTE_TYPE if its prefix is there. Of several optional arguments in a
    /// row the earlier ones are given first.
    bool optional = false;
    /// Whether it is the name of something that the command declares.
    bool declares = false;
    /// What may be given instead; NONE if nothing else.
    ArgumentKind alternative = ArgumentKind::NONE;
};

/// The description of a kind of argument. Its texts are never null and valid as long as the library
/// is loaded.
struct ArgumentHelp {
    /// How grammars show it.
    char const *word = "";
    /// What may be given, a phrase; "" if the word says all.
    char const *meaning = "";
    /// The words that may be given, if they are fixed; each choice has a prefix of its own.
    std::span<Vocabulary::Choice const> choices = {};
    /// Whether any word that is not among the choices is refused.
    bool fixed = false;
    /// Whether it takes all words to the end of the line.
    bool repeated = false;
};

/// The description of one command for its users. Its texts are never null and valid as long as the
/// library is loaded.
struct CommandHelp {
    /// The keyword as it is registered. It matches in any case.
    char const *keyword = "";
    /// The arguments as a line of text: words that a user replaces, `[` `]` around what may be left
    /// out, `|` between alternatives, `...` after what takes all words to the end of the line.
    char const *grammar = "";
    /// What the command does, a sentence.
    char const *summary = "";
    /// What is refused besides a line with too few words; several things are separated by "; ".
    char const *refused = "";
    /// What else a user should know, sentences.
    char const *notes = "";
    /// Command lines with "\n" between them, which an empty design accepts.
    char const *example = "";
    /// A line that is refused after the example; may be empty.
    char const *wrong = "";
    /// The message of that refusal, without its line end.
    char const *message = "";
    /// The arguments that follow the keyword, in order.
    std::span<Argument const> arguments = {};
    /// The number of words in the keyword, which is the index of the first argument among the
    /// tokens of a line.
    int words = 0;
};

/// The description of all commands of the library, in the order of their registration. Commands
/// that a client registers with a factory are not among them. It may be used from several threads.
class VESK_HDL_API CommandReference {
public:
    /// The number of commands.
    static int GetCount();
    /// The command of an index from 0 on; null outside.
    static CommandHelp const *GetAt(int index);
    /// The command of a keyword, in any case and with single blanks between its words; null if
    /// there is none.
    static CommandHelp const *Find(char const *keyword);
    /// The command that a line with these tokens runs, found as CommandFactory finds it; null if
    /// there is none.
    static CommandHelp const *FindFor(StringArray const &tokens);
    /// The description of a kind of argument.
    static ArgumentHelp const &GetArgument(ArgumentKind kind);
};

} // namespace Vesk_Hdl
