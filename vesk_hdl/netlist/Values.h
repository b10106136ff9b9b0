#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

/// The direction of a pin or port. INVALID is no direction: a signal is a port exactly when its
/// port polarity is not INVALID.
class VESK_HDL_API Polarity {
public:
    enum Value : int { INVALID = -1, INPUT = 0, OUTPUT = 1, BIDIRECTIONAL = 2 };

    Polarity() : value(INVALID) {}
    Polarity(Value v) : value(v) {}
    /// See GetValue(char const *).
    Polarity(char const *text);

    void SetValue(Value newValue) { value = newValue; }
    void SetValue(char const *text);
    Value GetValue() const { return value; }
    /// The direction whose name, "Input", "Output" or "BiDirectional", begins with the text in any
    /// case; INVALID if there is none. The empty text and null are INVALID.
    static Value GetValue(char const *text);
    static bool IsValidValue(Value value);
    /// The name. Anything but a direction, INVALID too, is called "Output".
    Basis::StringBase<char> GetValueName() const;

    bool operator==(Polarity const &other) const { return value == other.value; }
    bool operator!=(Polarity const &other) const { return value != other.value; }
    /// INVALID, INPUT, OUTPUT, BIDIRECTIONAL, in this order.
    bool operator<(Polarity const &other) const { return value < other.value; }

private:
    Value value;
};

/// A constant: the text of a value and, where the text told them, its base and width. The digits
/// are never checked against base or width. Copies are independent; a value in its default state
/// costs no allocation.
class VESK_HDL_API BitVectorValue {
public:
    /// Empty text, base 2, length 1, no base and length given.
    BitVectorValue();
    BitVectorValue(char const *text);
    BitVectorValue(BitVectorValue const &other);
    ~BitVectorValue();
    BitVectorValue &operator=(BitVectorValue const &other);

    /// Reads "LENGTH:BASE:DIGITS", the base word beginning with b, o or h for 2, 8 or 16 (any other
    /// counts as 2) and the length read as `atoi` does. A text with fewer than three parts is taken
    /// as digits alone. Null reads as empty.
    void SetValue(char const *text);
    Basis::StringBase<char> GetValue() const;
    /// 2, 8 or 16.
    int GetBase() const;
    /// The declared width in bits.
    int GetLength() const;
    bool HasBaseAndLength() const;
    /// Whether the text is empty.
    bool IsEmpty() const;

private:
    int ConvertToBase(char const *text) const;

    struct Record;
    Record *record; ///< null in the default state
};

} // namespace Vesk_Hdl
