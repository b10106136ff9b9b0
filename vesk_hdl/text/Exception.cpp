#include "vesk_hdl/text/Exception.h"

#include "vesk_hdl/text/Raise.h"
#include "vesk_hdl/text/basis/Printf.h"
#include "vesk_hdl/text/basis/Version.h"

namespace Vesk_Hdl {

Exception::Exception(Basis::Exception const &other) : Basis::Exception(other) {}
Exception::Exception(Exception const &other) = default;
Exception &Exception::operator=(Exception const &other) = default;
Exception::~Exception() = default;

void Raise(char const *sourceFile, int line, char const *format, ...) {
    va_list arguments;
    va_start(arguments, format);
    std::string const description = Basis::Printf(format, arguments);
    va_end(arguments);
    Basis::Exception raised("DesignEntry", sourceFile, Basis::Version::getValue("version"), line);
    raised.setDescription("%s", description.c_str());
    throw Exception(raised);
}

} // namespace Vesk_Hdl
