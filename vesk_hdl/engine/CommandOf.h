#pragma once

#include <algorithm>
#include <cstddef>

#include "vesk_hdl/engine/HdlCmd.h"

namespace Vesk_Hdl {

/// A keyword as an argument of a template: words with single blanks between them.
template <std::size_t SIZE> struct Keyword {
    char text[SIZE];

    consteval Keyword(char const (&keyword)[SIZE]) { std::copy_n(keyword, SIZE, text); }
};

/// The number of words in a keyword.
constexpr int WordsIn(char const *keyword) {
    int words = 1;
    for (; *keyword; ++keyword)
        words += *keyword == ' ';
    return words;
}

/// The class of a command. Its Arguments say what the command reads from its line and what it does:
///
///     bool Parse(StringArray const &tokens, int first); // false if they are not acceptable
///     void Run(Model &model);
///
/// `first` is the index of the first argument, which is the number of words in the keyword: no
/// command repeats it. The arguments are a member, so that a command is one allocation.
template <Keyword KEYWORD_TEXT, class Arguments> class CommandOf : public Command {
public:
    static constexpr char const *KEYWORD = KEYWORD_TEXT.text;

    using Command::Command;
    bool ParseArguments(StringArray const &tokens) override {
        constexpr int FIRST = WordsIn(KEYWORD);
        return arguments.Parse(tokens, FIRST);
    }
    void Execute() override { arguments.Run(RequireModel()); }
    char const *GetKeyword() const override { return KEYWORD; }

private:
    Arguments arguments;
};

} // namespace Vesk_Hdl
