#pragma once

#include "vesk_hdl/Api.h"

namespace Vesk_Hdl {

/// What a user of the command language is told of one command. All texts last as long as the
/// library and are never null.
struct CommandHelp {
    char const *keyword = ""; ///< as registered; matches in any case
    /// What follows the keyword: words to be replaced, `[` `]` around what may be missing, `|`
    /// between alternatives, `...` for words up to the end of the line.
    char const *grammar = "";
    char const *summary = ""; ///< what it does, a sentence
    /// What is refused besides a line with too few words, separated by "; ".
    char const *refused = "";
    char const *notes = "";   ///< what else is worth knowing, sentences
    char const *example = ""; ///< lines, "\n" between them, that an empty design accepts
    char const *wrong = "";   ///< a line that is refused behind the example; may be empty
    char const *message = ""; ///< with which message, without its end of line
};

/// The commands of the library, in the order of their registration.
class VESK_HDL_API CommandReference {
public:
    static int GetCount();
    /// Null for an index outside of 0 to GetCount() - 1.
    static CommandHelp const *GetAt(int index);
    /// By keyword in any case, its words separated by single blanks; null if there is none.
    static CommandHelp const *Find(char const *keyword);
};

} // namespace Vesk_Hdl
