#include "platform/Regional.h"

#include <cmath>
#include <cstdio>

namespace qv {
namespace {

std::tm LocalParts(std::time_t when) {
    std::tm parts{};
    localtime_r(&when, &parts);
    return parts;
}

std::string TwelveHourTime(const std::tm& t) {
    int hour = t.tm_hour % 12;
    if (hour == 0) hour = 12;
    char buffer[32];
    std::snprintf(buffer, sizeof buffer, "%d:%02d:%02d %s", hour, t.tm_min, t.tm_sec,
                  t.tm_hour < 12 ? "AM" : "PM");
    return buffer;
}

}  // namespace

std::string EnglishRegional::LongTime(std::time_t when) const {
    return TwelveHourTime(LocalParts(when));
}

std::string EnglishRegional::GeneralDate(std::time_t when) const {
    const std::tm t = LocalParts(when);
    char date[32];
    std::snprintf(date, sizeof date, "%d/%d/%d ", t.tm_mon + 1, t.tm_mday, t.tm_year + 1900);
    return date + TwelveHourTime(t);
}

std::string EnglishRegional::FormatNumber(double value, int decimals) const {
    char raw[64];
    std::snprintf(raw, sizeof raw, "%.*f", decimals < 0 ? 0 : decimals, std::fabs(value));
    std::string digits = raw;
    std::string fraction;
    if (const auto dot = digits.find('.'); dot != std::string::npos) {
        fraction = digits.substr(dot);
        digits.erase(dot);
    }
    std::string grouped;
    const std::size_t lead = digits.size() % 3;
    for (std::size_t i = 0; i < digits.size(); ++i) {
        if (i != 0 && (i + 3 - lead) % 3 == 0) grouped += ',';
        grouped += digits[i];
    }
    const bool negative = value < 0 && grouped.find_first_not_of("0,") != std::string::npos;
    return (negative ? "-" : "") + grouped + fraction;
}

std::string EnglishRegional::BooleanText(bool value) const { return value ? "True" : "False"; }

}  // namespace qv
