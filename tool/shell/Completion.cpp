// Completion offers what the grammar of the command allows at the cursor. It reads the same tables
// as the commands, so that a new command needs nothing here.

#include "tool/shell/Completion.h"

#include <algorithm>
#include <filesystem>

#include "tool/diagnostics/Keywords.h"
#include "tool/diagnostics/Words.h"

using namespace Vesk_Hdl;
namespace fs = std::filesystem;

namespace {

class Completer {
public:
    Completer(std::string_view line, Model const &ofModel) : model(ofModel) {
        result.begin = line.find_last_of(' ') + 1; // npos + 1 is the beginning
        word = line.substr(result.begin);
        before = WordsOf(line.substr(0, result.begin));
    }

    Completions Complete() {
        OfferShellWords();
        OfferKeywordWords();
        OfferArguments();
        std::sort(result.candidates.begin(), result.candidates.end());
        result.candidates.erase(std::unique(result.candidates.begin(), result.candidates.end()),
                                result.candidates.end());
        return std::move(result);
    }

private:
    /// Names with blanks or quotes are left out: they are typed in quotes, and a beginning that is
    /// inserted without quotes would name something else.
    void Offer(std::string_view candidate) {
        bool const wantsQuotes = candidate.find_first_of(" \"'") != std::string_view::npos;
        if (BeginsWith(candidate, word) && !wantsQuotes)
            result.candidates.emplace_back(candidate);
    }

    template <class Words> void OfferAll(Words const &words) {
        for (std::string_view const each : words)
            Offer(each);
    }

    template <class T> void OfferNames(Iterator<T> objects) {
        ForEach(objects, [this](Object const *object) { Offer(object->GetNameRef().View()); });
    }

    void OfferShellWords() {
        if (before.empty())
            OfferAll(ShellWords());
        else if (before.size() == 1 && SameIgnoringCase(before[0], "show"))
            OfferAll(ShownThings());
        else if (before.size() == 2 && SameIgnoringCase(before[0], "show") &&
                 SameIgnoringCase(before[1], "pins")) {
            OfferNames(model.GetNetlist()->GetInstanceIterator());
            OfferNames(model.GetNetlist()->GetComponentIterator());
        }
    }

    void OfferKeywordWords() {
        std::size_t const first = !before.empty() && SameIgnoringCase(before[0], "help") ? 1 : 0;
        std::string words;
        for (std::size_t i = first; i < before.size(); ++i)
            words += (words.empty() ? "" : " ") + before[i];
        std::string const last = before.empty() ? word : before.back() + word;
        // Keywords are offered in the case in which the user types.
        bool const lower =
            std::any_of(last.begin(), last.end(), [](char c) { return c >= 'a' && c <= 'z'; });
        for (std::string_view const next : NextKeywordWords(words))
            Offer(lower ? Lowercase(next) : std::string(next));
    }

    /// The argument that comes next, and if it may be left out, the one after it.
    void OfferArguments() {
        StringArray tokens;
        for (std::string const &each : before)
            tokens.Add(each.c_str());
        CommandHelp const *const command = CommandReference::FindFor(tokens);
        if (!command)
            return;
        std::span<Argument const> const arguments = command->arguments;
        std::size_t next = 0;
        for (auto token = static_cast<std::size_t>(command->words); token < before.size();
             ++token) {
            while (next < arguments.size() && !MayBe(arguments[next], before[token]))
                ++next;
            ++next;
        }
        while (next < arguments.size()) {
            OfferArgument(arguments[next]);
            if (!arguments[next++].optional)
                break;
        }
    }

    /// Whether the word may be the value of an argument. An option is recognized by its words. Any
    /// other optional argument is taken as given, since its words can be anything.
    static bool MayBe(Argument const &argument, std::string const &text) {
        ArgumentHelp const &help = CommandReference::GetArgument(argument.kind);
        if (!argument.optional || help.choices.empty())
            return true;
        for (Vocabulary::Choice const &choice : help.choices)
            if (*choice.prefix ? BeginsWith(text, choice.prefix)
                               : Vocabulary::IndexOf(choice.words, text.c_str()) >= 0)
                return true;
        return false;
    }

    void OfferArgument(Argument const &argument) {
        if (argument.declares)
            return; // a new name: names that exist would be refused
        OfferKind(argument.kind);
        OfferKind(argument.alternative);
    }

    void OfferKind(ArgumentKind kind) {
        Netlist const &netlist = *model.GetNetlist();
        std::string const holder = word.substr(0, FindPinPoint(word));
        switch (kind) {
        case ArgumentKind::COMPONENT:
            return OfferNames(netlist.GetComponentIterator());
        case ArgumentKind::INSTANCE:
            return OfferNames(netlist.GetInstanceIterator());
        case ArgumentKind::SIGNAL:
            return OfferNames(netlist.GetSignalIterator());
        case ArgumentKind::COMPONENT_PIN:
            return OfferPins(netlist.GetComponentIterator(), model.GetComponent(holder.c_str()));
        case ArgumentKind::INSTANCE_PIN:
            return OfferPins(netlist.GetInstanceIterator(), model.GetInstance(holder.c_str()));
        case ArgumentKind::FILE_NAME:
            return OfferFiles();
        default:
            for (Vocabulary::Choice const &choice : CommandReference::GetArgument(kind).choices)
                for (char const *const each : choice.words)
                    Offer(std::string(choice.prefix) + each);
        }
    }

    /// Offers owners until a point is typed, then the pins of the owner before it.
    template <class T, class Holder> void OfferPins(Iterator<T> holders, Holder const *holder) {
        if (FindPinPoint(word) == std::string::npos) {
            ForEach(holders, [this](Object const *each) {
                Offer(std::string(each->GetNameRef().View()) + ".");
            });
            result.wordEnds = false;
        } else if (holder) {
            std::string const begin = word.substr(0, FindPinPoint(word) + 1);
            ForEach(holder->GetPinIterator(),
                    [&](Pin const *pin) { Offer(begin + std::string(pin->GetNameRef().View())); });
        }
    }

    void OfferFiles() {
        fs::path const typed(word);
        fs::path const folder = typed.parent_path();
        std::error_code error;
        // A folder that cannot be read, or not to its end, only offers less: nothing here may
        // throw.
        fs::directory_iterator entry(folder.empty() ? fs::path(".") : folder, error);
        for (; !error && entry != fs::directory_iterator(); entry.increment(error)) {
            std::error_code unknown; // whether a dangling link is a folder
            std::string const name = (folder / entry->path().filename()).string();
            bool const isFolder = entry->is_directory(unknown);
            Offer(name + (isFolder ? "/" : ""));
            if (isFolder && BeginsWith(name, word))
                result.wordEnds = false;
        }
    }

    Model const &model;
    Completions result;
    std::string word;
    std::vector<std::string> before;
};

} // namespace

Completions Complete(std::string_view line, Model const &model) {
    return Completer(line, model).Complete();
}

std::string CommonBeginning(std::vector<std::string> const &candidates) {
    if (candidates.empty())
        return "";
    std::string common = candidates[0];
    for (std::string const &each : candidates) {
        std::size_t same = 0;
        while (same < common.size() && same < each.size() &&
               SameIgnoringCase(common.substr(same, 1), each.substr(same, 1)))
            ++same;
        common.erase(same);
    }
    return common;
}

std::vector<std::string_view> const &ShellWords() {
    static std::vector<std::string_view> const words = {"help", "show", "undo", "quit", "exit"};
    return words;
}

std::vector<std::string_view> const &ShownThings() {
    static std::vector<std::string_view> const words = {
        "netlist", "components", "instances", "signals", "ports", "pins", "options"};
    return words;
}
