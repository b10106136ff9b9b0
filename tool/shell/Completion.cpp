#include "tool/shell/Completion.h"

#include <algorithm>
#include <filesystem>

#include "tool/diagnostics/Blame.h"
#include "tool/diagnostics/Words.h"

using namespace Vesk_Hdl;
namespace fs = std::filesystem;

namespace {

bool BeginsWith(std::string_view text, std::string_view begin) {
    return SameIgnoringCase(text.substr(0, begin.size()), begin);
}

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
    /// Not what would want quotes: half of it, put in without them, would name something else.
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
        bool const lower =
            std::any_of(last.begin(), last.end(), [](char c) { return c >= 'a' && c <= 'z'; });
        for (int i = 0; i < CommandReference::GetCount(); ++i) {
            std::string_view rest = CommandReference::GetAt(i)->keyword;
            if (!words.empty()) {
                if (!BeginsWith(rest, words + " "))
                    continue;
                rest.remove_prefix(words.size() + 1);
            }
            std::string const next(rest.substr(0, rest.find(' ')));
            Offer(lower ? Lowercase(next) : next);
        }
    }

    void OfferArguments() {
        StringArray tokens;
        for (std::string const &each : before)
            tokens.Add(each.c_str());
        int words = 0;
        CommandHelp const *const command = KeywordOf(tokens, words);
        if (!command)
            return;
        std::string grammar = command->grammar;
        std::erase_if(grammar, [](char c) { return c == '[' || c == ']'; });
        std::vector<std::string> const placeholders = WordsOf(grammar);
        auto const at = before.size() - static_cast<std::size_t>(words);
        if (at >= placeholders.size())
            return;
        bool const names = BeginsWith(command->keyword, "ADD COMPONENT") && words == 2;
        bool const makesInstance = SameIgnoringCase(command->keyword, "ADD INSTANCE") && at == 1;
        if (!names && !makesInstance) // those are new
            OfferPlaceholder(placeholders[at]);
        // What may be missing: the next one may stand here.
        if (placeholders[at] == "-TYPE=type" || placeholders[at] == "option")
            OfferPlaceholder(placeholders[std::min(at + 1, placeholders.size() - 1)]);
        if (placeholders.back() == "file" && placeholders[at] != "file")
            OfferFiles();
    }

    void OfferPlaceholder(std::string_view placeholder) {
        Netlist const &netlist = *model.GetNetlist();
        static constexpr std::string_view POLARITIES[] = {"Input", "Output", "BiDirectional"};
        static constexpr std::string_view OPTIONS[] = {"-NOHEADER", "-APPEND", "-OVERWRITE"};
        static constexpr std::string_view FLAGS[] = {"true", "false"};
        static constexpr std::string_view TOOLS[] = {"QRT",      "EXEMPLAR",    "SYNPLICITY",
                                                     "SYNOPSYS", "VERILOG2001", "PRECISION"};
        static constexpr std::string_view SETTINGS[] = {"-GENERIC=NONE",   "-GENERIC=SYN",
                                                        "-GENERIC=NOSYN",  "-SYNATTR=NONE",
                                                        "-SYNATTR=ASSIGN", "-SYNATTR=ASSIGNNODEC"};
        static constexpr std::string_view TYPES[] = {
            "-TYPE=String", "-TYPE=Integer",   "-TYPE=Float", "-TYPE=Boolean",
            "-TYPE=Bit",    "-TYPE=BitVector", "-TYPE=User"};
        for (std::size_t at = 0; at <= placeholder.size();) {
            std::size_t const end = std::min(placeholder.find('|', at), placeholder.size());
            std::string_view const each = placeholder.substr(at, end - at);
            at = end + 1;
            if (each == "component")
                OfferNames(netlist.GetComponentIterator());
            else if (each == "instance" && placeholder == each)
                OfferNames(netlist.GetInstanceIterator());
            else if (each == "signal" && placeholder.find("component") == std::string_view::npos)
                OfferNames(netlist.GetSignalIterator());
            else if (each == "instance.pin")
                OfferPins(netlist.GetInstanceIterator(), model.GetInstance(Owner().c_str()));
            else if (each == "component.pin")
                OfferPins(netlist.GetComponentIterator(), model.GetComponent(Owner().c_str()));
            else if (each == "polarity")
                OfferAll(POLARITIES);
            else if (each == "option")
                OfferAll(OPTIONS);
            else if (each == "flag")
                OfferAll(FLAGS);
            else if (each == "tool")
                OfferAll(TOOLS);
            else if (each == "setting")
                OfferAll(SETTINGS);
            else if (each == "-TYPE=type")
                OfferAll(TYPES);
            else if (each == "file")
                OfferFiles();
            else if (placeholder.find('|') != std::string_view::npos)
                Offer(each); // a word that stands for itself
        }
    }

    std::string Owner() const { return word.substr(0, word.find('.')); }

    /// Owners up to the point, behind it the pins of the one that is named.
    template <class T, class Holder> void OfferPins(Iterator<T> owners, Holder const *owner) {
        if (word.find('.') == std::string::npos) {
            ForEach(owners, [this](Object const *each) {
                Offer(std::string(each->GetNameRef().View()) + ".");
            });
            result.wordEnds = false;
        } else if (owner) {
            ForEach(owner->GetPinIterator(), [&](Pin const *pin) {
                Offer(Owner() + "." + std::string(pin->GetNameRef().View()));
            });
        }
    }

    void OfferFiles() {
        fs::path const typed(word);
        fs::path const folder = typed.parent_path();
        std::error_code error;
        for (auto const &entry :
             fs::directory_iterator(folder.empty() ? fs::path(".") : folder, error)) {
            bool const isFolder = entry.is_directory(error);
            Offer((folder / entry.path().filename()).string() + (isFolder ? "/" : ""));
            if (isFolder && BeginsWith((folder / entry.path().filename()).string(), word))
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
