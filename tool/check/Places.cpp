#include "tool/check/Places.h"

#include <algorithm>

#include "tool/session/LineReader.h"

namespace Checks {

namespace {

bool IsStandardInput(std::string const &path) { return path == "-"; }

} // namespace

Spot SpotOf(LineTokens const &tokens, int token, std::uint32_t line) {
    constexpr unsigned MOST = 0xFFFF;
    unsigned const column = tokens.GetColumn(token);
    unsigned const length = std::min(tokens.GetLength(token), MOST);
    if (column > MOST)
        return {line};
    return {line, static_cast<std::uint16_t>(column), static_cast<std::uint16_t>(length)};
}

void Places::BeginFile(std::string const &path, std::string const &shownName) {
    files.push_back({path, shownName, lineCount, {}});
}

std::uint32_t Places::NextLine(std::string const &text) {
    if (!files.empty() && IsStandardInput(files.back().path))
        files.back().lines.push_back(text);
    return ++lineCount;
}

Spot Places::Find(Event event, void const *object, std::uint32_t before) const {
    auto const isLess = [](Entry const &left, Entry const &right) {
        return left.key != right.key ? left.key < right.key : left.spot.line < right.spot.line;
    };
    if (sortedCount < entries.size()) {
        auto const middle = entries.begin() + static_cast<std::ptrdiff_t>(sortedCount);
        std::stable_sort(middle, entries.end(), isLess);
        std::inplace_merge(entries.begin(), middle, entries.end(), isLess);
        sortedCount = entries.size();
    }
    std::uintptr_t const key = KeyOf(event, object);
    auto const behind =
        std::lower_bound(entries.begin(), entries.end(), Entry{key, {before, 0, 0}}, isLess);
    if (behind == entries.begin() || std::prev(behind)->key != key)
        return {};
    return std::prev(behind)->spot;
}

Places::File const &Places::FileOf(std::uint32_t line) const {
    auto file = files.end() - 1;
    while (file != files.begin() && file->linesBefore >= line)
        --file;
    return *file;
}

Place Places::GetPlace(Spot spot) const {
    Place place;
    if (files.empty())
        return place;
    File const &file = spot.line == 0 ? files.front() : FileOf(spot.line);
    place.file = file.shownName;
    place.line = spot.line == 0 ? 0 : spot.line - file.linesBefore;
    place.column = spot.column;
    place.length = spot.length;
    return place;
}

void Places::AddSources(std::vector<Diagnostic> &diagnostics,
                        std::vector<Spot> const &spots) const {
    std::size_t next = 0;
    for (std::size_t i = 0; i < files.size() && next < spots.size(); ++i) {
        File const &file = files[i];
        std::uint32_t const last = i + 1 < files.size() ? files[i + 1].linesBefore : lineCount;
        while (next < spots.size() && spots[next].line <= file.linesBefore)
            ++next;
        if (IsStandardInput(file.path)) {
            for (; next < spots.size() && spots[next].line <= last; ++next)
                diagnostics[next].source = file.lines[spots[next].line - file.linesBefore - 1];
            continue;
        }
        if (next == spots.size() || spots[next].line > last)
            continue;
        LineReader reader(file.path);
        std::string text;
        std::uint32_t line = file.linesBefore;
        while (next < spots.size() && spots[next].line <= last && reader.Next(text)) {
            ++line;
            for (; next < spots.size() && spots[next].line == line; ++next)
                diagnostics[next].source = text;
        }
    }
}

} // namespace Checks
