#pragma once

#include <functional>
#include <set>
#include <string>
#include <unordered_set>
#include <vector>

#include "tool/check/Checks.h"
#include "tool/check/LocationMap.h"
#include "tool/diagnostics/Diagnostic.h"

namespace Checks {

/// Another place that has to do with a finding: where something happened to an object. It is looked
/// up when the finding is shown, by address alone.
struct Related {
    void const *object;
    std::string text;
    LocationMap::Event event = LocationMap::MADE;
    std::uint32_t before = LocationMap::EVER;
};

/// What a check found. It holds places, never lines, and names as `Quoted` shortens them: a line as
/// long as the file may have as many findings as it has names.
struct Finding {
    Id id;
    CompactLocation spot;
    std::string subject; ///< what was found, in front of the sentence
    std::vector<Related> related = {};
    Languages languages = BOTH; ///< of those of the check
    std::string detail = {};    ///< after the sentence, in brackets
};

/// Takes findings, leaves out what nobody asked for, keeps each once with all languages that it
/// concerns, and gives them in the order of the lines.
class Findings {
public:
    void SwitchOff(Id id) { off.insert(id); }
    /// The languages that findings from now on have to concern.
    void SetLanguages(Languages wanted) { languages = wanted; }

    /// Whether a check is worth its work.
    bool Wants(Id id) const { return (Get(id).languages & languages) != 0 && off.count(id) == 0; }
    void Add(Finding finding);
    /// Calls `show` with each of what came in and forgets it. The lines are read again meanwhile;
    /// without findings nothing is read.
    void Show(LocationMap const &places, std::function<void(Diagnostic &)> const &show);

private:
    /// Findings by their number. Two are the same if check, line and, in any case, subject are.
    struct Hash {
        std::vector<Finding> const *findings;
        std::size_t operator()(std::uint32_t number) const;
    };
    struct Equal {
        std::vector<Finding> const *findings;
        bool operator()(std::uint32_t left, std::uint32_t right) const;
    };

    std::set<Id> off;
    Languages languages = BOTH;
    std::vector<Finding> findings;
    std::unordered_set<std::uint32_t, Hash, Equal> known{0, Hash{&findings}, Equal{&findings}};
};

} // namespace Checks
