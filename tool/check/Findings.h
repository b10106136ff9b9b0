#pragma once

#include <set>
#include <string>
#include <unordered_map>
#include <vector>

#include "tool/check/Checks.h"
#include "tool/check/Places.h"
#include "tool/diagnostics/Diagnostic.h"

namespace Checks {

/// Another place that has to do with a finding: where something happened to an object. It is looked
/// up when the finding is shown, by address alone.
struct Related {
    void const *object;
    std::string text;
    Places::Event event = Places::MADE;
    std::uint32_t before = Places::EVER;
};

struct Finding {
    Id id;
    Spot spot;
    std::string subject; ///< what was found, in front of the sentence
    std::vector<Related> related = {};
    Languages languages = BOTH; ///< of those of the check
    std::string detail = {};    ///< behind the sentence, in brackets
};

/// Takes findings, leaves out what nobody asked for, tells each once with all languages that it
/// concerns, and gives them in the order of the lines.
class Findings {
public:
    void SwitchOff(Id id) { off.insert(id); }
    /// The languages that findings from now on have to concern.
    void SetLanguages(Languages wanted) { languages = wanted; }

    /// Whether a check is worth its work.
    bool Wants(Id id) const { return (Get(id).languages & languages) != 0 && off.count(id) == 0; }
    void Add(Finding finding);
    /// What came in. Files are read again for the lines, hence no findings, no reading.
    std::vector<Diagnostic> Take(Places const &places);

private:
    std::set<Id> off;
    Languages languages = BOTH;
    std::vector<Finding> findings;
    std::unordered_map<std::string, std::size_t> told; ///< where they stand in the findings
};

} // namespace Checks
