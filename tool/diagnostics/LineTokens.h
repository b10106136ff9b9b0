#pragma once

#include <string>
#include <vector>

#include "vesk_hdl/Vesk_Hdl.h"

/// A command line as the engine reads it: its tokens, and the place of each in the line.
class LineTokens {
public:
    LineTokens() = default;
    explicit LineTokens(std::string const &line) { Read(line); }

    /// Takes the tokens of another line in place of those it has, in the same memory.
    void Read(std::string const &line);

    Vesk_Hdl::StringArray const &GetTokens() const { return tokens; }
    int GetSize() const { return tokens.GetSize(); }
    std::string_view At(int index) const;
    /// From 1, in bytes, of the token's first character or quote; 0 if there is no such token.
    unsigned GetColumn(int index) const;
    /// In bytes, quotes included.
    unsigned GetLength(int index) const;

private:
    Vesk_Hdl::StringArray tokens;
    std::vector<Basis_Range> places;
};
