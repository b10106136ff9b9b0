// The tokenizer of command lines. Without quotes it gives what a plain split gives; tokens written
// down with quotes again read as the same tokens, and each has the place that the parser reports.

#include <algorithm>
#include <vector>

#include "fuzz/Fuzz.h"
#include "vesk_hdl/Vesk_Hdl.h"

using Vesk_Hdl::StringArray;

namespace {

/// A token in quotes; empty if there is no way to write it so.
std::string InQuotes(std::string_view token) {
    if (!token.empty() && token.back() == '\\')
        return "";
    std::string quoted = "\"";
    for (char const c : token)
        (quoted += c == '"' ? "\\" : "") += c;
    return quoted + '"';
}

void CheckPlaces(std::string const &text, StringArray const &tokens,
                 std::vector<Basis_Range> const &places) {
    FUZZ_EXPECT(places.size() == static_cast<std::size_t>(tokens.GetSize()), "%zu", places.size());
    std::size_t end = 0;
    for (int i = 0; i < tokens.GetSize(); ++i) {
        Basis_Range const &place = places[static_cast<std::size_t>(i)];
        FUZZ_EXPECT(place.first >= end && place.first <= place.last && place.last < text.size(),
                    "token %d", i);
        std::string const source = text.substr(place.first, place.last + 1 - place.first);
        if (source.find_first_of("\"'\\") == std::string::npos)
            FUZZ_EXPECT(tokens.At(i).View() == source, "token %d", i);
        end = place.last + 1;
    }
}

} // namespace

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    std::string const text = TextOf(data, size);

    StringArray const plain(text.c_str(), " ", true, nullptr);
    std::vector<std::string> const split = Split(text, " ");
    FUZZ_EXPECT(static_cast<std::size_t>(plain.GetSize()) == split.size(), "%zu", split.size());
    for (int i = 0; i < plain.GetSize(); ++i)
        FUZZ_EXPECT(plain.At(i).View() == split[static_cast<std::size_t>(i)], "token %d", i);

    StringArray tokens;
    std::vector<Basis_Range> places;
    int const count = tokens.Parse(text.c_str(), " ", true, "\"\"''", &places);
    FUZZ_EXPECT(count == tokens.GetSize(), "%d", count);
    CheckPlaces(text, tokens, places);

    std::string again;
    for (int i = 0; i < tokens.GetSize(); ++i) {
        std::string const quoted = InQuotes(tokens.At(i).View());
        if (quoted.empty())
            return 0;
        again += quoted + " ";
    }
    StringArray const same(again.c_str(), " ", true, "\"\"''");
    FUZZ_EXPECT(same.GetSize() == tokens.GetSize(), "%s", again.c_str());
    for (int i = 0; i < same.GetSize(); ++i)
        FUZZ_EXPECT(same.At(i).View() == tokens.At(i).View(), "token %d of %s", i, again.c_str());
    return 0;
}
