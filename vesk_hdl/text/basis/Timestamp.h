#pragma once

#include <ctime>

#include "vesk_hdl/text/basis/StringBase.h"

/// The local date and time of its construction, in parts: two digits each, the year in four.
class VESK_HDL_API TP_TIMESTAMP {
public:
    TP_TIMESTAMP();
    ~TP_TIMESTAMP();

    Basis::StringBase<char> getTimeStampMonthNumber() const;
    Basis::StringBase<char> getTimeStampMonthDay() const;
    Basis::StringBase<char> getTimeStampYear() const;
    Basis::StringBase<char> getTimeStampHour() const;
    Basis::StringBase<char> getTimeStampMinute() const;
    Basis::StringBase<char> getTimeStampSecond() const;

private:
    std::tm moment;
};
