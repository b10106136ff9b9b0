#pragma once

#include <vector>

#include "vesk_hdl/text/basis/StringBase.h"

namespace Vesk_Hdl {

class Model;

/// An ordered, growable array of strings, which it owns, and the tokenizer of command lines.
///
/// Indices count from 0. Reading outside gives the empty string and is no failure, so that a
/// command whose last words are missing reads empty ones. Copies are deep. If memory runs out
/// (std::bad_alloc), the array may hold the strings that were added until then.
class VESK_HDL_API StringArray {
public:
    /// An empty array.
    StringArray();
    /// An empty array, then Parse with the same arguments.
    StringArray(char const *text, char const *separators, bool skipEmpty, char const *quotePairs);
    /// An independent copy.
    StringArray(StringArray const &other);
    /// Frees the strings; references from At are no longer valid.
    ~StringArray();
    /// Replaces the strings by copies of those of `other`.
    StringArray &operator=(StringArray const &other);

    /// The number of strings.
    int GetSize() const;
    /// Whether there are no strings.
    bool IsEmpty() const;
    /// A copy of the string at an index; the empty string outside.
    Basis::StringBase<char> operator[](int index) const;
    /// The same under another name.
    Basis::StringBase<char> GetAt(int index) const;
    /// The string itself, valid until the array changes. Outside it is an empty string that is
    /// always valid.
    Basis::StringBase<char> const &At(int index) const;

    /// Appends a copy and returns its index.
    int Add(Basis::StringBase<char> const &string);
    /// Appends copies of all strings of another array, whose size is read anew for each string. An
    /// array that is added to itself therefore grows until memory runs out.
    void Add(StringArray const &strings);
    /// Replaces the string at an index. An index past the end makes the array longer, with empty
    /// strings in between. A negative index does nothing.
    void SetAt(int index, Basis::StringBase<char> const &string);
    /// Removes all strings.
    void Empty();

    /// Splits `text` at the characters of `separators`, appends the tokens to what the array holds
    /// and returns how many were added. Null arguments count as empty.
    ///
    /// With `skipEmpty` a run of separators counts as one. `quotePairs` lists pairs of an opening
    /// and a closing character; null or empty means no quoting. An opening character begins a quote
    /// only at the beginning of the text or directly after a separator. Inside a quote separators
    /// are ordinary. The quote ends at the closing character before a separator or the end of the
    /// text; a closing character before anything else is dropped; a backslash before a closing
    /// character makes it ordinary. The quotes do not become part of the token. A quoted token may
    /// be empty, except as the last one of the text, where it is lost. A quote that is not closed
    /// runs to the end.
    int Parse(char const *text, char const *separators, bool skipEmpty, char const *quotePairs);
    /// The same. In addition it appends to `places`, unless that is null, the range of `text` that
    /// each token was read from, with its quotes. For an empty token `first` is greater than
    /// `last`.
    int Parse(char const *text, char const *separators, bool skipEmpty, char const *quotePairs,
              std::vector<Basis_Range> *places);

    /// Whether a string of the array equals the argument exactly.
    bool Contains(Basis::StringBase<char> const &string) const;
    /// Whether a string of the array equals the argument but for case.
    bool IContains(Basis::StringBase<char> const &string) const;
    /// Whether every string of the argument is here exactly. False at once if the argument has more
    /// strings than this array, even if they repeat. True for an empty argument.
    bool Contains(StringArray const &strings) const;
    /// The same with case ignored.
    bool IContains(StringArray const &strings) const;

    /// All strings in order with `separator` between them. Empty for an empty array.
    Basis::StringBase<char> Concatenate(Basis::StringBase<char> const &separator) const;
    /// Reads the string at an index as a decimal integer, see Basis::strtol, into `value`. False,
    /// and `value` as it was, if it is none, or outside. A number that fits `long` and not `int` is
    /// converted as by a cast. `seed` has no effect on the result.
    bool GetIntAt(int index, int &value, int seed) const;

    /// Sorts by the values of unsigned bytes, a text before a longer one that begins with it. Not
    /// stable.
    void Sort();
    /// Sorts by a function that returns whether its first argument comes strictly before its second
    /// and gets `context` as its third. Not stable. A function that is no strict order gives some
    /// order and no fault.
    void Sort(bool (*less)(Basis::StringBase<char> const &, Basis::StringBase<char> const &,
                           void *),
              void *context);

    /// Replaces the strings by the tokens of a command line: Empty, then Parse at blanks with the
    /// quotes " and '. Memory of strings that no copy shares is used again, which is why a model
    /// has one array for all its lines. A null line is empty. `places`, unless it is null, gets the
    /// ranges of these tokens alone.
    void ParseLine(char const *line, std::vector<Basis_Range> *places);

private:
    struct Record;
    Record *record;
};

} // namespace Vesk_Hdl
