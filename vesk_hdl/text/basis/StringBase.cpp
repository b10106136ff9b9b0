// The string of the library: a counted text that copies share until one of them changes.

#include "vesk_hdl/text/basis/StringBase.h"

#include <algorithm>
#include <cstdarg>
#include <cstdlib>
#include <cstring>
#include <new>
#include <stdexcept>
#include <utility>

#include "vesk_hdl/text/basis/Ascii.h"
#include "vesk_hdl/text/basis/Counting.h"
#include "vesk_hdl/text/basis/File.h"
#include "vesk_hdl/text/basis/OrEmpty.h"
#include "vesk_hdl/text/basis/Printf.h"
#include "vesk_hdl/text/basis/Regexp.h"
#include "vesk_hdl/text/basis/Tokens.h"

namespace Basis {

namespace {

/// Lengths are 32 bits wide. The block around the text must not overflow them either, and
/// 0xFFFFFFFF is no index.
constexpr std::size_t MAX_LENGTH = 0xFFFFFFEFU;

} // namespace

constinit StringBase<char>::EmptyRep StringBase<char>::empty = {{{1}, 0, 0}, {}};

StringBase<char>::Rep *StringBase<char>::NewRep(std::size_t capacity, std::size_t extra) {
    if (capacity > MAX_LENGTH)
        throw std::length_error("Basis::StringBase: text too long");
    void *const memory = std::malloc(sizeof(Rep) + capacity + 1 + extra);
    if (!memory)
        throw std::bad_alloc();
    return new (memory) Rep{{1}, 0, static_cast<unsigned int>(capacity)};
}

/// The room begins after the NUL at the next address that is aligned for a pointer.
StringBase<char> StringBase<char>::MakeWithRoom(std::string_view text, std::size_t extra,
                                                void *&room) {
    std::size_t const bytes = sizeof(Rep) + text.size() + 1;
    std::size_t const padding = (alignof(void *) - bytes % alignof(void *)) % alignof(void *);
    StringBase made;
    made.rep = NewRep(text.size(), padding + extra);
    text.copy(made.Writable(text.size()), text.size());
    room = reinterpret_cast<char *>(made.rep) + bytes + padding;
    return made;
}

void StringBase<char>::Release(Rep *rep) noexcept {
    if (rep != &empty.rep && Counting::Leave(rep->owners))
        std::free(rep);
}

/// Makes the text this string's own and `length` characters long, and returns it for writing. The
/// old characters up to the new length stay; the caller fills the others. A text that is changed
/// again and again grows by half, so that appending character by character takes linear time; a
/// text that is shared gets no more than it needs.
char *StringBase<char>::Writable(std::size_t length) {
    bool const own = rep != &empty.rep && rep->owners.load(std::memory_order_acquire) == 1;
    if (!own || length > rep->capacity) {
        std::size_t const grown = own ? std::size_t{rep->capacity} * 3 / 2 : 0;
        Rep *const wider = NewRep(length > grown ? length : std::min(grown, MAX_LENGTH));
        std::memcpy(wider->Text(), rep->Text(), std::min<std::size_t>(length, rep->length));
        Release(rep);
        rep = wider;
    }
    rep->length = static_cast<unsigned int>(length);
    rep->Text()[length] = '\0';
    return rep->Text();
}

StringBase<char>::StringBase(char const *text) : StringBase(ViewOf(text)) {}

StringBase<char>::StringBase(std::string_view text) : rep(&empty.rep) {
    if (!text.empty())
        std::memcpy(Writable(text.size()), text.data(), text.size());
}

StringBase<char>::StringBase(StringBase const &other) noexcept : rep(other.rep) {
    if (rep != &empty.rep)
        Counting::Join(rep->owners);
}

StringBase<char>::StringBase(StringBase const &whole, Basis_Range const &range)
    : StringBase(whole.Extract(range)) {}

StringBase<char> &StringBase<char>::operator=(char const *text) {
    return *this = StringBase(ViewOf(text));
}

StringBase<char> &StringBase<char>::operator=(StringBase const &other) noexcept {
    return *this = StringBase(other);
}

/// The old text is freed with `other`, mostly a temporary.
StringBase<char> &StringBase<char>::operator=(StringBase &&other) noexcept {
    std::swap(rep, other.rep);
    return *this;
}

StringBase<char> &StringBase<char>::operator+=(char character) {
    return character ? *this += std::string_view(&character, 1) : *this;
}

StringBase<char> &StringBase<char>::operator+=(char const *text) { return *this += ViewOf(text); }

StringBase<char> &StringBase<char>::operator+=(StringBase const &text) {
    return *this += text.View();
}

StringBase<char> &StringBase<char>::operator+=(std::string_view text) {
    if (text.empty())
        return *this;
    std::size_t const old = GetLength();
    // A piece of this very text must stay valid until it is copied: a second owner keeps the block.
    bool const ownPiece = text.data() >= GetText() && text.data() <= GetText() + old;
    StringBase const keep = ownPiece ? *this : StringBase();
    std::memcpy(Writable(old + text.size()) + old, text.data(), text.size());
    return *this;
}

StringBase<char> &StringBase<char>::Append(StringBase const &text) { return *this += text; }

StringBase<char> &StringBase<char>::Append(char const *text, unsigned int count) {
    if (!text || count == NOT_FOUND)
        return *this += ViewOf(text);
    return *this += std::string_view(text, ::strnlen(text, count)); // no NUL gets into a string
}

void StringBase<char>::Empty() {
    Release(rep);
    rep = &empty.rep;
}

int StringBase<char>::Compare(StringBase const &other, CompareType type) const {
    if (rep == other.rep) // copies share their text
        return 0;
    bool const equal = type == COMPARE_IGNORING_CASE
                           ? Ascii::EqualIgnoringCase(View(), other.View())
                           : View() == other.View();
    return equal ? 0 : 1;
}

int StringBase<char>::Compare(char const *other, CompareType type) const {
    std::string_view const view = ViewOf(other);
    bool const equal =
        type == COMPARE_IGNORING_CASE ? Ascii::EqualIgnoringCase(View(), view) : View() == view;
    return equal ? 0 : 1;
}

unsigned int StringBase<char>::GetIndexOfFirstChar(char character, char) const {
    std::size_t const at = character ? View().find(character) : std::string_view::npos;
    return at == std::string_view::npos ? NOT_FOUND : static_cast<unsigned int>(at);
}

unsigned int StringBase<char>::GetIndexOfLastChar(char character, char) const {
    std::size_t const at = character ? View().rfind(character) : std::string_view::npos;
    return at == std::string_view::npos ? NOT_FOUND : static_cast<unsigned int>(at);
}

unsigned int StringBase<char>::GetIndexOfString(char const *text, CompareType type) const {
    std::string_view const wanted = ViewOf(text);
    if (type == COMPARE_EXACT) {
        std::size_t const at = View().find(wanted);
        return at == std::string_view::npos ? NOT_FOUND : static_cast<unsigned int>(at);
    }
    for (std::size_t at = 0; at + wanted.size() <= GetLength(); ++at)
        if (Ascii::EqualIgnoringCase(View().substr(at, wanted.size()), wanted))
            return static_cast<unsigned int>(at);
    return NOT_FOUND;
}

/// A text without the character is not copied: most names are normal and share their text.
unsigned int StringBase<char>::ReplaceChars(char from, char to) {
    if (from == to || to == '\0' || GetIndexOfFirstChar(from, 0) == NOT_FOUND)
        return 0;
    unsigned int count = 0;
    char *const text = Writable(GetLength());
    for (unsigned int i = 0; i < GetLength(); ++i)
        if (text[i] == from) {
            text[i] = to;
            ++count;
        }
    return count;
}

void StringBase<char>::MakeUpper() {
    if (IsEmpty()) // the text of all empty strings must not be written
        return;
    char *const text = Writable(GetLength());
    for (unsigned int i = 0; i < GetLength(); ++i)
        text[i] = Ascii::ToUpper(text[i]);
}

void StringBase<char>::MakeLower() {
    if (IsEmpty()) // likewise
        return;
    char *const text = Writable(GetLength());
    for (unsigned int i = 0; i < GetLength(); ++i)
        text[i] = Ascii::ToLower(text[i]);
}

void StringBase<char>::Trim(char const *characters, TrimType) {
    std::string_view const set = ViewOf(characters);
    std::size_t const first = View().find_first_not_of(set);
    if (first == std::string_view::npos)
        return Empty();
    std::size_t const last = View().find_last_not_of(set);
    *this = StringBase(View().substr(first, last + 1 - first));
}

StringBase<char> StringBase<char>::Extract(Basis_Range const &range) const {
    if (range.first > range.last || range.first >= GetLength())
        return {};
    if (range.first == 0 && range.last >= GetLength() - 1)
        return *this; // the whole text is shared and not copied
    std::size_t const count = static_cast<std::size_t>(range.last) + 1 - range.first;
    return StringBase(View().substr(range.first, count));
}

void StringBase<char>::Remove(Basis_Range const &range) {
    if (range.first > range.last || range.first >= GetLength())
        return;
    StringBase rest(View().substr(0, range.first));
    if (range.last < GetLength())
        rest += View().substr(static_cast<std::size_t>(range.last) + 1);
    *this = static_cast<StringBase &&>(rest);
}

StringBase<char> &StringBase<char>::Format(char const *format, ...) {
    va_list arguments;
    va_start(arguments, format);
    *this = Printf(OrEmpty(format), arguments).c_str();
    va_end(arguments);
    return *this;
}

StringBase<char> StringBase<char>::doFormat(char const *format, ...) {
    va_list arguments;
    va_start(arguments, format);
    StringBase text(Printf(OrEmpty(format), arguments).c_str());
    va_end(arguments);
    return text;
}

bool StringBase<char>::ReadLine(Stream *stream) {
    std::string_view line;
    if (!stream || !stream->ReadLine(line))
        return false;
    *this = StringBase(line.substr(0, line.find('\0'))); // a string holds no NUL
    return true;
}

bool StringBase<char>::NextTokenRange(Basis_Range &range, char const *separators,
                                      ParseType type) const {
    return NextToken(View(), range, ViewOf(separators), type == PARSE_SKIPPING_EMPTY);
}

Basis_Range StringBase<char>::GetRangeOfMatch(Basis_Regexp const &expression) const {
    return expression.Match(View());
}

} // namespace Basis
