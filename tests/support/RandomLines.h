#pragma once

#include <random>
#include <string>

#include "vesk_hdl/Vesk_Hdl.h"

/// Command lines made from the grammar of the commands and a small set of names, so that most of
/// them are accepted and refer to the same objects.
class RandomLines {
public:
    explicit RandomLines(std::mt19937 &source) : random(source) {}

    /// Components, pins of all forms and instances for the other lines to use, each ended by "\n".
    static std::string Preface();
    /// A line, ended by "\n". Half of them connect something.
    std::string Next();

private:
    std::string Word(Vesk_Hdl::ArgumentKind kind);
    std::string Name();
    std::string SimpleName();
    std::string Index();

    int Below(int limit) { return static_cast<int>(random() % static_cast<unsigned>(limit)); }
    template <class List> auto const &Pick(List const &list) {
        return list[random() % std::size(list)];
    }

    std::mt19937 &random;
};
