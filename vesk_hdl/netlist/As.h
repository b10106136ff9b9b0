#pragma once

#include <typeinfo>

#include "vesk_hdl/netlist/Signal.h"

namespace Vesk_Hdl {

/// dynamic_cast<T *>(signal), which takes a walk over the bases, with a short way for the library's
/// own classes: nothing but the class itself is one of them unless a client derives from it.
template <class T> T *As(Signal *signal) {
    if (!signal)
        return nullptr;
    std::type_info const &type = typeid(*signal);
    if (type == typeid(T))
        return static_cast<T *>(signal);
    if (type == typeid(ScalarSignal))
        return nullptr;
    return dynamic_cast<T *>(signal);
}
template <class T> T const *As(Signal const *signal) { return As<T>(const_cast<Signal *>(signal)); }

} // namespace Vesk_Hdl
