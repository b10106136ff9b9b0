#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

/// The direction of a pin or port: a plain value of 32 bits. INVALID means no direction: a signal
/// is a port exactly when its port polarity is not INVALID. In text the directions are the modes
/// in, out and inout (IEEE 1076-1993, 1.1.1.2; IEEE 1364-1995, 12.3.2).
class VESK_HDL_API Polarity {
public:
    /// The directions. Their order is that of the ports in written text.
    enum Value : int {
        INVALID = -1,     ///< no direction
        INPUT = 0,        ///< into the component or the module
        OUTPUT = 1,       ///< out of it
        BIDIRECTIONAL = 2 ///< both ways
    };

    /// INVALID.
    Polarity() : value(INVALID) {}
    /// That value. It is not checked against the range of directions.
    Polarity(Value v) : value(v) {}
    /// The direction that the text names, see GetValue(char const *).
    Polarity(char const *text);

    /// Sets the value, which is not checked.
    void SetValue(Value newValue) { value = newValue; }
    /// Sets the direction that the text names, INVALID for any other text.
    void SetValue(char const *text);
    /// The value as it was set.
    Value GetValue() const { return value; }
    /// The direction whose name, "Input", "Output" or "BiDirectional", begins with the text in any
    /// case: "in", "OUTPUT" and "b" are directions, "inout" and "inputs" are not. INVALID for any
    /// other text, the empty one and null.
    static Value GetValue(char const *text);
    /// Whether the value is a direction; INVALID is none.
    static bool IsValidValue(Value value);
    /// "Input", "Output" or "BiDirectional". Any value that is no direction, also INVALID, is
    /// called "Output", which clients rely on.
    Basis::StringBase<char> GetValueName() const;

    /// Whether both values are equal.
    bool operator==(Polarity const &other) const { return value == other.value; }
    /// Whether the values differ.
    bool operator!=(Polarity const &other) const { return value != other.value; }
    /// The order of sorted pins and signals: INVALID, INPUT, OUTPUT, BIDIRECTIONAL.
    bool operator<(Polarity const &other) const { return value < other.value; }

private:
    Value value;
};

/// A constant: the text of its digits and, if they were given, a base and a length in bits.
///
/// Base and length say how the writers spell the constant. The digits are never checked against
/// them, and no number is computed. Copies are independent; a value in its default state costs no
/// allocation.
class VESK_HDL_API BitVectorValue {
public:
    /// The default state: no digits, base 2, length 1, no base and length given.
    BitVectorValue();
    /// The constant of a text, see SetValue.
    BitVectorValue(char const *text);
    /// An independent copy.
    BitVectorValue(BitVectorValue const &other);
    /// Frees the text.
    ~BitVectorValue();
    /// Replaces the constant by a copy. If memory runs out (std::bad_alloc), it is as it was.
    BitVectorValue &operator=(BitVectorValue const &other);

    /// Replaces the constant. "LENGTH:BASE:DIGITS", such as "8:h:FF", gives all three: the length
    /// is read as `atoi` does, the base word begins with b, o or h for 2, 8 or 16 (any other counts
    /// as 2), and parts after the third are ignored. A text with fewer than three parts is taken
    /// whole as digits, with base 2 and length 1. Null counts as empty and gives the default state.
    void SetValue(char const *text);
    /// The digits, or the whole text if it has no base and length.
    Basis::StringBase<char> GetValue() const;
    /// 2, 8 or 16.
    int GetBase() const;
    /// The length in bits as it was given: 0 and negative numbers are possible.
    int GetLength() const;
    /// Whether the text gave base and length. The writers show them only then.
    bool HasBaseAndLength() const;
    /// Whether there are no digits: then there is no constant to write.
    bool IsEmpty() const;

private:
    int ConvertToBase(char const *text) const;

    struct Record;
    Record *record; ///< null in the default state
};

} // namespace Vesk_Hdl
