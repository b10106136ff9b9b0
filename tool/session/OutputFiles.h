#pragma once

#include <functional>
#include <optional>
#include <string>

#include "tool/session/Confinement.h"
#include "vesk_hdl/Vesk_Hdl.h"

/// Opens the files of write commands for the tool.
class OutputFiles : public Vesk_Hdl::WriteOpener {
public:
    /// From now on no file outside the folder is opened. Throws as Confinement does.
    void Confine(std::string const &folder) { confinement.emplace(folder); }
    /// What is told the name of each file before it is opened.
    void SetListener(std::function<void(char const *)> heard) { listener = std::move(heard); }
    /// The next file is standard output, whatever its name.
    void SendNextToStandardOutput() { nextIsStandardOutput = true; }

    int Open(char const *fileName, bool append) override;

private:
    std::optional<Confinement> confinement;
    std::function<void(char const *)> listener;
    bool nextIsStandardOutput = false;
};
