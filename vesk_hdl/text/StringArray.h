#pragma once

#include <vector>

#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

class Model;

/// An ordered, growable array of strings that it owns, and the tokenizer of command lines.
/// Indexes count from 0. Reading outside gives the empty string, never a failure. Copies are deep.
class VESK_HDL_API StringArray {
public:
    StringArray();
    /// An empty array, then Parse with the same arguments.
    StringArray(char const *text, char const *separators, bool skipEmpty, char const *quotePairs);
    StringArray(StringArray const &other);
    ~StringArray();
    StringArray &operator=(StringArray const &other);

    int GetSize() const;
    bool IsEmpty() const;
    /// A copy of the string at the index; the empty string for any index outside.
    Basis::StringBase<char> operator[](int index) const;
    Basis::StringBase<char> GetAt(int index) const;
    /// The string itself, valid until the array changes; a lasting empty string outside.
    Basis::StringBase<char> const &At(int index) const;

    /// Appends a copy and returns its index.
    int Add(Basis::StringBase<char> const &string);
    /// Appends copies of all strings of another array. An array added to itself does not end but
    /// with the memory, since its size is read anew for each string.
    void Add(StringArray const &strings);
    /// Assigns the string at the index, making the array longer with empty strings as needed. A
    /// negative index does nothing.
    void SetAt(int index, Basis::StringBase<char> const &string);
    void Empty();

    /// Splits `text` at the characters of `separators`, appends the tokens and returns how many.
    ///
    /// With `skipEmpty` a run of separators counts as one. `quotePairs` lists pairs of an opening
    /// and a closing character; null is no quoting. An opening character counts at the beginning
    /// of the text or directly behind a separator. Up to the closing character that stands before
    /// a separator or the end, separators are ordinary; a closing character before anything else
    /// is dropped; a backslash in front of the closing character makes it ordinary. Quotes do not
    /// become part of a token. A quoted token may be empty, but not as the last of the text. A
    /// quote that nobody closes runs to the end.
    int Parse(char const *text, char const *separators, bool skipEmpty, char const *quotePairs);
    /// The same, and appends to `places` for each token the characters of `text` that it was read
    /// from, its quotes included; for an empty one a range whose `first` is greater. Null asks for
    /// none.
    int Parse(char const *text, char const *separators, bool skipEmpty, char const *quotePairs,
              std::vector<Basis_Range> *places);

    /// True if a string equals the argument, exactly or but for case.
    bool Contains(Basis::StringBase<char> const &string) const;
    bool IContains(Basis::StringBase<char> const &string) const;
    /// True if every string of the argument is here; false at once if the argument is longer.
    bool Contains(StringArray const &strings) const;
    bool IContains(StringArray const &strings) const;

    /// All strings in order with `separator` between them.
    Basis::StringBase<char> Concatenate(Basis::StringBase<char> const &separator) const;
    /// Reads the string at the index as a decimal integer into `value`; false, and `value` as it
    /// was, if Basis::strtol reads no number there. A number that fits `long` and not `int` is
    /// converted as a cast does. `seed` plays no part in the result.
    bool GetIntAt(int index, int &value, int seed) const;

    /// Sorts by unsigned bytes, a prefix before what it begins. Not stable.
    void Sort();
    /// Sorts by a less-than function, which gets `context` as its third argument. Not stable.
    void Sort(bool (*less)(Basis::StringBase<char> const &, Basis::StringBase<char> const &,
                           void *),
              void *context);

    /// Empty and Parse of a command line, at blanks and with both kinds of quotes, in one: the
    /// strings that nobody else holds give their memory to the new ones. A null line is empty. The
    /// places of the tokens take the place of what is in `places`, which may be null.
    void ParseLine(char const *line, std::vector<Basis_Range> *places);

private:
    struct Record;
    Record *record;
};

} // namespace Vesk_Hdl
