#include "tool/check/Findings.h"

#include <algorithm>

#include "tool/diagnostics/Words.h"

namespace Checks {

namespace {

Diagnostic DiagnosticOf(Finding const &finding, Places const &places) {
    Row const &row = Get(finding.id);
    Diagnostic diagnostic;
    diagnostic.severity = Severity::WARNING;
    diagnostic.place = places.GetPlace(finding.spot);
    diagnostic.message = finding.subject + " " + row.sentence;
    if (!finding.detail.empty())
        diagnostic.message += " (" + finding.detail + ")";
    diagnostic.hints = {row.hint};
    for (Related const &related : finding.related) {
        Spot const spot = places.Find(related.event, related.object, related.before);
        if (spot.line > 0)
            diagnostic.notes.push_back({places.GetPlace(spot), related.text});
    }
    diagnostic.name = row.name;
    diagnostic.language = NameOf(finding.languages);
    return diagnostic;
}

} // namespace

void Findings::Add(Finding finding) {
    finding.languages &= Get(finding.id).languages;
    if ((finding.languages & languages) == 0 || !Wants(finding.id))
        return;
    std::string const key = std::to_string(static_cast<int>(finding.id)) + ' ' +
                            std::to_string(finding.spot.line) + ' ' + Lowercase(finding.subject);
    auto const [known, isNew] = told.try_emplace(key, findings.size());
    if (isNew)
        findings.push_back(std::move(finding));
    else
        findings[known->second].languages |= finding.languages;
}

std::vector<Diagnostic> Findings::Take(Places const &places) {
    std::stable_sort(findings.begin(), findings.end(), [](Finding const &a, Finding const &b) {
        return a.spot.line != b.spot.line ? a.spot.line < b.spot.line
                                          : a.spot.column < b.spot.column;
    });
    std::vector<Diagnostic> diagnostics;
    std::vector<Spot> spots;
    for (Finding const &finding : findings) {
        diagnostics.push_back(DiagnosticOf(finding, places));
        spots.push_back(finding.spot);
    }
    findings.clear();
    told.clear();
    places.AddSources(diagnostics, spots);
    return diagnostics;
}

} // namespace Checks
