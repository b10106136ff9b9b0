#pragma once

#include "tool/check/Design.h"
#include "tool/session/Session.h"

namespace Checks {

/// Lets a line that writes do to the netlist what it does to it for good: ports give their
/// connections to dummy signals, open pins may get nets, a Verilog file changes the case of names.
/// Its text is thrown away.
void Rewrite(Session &session, Design const &design, LocationMap &places, std::string const &line);

} // namespace Checks
