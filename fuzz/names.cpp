// The forms of names: all parsers are compared with each other and with regular expressions.

#include <regex>
#include <vector>

#include "fuzz/Fuzz.h"
#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;
using Text = Basis::StringBase<char>;

namespace {

constexpr std::size_t MAX_NAME = 300; // std::regex recurses for each character

std::regex const BASE("[A-Za-z'_][A-Za-z0-9_]*");
std::regex const INTEGER("[+-]?[0-9]+");
std::regex const BUS("([A-Za-z'_][A-Za-z0-9_]*)\\(([+-]?[0-9]+):([+-]?[0-9]+)\\)");
std::regex const INDEX("([A-Za-z'_][A-Za-z0-9_]*)\\(([+-]?[0-9]+)\\)");

bool Matches(std::string const &text, std::regex const &form) {
    return std::regex_match(text, form);
}

std::string Normal(std::string name) {
    for (char &c : name)
        c = std::string_view("[{<").find(c) != std::string_view::npos   ? '('
            : std::string_view("]}>").find(c) != std::string_view::npos ? ')'
            : c == '-'                                                  ? ':'
                                                                        : c;
    return name;
}

void CheckBus(std::string const &text, Text const &name) {
    Text base("was");
    Text left;
    Text right;
    int leftBound = 77;
    int rightBound = 77;
    bool const isBus = Bus::ParseBusName(name, base, left, right);
    FUZZ_EXPECT(isBus == Bus::ParseBusName(name, base, leftBound, rightBound), "overloads");
    std::smatch parts;
    bool const matches = std::regex_match(text, parts, BUS);
    // IsBusName looks at the first bracket and colon, ParseBusName walks over tokens. They may
    // differ on odd texts, but not on names of the plain form.
    if (matches) {
        FUZZ_EXPECT(Bus::IsBusName(name) && isBus, "a bus");
        FUZZ_EXPECT(base.View() == parts[1].str() && left.View() == parts[2].str() &&
                        right.View() == parts[3].str(),
                    "parts");
        FUZZ_EXPECT(!BusIndex::IsBusIndexName(name), "both forms");
    } else {
        FUZZ_EXPECT(!Bus::IsBusName(name), "no bus");
        if (!isBus)
            FUZZ_EXPECT(base.View() == "was" && leftBound == 77, "outputs");
    }
}

} // namespace

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    std::string const raw = TextOf(data, std::min(size, MAX_NAME));
    Text normalized(raw.c_str());
    Object::NormalizeName(normalized);
    FUZZ_EXPECT(normalized.View() == Normal(raw), "rewriting");

    for (std::string const &text : {raw, Normal(raw)}) {
        Text const name(text.c_str());
        FUZZ_EXPECT(Object::IsValidBaseName(name) == Matches(text, BASE), "base");
        FUZZ_EXPECT(Object::IsValidIntegerString(name) == Matches(text, INTEGER), "integer");
        CheckBus(text, name);
        if (Matches(text, INDEX))
            FUZZ_EXPECT(BusIndex::IsBusIndexName(name), "an index");

        std::vector<std::string> const members = Split(text, ",\\");
        bool compound = members.size() > 1;
        for (std::string const &member : members)
            compound &= Matches(member, BASE) || Bus::IsBusName(Text(member.c_str())) ||
                        BusIndex::IsBusIndexName(Text(member.c_str()));
        FUZZ_EXPECT(CompoundBus::IsCompoundBusName(name) == compound, "compound");
        StringArray found;
        CompoundBus::ParseCompoundBusName(name, found, false);
        FUZZ_EXPECT(static_cast<std::size_t>(found.GetSize()) == (compound ? members.size() : 0),
                    "members");
        for (int i = 0; i < found.GetSize(); ++i)
            FUZZ_EXPECT(found.At(i).View() == members[static_cast<std::size_t>(i)], "member %d", i);
    }

    std::string const normal = Normal(raw);
    std::size_t const open = normal.find('(');
    bool const hasBase = open != std::string::npos && normal.find(')') != std::string::npos &&
                         normal.find(',') == std::string::npos;
    FUZZ_EXPECT(Object::GetBaseName(raw.c_str()).View() ==
                    (hasBase ? normal.substr(0, open) : normal),
                "base of %s", raw.c_str());
    return 0;
}
