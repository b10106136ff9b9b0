#pragma once

#include <typeinfo>

#include "vesk_hdl/netlist/Signal.h"

namespace Vesk_Hdl {

/// dynamic_cast<T *>(signal), with a short way for the library's own classes. A dynamic_cast walks
/// over the bases of the object, and the passes ask about a million signals. Comparing the type is
/// enough unless a client derived a class of its own; then the cast decides.
template <class T> T *As(Signal *signal) {
    if (!signal)
        return nullptr;
    std::type_info const &type = typeid(*signal);
    if (type == typeid(T))
        return static_cast<T *>(signal);
    if (type == typeid(ScalarSignal)) // most signals of a design, and none of the other classes
        return nullptr;
    return dynamic_cast<T *>(signal);
}
template <class T> T const *As(Signal const *signal) { return As<T>(const_cast<Signal *>(signal)); }

} // namespace Vesk_Hdl
