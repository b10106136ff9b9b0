#pragma once

#include <ctime>

#include "vesk_hdl/text/basis/StringBase.h"

/// A date and time in parts: two digits each, the year in four.
class VESK_HDL_API TP_TIMESTAMP {
public:
    /// The local date and time of the construction.
    TP_TIMESTAMP();
    /// The date and time of a moment in UTC; 1970 begins if it is beyond what a date can hold.
    explicit TP_TIMESTAMP(std::time_t instant);
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
