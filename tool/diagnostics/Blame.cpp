#include "tool/diagnostics/Blame.h"

#include <algorithm>
#include <cerrno>
#include <climits>
#include <cstring>
#include <functional>
#include <numeric>
#include <string_view>
#include <vector>

#include "tool/diagnostics/LineTokens.h"

using namespace Vesk_Hdl;

namespace {

constexpr int MOST_KEYWORD_WORDS = 5;

bool SameIgnoringCase(std::string_view left, std::string_view right) {
    return left.size() == right.size() &&
           std::equal(left.begin(), left.end(), right.begin(), [](char a, char b) {
               auto const lower = [](char c) { return c >= 'A' && c <= 'Z' ? c - 'A' + 'a' : c; };
               return lower(a) == lower(b);
           });
}

std::string Lowercase(std::string text) {
    for (char &c : text)
        if (c >= 'A' && c <= 'Z')
            c = static_cast<char>(c - 'A' + 'a');
    return text;
}

/// "A, B or C"
std::string Alternatives(std::vector<std::string_view> const &words) {
    std::string text;
    for (std::size_t i = 0; i < words.size(); ++i)
        text.append(i == 0 ? "" : i + 1 < words.size() ? ", " : " or ").append(words[i]);
    return text;
}

std::string Quoted(std::string_view text) { return '"' + std::string(text) + '"'; }

std::vector<std::string> WordsOf(std::string_view text) {
    std::vector<std::string> words;
    for (std::size_t at = 0; at < text.size();) {
        std::size_t const end = std::min(text.find(' ', at), text.size());
        if (end > at)
            words.emplace_back(text.substr(at, end - at));
        at = end + 1;
    }
    return words;
}

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
    std::string WordsBehindLine() const;
    void BlameArguments();
    void BlameName();
    bool BlameOption(WordOption const &option);

    std::vector<Placeholder> Grammar() const;
    bool Fits(Placeholder const &placeholder, std::string_view token);
    bool FindName(std::string_view name, std::string_view kind);
    void HintForMissing(std::string_view kind, std::string_view name);
    void HintForTaken(std::string const &name);

    LineTokens tokens;
    Model const &model;
    Diagnostic diagnostic;
    CommandHelp const *command = nullptr;
    int keywordWords = 0;
};

/// The number of edits (a letter more, less, other, or two exchanged) between two texts, case
/// ignored.
int Distance(std::string_view left, std::string_view right) {
    std::size_t const width = right.size() + 1;
    std::vector<int> before(width);
    std::vector<int> row(width);
    std::vector<int> beforeThat(width);
    std::iota(row.begin(), row.end(), 0);
    for (std::size_t i = 1; i <= left.size(); ++i) {
        beforeThat.swap(before);
        before.swap(row);
        row[0] = static_cast<int>(i);
        for (std::size_t j = 1; j < width; ++j) {
            auto const same = [&](std::size_t a, std::size_t b) {
                return SameIgnoringCase(left.substr(a, 1), right.substr(b, 1));
            };
            row[j] = std::min(
                {before[j] + 1, row[j - 1] + 1, before[j - 1] + (same(i - 1, j - 1) ? 0 : 1)});
            if (i > 1 && j > 1 && same(i - 1, j - 2) && same(i - 2, j - 1))
                row[j] = std::min(row[j], beforeThat[j - 2] + 1);
        }
    }
    return row[width - 1];
}

/// The words with which keywords go on where the line ends; empty if there are none.
std::string Refusal::WordsBehindLine() const {
    std::string const begin = std::string(tokens.GetTokens().Concatenate(" ").View()) + " ";
    std::vector<std::string_view> words;
    for (int i = 0; i < CommandReference::GetCount(); ++i) {
        std::string_view rest = CommandReference::GetAt(i)->keyword;
        if (!SameIgnoringCase(rest.substr(0, begin.size()), begin))
            continue;
        rest.remove_prefix(begin.size());
        rest = rest.substr(0, rest.find(' '));
        if (std::find(words.begin(), words.end(), rest) == words.end())
            words.push_back(rest);
    }
    return Alternatives(words);
}

/// The nearest keyword to what the line begins with, if one is near enough to be meant.
void Refusal::BlameKeyword() {
    constexpr std::size_t LONGEST_WORD = 40; // no word of a keyword comes near it
    CommandHelp const *nearest = CommandReference::GetAt(0);
    int least = INT_MAX;
    for (int i = 0; i < CommandReference::GetCount(); ++i) {
        CommandHelp const &candidate = *CommandReference::GetAt(i);
        std::vector<std::string> const words = WordsOf(candidate.keyword);
        std::string begin;
        for (int word = 0; word < static_cast<int>(words.size()) && word < tokens.GetSize(); ++word)
            (begin += word > 0 ? " " : "") += tokens.At(word).substr(0, LONGEST_WORD);
        int const distance = Distance(begin, candidate.keyword);
        if (distance < least) {
            nearest = &candidate;
            least = distance;
        }
    }
    Mark(0);
    if (std::string const words = WordsBehindLine(); !words.empty()) {
        MarkEnd();
        Hint("the keyword goes on with " + words);
        return;
    }
    if (least > static_cast<int>(std::strlen(nearest->keyword)) / 3) {
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
        if (token.size() == signalWord.size() && Distance(token, signalWord) <= 1)
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
    else if (message.find("already") != std::string::npos)
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
    std::string begin;
    for (int i = 0; i < tokens.GetSize() && i < MOST_KEYWORD_WORDS; ++i) {
        (begin += i > 0 ? " " : "") += tokens.At(i).View();
        if (CommandHelp const *const command = CommandReference::Find(begin.c_str())) {
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

Diagnostic BlameWrite(std::string const &line, Place const &place, WriteStatus const &write) {
    LineTokens const tokens(line);
    Diagnostic diagnostic = At(line, place);
    std::string const file(write.fileName.View());
    diagnostic.message = "cannot write " + file + ": " +
                         (write.error == EXDEV ? "it lies outside the folder that --restrict names"
                                               : std::strerror(write.error));
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
