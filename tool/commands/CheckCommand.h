#pragma once

#include <string>
#include <vector>

namespace CLI {
class App;
}

/// What `vesk-hdl check` was asked for.
struct CheckOptions {
    std::vector<std::string> files; ///< in order; "-" is standard input
    std::string modelName = "hdlNetlist";
    std::string language; ///< "vhdl", "verilog", "both"; empty for what the WRITE lines write
    std::vector<std::string> off;
    std::vector<std::string> only;
    bool strict = false;
    bool list = false;
    bool markdown = false;
    std::string format = "text"; ///< or "json"
    std::string colour = "auto"; ///< or "always", "never"
};

/// Registers the command; parsing fills the options.
CLI::App *AddCheckCommand(CLI::App &app, CheckOptions &options);

/// Runs the lines but those that write, and tells on standard error which lines are refused and
/// what of the written text will be illegal, wrong or suspicious. The exit code: 0 if no line was
/// refused and, with `strict`, nothing found; otherwise 1.
int Check(CheckOptions const &options);
