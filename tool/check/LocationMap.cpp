#include "tool/check/LocationMap.h"

#include <algorithm>
#include <tuple>

namespace Checks {

CompactLocation LocationOf(LineTokens const &tokens, int token, std::uint32_t line) {
    constexpr unsigned MOST = 0xFFFF;
    unsigned const column = tokens.GetColumn(token);
    unsigned const length = std::min(tokens.GetLength(token), MOST);
    if (column > MOST)
        return {line};
    return {line, static_cast<std::uint16_t>(column), static_cast<std::uint16_t>(length)};
}

void LocationMap::BeginFile(std::string const &path, std::string const &shownName) {
    files.push_back({path, shownName, lineCount, nullptr});
    if (!LineReader::CanReadAgain(path))
        files.back().lines = std::make_unique<LineStore>();
}

std::uint32_t LocationMap::NextLine(std::string const &text) {
    if (!files.empty() && files.back().lines)
        files.back().lines->Add(text);
    return ++lineCount;
}

/// The tokens of a line are put from left to right, so that the last one put comes after the
/// others.
bool LocationMap::Less::operator()(Entry const &left, Entry const &right) const {
    return std::tie(left.key, left.spot.line, left.spot.column) <
           std::tie(right.key, right.spot.line, right.spot.column);
}

void LocationMap::Sort() const {
    auto const middle = entries.begin() + static_cast<std::ptrdiff_t>(sortedCount);
    std::sort(middle, entries.end(), Less());
    std::inplace_merge(entries.begin(), middle, entries.end(), Less());
    sortedCount = entries.size();
    walks = 0;
}

/// A clean design asks for few places, for which a walk costs less than sorting them all.
CompactLocation LocationMap::Find(Event event, void const *object, std::uint32_t before) const {
    if (sortedCount < entries.size() && ++walks > MAX_WALKS)
        Sort();
    Entry const end{KeyOf(event, object), {before, 0, 0}};
    for (std::size_t i = entries.size(); i-- > sortedCount;)
        if (entries[i].key == end.key && entries[i].spot.line < before)
            return entries[i].spot;
    auto const sortedEnd = entries.begin() + static_cast<std::ptrdiff_t>(sortedCount);
    auto const after = std::lower_bound(entries.begin(), sortedEnd, end, Less());
    if (after == entries.begin() || std::prev(after)->key != end.key)
        return {};
    return std::prev(after)->spot;
}

/// The last file that begins before the line.
std::size_t LocationMap::FileOf(std::uint32_t line) const {
    auto const after =
        std::partition_point(files.begin() + 1, files.end(),
                             [line](File const &file) { return file.linesBefore < line; });
    return static_cast<std::size_t>(after - files.begin()) - 1;
}

SourceRange LocationMap::GetPlace(CompactLocation spot) const {
    SourceRange place;
    if (files.empty())
        return place;
    File const &file = files[spot.line == 0 ? 0 : FileOf(spot.line)];
    place.file = file.shownName;
    place.line = spot.line == 0 ? 0 : spot.line - file.linesBefore;
    place.column = spot.column;
    place.length = spot.length;
    return place;
}

std::string const *LocationMap::SourceReader::Get(std::uint32_t line) {
    if (line == 0 || places.files.empty())
        return nullptr;
    std::size_t const wanted = places.FileOf(line);
    if (!reader || wanted != file) {
        File const &source = places.files[wanted];
        file = wanted;
        lineRead = source.linesBefore;
        reader = source.lines ? source.lines->Read() : std::make_unique<LineReader>(source.path);
    }
    while (lineRead < line && reader->Next(text))
        ++lineRead;
    return lineRead == line ? &text : nullptr;
}

} // namespace Checks
