#pragma once

#include <string>
#include <string_view>

#include "vesk_hdl/Vesk_Hdl.h"

// What a design says about a name that was refused. The work for one hint is bounded, however large
// the design is.

/// What would make a missing component, instance, signal or attribute known; "" for another kind of
/// refusal.
std::string HintForMissing(int kind, std::string_view name);

/// The same for a missing pin of a component or an instance; the holder is the one that exists.
std::string HintForMissingPin(Vesk_Hdl::Model const &model, bool ofInstance,
                              std::string const &holder, std::string const &pin);

/// What has a name already, and how it is spelled; "" if nothing has it.
std::string HintForTaken(Vesk_Hdl::Model const &model, std::string const &name);
