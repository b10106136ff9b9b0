#pragma once

#include <functional>
#include <string>
#include <sys/types.h>
#include <vector>

#include "tool/session/Descriptor.h"
#include "vesk_hdl/Vesk_Hdl.h"

namespace Checks {

/// A piece of a file, in memory: some statements that the library's own writers put together.
/// Checks look here for what becomes of a text, so that they need not know how it is written.
class WrittenText {
public:
    using Write = std::function<void(Vesk_Hdl::OutStream &)>;

    /// The text as it is written, without indentation and in lines of any length.
    static std::string Plain(Write const &write);

    /// Takes in what `write` writes at a depth of nesting, in place of what was here. Throws
    /// std::system_error if there is no memory for a file.
    void Take(int level, Write const &write);
    /// The text as it is written, see above.
    std::string const &GetPlain() const { return plain; }
    /// Whether a file goes on in a new line somewhere where the plain text does not.
    bool IsFolded() const { return !folds.empty(); }
    /// Whether it does so between two indexes of the plain text, or at the second one.
    bool IsFoldedWithin(std::size_t begin, std::size_t end) const;

private:
    bool MayFold(int level) const;
    std::string TakeFile(int level, Write const &write);
    std::string ReadOn();

    Descriptor file; ///< in memory; opened for the first text that may fold
    off_t readUpTo = 0;
    Vesk_Hdl::TextFileOutStream stream{nullptr};
    std::string plain;
    std::vector<std::size_t> folds; ///< indexes of the plain text at which a file begins a line
};

} // namespace Checks
