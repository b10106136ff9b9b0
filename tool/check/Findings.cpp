#include "tool/check/Findings.h"

#include <algorithm>
#include <numeric>

#include "tool/check/SeededHash.h"
#include "tool/diagnostics/Reporter.h"
#include "tool/diagnostics/Words.h"

namespace Checks {

namespace {

Diagnostic DiagnosticOf(Finding const &finding, LocationMap const &places) {
    Row const &row = Get(finding.id);
    Diagnostic diagnostic;
    diagnostic.severity = Severity::WARNING;
    diagnostic.place = places.GetPlace(finding.spot);
    diagnostic.message = finding.subject + " " + row.sentence;
    if (!finding.detail.empty())
        diagnostic.message += " (" + finding.detail + ")";
    diagnostic.hints = {row.hint};
    for (Related const &related : finding.related) {
        CompactLocation const spot = places.Find(related.event, related.object, related.before);
        if (spot.line > 0)
            diagnostic.notes.push_back({places.GetPlace(spot), related.text});
    }
    diagnostic.name = row.name;
    diagnostic.language = NameOf(finding.languages);
    return diagnostic;
}

} // namespace

std::size_t Findings::Hash::operator()(std::uint32_t number) const {
    Finding const &finding = (*findings)[number];
    std::size_t const line = finding.spot.line;
    return SeededHash()(Lowercase(finding.subject)) + 64 * line +
           static_cast<std::size_t>(finding.id);
}

bool Findings::Equal::operator()(std::uint32_t left, std::uint32_t right) const {
    Finding const &a = (*findings)[left];
    Finding const &b = (*findings)[right];
    return a.id == b.id && a.spot.line == b.spot.line && SameIgnoringCase(a.subject, b.subject);
}

void Findings::Add(Finding finding) {
    finding.languages &= Get(finding.id).languages;
    if ((finding.languages & languages) == 0 || !Wants(finding.id))
        return;
    findings.push_back(std::move(finding));
    auto const [same, isNew] = known.insert(static_cast<std::uint32_t>(findings.size() - 1));
    if (isNew)
        return;
    findings[*same].languages |= findings.back().languages;
    findings.pop_back();
}

void Findings::Show(LocationMap const &places, std::function<void(Diagnostic &)> const &show) {
    known.clear();
    std::vector<std::uint32_t> order(findings.size());
    std::iota(order.begin(), order.end(), 0);
    std::sort(order.begin(), order.end(), [this](std::uint32_t left, std::uint32_t right) {
        CompactLocation const &a = findings[left].spot;
        CompactLocation const &b = findings[right].spot;
        return a.line != b.line       ? a.line < b.line
               : a.column != b.column ? a.column < b.column
                                      : left < right;
    });
    LocationMap::SourceReader sources(places);
    for (std::uint32_t const number : order) {
        Finding const &finding = findings[number];
        Diagnostic diagnostic = DiagnosticOf(finding, places);
        if (std::string const *const line = sources.Get(finding.spot.line))
            SetSource(diagnostic, *line);
        show(diagnostic);
    }
    findings.clear();
}

} // namespace Checks
