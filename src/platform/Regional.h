#pragma once
#include <ctime>
#include <string>

namespace qv {

// The user's regional formats: how dates, times, numbers and booleans read on this desktop.
class Regional {
public:
    virtual ~Regional() = default;
    // Time of day in the long format, e.g. "9:05:12 PM".
    virtual std::string LongTime(std::time_t when) const = 0;
    // Date and time in the general format, e.g. "3/17/2004 3:30:00 PM".
    virtual std::string GeneralDate(std::time_t when) const = 0;
    // A number with digit grouping and the given count of decimals, e.g. "1,234.5".
    virtual std::string FormatNumber(double value, int decimals) const = 0;
    // The text of a boolean as stored in games.inc ("True"/"False" on English systems).
    virtual std::string BooleanText(bool value) const = 0;
};

// Fixed English (United States) formats; used by tests and wherever the locale is unknown.
class EnglishRegional final : public Regional {
public:
    std::string LongTime(std::time_t when) const override;
    std::string GeneralDate(std::time_t when) const override;
    std::string FormatNumber(double value, int decimals) const override;
    std::string BooleanText(bool value) const override;
};

}  // namespace qv
