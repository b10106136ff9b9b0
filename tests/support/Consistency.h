#pragma once

#include <string>

#include "vesk_hdl/Vesk_Hdl.h"

/// Walks over all objects of a netlist and what they point at. The result is the first thing that
/// is not as it must be between two commands; "" if there is none. Under an address sanitizer the
/// walk also finds each pointer that outlived its object.
///
/// - A name finds an object of that name, whatever its case; the object is one of the array's.
/// - The signal of a pin lists the pin, unless the library made it and joined them one way: for a
///   constant, for an open pin, or as a dummy that had pins already.
/// - A slice or bit is listed by the bus of its name, dummies aside.
/// - No list holds null or the same pin twice.
std::string Inconsistency(Vesk_Hdl::Netlist const &netlist);
