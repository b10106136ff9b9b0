// Directions and constants.

#include "vesk_hdl/netlist/Values.h"

#include <cstdlib>
#include <cstring>

#include "vesk_hdl/netlist/Vocabulary.h"
#include "vesk_hdl/text/StringArray.h"

namespace Vesk_Hdl {

using Basis::StringBase;

Polarity::Polarity(char const *text) : value(GetValue(text)) {}

void Polarity::SetValue(char const *text) { value = GetValue(text); }

Polarity::Value Polarity::GetValue(char const *text) {
    std::size_t const length = text ? std::strlen(text) : 0;
    if (length == 0)
        return INVALID;
    // The names begin with different letters, so that no text is the beginning of two.
    for (int i = INPUT; i <= BIDIRECTIONAL; ++i)
        if (Basis::strnicmp(Vocabulary::POLARITIES[i], text, length) == 0)
            return static_cast<Value>(i);
    return INVALID;
}

bool Polarity::IsValidValue(Value value) {
    return static_cast<unsigned int>(value) <= static_cast<unsigned int>(BIDIRECTIONAL);
}

StringBase<char> Polarity::GetValueName() const {
    // Required: anything that is no direction is called "Output", also INVALID.
    return IsValidValue(value) ? Vocabulary::POLARITIES[value] : "Output";
}

/// Made for a value that is not in its default state: every signal and pin has a value, and few are
/// set.
struct BitVectorValue::Record {
    StringBase<char> value;
    int base = 2;
    int length = 1;
    bool hasBaseAndLength = false;
};

BitVectorValue::BitVectorValue() : record(nullptr) {}

BitVectorValue::BitVectorValue(char const *text) : record(nullptr) { SetValue(text); }

BitVectorValue::BitVectorValue(BitVectorValue const &other)
    : record(other.record ? new Record(*other.record) : nullptr) {}

BitVectorValue::~BitVectorValue() { delete record; }

BitVectorValue &BitVectorValue::operator=(BitVectorValue const &other) {
    if (this != &other) {
        Record *const copy = other.record ? new Record(*other.record) : nullptr;
        delete record;
        record = copy;
    }
    return *this;
}

void BitVectorValue::SetValue(char const *text) {
    StringBase<char> const whole(text); // the text may be this value's own
    delete record;
    record = nullptr;
    if (whole.IsEmpty())
        return;
    record = new Record;
    StringArray const parts(whole, ":", true, nullptr);
    if (parts.GetSize() < 3) { // a text that is not of the form is no error: it is the digits
        record->value = whole;
        return;
    }
    record->length = std::atoi(parts.At(0));
    record->base = ConvertToBase(parts.At(1));
    record->value = parts.At(2);
    record->hasBaseAndLength = true;
}

StringBase<char> BitVectorValue::GetValue() const {
    return record ? record->value : StringBase<char>();
}

int BitVectorValue::GetBase() const { return record ? record->base : 2; }
int BitVectorValue::GetLength() const { return record ? record->length : 1; }
bool BitVectorValue::HasBaseAndLength() const { return record && record->hasBaseAndLength; }
bool BitVectorValue::IsEmpty() const { return !record || record->value.IsEmpty(); }

int BitVectorValue::ConvertToBase(char const *text) const {
    switch (text[0]) {
    case 'o':
    case 'O':
        return 8;
    case 'h':
    case 'H':
        return 16;
    default: // required: any other word, not only "b"
        return 2;
    }
}

} // namespace Vesk_Hdl
