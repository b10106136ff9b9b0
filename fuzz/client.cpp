// Strings, arrays, sets, maps and expressions, which clients use without a line of the language,
// against plain models.

#include <algorithm>
#include <map>
#include <regex>
#include <vector>

#include "fuzz/Choices.h"
#include "fuzz/Fuzz.h"
#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;
using Text = Basis::StringBase<char>;

namespace {

std::string Upper(std::string text) {
    for (char &c : text)
        c = c >= 'a' && c <= 'z' ? static_cast<char>(c - 32) : c;
    return text;
}

unsigned int PlaceOf(std::size_t found) {
    return found == std::string::npos ? Basis::NOT_FOUND : static_cast<unsigned int>(found);
}

void Strings(Choices &choices) {
    Text text;
    std::string model;
    while (!choices.IsEmpty()) {
        Text const before(text); // shares the text, and is not to see the change
        std::string const was = model;
        std::string const piece = choices.Text();
        unsigned int const first = choices.Below(6);
        Basis_Range const range = {first, choices.Below(6)};
        bool const isRange = range.first <= range.last && range.first < model.size();
        switch (choices.Below(10)) {
        case 0:
            text += piece.c_str();
            model += piece;
            break;
        case 1:
            text.Append(piece.c_str(), first);
            model += piece.substr(0, first);
            break;
        case 2:
            text.MakeUpper();
            model = Upper(model);
            break;
        case 3:
            text.Trim(piece.c_str(), Text::TRIM_BOTH_ENDS);
            model.erase(0, std::min(model.find_first_not_of(piece), model.size()));
            model.erase(model.find_last_not_of(piece) + 1);
            break;
        case 4:
            text.Remove(range);
            if (isRange)
                model.erase(first, range.last + 1 - first);
            break;
        case 5:
            text = text.Extract(range);
            model = isRange ? model.substr(first, range.last + 1 - first) : "";
            break;
        case 6:
            text.ReplaceChars('a', 'Z');
            std::replace(model.begin(), model.end(), 'a', 'Z');
            break;
        case 7:
            text.Format("%s|%5u", piece.c_str(), first);
            model = piece + "|    " + std::to_string(first);
            break;
        case 8:
            text += text;
            model += model;
            break;
        default:
            text.MakeLower();
            for (char &c : model)
                c = c >= 'A' && c <= 'Z' ? static_cast<char>(c + 32) : c;
        }
        if (model.size() > 500)
            return;
        FUZZ_EXPECT(text.View() == model && before.View() == was, "%s", model.c_str());
        FUZZ_EXPECT(text.GetIndexOfString(piece.c_str(), Text::COMPARE_EXACT) ==
                        PlaceOf(model.find(piece)),
                    "%s in %s", piece.c_str(), model.c_str());
        FUZZ_EXPECT(text.GetIndexOfString(piece.c_str(), Text::COMPARE_IGNORING_CASE) ==
                        PlaceOf(Upper(model).find(Upper(piece))),
                    "%s in %s", piece.c_str(), model.c_str());
        FUZZ_EXPECT(text.GetIndexOfFirstChar('a', 0) == PlaceOf(model.find('a')) &&
                        text.GetIndexOfLastChar('a', 0) == PlaceOf(model.rfind('a')),
                    "%s", model.c_str());
        FUZZ_EXPECT((text.Compare(piece.c_str(), Text::COMPARE_IGNORING_CASE) == 0) ==
                        (Upper(model) == Upper(piece)),
                    "%s", piece.c_str());
    }
}

/// The leftmost longest match, by trying all.
void Expressions(Choices &choices) {
    std::string pattern;
    for (unsigned int atoms = 1 + choices.Below(5); atoms > 0; --atoms) {
        static char const *const ATOMS[] = {"a", "b", ".", "[ab1]", "[^a]", "[0-9]", "\\."};
        static char const *const TIMES[] = {"", "", "*", "+", "?"};
        pattern += ATOMS[choices.Below(std::size(ATOMS))];
        pattern += TIMES[choices.Below(std::size(TIMES))];
    }
    std::string text;
    for (unsigned int size = choices.Below(12); size > 0; --size)
        text += "ab1.z"[choices.Below(5)];
    std::regex const whole(pattern);
    Basis_Range expected = {1, 0};
    for (unsigned int first = 0; first < text.size() && expected.first > expected.last; ++first)
        for (auto size = static_cast<unsigned int>(text.size()) - first; size > 0; --size)
            if (std::regex_match(text.substr(first, size), whole)) {
                expected = {first, first + size - 1};
                break;
            }
    Basis_Range const found = Text(text.c_str()).GetRangeOfMatch(Basis_Regexp(pattern.c_str()));
    FUZZ_EXPECT(found.first == expected.first && found.last == expected.last, "%s in %s: %u to %u",
                pattern.c_str(), text.c_str(), found.first, found.last);
}

void Collections(Choices &choices) {
    StringArray array;
    std::vector<std::string> strings;
    StringSet set;
    std::map<std::string, bool> exact; // of the set
    std::map<std::string, bool> folded;
    IStringPtrMap<int *> map;
    std::map<std::string, int *> pointers;
    int numbers[3] = {};
    while (!choices.IsEmpty() && strings.size() < 100) {
        std::string const name = choices.Name();
        unsigned int const at = choices.Below(12);
        switch (choices.Below(8)) {
        case 0:
            array.Add(name.c_str());
            strings.push_back(name);
            break;
        case 1:
            array.SetAt(static_cast<int>(at), name.c_str());
            strings.resize(std::max<std::size_t>(strings.size(), at + 1));
            strings[at] = name;
            break;
        case 2:
            array.Sort();
            std::sort(strings.begin(), strings.end());
            break;
        case 3:
            set.Add(name.c_str());
            exact[name] = folded[Upper(name)] = true;
            break;
        case 4:
            set.Remove(name.c_str());
            exact.erase(name);
            folded.erase(Upper(name));
            break;
        case 5:
            set.Empty(); // what ignores case stays known
            exact.clear();
            break;
        case 6:
            map.Add(name.c_str(), &numbers[at % 3]);
            pointers[Upper(name)] = &numbers[at % 3];
            break;
        default:
            map.Remove(name.c_str());
            pointers.erase(Upper(name));
        }
        StringArray copy(array);
        FUZZ_EXPECT(copy.Contains(array) && copy.IContains(array), "a copy");
        FUZZ_EXPECT(!array.Contains(name.c_str()) || array.IContains(Upper(name).c_str()), "case");
        copy.Add(array);
        FUZZ_EXPECT(copy.GetSize() == 2 * array.GetSize() && copy[-1].IsEmpty() &&
                        copy.GetAt(array.GetSize()) == array.GetAt(0),
                    "twice");
        copy = array;
        std::string joined;
        for (std::size_t i = 0; i < strings.size(); ++i)
            (joined += i > 0 ? "|" : "") += strings[i];
        FUZZ_EXPECT(copy.Concatenate("|").View() == joined, "%s", joined.c_str());
        FUZZ_EXPECT(array.Contains(name.c_str()) ==
                        (std::find(strings.begin(), strings.end(), name) != strings.end()),
                    "%s", name.c_str());
        FUZZ_EXPECT(set.Contains(name.c_str()) == (exact.count(name) > 0) &&
                        set.IContains(name.c_str()) == (folded.count(Upper(name)) > 0),
                    "%s", name.c_str());
        StringSet other(set); // which knows again what was emptied out
        StringSetIterator place;
        place = other.GetBeginPos();
        FUZZ_EXPECT(exact.empty() || other.IContains((*place).GetText()), "copy");
        IStringPtrMap<int *> otherMap(map);
        FUZZ_EXPECT(otherMap.IsEmpty() == pointers.empty(), "copy");
        std::size_t walked = 0;
        for (StringSetIterator it = set.GetBeginPos(); it != set.GetEndPos(); ++it)
            walked += exact.count((*it).GetText());
        FUZZ_EXPECT(walked == exact.size() && set.IsEmpty() == exact.empty(), "%zu", walked);
        auto const pointer = pointers.find(Upper(name));
        FUZZ_EXPECT(map.Get(name.c_str()) ==
                        (pointer == pointers.end() ? nullptr : pointer->second),
                    "%s", name.c_str());
    }
}

} // namespace

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    Choices choices(data, size);
    switch (choices.Below(3)) {
    case 0:
        Strings(choices);
        break;
    case 1:
        Expressions(choices);
        break;
    default:
        Collections(choices);
    }
    return 0;
}
