// The exception of the library, and the one function that throws it.

#include "vesk_hdl/text/Exception.h"

#include <string>

#include "vesk_hdl/text/Raise.h"
#include "vesk_hdl/text/basis/OrEmpty.h"
#include "vesk_hdl/text/basis/Version.h"

namespace Vesk_Hdl {

Exception::Exception(Basis::Exception const &other) : Basis::Exception(other) {}
Exception::Exception(Exception const &other) = default;
Exception &Exception::operator=(Exception const &other) = default;
Exception::~Exception() = default;

void Raise(char const *sourceFile, int line, Message const &message,
           std::initializer_list<char const *> names) {
    // Not printf: a name may hold a "%", and names may be longer than any buffer.
    constexpr std::string_view PLACE = "%s";
    std::string description;
    std::string_view rest = message.text;
    char const *subject = "";
    for (char const *const name : names) {
        subject = Basis::OrEmpty(name);
        std::size_t const place = rest.find(PLACE);
        if (place == rest.npos)
            continue; // a subject that the text does not show
        description.append(rest.substr(0, place)).append(subject);
        rest.remove_prefix(place + PLACE.size());
    }
    description.append(rest);
    Basis::Exception raised("DesignEntry", sourceFile, Basis::Version::getValue("version"), line);
    raised.setDescription("%s", description.c_str()).setKind(message.kind, subject);
    throw Exception(raised);
}

} // namespace Vesk_Hdl
