#pragma once

#include <functional>
#include <string>
#include <vector>

#include "tool/session/Descriptor.h"
#include "vesk_hdl/Vesk_Hdl.h"

namespace Checks {

/// A piece of a file, in memory: statements that the library's own writers put together. Checks
/// look here for what becomes of a text, so that they need not know how it is written. Many
/// statements are added before the file is read once, which takes some system calls.
class WrittenText {
public:
    using Write = std::function<void(Vesk_Hdl::OutStream &)>;

    /// A part of the plain text, from an index up to another one. By default it is no part.
    struct Range {
        std::size_t begin = 0;
        std::size_t end = 0;
    };

    /// The text as it is written, without indentation and in lines of any length.
    static std::string Plain(Write const &write);

    WrittenText();
    WrittenText(WrittenText const &) = delete;
    WrittenText &operator=(WrittenText const &) = delete;

    /// Adds what `write` writes at a depth of nesting. False, and nothing is added, if a file folds
    /// none of it. Throws std::system_error if there is no memory for a file.
    bool Add(int level, Write const &write);
    /// What was added, as Plain gives it.
    std::string const &GetPlain() const { return plain; }
    /// The index of the plain text at which the last addition begins.
    std::size_t GetLastBegin() const { return lastBegin; }
    /// Whether it is time to read the folds and to begin anew.
    bool IsFull() const { return plain.size() >= MAX_SIZE; }
    /// Finds out where the file folds what was added. Throws as Add does.
    void ReadFolds();
    /// Whether the file goes on in a new line within a part or right after it, where the plain text
    /// does not. To be asked after ReadFolds.
    bool IsFoldedWithin(Range const &part) const;
    /// Forgets what was added.
    void Clear();

private:
    static constexpr std::size_t MAX_SIZE = 32 * 1024; ///< a statement may exceed it

    bool MayFold(int level) const;
    void AddToFile(int level, Write const &write);
    std::string TakeFile();

    std::string plain;
    std::size_t lastBegin = 0;
    Vesk_Hdl::OutStream memory; ///< into `plain`
    Descriptor file;            ///< in memory; opened for the first text that may fold
    Vesk_Hdl::TextFileOutStream stream{nullptr};
    std::vector<std::size_t> folds; ///< indexes of the plain text at which the file begins a line
};

} // namespace Checks
