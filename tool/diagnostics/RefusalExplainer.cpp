// Explains a refused line: marks the token that the refusal is about and adds hints. What was
// refused is taken from the kind and the subject of the exception, never from its text.

#include "tool/diagnostics/RefusalExplainer.h"

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <initializer_list>
#include <string_view>
#include <vector>

#include "tool/diagnostics/Arguments.h"
#include "tool/diagnostics/Hints.h"
#include "tool/diagnostics/Keywords.h"
#include "tool/diagnostics/LineTokens.h"
#include "tool/diagnostics/Words.h"

using namespace Vesk_Hdl;
using enum ArgumentKind;

namespace {

/// A diagnostic of a line without its message, and the marking of what is wrong in the line.
class LineDiagnostic {
public:
    LineDiagnostic(std::string const &line, SourceRange const &place) : tokens(line) {
        diagnostic.place = place;
        diagnostic.source = line;
    }

protected:
    void Mark(int token) {
        diagnostic.place.column = tokens.GetColumn(token);
        diagnostic.place.length = tokens.GetLength(token);
    }

    /// After the last token, where another one is missing.
    void MarkEnd() {
        Mark(tokens.GetSize() - 1);
        diagnostic.place.column += diagnostic.place.length + 1;
        diagnostic.place.length = 1;
    }

    void Hint(std::string text) {
        if (!text.empty())
            diagnostic.hints.push_back(std::move(text));
    }

    LineTokens tokens;
    Diagnostic diagnostic;
};

/// Explains a line that was refused. `refusal.getSubject()` is what the refusal is about.
class RefusalExplainer : LineDiagnostic {
public:
    RefusalExplainer(std::string const &line, SourceRange const &place,
                     Basis::Exception const &refused, Model const &onModel, bool wantHints)
        : LineDiagnostic(line, place), refusal(refused), model(onModel), withHints(wantHints),
          command(CommandReference::FindFor(tokens.GetTokens())) {
        // Messages of the library end in a line feed, which is not part of what is shown.
        std::string_view text = refusal.getDescription();
        while (text.ends_with('\n'))
            text.remove_suffix(1);
        diagnostic.message = text;
    }

    Diagnostic Explain() {
        // The first argument is marked unless something better is found below; without a command,
        // the first word.
        Mark(std::min(command ? command->words : 0, tokens.GetSize() - 1));
        if (command)
            given = MatchArguments(*command, tokens.GetTokens());
        ExplainKind();
        // The engine separates words at blanks only. A tab in a line is easy to miss, as it looks
        // like blanks.
        if (diagnostic.source.find('\t') != std::string::npos)
            Hint("words are separated by blanks: a tab is a letter like any other");
        return std::move(diagnostic);
    }

private:
    using Kinds = std::initializer_list<ArgumentKind>;

    void ExplainKind();
    void ExplainKeyword();
    void ExplainArguments();
    void ExplainWord(Vocabulary::Choice const &choice);
    void ExplainMissing(ArgumentKind kind);
    void ExplainMissingPin();
    GivenArgument const *MarkSubject(Kinds kinds);

    std::string_view At(GivenArgument const &each) const { return tokens.At(each.token); }

    Basis::Exception const &refusal;
    Model const &model;
    bool withHints;
    CommandHelp const *command;
    std::vector<GivenArgument> given;
};

void RefusalExplainer::ExplainKind() {
    switch (refusal.getKind()) {
    case Exception::UNKNOWN_COMMAND:
        ExplainKeyword();
        break;
    case Exception::INVALID_ARGUMENTS:
        ExplainArguments();
        break;
    case Exception::NAME_TAKEN:
    case Exception::BUS_DECLARED:
        MarkSubject({COMPONENT, INSTANCE, SIGNAL});
        if (withHints)
            Hint(HintForTaken(model, refusal.getSubject()));
        break;
    case Exception::PIN_TAKEN:
        MarkSubject({PIN});
        break;
    case Exception::COMPONENT_NOT_FOUND:
        ExplainMissing(COMPONENT);
        break;
    case Exception::INSTANCE_NOT_FOUND:
        ExplainMissing(INSTANCE);
        break;
    case Exception::SIGNAL_NOT_FOUND:
        ExplainMissing(SIGNAL);
        break;
    case Exception::PIN_NOT_FOUND:
        ExplainMissingPin();
        break;
    case Exception::ATTRIBUTE_NOT_FOUND:
        ExplainMissing(ATTRIBUTE);
        break;
    case Exception::NOT_A_USER_ATTRIBUTE:
        MarkSubject({ATTRIBUTE});
        Hint("the attribute is not of type User: add it with -TYPE=User");
        break;
    // An option is one token, a prefix and a word: the word is what is wrong.
    case Exception::INVALID_ATTRIBUTE_TYPE:
        ExplainWord(Vocabulary::TYPE);
        break;
    case Exception::INVALID_GENERIC_WORD:
        ExplainWord(Vocabulary::GENERIC);
        break;
    case Exception::INVALID_SYNTHESIS_WORD:
        ExplainWord(Vocabulary::SYNATTR);
        break;
    default:
        break;
    }
}

/// Marks the first wrong word of the keyword, or the end if words are missing.
void RefusalExplainer::ExplainKeyword() {
    std::string const part = KeywordPart(tokens.GetTokens());
    if (std::vector<std::string_view> const words = NextKeywordWords(part); !words.empty()) {
        MarkEnd();
        Hint("the keyword goes on with " + Alternatives(words));
        return;
    }
    // No keyword begins like this line. Either the line is misspelled, or its first word is
    // something else altogether.
    CommandHelp const *const nearest = NearestKeyword(part);
    if (!nearest) {
        Hint("`vesk-hdl commands` lists all keywords");
        return;
    }
    std::vector<std::string> const words = WordsOf(nearest->keyword);
    int wrong = 0;
    while (wrong < tokens.GetSize() && wrong < nearest->words &&
           SameIgnoringCase(tokens.At(wrong), words[static_cast<std::size_t>(wrong)]))
        ++wrong;
    if (wrong < tokens.GetSize())
        Mark(wrong);
    else
        MarkEnd();
    Hint("the nearest keyword is " + Quoted(nearest->keyword));
}

/// Marks the first token that does not fit its argument, or the place where one is missing.
void RefusalExplainer::ExplainArguments() {
    for (GivenArgument const &each : given)
        if (each.token < 0) {
            MarkEnd();
            break;
        } else if (!Fits(each.argument, At(each))) {
            Mark(each.token);
            Hint(HintForUnfit(*command, each.argument, At(each)));
            break;
        }
    // The grammar in any case: the line may be wrong in more than one place.
    Hint("the grammar is " + std::string(command->keyword) + (*command->grammar ? " " : "") +
         command->grammar);
}

/// Marks a word that an option does not take. If an option is given twice, the library reads the
/// later one, so that the search is from the end.
void RefusalExplainer::ExplainWord(Vocabulary::Choice const &choice) {
    auto const found = std::find_if(given.rbegin(), given.rend(), [&](GivenArgument const &each) {
        return each.token >= 0 && BeginsWith(At(each), choice.prefix);
    });
    if (found == given.rend())
        return;
    Mark(found->token);
    std::vector<std::string_view> const words(choice.words.begin(), choice.words.end());
    Hint(std::string(choice.prefix) + " takes " + Alternatives(words));
}

void RefusalExplainer::ExplainMissing(ArgumentKind kind) {
    MarkSubject({kind});
    Hint(HintForMissing(refusal.getKind(), refusal.getSubject()));
}

void RefusalExplainer::ExplainMissingPin() {
    GivenArgument const *const found = MarkSubject({PIN});
    std::string holder;
    std::string pin;
    if (!withHints || !found || !SplitPinReference(At(*found), holder, pin))
        return;
    bool const ofInstance =
        found->argument.kind == INSTANCE_PIN || found->argument.alternative == INSTANCE_PIN;
    Hint(HintForMissingPin(model, ofInstance, holder, pin));
}

/// Marks the name that the refusal is about, where it occurs in the line as one of these kinds. A
/// line such as "ADD INSTANCE U1 U1" may hold the name twice: a taken name is the new one, so names
/// that the line declares are looked at first.
GivenArgument const *RefusalExplainer::MarkSubject(Kinds kinds) {
    // The subject of a refusal is spelled as the library stores names, with round brackets; the
    // line need not be.
    auto const normalized = [](std::string_view text) {
        Basis::StringBase<char> form(text);
        Object::NormalizeName(form);
        return form;
    };
    auto const wanted = normalized(refusal.getSubject());
    for (bool const declares : {true, false})
        for (GivenArgument const &each : given) {
            if (each.token < 0 || each.argument.declares != declares)
                continue;
            std::string_view const text = At(each);
            for (NamePart const &part : NamesIn(each.argument, text)) {
                if (std::find(kinds.begin(), kinds.end(), part.kind) == kinds.end() ||
                    !SameIgnoringCase(normalized(text.substr(part.offset, part.length)).View(),
                                      wanted.View()))
                    continue;
                Mark(each.token);
                if (tokens.GetLength(each.token) == text.size()) { // no quotes, no backslash
                    diagnostic.place.column += static_cast<unsigned>(part.offset);
                    diagnostic.place.length = static_cast<unsigned>(part.length);
                }
                return &each;
            }
        }
    return nullptr;
}

/// Explains what is not a refusal of the model.
class FaultExplainer : LineDiagnostic {
public:
    using LineDiagnostic::LineDiagnostic;

    Diagnostic ExplainWrite(WriteStatus const &write) {
        std::string const file(write.fileName.View());
        diagnostic.message = "cannot write " + file + ": " + FailureOf(write);
        CommandHelp const *const command = CommandReference::FindFor(tokens.GetTokens());
        // The last token of that text: the file name comes after the options.
        for (int token = command ? command->words : 0; token < tokens.GetSize(); ++token)
            if (tokens.At(token) == file)
                Mark(token);
        return std::move(diagnostic);
    }

    Diagnostic ExplainNul(std::size_t at) {
        diagnostic.message = "the line holds a NUL byte";
        diagnostic.place.column = static_cast<unsigned>(at) + 1;
        diagnostic.place.length = 1;
        return std::move(diagnostic);
    }
};

} // namespace

Diagnostic ExplainRefusal(std::string const &line, SourceRange const &place,
                          Basis::Exception const &refusal, Model const &model, bool withHints) {
    return RefusalExplainer(line, place, refusal, model, withHints).Explain();
}

std::string FailureOf(WriteStatus const &write) {
    return write.reason.IsEmpty() ? std::strerror(write.error) : write.reason.GetText();
}

Diagnostic ExplainWrite(std::string const &line, SourceRange const &place,
                        WriteStatus const &write) {
    return FaultExplainer(line, place).ExplainWrite(write);
}

Diagnostic ExplainNul(std::string const &line, SourceRange const &place, std::size_t at) {
    return FaultExplainer(line, place).ExplainNul(at);
}
