// A client that has only the installed library: makes a design, is refused a line that is no
// command, and writes the file that it is given.
#include <cstring>
#include <filesystem>
#include <iostream>
#include <string>

#include "vesk_hdl/Vesk_Hdl.h"

namespace {

bool Check(bool holds, char const *what) {
    if (!holds)
        std::cerr << "failed: " << what << '\n';
    return holds;
}

std::string MessageOf(Vesk_Hdl::Engine &engine, char const *line) {
    try {
        engine.Execute(line);
        return "";
    } catch (Vesk_Hdl::Exception const &exception) {
        return exception.getDescription();
    }
}

} // namespace

int main(int argc, char **argv) {
    if (argc != 2) {
        std::cerr << "usage: stranger FILE.vhd\n";
        return 2;
    }
    std::string const file = argv[1];
    Vesk_Hdl::Engine engine;

    bool good = Check(engine.CreateAndAddModel("m", nullptr), "a model is made");
    good &= Check(engine.UseModel("m"), "the model is current");
    good &= Check(MessageOf(engine, "ADD COMPONENT AND2").empty(), "a command runs");
    good &= Check(MessageOf(engine, "BOGUS") == "Command not find.\n", "a refusal comes through");
    good &= Check(MessageOf(engine, ("WRITE VHDL " + file).c_str()).empty(), "a write runs");
    good &= Check(std::filesystem::exists(file) && std::filesystem::file_size(file) > 0,
                  "the file is there");
    return good ? 0 : 1;
}
