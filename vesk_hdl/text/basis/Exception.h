#pragma once

#include "vesk_hdl/Api.h"

namespace Basis {

/// The base of what the library throws: a description, the place of the throw, and a kind that
/// programs can test. It derives from nothing, not even std::exception: a client catches it by its
/// own name, or as Vesk_Hdl::Exception.
///
/// Texts are copied in and stay the property of the exception. A pointer that a getter returns is
/// valid until the exception is assigned to, gets another such text, or is destroyed.
class VESK_HDL_API Exception {
public:
    /// An exception without a description and of kind 0. `module` names the library that throws;
    /// source file, revision and line (from 1) name the place. Null texts count as empty.
    Exception(char const *module, char const *sourceFile, char const *revision, int line);
    /// An independent copy. The library catches and throws on by copy, so that a client always gets
    /// an exception of its own.
    Exception(Exception const &other);
    /// Copies everything. Assigning an exception to itself changes nothing.
    Exception &operator=(Exception const &other);

    /// Frees the texts; pointers from the getters are no longer valid.
    virtual ~Exception();
    /// The description as wide characters, each byte as one character of its own. Never null.
    virtual wchar_t const *getLocalized() const;
    /// Writes module and description to standard error. The library itself never calls it: what
    /// becomes of a message is up to the client.
    virtual void report() const;

    /// Replaces the description by one that is formatted as printf does, of any length, and returns
    /// the exception. A null format counts as empty. A name belongs into the arguments and never
    /// into the format, since it may hold a "%".
    Exception &setDescription(char const *format, ...) __attribute__((format(printf, 2, 3)));
    /// The description, empty until it is set. Never null. It is not virtual, so that the virtual
    /// table has only the three operations above.
    char const *getDescription() const;
    /// Why the exception was thrown, as a number that the throwing library defines, so that no
    /// program need read the description. 0 until it is set. See Vesk_Hdl::Exception::Kind.
    int getKind() const;
    /// The name or word that the exception is about, as the caller spelled it. Empty if the kind
    /// has none. Never null.
    char const *getSubject() const;
    /// Sets kind and subject and returns the exception. A null subject counts as empty.
    Exception &setKind(int kind, char const *subject);
    /// The module given to the constructor. Never null.
    char const *getModule() const;
    /// The source file given to the constructor. Never null.
    char const *getSourceFile() const;
    /// The line given to the constructor.
    int getLine() const;

private:
    struct Record;
    Record *record;
};

} // namespace Basis
