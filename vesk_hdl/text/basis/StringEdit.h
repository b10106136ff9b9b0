#pragma once

#include "vesk_hdl/text/basis/StringBase.h"

namespace Basis {

/// What the library may do with the memory of a string and its clients may not: the private
/// operations of StringBase<char>, which say what they do.
struct StringEdit {
    static StringBase<char> MakeWithRoom(std::string_view text, std::size_t extra, void *&room) {
        return StringBase<char>::MakeWithRoom(text, extra, room);
    }
    static void Assign(StringBase<char> &string, std::string_view text) { string.Assign(text); }
};

} // namespace Basis
