#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <unordered_set>
#include <vector>

#include "tool/diagnostics/Diagnostic.h"
#include "tool/diagnostics/LineTokens.h"
#include "tool/session/LineReader.h"
#include "tool/session/LineStore.h"

namespace Checks {

/// A place in the command files, whose lines have one count over all files. It is small, since a
/// large design has as many of them as it has objects and connections.
struct CompactLocation {
    std::uint32_t line = 0; ///< from 1; 0 is unknown
    std::uint16_t column = 0;
    std::uint16_t length = 0;
};

/// The place of a token, or its whole line if the column is too large for a CompactLocation.
CompactLocation LocationOf(LineTokens const &tokens, int token, std::uint32_t line);

/// Which line made an object, connected it, or gave it a constant or a text.
class LocationMap {
public:
    enum Event : std::uintptr_t { MADE = 0, CONNECTED = 1, CONSTANT = 2, ASSIGNED = 3, TEXT = 4 };
    static constexpr std::uint32_t EVER = UINT32_MAX;

    /// The lines to come are of this file; `shownName` is what the user called it.
    void BeginFile(std::string const &path, std::string const &shownName);
    /// Counts a line and gives its number. Of an input that cannot be read again the text is kept.
    std::uint32_t NextLine(std::string const &text);

    void Put(Event event, void const *object, CompactLocation spot) {
        entries.push_back({KeyOf(event, object), spot});
    }
    /// The last place that was put before a line. An object that died may have left its address to
    /// another: ask for the former one with the line at which it was alive.
    CompactLocation Find(Event event, void const *object, std::uint32_t before = EVER) const;

    /// A net that a write gave to an open pin has no place, and no check looks at it.
    void PutOpen(void const *net) { openNets.insert(net); }
    bool IsOpen(void const *net) const { return !openNets.empty() && openNets.count(net) > 0; }
    bool HasOpen() const { return !openNets.empty(); }
    /// When a line speaks of the net, it becomes one of that line's. Whether it was open.
    bool TakeOpen(void const *net) { return !openNets.empty() && openNets.erase(net) > 0; }

    SourceRange GetPlace(CompactLocation spot) const;

    /// Reads lines again, one at a time.
    class SourceReader {
    public:
        explicit SourceReader(LocationMap const &readPlaces) : places(readPlaces) {}
        /// The text of a line, null if it cannot be read. Lines are asked for in ascending order.
        std::string const *Get(std::uint32_t line);

    private:
        LocationMap const &places;
        std::size_t file = 0;
        std::unique_ptr<LineReader> reader; ///< of the file
        std::uint32_t lineRead = 0;
        std::string text;
    };

private:
    struct Entry {
        std::uintptr_t key;
        CompactLocation spot;
    };
    struct File {
        std::string path;
        std::string shownName;
        std::uint32_t linesBefore;
        std::unique_ptr<LineStore> lines; ///< of an input that cannot be read again
    };

    /// The addresses of objects are multiples of eight: the low bits are free for the event.
    static std::uintptr_t KeyOf(Event event, void const *object) {
        return reinterpret_cast<std::uintptr_t>(object) | event;
    }
    static constexpr int MAX_WALKS = 30; ///< over places that are not sorted yet

    struct Less {
        bool operator()(Entry const &left, Entry const &right) const;
    };

    void Sort() const;
    std::size_t FileOf(std::uint32_t line) const;

    std::unordered_set<void const *> openNets;
    std::vector<File> files;
    std::uint32_t lineCount = 0;
    mutable std::vector<Entry> entries; ///< those in front sorted by key, then by place
    mutable std::size_t sortedCount = 0;
    mutable int walks = 0; ///< over the others
};

} // namespace Checks
