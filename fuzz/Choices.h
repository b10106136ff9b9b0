#pragma once

#include <cstddef>
#include <cstdint>
#include <iterator>
#include <string>
#include <vector>

/// The bytes of an input as a sequence of choices. After its end every choice is 0.
class Choices {
public:
    Choices(std::uint8_t const *data, std::size_t size) : at(data), end(data + size) {}
    bool IsEmpty() const { return at == end; }
    unsigned int Below(unsigned int bound) { return IsEmpty() ? 0 : *at++ % bound; }
    std::string Text() {
        std::string text;
        for (unsigned int left = Below(8); left > 0; --left)
            text += "aAbBz1290_ ,()[:]-.*+?\"\\\n\t\xe9"[Below(27)];
        return text;
    }
    /// A name, mostly out of a small set, so that several objects get the same one.
    std::string Name() {
        static char const *const NAMES[] = {"a",      "A1",     "D(3:0)", "D[2]",   "D(1:0)",
                                            "s",      "c<0:7>", "",       "open",   "u_1",
                                            "d,D(0)", "D(7:0)", "D(0:9)", "s(1:0)", "a_DUMMY"};
        unsigned int const which = Below(20);
        return which < std::size(NAMES) ? NAMES[which] : Text();
    }
    /// One of these objects, which are not owned; null if there is none.
    template <class T> T *Of(std::vector<T *> const &all) {
        return all.empty() ? nullptr : all[Below(static_cast<unsigned int>(all.size()))];
    }

private:
    std::uint8_t const *at;
    std::uint8_t const *end;
};
