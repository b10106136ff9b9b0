// The base of the exceptions.

#include "vesk_hdl/text/basis/Exception.h"

#include <string>

#include "vesk_hdl/text/basis/OrEmpty.h"
#include "vesk_hdl/text/basis/Printf.h"

namespace Basis {

/// Apart from the class, so that it can grow without a change of the binary interface.
struct Exception::Record {
    std::string module;
    std::string sourceFile;
    std::string revision;
    int line;
    std::string description;
    std::wstring localized;
    int kind;
    std::string subject;
};

Exception::Exception(char const *module, char const *sourceFile, char const *revision, int line)
    : record(new Record{
          OrEmpty(module), OrEmpty(sourceFile), OrEmpty(revision), line, {}, {}, 0, {}}) {}

Exception::Exception(Exception const &other) : record(new Record(*other.record)) {}

Exception &Exception::operator=(Exception const &other) {
    *record = *other.record;
    return *this;
}

Exception::~Exception() { delete record; }

/// Made by setDescription, so that this operation can be const and cannot fail.
wchar_t const *Exception::getLocalized() const { return record->localized.c_str(); }

void Exception::report() const {
    std::fprintf(stderr, "%s: %s", record->module.c_str(), record->description.c_str());
}

Exception &Exception::setDescription(char const *format, ...) {
    va_list arguments;
    va_start(arguments, format);
    record->description = Printf(OrEmpty(format), arguments);
    va_end(arguments);
    record->localized.clear();
    for (char const c : record->description)
        record->localized += static_cast<wchar_t>(static_cast<unsigned char>(c));
    return *this;
}

Exception &Exception::setKind(int kind, char const *subject) {
    record->kind = kind;
    record->subject = OrEmpty(subject);
    return *this;
}

char const *Exception::getDescription() const { return record->description.c_str(); }
int Exception::getKind() const { return record->kind; }
char const *Exception::getSubject() const { return record->subject.c_str(); }
char const *Exception::getModule() const { return record->module.c_str(); }
char const *Exception::getSourceFile() const { return record->sourceFile.c_str(); }
int Exception::getLine() const { return record->line; }

} // namespace Basis
