// A date and time in parts. tm counts months from 0 and years from 1900.

#include "vesk_hdl/text/basis/Timestamp.h"

using Text = Basis::StringBase<char>;

TP_TIMESTAMP::TP_TIMESTAMP() : moment() {
    std::time_t const now = std::time(nullptr);
    localtime_r(&now, &moment);
}

/// gmtime_r fails if the year does not fit an int.
TP_TIMESTAMP::TP_TIMESTAMP(std::time_t instant) : moment() {
    std::time_t const epoch = 0;
    if (!gmtime_r(&instant, &moment))
        gmtime_r(&epoch, &moment);
}

TP_TIMESTAMP::~TP_TIMESTAMP() = default;

Text TP_TIMESTAMP::getTimeStampMonthNumber() const {
    return Text::doFormat("%02d", moment.tm_mon + 1);
}
Text TP_TIMESTAMP::getTimeStampMonthDay() const { return Text::doFormat("%02d", moment.tm_mday); }
Text TP_TIMESTAMP::getTimeStampYear() const {
    return Text::doFormat("%04d", moment.tm_year + 1900);
}
Text TP_TIMESTAMP::getTimeStampHour() const { return Text::doFormat("%02d", moment.tm_hour); }
Text TP_TIMESTAMP::getTimeStampMinute() const { return Text::doFormat("%02d", moment.tm_min); }
Text TP_TIMESTAMP::getTimeStampSecond() const { return Text::doFormat("%02d", moment.tm_sec); }
