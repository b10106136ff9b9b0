#include "tool/session/Session.h"

#include <cstring>

#include "tool/diagnostics/RefusalExplainer.h"

using namespace Vesk_Hdl;

Session::Session(std::string const &modelName) {
    engine.CreateAndAddModel(modelName.c_str(), nullptr);
    engine.UseModel(modelName.c_str());
    model = engine.GetCurrentModel();
}

std::optional<Diagnostic> Session::RunLine(std::string const &line, StringArray const *tokens,
                                           Place const &place) {
    if (std::size_t const at = line.find('\0'); at != std::string::npos)
        return ExplainNul(line, place, at);
    int const writesBefore = model->GetLastWrite().number;
    try {
        if (tokens)
            model->Execute(*tokens);
        else
            engine.Execute(line.c_str());
    } catch (Exception const &refusal) {
        return ExplainRefusal(line, place, refusal, *model, withHints);
    }
    // Commands are kept as done until somebody clears them, and the tool never looks back. One at a
    // time: its memory is then at hand for the next one.
    model->GetCommandManager()->Clear();
    WriteStatus const &write = model->GetLastWrite();
    if (write.number == writesBefore || write.error == 0)
        return std::nullopt;
    return ExplainWrite(line, place, write);
}

WriteStatus const &Session::Write(char const *language, std::string const &file) {
    StringArray tokens;
    for (char const *const token : {"WRITE", language, file.c_str()})
        tokens.Add(token);
    model->Execute(tokens);
    return model->GetLastWrite();
}
