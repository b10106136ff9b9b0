#pragma once

#include <iosfwd>
#include <span>
#include <string>
#include <string_view>

/// A family of designs that grows with one number.
struct Kind {
    char const *name;
    char const *counts; ///< what the number counts
    char const *shape;
    void (*write)(std::ostream &lines, long n); ///< all lines that declare and connect
    int writes = 1;                             ///< how often each output is written
};

std::span<Kind const> GetKinds();
/// Null if there is none of that name.
Kind const *FindKind(std::string_view name);

/// Writes a whole command file. An output without a file name is left out.
void WriteDesign(std::ostream &lines, Kind const &kind, long n, std::string const &vhdlFile,
                 std::string const &verilogFile);
