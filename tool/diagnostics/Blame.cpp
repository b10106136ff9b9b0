#include "tool/diagnostics/Blame.h"

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <string_view>
#include <vector>

#include "tool/diagnostics/LineTokens.h"
#include "tool/diagnostics/Words.h"

using namespace Vesk_Hdl;

namespace {

/// Options of attribute commands and the words that they take.
struct WordOption {
    std::string_view prefix;
    std::vector<std::string_view> words;
};
WordOption const TYPE = {"-TYPE=",
                         {"String", "Integer", "Float", "Boolean", "Bit", "BitVector", "User"}};
WordOption const GENERIC = {"-GENERIC=", {"NONE", "NOSYN", "SYN"}};
WordOption const SYNATTR = {"-SYNATTR=", {"NONE", "ASSIGN", "ASSIGNNODEC"}};

bool IsOption(std::string_view token, WordOption const &option) {
    return SameIgnoringCase(token.substr(0, option.prefix.size()), option.prefix);
}

/// A line that was refused, and the diagnostic in the making.
class Refusal {
public:
    Refusal(std::string const &line, Place const &place, std::string text, Model const &onModel)
        : tokens(line), model(onModel) {
        while (!text.empty() && text.back() == '\n')
            text.pop_back();
        diagnostic.place = place;
        diagnostic.message = std::move(text);
        diagnostic.source = line;
        command = KeywordOf(tokens.GetTokens(), keywordWords);
    }

    Diagnostic Explain() {
        if (!command)
            BlameKeyword();
        else if (SameIgnoringCase(diagnostic.message,
                                  std::string(command->keyword) + ": Invalid Arguments."))
            BlameArguments();
        else
            BlameName();
        if (diagnostic.source.find('\t') != std::string::npos)
            Hint("words are separated by blanks: a tab is a letter like any other");
        return std::move(diagnostic);
    }

private:
    // What an argument has to be, by the word that stands for it in the grammar.
    struct Placeholder {
        std::string word;
        bool optional;
        bool toEndOfLine;
    };

    void Mark(int token) {
        diagnostic.place.column = tokens.GetColumn(token);
        diagnostic.place.length = tokens.GetLength(token);
    }

    /// Behind the last token, where another one is missing.
    void MarkEnd() {
        int const last = tokens.GetSize() - 1;
        diagnostic.place.column = tokens.GetColumn(last) + tokens.GetLength(last) + 1;
        diagnostic.place.length = 1;
    }

    void MarkPart(int token, std::size_t offset, std::size_t length) {
        Mark(token);
        diagnostic.place.column += static_cast<unsigned>(offset);
        diagnostic.place.length = static_cast<unsigned>(length);
    }

    void Hint(std::string text) { diagnostic.hints.push_back(std::move(text)); }

    void BlameKeyword();
    void BlameArguments();
    void BlameName();
    bool BlameOption(WordOption const &option);

    std::vector<Placeholder> Grammar() const;
    bool Fits(Placeholder const &placeholder, std::string_view token);
    bool FindName(std::string_view name, std::string_view kind);
    void HintForMissing(std::string_view kind, std::string_view name);
    void HintForTaken(std::string const &name);
    std::string PinOfThatBase() const;

    LineTokens tokens;
    Model const &model;
    Diagnostic diagnostic;
    CommandHelp const *command = nullptr;
    int keywordWords = 0;
};

/// Where the keyword goes wrong, and the nearest one if one is near enough to be meant.
void Refusal::BlameKeyword() {
    Mark(0);
    std::string const part = KeywordPart(tokens.GetTokens());
    if (std::vector<std::string_view> const words = KeywordWordsBehind(part); !words.empty()) {
        MarkEnd();
        Hint("the keyword goes on with " + Alternatives(words));
        return;
    }
    CommandHelp const *const nearest = NearestKeyword(part);
    if (!nearest) {
        Hint("`vesk-hdl commands` lists all keywords");
        return;
    }
    std::vector<std::string> const words = WordsOf(nearest->keyword);
    int wrong = 0;
    while (wrong < tokens.GetSize() && wrong < static_cast<int>(words.size()) &&
           SameIgnoringCase(tokens.At(wrong), words[static_cast<std::size_t>(wrong)]))
        ++wrong;
    if (wrong < tokens.GetSize())
        Mark(wrong);
    else
        MarkEnd();
    Hint("the nearest keyword is " + Quoted(nearest->keyword));
}

std::vector<Refusal::Placeholder> Refusal::Grammar() const {
    std::vector<Placeholder> placeholders;
    int depth = 0;
    for (std::string word : WordsOf(command->grammar)) {
        int const opened = static_cast<int>(std::count(word.begin(), word.end(), '['));
        int const closed = static_cast<int>(std::count(word.begin(), word.end(), ']'));
        bool const optional = depth + opened > 0;
        depth += opened - closed;
        word.erase(
            std::remove_if(word.begin(), word.end(), [](char c) { return c == '[' || c == ']'; }),
            word.end());
        std::size_t const dots = word.find("...");
        placeholders.push_back({word.substr(0, dots), optional, dots != std::string::npos});
    }
    return placeholders;
}

/// Whether a token can stand for a placeholder. Where it cannot, a hint tells what can.
bool Refusal::Fits(Placeholder const &placeholder, std::string_view token) {
    std::string const text(token);
    if (placeholder.word == "polarity") {
        if (Polarity::GetValue(text.c_str()) != Polarity::INVALID)
            return true;
        Hint(SameIgnoringCase(token, "inout")
                 ? "the word for both directions is BiDirectional, or any beginning of it"
                 : "a polarity is Input, Output or BiDirectional, or any beginning of one, in any "
                   "case");
        return false;
    }
    if (placeholder.word == "component.pin" || placeholder.word == "instance.pin") {
        std::size_t const point =
            token.find('.', std::min(token.find_first_not_of('.'), token.size()));
        if (point != std::string_view::npos && point + 1 < token.size())
            return true;
        Hint("a pin is named with its owner, " + placeholder.word);
        return false;
    }
    if (placeholder.word == "setting") {
        if (IsOption(token, GENERIC) || IsOption(token, SYNATTR))
            return true;
        Hint("a setting is -GENERIC=" + Alternatives(GENERIC.words) +
             ", or -SYNATTR=" + Alternatives(SYNATTR.words));
        return false;
    }
    if (placeholder.word.rfind("instance|si", 0) == 0) {
        std::string const signalWord = placeholder.word.substr(9, 6);
        for (std::string_view const word :
             {std::string_view("instance"), std::string_view(signalWord),
              std::string_view("component")})
            if (SameIgnoringCase(token, word))
                return true;
        if (SameIgnoringCase(token, "signal") || SameIgnoringCase(token, "siganl"))
            Hint("the word for signals that " + std::string(command->keyword) + " wants is " +
                 Quoted(signalWord));
        else
            Hint("the words are \"instance\", " + Quoted(signalWord) + " and \"component\"");
        return false;
    }
    return !token.empty() || placeholder.word == "value" || placeholder.word == "text";
}

/// The first token that does not fit the grammar, or the place where one is missing.
void Refusal::BlameArguments() {
    std::vector<Placeholder> const grammar = Grammar();
    auto required =
        std::count_if(grammar.begin(), grammar.end(),
                      [](Placeholder const &placeholder) { return !placeholder.optional; });
    int token = keywordWords;
    Mark(std::min(keywordWords, tokens.GetSize() - 1));
    for (Placeholder const &placeholder : grammar) {
        if (placeholder.optional) {
            bool const given = placeholder.word == "-TYPE=type"
                                   ? IsOption(tokens.At(token), TYPE)
                                   : tokens.GetSize() - token > required;
            if (!given)
                continue;
        } else {
            --required;
        }
        if (token >= tokens.GetSize()) {
            MarkEnd();
            break;
        }
        if (!Fits(placeholder, tokens.At(token))) {
            Mark(token);
            break;
        }
        ++token;
    }
    Hint("the grammar is " + std::string(command->keyword) + (*command->grammar ? " " : "") +
         command->grammar);
}

/// Looks for the name that a message quotes: as a whole token, then as a part of one, such as the
/// pin of INSTANCE.PIN or the member of a compound; first in an argument of the kind in question.
bool Refusal::FindName(std::string_view name, std::string_view kind) {
    auto const normalized = [](std::string_view text) {
        Basis::StringBase<char> form(text);
        Object::NormalizeName(form);
        return std::string(form.View());
    };
    std::string const wanted = normalized(name);
    if (wanted.empty())
        return false;
    std::vector<Placeholder> const grammar = Grammar();
    auto const isOfKind = [&](int token) {
        std::size_t const at = static_cast<std::size_t>(token - keywordWords);
        return at < grammar.size() && grammar[at].word.find(kind) != std::string::npos;
    };
    for (bool const anyKind : {false, true})
        for (int token = keywordWords; token < tokens.GetSize(); ++token)
            if ((anyKind || isOfKind(token)) &&
                SameIgnoringCase(normalized(tokens.At(token)), wanted)) {
                Mark(token);
                return true;
            }
    for (int token = keywordWords; token < tokens.GetSize(); ++token) {
        std::string const text = normalized(tokens.At(token));
        auto const at =
            std::search(text.begin(), text.end(), wanted.begin(), wanted.end(), [](char a, char b) {
                return SameIgnoringCase({&a, 1}, {&b, 1});
            });
        if (at == text.end())
            continue;
        bool const asWritten = tokens.GetLength(token) == text.size(); // no quotes, no backslash
        if (asWritten)
            MarkPart(token, static_cast<std::size_t>(at - text.begin()), wanted.size());
        else
            Mark(token);
        return true;
    }
    return false;
}

/// OWNER.PIN of a pin that differs from the one in the line by its range alone; empty if there is
/// none.
std::string Refusal::PinOfThatBase() const {
    std::string found;
    for (int token = keywordWords; token < tokens.GetSize(); ++token) {
        std::string const text(tokens.At(token));
        std::size_t const point = text.find('.');
        if (point == std::string::npos)
            continue;
        std::string const owner = text.substr(0, point);
        auto const base = Object::GetBaseName(text.substr(point + 1).c_str());
        auto const look = [&](Pin const *pin) {
            if (SameIgnoringCase(pin->GetBaseName().View(), base.View()))
                found = owner + "." + std::string(pin->GetNameRef().View());
        };
        if (Instance const *const instance = model.GetInstance(owner.c_str()))
            ForEach(instance->GetPinIterator(), look);
        else if (Component const *const component = model.GetComponent(owner.c_str()))
            ForEach(component->GetPinIterator(), look);
    }
    return found;
}

/// What would make a name known, for a message that ends in "not found."
void Refusal::HintForMissing(std::string_view kind, std::string_view name) {
    std::string const text(name);
    Basis::StringBase<char> form(name);
    Object::NormalizeName(form);
    if (kind == "signal") {
        // A missing instance of a connection is told as a signal.
        for (int token = keywordWords; token < tokens.GetSize(); ++token)
            if (tokens.At(token).size() > name.size() + 1 && tokens.At(token)[name.size()] == '.' &&
                SameIgnoringCase(tokens.At(token).substr(0, name.size()), name)) {
                Hint("there is no instance of that name: declare it first with ADD INSTANCE");
                return;
            }
        if (BusIndex::IsBusIndexName(form))
            Hint("declare the bus first: ADD SIGNAL " +
                 std::string(Object::GetBaseName(text.c_str()).View()) + "(LEFT:RIGHT)");
        else
            Hint("declare it first with ADD SIGNAL or ADD PORT");
    } else if (kind == "component") {
        Hint("declare it first with ADD COMPONENT");
    } else if (kind == "attribute") {
        Hint("add it first with ADD ... ATTRIBUTE");
    } else if (std::string const pin = PinOfThatBase(); kind == "pin" && !pin.empty()) {
        Hint("the pin is called " + pin);
    } else if (kind == "pin") {
        Hint("declare it with ADD PIN before the instance is made: instances made earlier do not "
             "get it");
    } else {
        Hint("declare it first");
    }
}

/// Who has a name already, and how it is spelled.
void Refusal::HintForTaken(std::string const &name) {
    auto const tell = [&](char const *kind, Object const *object) {
        if (object)
            Hint(std::string("the ") + kind + " " + Quoted(object->GetNameRef().View()) +
                 " has it; names ignore case");
        return object != nullptr;
    };
    tell("component", model.GetComponent(name.c_str())) ||
        tell("instance", model.GetInstance(name.c_str())) ||
        tell("signal", model.GetSignal(name.c_str())) ||
        tell("bus", model.GetNetlist()->GetParentBus(name.c_str()));
}

/// A refusal of the model: a word of an option, or a name that the message quotes last.
void Refusal::BlameName() {
    int const firstArgument = std::min(keywordWords, tokens.GetSize() - 1);
    Mark(firstArgument);
    std::string const &message = diagnostic.message;
    if (message == "Invalid attribute type.") {
        BlameOption(TYPE);
        return;
    }
    if (message == "Invalid generic value.") {
        BlameOption(GENERIC) || BlameOption(SYNATTR);
        return;
    }
    std::size_t const close = message.rfind('"');
    std::size_t const open = close == std::string::npos || close == 0
                                 ? std::string::npos
                                 : message.rfind('"', close - 1);
    if (open == std::string::npos)
        return;
    std::string const name = message.substr(open + 1, close - open - 1);
    std::string kind = Lowercase(message.substr(0, message.find(' ')));
    FindName(name, kind);
    if (message.compare(close, std::string::npos, "\" not found.") == 0)
        HintForMissing(kind, name);
    else if (kind == "identifier" || kind == "signal")
        HintForTaken(name);
}

/// The first option of that kind whose word is none that it takes.
bool Refusal::BlameOption(WordOption const &option) {
    for (int token = keywordWords; token < tokens.GetSize(); ++token) {
        std::string_view const text = tokens.At(token);
        auto const isWord = [&](std::string_view word) {
            return SameIgnoringCase(text.substr(option.prefix.size()), word);
        };
        if (!IsOption(text, option) ||
            std::any_of(option.words.begin(), option.words.end(), isWord))
            continue;
        Mark(token);
        Hint(std::string(option.prefix) + " takes " + Alternatives(option.words));
        return true;
    }
    return false;
}

/// A diagnostic of a line without its message.
Diagnostic At(std::string const &line, Place const &place) {
    Diagnostic diagnostic;
    diagnostic.place = place;
    diagnostic.source = line;
    return diagnostic;
}

} // namespace

CommandHelp const *KeywordOf(StringArray const &tokens, int &words) {
    CommandHelp const *found = nullptr;
    StringArray begin;
    for (int i = 0; i < std::min(tokens.GetSize(), MOST_KEYWORD_WORDS); ++i) {
        begin.Add(tokens.At(i));
        if (CommandHelp const *const command = CommandReference::Find(KeywordPart(begin).c_str())) {
            found = command;
            words = i + 1;
        }
    }
    return found;
}

Diagnostic BlameRefusal(std::string const &line, Place const &place, std::string text,
                        Model const &model) {
    return Refusal(line, place, std::move(text), model).Explain();
}

std::string FailureOf(WriteStatus const &write) {
    return write.reason.IsEmpty() ? std::strerror(write.error) : write.reason.GetText();
}

Diagnostic BlameWrite(std::string const &line, Place const &place, WriteStatus const &write) {
    LineTokens const tokens(line);
    Diagnostic diagnostic = At(line, place);
    std::string const file(write.fileName.View());
    diagnostic.message = "cannot write " + file + ": " + FailureOf(write);
    for (int token = 2; token < tokens.GetSize(); ++token)
        if (tokens.At(token) == file) {
            diagnostic.place.column = tokens.GetColumn(token);
            diagnostic.place.length = tokens.GetLength(token);
        }
    return diagnostic;
}

Diagnostic BlameNul(std::string const &line, Place const &place, std::size_t at) {
    Diagnostic diagnostic = At(line, place);
    diagnostic.message = "the line holds a NUL byte";
    diagnostic.place.column = static_cast<unsigned>(at) + 1;
    diagnostic.place.length = 1;
    return diagnostic;
}
