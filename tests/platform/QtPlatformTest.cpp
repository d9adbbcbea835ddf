#include <gtest/gtest.h>

#include <QLocale>
#include <QTimer>

#include "platform/qt/QtEventYield.h"
#include "platform/qt/QtRegional.h"

namespace qv::test {

namespace {
std::time_t LocalMoment(int year, int month, int day, int hour, int minute, int second) {
    std::tm t{};
    t.tm_year = year - 1900;
    t.tm_mon = month - 1;
    t.tm_mday = day;
    t.tm_hour = hour;
    t.tm_min = minute;
    t.tm_sec = second;
    t.tm_isdst = -1;
    return std::mktime(&t);
}
}  // namespace

TEST(QtRegional, EnglishFormatsShowClockWithoutTimeZone) {
    QtRegional english(QLocale(QLocale::English, QLocale::UnitedStates));
    const std::time_t evening = LocalMoment(2004, 3, 17, 21, 5, 12);
    const std::string time = english.LongTime(evening);
    // Qt may put a narrow space before PM; the digits and the marker are what matter.
    EXPECT_EQ(time.rfind("9:05:12", 0), 0u) << time;
    EXPECT_EQ(time.substr(time.size() - 2), "PM") << time;
    const std::string date = english.GeneralDate(evening);
    EXPECT_EQ(date.rfind("3/17/", 0), 0u) << date;
    EXPECT_NE(date.find(time), std::string::npos) << date;

    EXPECT_EQ(english.FormatNumber(1234, 0), "1,234");
    EXPECT_EQ(english.FormatNumber(1234567.5, 1), "1,234,567.5");
    EXPECT_EQ(english.BooleanText(true), "True");
    EXPECT_EQ(english.BooleanText(false), "False");

    QtRegional german(QLocale(QLocale::German, QLocale::Germany));
    EXPECT_EQ(german.FormatNumber(1234.5, 1), "1.234,5");
    EXPECT_EQ(german.LongTime(evening), "21:05:12");
    EXPECT_EQ(german.BooleanText(true), "True");
}

TEST(QtEventYield, RunsPendingEvents) {
    bool ran = false;
    QTimer::singleShot(0, [&] { ran = true; });
    QtEventYield yield;
    yield.Yield();
    EXPECT_TRUE(ran);
}

}  // namespace qv::test
