#pragma once

#include <atomic>
#include <string_view>

#include "vesk_hdl/Api.h"

class Basis_Regexp;

/// A pair of character indices, counted from 0 and both inclusive. A range whose `first` is greater
/// than its `last` is empty; (1, 0) is where every walk with NextTokenRange starts.
struct Basis_Range {
    unsigned int first; ///< the index of the first character
    unsigned int last;  ///< the index of the last character
};

namespace Basis {

class Stream;
struct StringEdit;

/// The result of every search that finds nothing: an index that no string has.
inline constexpr unsigned int NOT_FOUND = 0xFFFFFFFFU;

template <class Char> class StringBase;

/// The string of the whole library: 8-bit characters, whose text pointer is never null.
///
/// A value type. Copies share their text until one of them changes, so that passing a name on costs
/// a counter; a change never shows in another copy, also across threads. One string object is for
/// one thread at a time.
///
/// The text holds no NUL character: what is built from `char const *` ends at the first one, and
/// null counts as empty. A string holds at most 0xFFFFFFEF characters; more raises
/// std::length_error, and lack of memory raises std::bad_alloc. After either the string is as it
/// was before.
///
/// Indices count from 0. Case means that of the ASCII letters, whatever the locale of the program.
template <> class VESK_HDL_API StringBase<char> {
public:
    /// How texts are compared.
    enum CompareType : int {
        COMPARE_EXACT = 0,        ///< byte for byte
        COMPARE_IGNORING_CASE = 1 ///< ASCII letters without regard to case
    };
    /// What a run of separators means to NextTokenRange.
    enum ParseType : int {
        PARSE_KEEPING_EMPTY = 0, ///< an empty token between each two separators
        PARSE_SKIPPING_EMPTY = 1 ///< one separator
    };
    /// Where Trim removes characters.
    enum TrimType : int {
        TRIM_BOTH_ENDS = 2 ///< at the beginning and at the end
    };

    /// The empty string. It needs no memory.
    StringBase() noexcept : rep(&empty.rep) {}
    /// A copy of the text up to its NUL. Null gives the empty string.
    StringBase(char const *text);
    /// Shares the text of `other`.
    StringBase(StringBase const &other) noexcept;
    /// Takes the text of `other`, which is empty afterwards.
    StringBase(StringBase &&other) noexcept : rep(other.rep) { other.rep = &empty.rep; }
    /// The characters of `range`; indices past the end of `whole` are left out. An empty range
    /// gives the empty string.
    StringBase(StringBase const &whole, Basis_Range const &range);
    /// A copy of the text, which must hold no NUL character: the string does not look for one.
    explicit StringBase(std::string_view text);
    /// Frees the text if no copy shares it.
    ~StringBase() {
        if (rep != &empty.rep)
            Release(rep);
    }

    /// Replaces the text. The new one may be a piece of the old.
    StringBase &operator=(char const *text);
    /// Shares the text of `other` from now on.
    StringBase &operator=(StringBase const &other) noexcept;
    /// Exchanges the texts, so that the old one is freed with `other`.
    StringBase &operator=(StringBase &&other) noexcept;

    /// Appends a character. NUL appends nothing.
    StringBase &operator+=(char character);
    /// Appends a text up to its NUL. It may be a piece of this string. Null appends nothing.
    StringBase &operator+=(char const *text);
    /// Appends a string, which may be this one.
    StringBase &operator+=(StringBase const &text);
    /// Appends a text without NUL characters. It may be a piece of this string.
    StringBase &operator+=(std::string_view text);
    /// Appends a string, which may be this one.
    StringBase &Append(StringBase const &text);
    /// Appends `count` characters, fewer if a NUL comes before, or with 0xFFFFFFFF all up to the
    /// NUL.
    StringBase &Append(char const *text, unsigned int count);
    /// Makes the string empty and gives up its memory.
    void Empty();

    /// The number of characters, without the NUL. Takes no walk.
    unsigned int GetLength() const { return rep->length; }
    /// Whether there are no characters.
    bool IsEmpty() const { return rep->length == 0; }
    /// The characters with a NUL after them. Never null. Valid until this string changes or ends.
    char const *GetText() const { return rep->Text(); }
    /// As GetText, where a `char const *` is expected.
    operator char const *() const { return rep->Text(); }
    /// The same characters as a view, valid as long as GetText.
    std::string_view View() const { return {rep->Text(), rep->length}; }

    /// 0 if both texts are equal, otherwise another value, whose sign says nothing.
    int Compare(StringBase const &other, CompareType type) const;
    /// The same with a text that ends in NUL. Null counts as empty.
    int Compare(char const *other, CompareType type) const;

    /// The index of the first occurrence of a character, or NOT_FOUND. NUL is never found. The
    /// second argument is passed as 0 and has no effect.
    unsigned int GetIndexOfFirstChar(char character, char) const;
    /// The same for the last occurrence.
    unsigned int GetIndexOfLastChar(char character, char) const;
    /// The index of the first occurrence of a text, or NOT_FOUND. The empty text, also null, is
    /// found at 0.
    unsigned int GetIndexOfString(char const *text, CompareType type) const;

    /// Replaces each occurrence of one character by another and returns how many were replaced. The
    /// same character, or NUL as the new one, changes nothing and gives 0.
    unsigned int ReplaceChars(char from, char to);
    /// Makes ASCII letters upper case.
    void MakeUpper();
    /// Makes ASCII letters lower case.
    void MakeLower();
    /// Removes every character that is one of `characters` from both ends. Null removes nothing.
    void Trim(char const *characters, TrimType type);
    /// The characters of a range as a new string; indices past the end are left out.
    StringBase Extract(Basis_Range const &range) const;
    /// Removes the characters of a range. A range that is empty or begins past the end removes
    /// none.
    void Remove(Basis_Range const &range);

    /// Replaces the text by one that is formatted as printf does, of any length, and returns this
    /// string. A null format counts as empty. Numbers follow the locale of the program.
    StringBase &Format(char const *format, ...) __attribute__((format(printf, 2, 3)));
    /// The same into a new string.
    static StringBase doFormat(char const *format, ...) __attribute__((format(printf, 1, 2)));

    /// Replaces the text by the next line of a stream, without its end ("\n" or "\r\n"). A last
    /// line without an end is a line like any other. A line that holds a NUL ends there. False, and
    /// the text as it was, when no line is left and for a null stream.
    bool ReadLine(Stream *stream);

    /// Moves `range` to the next token, a run of characters that are none of `separators`, and
    /// returns true; false when no token is left. The search begins after the separator that ended
    /// the former token. The separators may change between the calls. PARSE_SKIPPING_EMPTY takes a
    /// run of separators as one, leading ones included. PARSE_KEEPING_EMPTY reports the empty token
    /// before a separator at index i as the empty range (i + 2, i).
    bool NextTokenRange(Basis_Range &range, char const *separators, ParseType type) const;

    /// The leftmost longest match of an expression, see Basis_Regexp::Match; (1, 0) if there is
    /// none.
    Basis_Range GetRangeOfMatch(Basis_Regexp const &expression) const;

    /// Whether both texts are equal, byte for byte.
    friend bool operator==(StringBase const &a, StringBase const &b) {
        return a.View() == b.View();
    }
    /// The same with a text that ends in NUL. Null counts as empty.
    friend bool operator==(StringBase const &a, char const *b) {
        return a.View() == std::string_view(b ? b : "");
    }

private:
    /// The head of a text. The characters follow it in the same block of memory.
    struct Rep {
        std::atomic<unsigned int> owners;
        unsigned int length;
        unsigned int capacity;

        char *Text() { return reinterpret_cast<char *>(this + 1); }
    };
    struct EmptyRep {
        Rep rep;
        char terminator[4];
    };

    friend struct StringEdit;

    /// A text that is followed by `extra` bytes in its block, aligned as a pointer is. They last as
    /// long as any copy of the text, see docs/architecture.md, "Storage and its invariants".
    static StringBase MakeWithRoom(std::string_view text, std::size_t extra, void *&room);

    /// Replaces the text by one that is no piece of it. The memory is used again if it is large
    /// enough and no copy shares it.
    void Assign(std::string_view text) {
        if (text.empty() || text.size() > rep->capacity ||
            rep->owners.load(std::memory_order_acquire) != 1) {
            *this = StringBase(text);
            return;
        }
        text.copy(rep->Text(), text.size());
        rep->Text()[text.size()] = '\0';
        rep->length = static_cast<unsigned int>(text.size());
    }
    static Rep *NewRep(std::size_t capacity, std::size_t extra = 0);
    static void Release(Rep *rep) noexcept;
    char *Writable(std::size_t length);

    /// The one text of all empty strings. It is never counted, written or freed, so that threads
    /// can share it without synchronization.
    static EmptyRep empty;

    Rep *rep;
};

} // namespace Basis
