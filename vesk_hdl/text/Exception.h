#pragma once

#include "vesk_hdl/text/basis/Exception.h"

namespace Vesk_Hdl {

/// The one exception that the library throws. Its description is the message, ending in a line
/// feed, with nothing in front. Module tag "DesignEntry". It adds nothing to its base.
class VESK_HDL_API Exception : public Basis::Exception {
public:
    Exception(Basis::Exception const &other);
    Exception(Exception const &other);
    Exception &operator=(Exception const &other);
    ~Exception() override;
};

} // namespace Vesk_Hdl
