#include "fuzz/CommandLines.h"

#include <algorithm>
#include <random>

#include "tests/support/RandomLines.h"

namespace {

std::vector<std::string> LinesOf(std::string const &text) {
    std::vector<std::string> lines;
    for (std::size_t at = 0; at < text.size();) {
        std::size_t const end = std::min(text.find('\n', at), text.size());
        lines.push_back(text.substr(at, end - at));
        at = end + 1;
    }
    return lines;
}

} // namespace

std::vector<std::string> CommandLines(std::uint8_t const *data, std::size_t size) {
    constexpr std::size_t MAX_LINES = 400;
    std::vector<std::string> lines = LinesOf(RandomLines::Preface());
    for (std::string const &line : LinesOf(std::string(reinterpret_cast<char const *>(data), size)))
        if (lines.size() < MAX_LINES)
            lines.push_back(line.substr(0, line.find('\0')));
    return lines;
}

#ifdef VESK_HDL_FUZZER
extern "C" std::size_t LLVMFuzzerMutate(std::uint8_t *data, std::size_t size, std::size_t most);

extern "C" std::size_t LLVMFuzzerCustomMutator(std::uint8_t *data, std::size_t size,
                                               std::size_t most, unsigned int seed) {
    std::mt19937 random(seed);
    if (random() % 8 == 0)
        return LLVMFuzzerMutate(data, size, most);
    std::vector<std::string> lines =
        LinesOf(std::string(reinterpret_cast<char const *>(data), size));
    RandomLines source(random);
    for (unsigned change = 1 + random() % 4; change > 0; --change) {
        std::size_t const at = random() % (lines.size() + 1);
        auto const place = lines.begin() + static_cast<std::ptrdiff_t>(at);
        unsigned const kind = random() % 4;
        if (kind == 0 && at < lines.size())
            lines.erase(place);
        else if (kind == 1 && at < lines.size())
            std::swap(lines[at], lines[random() % lines.size()]);
        else
            lines.insert(place, source.Next());
    }
    std::string text;
    for (std::string const &line : lines)
        text += line + (line.ends_with('\n') ? "" : "\n");
    size = std::min(text.size(), most);
    std::copy_n(text.begin(), size, data);
    return size;
}
#endif
