#include "tool/commands/HeaderCommand.h"

#include <cstring>
#include <iostream>
#include <memory>
#include <unistd.h>

#include <CLI/CLI.hpp>

#include "vesk_hdl/Vesk_Hdl.h"

using namespace Vesk_Hdl;

namespace {

struct HeaderOptions {
    std::string file;
    std::string application, command, design, device, purpose, reference;
    bool verilog = false;
};

int WriteHeader(HeaderOptions const &options) {
    bool const toStandardOutput = options.file == STANDARD_STREAM;
    TextFileOutStream stream(toStandardOutput ? nullptr : options.file.c_str(), false);
    if (toStandardOutput)
        stream.Adopt(::dup(STDOUT_FILENO));
    NetlistHeader(options.application.c_str(), options.file.c_str(), options.command.c_str(),
                  options.design.c_str(), options.device.c_str(), options.purpose.c_str(),
                  options.reference.c_str(), !options.verilog, stream)
        .Write();
    stream.Close();
    if (stream.GetError() == 0)
        return ALL_WELL;
    Reporter(std::cerr, ReportOptions().GetStyle())
        .Report(
            About(options.file, std::string("cannot write: ") + std::strerror(stream.GetError())));
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
    header.callback([options, &action] { action = [options] { return WriteHeader(*options); }; });
}
