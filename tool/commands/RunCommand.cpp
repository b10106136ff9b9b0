#include "tool/commands/RunCommand.h"

#include <cstring>
#include <filesystem>
#include <iostream>

#include "tool/session/LineReader.h"
#include "tool/session/Session.h"

namespace {

/// A name of a file to be read that stays right when the current folder changes.
std::string Lasting(std::string const &file) {
    return file == "-" ? file : std::filesystem::absolute(file).string();
}

/// Something about a file as a whole.
Diagnostic About(std::string const &file, std::string const &message) {
    Diagnostic diagnostic;
    diagnostic.place.file = file;
    diagnostic.message = message;
    return diagnostic;
}

/// The lines of one file, up to the first refused one unless we are to keep going.
bool RunFile(Session &session, Reporter &reporter, std::string const &path, Place place,
             bool keepGoing) {
    LineReader reader(path);
    std::string line;
    bool good = true;
    while ((good || keepGoing) && reader.Next(line)) {
        ++place.line;
        if (std::optional<Diagnostic> const diagnostic = session.RunLine(line, place)) {
            reporter.Report(*diagnostic);
            good = false;
        }
    }
    if (reader.GetError() == 0)
        return good;
    reporter.Report(
        About(place.file, std::string("cannot read: ") + std::strerror(reader.GetError())));
    return false;
}

} // namespace

int Run(RunOptions const &options) {
    Reporter reporter(std::cerr, options.report);
    std::vector<std::string> paths;
    for (std::string const &file : options.files)
        paths.push_back(Lasting(file));
    if (!options.outputDir.empty()) {
        std::error_code error;
        std::filesystem::current_path(options.outputDir, error);
        if (error) {
            reporter.Report(
                About(options.outputDir, "cannot enter the output folder: " + error.message()));
            return 1;
        }
    }
    Session session(options.modelName);
    bool good = true;
    for (std::size_t i = 0; i < paths.size() && (good || options.keepGoing); ++i) {
        std::string const &file = options.files[i];
        good &= RunFile(session, reporter, paths[i], {file == "-" ? "<stdin>" : file},
                        options.keepGoing);
    }
    return good ? 0 : 1;
}
