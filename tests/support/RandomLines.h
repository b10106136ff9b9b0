#pragma once

#include <random>
#include <string>

/// Command lines made from the grammar of the commands and a small stock of names, so that most of
/// them are accepted, meet each other's objects and reach deep states.
class RandomLines {
public:
    explicit RandomLines(std::mt19937 &source) : random(source) {}

    /// Components, pins of all forms and instances for the other lines to use, each ended by "\n".
    static std::string Preface();
    /// A line, ended by "\n". Half of them connect something.
    std::string Next();

private:
    std::string Argument(std::string word);
    std::string Name();
    std::string SimpleName();
    std::string Index();
    std::string Value();

    int Below(int limit) { return static_cast<int>(random() % static_cast<unsigned>(limit)); }
    template <std::size_t Count> char const *Pick(char const *const (&words)[Count]) {
        return words[random() % Count];
    }

    std::mt19937 &random;
};
