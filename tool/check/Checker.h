#pragma once

#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "tool/check/Design.h"
#include "tool/session/Session.h"

namespace Checks {

/// The lines of command files on one design, and the checks at each line that would write.
class Checker {
public:
    /// Without languages, those that the lines write.
    Checker(std::string const &modelName, Languages requestedLanguages)
        : session(modelName), recorder(session.GetModel(), places, findings),
          requested(requestedLanguages) {}

    void SwitchOff(Id id) { findings.SwitchOff(id); }
    /// The lines to come are of this file; `shownName` is what the user called it.
    void BeginFile(std::string const &path, std::string const &shownName) {
        places.BeginFile(path, shownName);
    }
    /// Runs a line, but for one that writes: there, nothing is written. Tells what is wrong if it
    /// is refused.
    std::optional<Diagnostic> RunLine(std::string const &line, SourceRange const &place);
    /// Behind the last line: calls `show` with each finding, in the order of the lines.
    void Finish(std::function<void(Diagnostic &)> const &show);

    Vesk_Hdl::Model &GetModel() { return session.GetModel(); }

private:
    std::optional<Diagnostic> PassWrite(std::string const &line, SourceRange const &place,
                                        std::uint32_t number, Vesk_Hdl::CommandHelp const &command);
    void RewriteDesign();
    void CheckWriteLine(std::uint32_t number, int first, Vesk_Hdl::WriteArguments const &arguments);
    void CheckDesign(Languages languages);
    Design DesignNow() { return Design(session.GetModel(), places, recorder, findings); }
    Languages RequestedOr(Languages others) const {
        return requested != NO_LANGUAGE ? requested : others;
    }

    Session session;
    LocationMap places;
    Findings findings;
    Recorder recorder;
    LineTokens tokens; ///< of the line that runs
    Languages requested;
    Languages written = NO_LANGUAGE;
    std::vector<std::string> lastWrites; ///< lines for which the design is not yet rewritten
    bool changed = false;                ///< since the last line that wrote
    bool writesVhdl = false;             ///< one of those lines
};

} // namespace Checks
