#pragma once

#include <iosfwd>
#include <string>
#include <string_view>
#include <vector>

/// A family of command files that someone could write to make the tool slow, or could hit upon
/// without meaning to. It grows with one number, n.
struct HostileKind {
    /// A piece of the file, written once or n times. In it {i} is replaced by the number of the
    /// repetition, from 0 on; WriteHostile says what else.
    struct Part {
        enum Times { ONCE, EACH, EACH_HUNDREDTH };

        Times times;
        std::string text;
    };

    std::string name;
    std::string shape; ///< what there are n of
    std::vector<Part> parts;
    long size = 64000; ///< n of the largest run: a linear kind takes some tenths of a second
    /// Why the output that is asked for grows faster than the file; null if it does not.
    char const *inherent = nullptr;
};

/// The kinds of the tables, then those that follow from the grammar of each command.
std::vector<HostileKind> const &GetHostileKinds();
/// Null if there is none of that name.
HostileKind const *FindHostileKind(std::string_view name);

void WriteHostile(std::ostream &lines, HostileKind const &kind, long n);
