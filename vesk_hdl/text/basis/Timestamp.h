#pragma once

#include <ctime>

#include "vesk_hdl/text/basis/StringBase.h"

/// A date and time, taken apart into decimal texts. Each getter pads with zeros to two digits, the
/// year to four. The object keeps the moment: a getter called later gives the same text.
class VESK_HDL_API TP_TIMESTAMP {
public:
    /// The date and time of the construction in the local time zone.
    TP_TIMESTAMP();
    /// A moment in seconds since 1970, in UTC. A moment beyond what a calendar date can hold counts
    /// as the beginning of 1970.
    explicit TP_TIMESTAMP(std::time_t instant);
    /// Frees nothing: the object holds no memory.
    ~TP_TIMESTAMP();

    /// The month, "01" to "12".
    Basis::StringBase<char> getTimeStampMonthNumber() const;
    /// The day of the month, "01" to "31".
    Basis::StringBase<char> getTimeStampMonthDay() const;
    /// The year, such as "2024".
    Basis::StringBase<char> getTimeStampYear() const;
    /// The hour, "00" to "23".
    Basis::StringBase<char> getTimeStampHour() const;
    /// The minute, "00" to "59".
    Basis::StringBase<char> getTimeStampMinute() const;
    /// The second, "00" to "60": a leap second has its own number.
    Basis::StringBase<char> getTimeStampSecond() const;

private:
    std::tm moment;
};
