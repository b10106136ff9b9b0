#include "tool/RunCommand.h"

#include <cstring>
#include <filesystem>
#include <iostream>

#include "tool/LineReader.h"
#include "vesk_hdl/Vesk_Hdl.h"

namespace {

using namespace Vesk_Hdl;

/// Commands are kept as done until somebody clears them, and the tool never looks back.
constexpr int MOST_DONE_COMMANDS = 4096;

/// Runs lines on one model and tells what went wrong.
class Session {
public:
    explicit Session(std::string const &modelName) {
        engine.CreateAndAddModel(modelName.c_str(), nullptr);
        engine.UseModel(modelName.c_str());
        model = engine.GetCurrentModel();
    }

    /// False if the line was refused or a file that it writes did not reach the disk whole.
    bool RunLine(std::string const &line, std::string const &place) {
        if (line.find('\0') != std::string::npos)
            return Fail(place, "the line holds a NUL byte");
        int const writesBefore = model->GetLastWrite().number;
        try {
            engine.Execute(line.c_str());
        } catch (Exception const &refusal) {
            std::string message = refusal.getDescription();
            while (!message.empty() && message.back() == '\n')
                message.pop_back();
            return Fail(place, message);
        }
        if (model->GetCommandManager()->GetDoneCommandCount() >= MOST_DONE_COMMANDS)
            model->GetCommandManager()->Clear();
        WriteStatus const &write = model->GetLastWrite();
        if (write.number == writesBefore || write.error == 0)
            return true;
        return Fail(place, std::string("cannot write ") + write.fileName.GetText() + ": " +
                               std::strerror(write.error));
    }

    static bool Fail(std::string const &place, std::string const &message) {
        std::cerr << place << ": error: " << message << '\n';
        return false;
    }

private:
    Engine engine;
    Model *model;
};

/// A name of a file to be read that stays right when the current folder changes.
std::string Lasting(std::string const &file) {
    return file == "-" ? file : std::filesystem::absolute(file).string();
}

bool RunFile(Session &session, std::string const &path, std::string const &shownName,
             bool keepGoing) {
    LineReader reader(path);
    std::string line;
    bool good = true;
    for (unsigned long number = 1; (good || keepGoing) && reader.Next(line); ++number)
        good &= session.RunLine(line, shownName + ":" + std::to_string(number));
    if (reader.GetError() != 0)
        good = Session::Fail(shownName,
                             std::string("cannot read: ") + std::strerror(reader.GetError()));
    return good;
}

} // namespace

int Run(RunOptions const &options) {
    std::vector<std::string> paths;
    for (std::string const &file : options.files)
        paths.push_back(Lasting(file));
    if (!options.outputDir.empty()) {
        std::error_code error;
        std::filesystem::current_path(options.outputDir, error);
        if (error) {
            Session::Fail(options.outputDir, "cannot enter the output folder: " + error.message());
            return 1;
        }
    }
    Session session(options.modelName);
    bool good = true;
    for (std::size_t i = 0; i < paths.size() && (good || options.keepGoing); ++i) {
        std::string const &file = options.files[i];
        good &= RunFile(session, paths[i], file == "-" ? "<stdin>" : file, options.keepGoing);
    }
    return good ? 0 : 1;
}
