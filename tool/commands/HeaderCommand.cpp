#include "tool/commands/HeaderCommand.h"

#include <iostream>
#include <memory>

#include <CLI/CLI.hpp>

#include "tool/diagnostics/RefusalExplainer.h"
#include "tool/session/OutputFiles.h"
#include "tool/session/Signals.h"
#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;

namespace {

struct HeaderOptions {
    std::string file;
    std::string application, command, design, device, purpose, reference;
    bool verilog = false;
    std::optional<std::time_t> time; ///< in place of the present one
};

int WriteHeader(HeaderOptions const &options) {
    ReportStyle const style = ReportOptions().GetStyle();
    Signals::EndProgram(EndMessages(style, "", "; the file is as it was before"));
    // The same way to the disk as that of a WRITE line: the old file stays until the new one is
    // complete.
    OutputFiles outputs;
    // "-" is a name for this tool only; the library would make a file of that name.
    if (options.file == STANDARD_STREAM)
        outputs.SendNextToStandardOutput();
    TextFileOutStream stream(options.file.c_str());
    stream.Adopt(outputs.Open(options.file.c_str(), false));
    NetlistHeader header(options.application.c_str(), options.file.c_str(), options.command.c_str(),
                         options.design.c_str(), options.device.c_str(), options.purpose.c_str(),
                         options.reference.c_str(), !options.verilog, stream);
    header.Write(options.time ? HdlUtilities::TimeString(*options.time)
                              : HdlUtilities::CurrentTimeString());
    stream.Close();
    // What the write command of the library would report.
    WriteStatus status;
    status.error = stream.GetError();
    outputs.Finish(status);
    if (status.error == 0)
        return ALL_WELL;
    Reporter(std::cerr, style).Report(About(options.file, "cannot write: " + FailureOf(status)));
    return SOMETHING_REFUSED;
}

} // namespace

void AddHeaderCommand(CLI::App &app, Action &action) {
    CLI::App &header = *app.add_subcommand("header", "Write a file that holds the header alone");
    auto const options = std::make_shared<HeaderOptions>();
    header.add_option("FILE", options->file, "File to write; '-' is standard output")->required();
    header.add_flag("--verilog,!--vhdl", options->verilog,
                    "Comments of Verilog or of VHDL, which is the default");
    for (auto const &[name, field, what] :
         {std::tuple{"--design", &options->design, "Name of the design"},
          {"--application", &options->application, "Which program asks for the file"},
          {"--command", &options->command, "The command that made the design"},
          {"--device", &options->device, "What the design is for"},
          {"--purpose", &options->purpose, "What the file is for"},
          {"--reference", &options->reference, "What to read about it"}})
        header.add_option(name, *field, what);
    header.callback([options, &action] {
        options->time = HeaderTime();
        action = [options] { return WriteHeader(*options); };
    });
}
