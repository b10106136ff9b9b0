// The tokenizer of command lines, and the values that tokens are read as. Without quotes it gives
// what a plain split gives; tokens written down with quotes again read as the same tokens, and each
// has the place that the parser reports. Every text can be set as a value, whose own text gives the
// same value.

#include <algorithm>
#include <memory>
#include <vector>

#include "fuzz/Fuzz.h"
#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;

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

/// Tokens between which empty ones count, and what is a number among them.
void CheckKeepingEmpty(std::string const &text) {
    StringArray const tokens(text.c_str(), " ", false, nullptr);
    int count = 0;
    for (std::size_t at = 0; at < text.size(); ++count) {
        std::size_t const end = std::min(text.find(' ', at), text.size());
        std::string const token = text.substr(at, end - at);
        FUZZ_EXPECT(tokens.At(count).View() == token, "token %d", count);
        int number = 77;
        bool const isNumber = tokens.GetIntAt(count, number, 0);
        std::size_t const sign = token.find_first_of("+-") == 0 ? 1 : 0;
        bool const isDigits =
            token.size() > sign && token.find_first_not_of("0123456789", sign) == std::string::npos;
        FUZZ_EXPECT(isDigits ? token.size() > 9 || number == std::stoi(token)
                             : !isNumber && number == 77,
                    "%s: %d", token.c_str(), number);
        at = end + 1;
    }
    FUZZ_EXPECT(tokens.GetSize() == count, "%d", tokens.GetSize());
}

void CheckValues(std::string const &text) {
    BitVectorValue value;
    value.SetValue(text.c_str());
    BitVectorValue const copy(value);
    value.SetValue("4:b:1010");
    value = copy;
    FUZZ_EXPECT(value.GetValue() == copy.GetValue() && value.GetLength() == copy.GetLength() &&
                    value.GetBase() == copy.GetBase(),
                "copy");
    for (char const *const type :
         {"String", "Integer", "Float", "Boolean", "Bit", "BitVector", "User"}) {
        std::unique_ptr<Attribute> const attribute(
            AttributeFactory::GetInstance().CreateAttribute(type, "name", text.c_str()));
        std::string const shown(attribute->GetValueString());
        std::unique_ptr<Attribute> const clone(attribute->CloneAttribute());
        // A copy of a float has another width and precision, and so another text.
        if (dynamic_cast<AttributeFloat *>(clone.get()))
            continue;
        FUZZ_EXPECT(*clone == *attribute, "clone of %s", type);
        attribute->SetValue("0");
        attribute->SetValue(shown.c_str());
        FUZZ_EXPECT(std::string(attribute->GetValueString()) == shown, "%s: %s", type,
                    shown.c_str());
    }
}

} // namespace

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    std::string const text = TextOf(data, size);
    CheckKeepingEmpty(text);
    CheckValues(text);

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
