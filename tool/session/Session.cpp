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
                                           SourceRange const &place) {
    // The library takes the line as a C string and would run what is in front of the NUL.
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
    // The manager keeps each command that ran until Clear is called; the tool never asks for
    // them. Cleared after each line, so that the next command gets the same memory.
    model->GetCommandManager()->Clear();
    WriteStatus const &write = model->GetLastWrite();
    if (write.number == writesBefore || write.error == 0)
        return std::nullopt;
    return ExplainWrite(line, place, write);
}

WriteStatus const &Session::Write(char const *language, std::string const &file) {
    StringArray tokens;
    // As tokens and not as a line: the file name may hold blanks and quotes.
    for (char const *const token : {"WRITE", language, file.c_str()})
        tokens.Add(token);
    model->Execute(tokens);
    return model->GetLastWrite();
}
