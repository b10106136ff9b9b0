#pragma once

#include <atomic>
#include <string_view>

#include "vesk_hdl/Api.h"

class Basis_Regexp;

/// A pair of character indices, both inclusive. `first` greater than `last` is an empty range;
/// (1, 0) is where every walk with NextTokenRange starts.
struct Basis_Range {
    unsigned int first;
    unsigned int last;
};

namespace Basis {

class Stream;
struct StringEdit;

/// The answer of every search that finds nothing.
inline constexpr unsigned int NOT_FOUND = 0xFFFFFFFFU;

template <class Char> class StringBase;

/// The string of the whole library: 8-bit characters behind a text pointer that is never null.
///
/// A value type. Copies share their text until one of them changes, so that handing a name on costs
/// a counter; a change never shows in another copy, also across threads. The text holds no NUL
/// character: what is built from `char const *` ends at the first one, and null counts as empty.
/// A string holds at most 0xFFFFFFEF characters; more raises std::length_error.
template <> class VESK_HDL_API StringBase<char> {
public:
    enum CompareType : int { COMPARE_EXACT = 0, COMPARE_IGNORING_CASE = 1 };
    enum ParseType : int { PARSE_KEEPING_EMPTY = 0, PARSE_SKIPPING_EMPTY = 1 };
    enum TrimType : int { TRIM_BOTH_ENDS = 2 };

    StringBase() noexcept : rep(&empty.rep) {}
    StringBase(char const *text);
    StringBase(StringBase const &other) noexcept;
    StringBase(StringBase &&other) noexcept : rep(other.rep) { other.rep = &empty.rep; }
    /// The characters of `range`; what lies behind the end of `whole` is left out.
    StringBase(StringBase const &whole, Basis_Range const &range);
    /// The text holds no NUL character.
    explicit StringBase(std::string_view text);
    ~StringBase() {
        if (rep != &empty.rep)
            Release(rep);
    }

    StringBase &operator=(char const *text);
    StringBase &operator=(StringBase const &other) noexcept;
    StringBase &operator=(StringBase &&other) noexcept;

    StringBase &operator+=(char character);
    StringBase &operator+=(char const *text);
    StringBase &operator+=(StringBase const &text);
    StringBase &operator+=(std::string_view text);
    StringBase &Append(StringBase const &text);
    /// Appends `count` characters, or with 0xFFFFFFFF all up to the terminating NUL.
    StringBase &Append(char const *text, unsigned int count);
    void Empty();

    unsigned int GetLength() const { return rep->length; }
    bool IsEmpty() const { return rep->length == 0; }
    /// Never null; valid until this string changes or dies.
    char const *GetText() const { return rep->Text(); }
    operator char const *() const { return rep->Text(); }
    /// The same characters without a copy, valid as long as GetText.
    std::string_view View() const { return {rep->Text(), rep->length}; }

    /// 0 if equal; the sign of any other answer means nothing.
    int Compare(StringBase const &other, CompareType type) const;
    int Compare(char const *other, CompareType type) const;

    /// The index of an occurrence, or NOT_FOUND. The NUL character is never found. The second
    /// argument is passed as 0 and plays no part.
    unsigned int GetIndexOfFirstChar(char character, char) const;
    unsigned int GetIndexOfLastChar(char character, char) const;
    unsigned int GetIndexOfString(char const *text, CompareType type) const;

    unsigned int ReplaceChars(char from, char to);
    void MakeUpper();
    void MakeLower();
    /// Removes every character that is one of `characters` from both ends.
    void Trim(char const *characters, TrimType type);
    StringBase Extract(Basis_Range const &range) const;
    void Remove(Basis_Range const &range);

    /// Replaces the text by printf-style formatting; any length is held.
    StringBase &Format(char const *format, ...) __attribute__((format(printf, 2, 3)));
    static StringBase doFormat(char const *format, ...) __attribute__((format(printf, 1, 2)));

    /// The next line without its end ("\n" or "\r\n"); false when none is left. A last line without
    /// an end is a line like any other.
    bool ReadLine(Stream *stream);

    /// Moves `range` to the next token, a run of characters that are none of `separators`,
    /// searching behind the separator that ended the former one; false when no token is left. The
    /// separators may change between the calls. PARSE_SKIPPING_EMPTY takes a run of separators as
    /// one, leading ones included. PARSE_KEEPING_EMPTY reports the empty token in front of a
    /// separator at index i as the empty range (i + 2, i).
    bool NextTokenRange(Basis_Range &range, char const *separators, ParseType type) const;

    /// The leftmost longest match, or (1, 0) if there is none.
    Basis_Range GetRangeOfMatch(Basis_Regexp const &expression) const;

    friend bool operator==(StringBase const &a, StringBase const &b) {
        return a.View() == b.View();
    }
    friend bool operator==(StringBase const &a, char const *b) {
        return a.View() == std::string_view(b ? b : "");
    }

private:
    /// Stands in front of the characters, in one block with them.
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

    /// A text that has `extra` bytes behind it in its block, aligned as a pointer is: they last as
    /// long as any copy of the text does.
    static StringBase MakeWithRoom(std::string_view text, std::size_t extra, void *&room);

    /// Replaces the text, in its memory if that serves, by one that is no piece of it.
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

    /// The one text of all empty strings. It is never counted, written or freed.
    static EmptyRep empty;

    Rep *rep;
};

} // namespace Basis
