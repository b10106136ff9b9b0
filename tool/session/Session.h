#pragma once

#include <optional>
#include <string>

#include "tool/diagnostics/Diagnostic.h"
#include "vesk_hdl/Vesk_Hdl.h"

/// One design, and the running of lines on it.
class Session {
public:
    explicit Session(std::string const &modelName);

    /// Runs a line. The result is a diagnostic if the line was refused, or if a file that it writes
    /// did not reach the disk whole; its place has the column of the token that is wrong.
    std::optional<Diagnostic> RunLine(std::string const &line, SourceRange const &place) {
        return RunLine(line, nullptr, place);
    }
    /// The same with the line's tokens, where the caller has them already.
    std::optional<Diagnostic> RunLine(std::string const &line, Vesk_Hdl::StringArray const &tokens,
                                      SourceRange const &place) {
        return RunLine(line, &tokens, place);
    }

    /// Writes the design as "VHDL" or "VERILOG".
    Vesk_Hdl::WriteStatus const &Write(char const *language, std::string const &file);

    /// Whether the diagnostics of refused lines get hints for which the design is searched; they do
    /// unless this turns it off.
    void SetHints(bool wanted) { withHints = wanted; }

    Vesk_Hdl::Model &GetModel() { return *model; }

private:
    std::optional<Diagnostic> RunLine(std::string const &line, Vesk_Hdl::StringArray const *tokens,
                                      SourceRange const &place);

    Vesk_Hdl::Engine engine;
    Vesk_Hdl::Model *model; ///< the engine's current one
    bool withHints = true;
};
