#pragma once

#include "tool/check/Design.h"

namespace Checks {

/// Does to the netlist what a write does to it for good, as far as later lines can notice: ports
/// give their connections to dummy signals, and a Verilog file changes the case of names.
void Rewrite(Vesk_Hdl::Model &model, Design const &design, Places &places, Languages language);

} // namespace Checks
