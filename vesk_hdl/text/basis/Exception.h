#pragma once

#include "vesk_hdl/Api.h"

namespace Basis {

/// What the library throws: a description and the place of the throw. It derives from nothing.
class VESK_HDL_API Exception {
public:
    /// `module` tags the library that throws; file, revision and line name the place. The three
    /// texts are copied; null counts as empty.
    Exception(char const *module, char const *sourceFile, char const *revision, int line);
    Exception(Exception const &other);
    Exception &operator=(Exception const &other);

    virtual ~Exception();
    /// The description as wide characters, each byte a character of its own. Valid as long as the
    /// exception, never null.
    virtual wchar_t const *getLocalized() const;
    /// Writes module tag and description to standard error. The library itself never does.
    virtual void report() const;

    /// Stores a printf-formatted description and returns the exception.
    Exception &setDescription(char const *format, ...) __attribute__((format(printf, 2, 3)));
    /// The description, never null, valid as long as the exception keeps it. Not virtual, so that
    /// the virtual slots stay the three above.
    char const *getDescription() const;
    /// Why it was thrown, as a number of the library that throws, so that nobody needs to read the
    /// description; and the name that it is about, never null, valid as the description is. An
    /// exception has kind 0 and no name until they are set. Null counts as no name.
    int getKind() const;
    char const *getSubject() const;
    Exception &setKind(int kind, char const *subject);
    /// The place of the throw, as given to the constructor. The texts are never null.
    char const *getModule() const;
    char const *getSourceFile() const;
    int getLine() const;

private:
    struct Record;
    Record *record;
};

} // namespace Basis
