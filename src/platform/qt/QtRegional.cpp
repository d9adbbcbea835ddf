#include "platform/qt/QtRegional.h"

#include <QDateTime>
#include <QRegularExpression>

namespace qv {

namespace {
QDateTime Local(std::time_t when) {
    return QDateTime::fromSecsSinceEpoch(static_cast<qint64>(when), Qt::LocalTime);
}
}  // namespace

QtRegional::QtRegional(QLocale locale) : locale_(std::move(locale)) {}

// The locale's long time format names the time zone; log lines and dates show only the clock.
QString QtRegional::TimeFormat() const {
    QString format = locale_.timeFormat(QLocale::LongFormat);
    format.remove(QRegularExpression(QStringLiteral("\\s*\\bt+\\b")));
    return format.trimmed();
}

std::string QtRegional::LongTime(std::time_t when) const {
    return locale_.toString(Local(when).time(), TimeFormat()).toStdString();
}

std::string QtRegional::GeneralDate(std::time_t when) const {
    const QDateTime moment = Local(when);
    return (locale_.toString(moment.date(), QLocale::ShortFormat) + QLatin1Char(' ') +
            locale_.toString(moment.time(), TimeFormat()))
        .toStdString();
}

std::string QtRegional::FormatNumber(double value, int decimals) const {
    QLocale grouped = locale_;
    grouped.setNumberOptions(grouped.numberOptions() & ~QLocale::OmitGroupSeparator);
    return grouped.toString(value, 'f', decimals < 0 ? 0 : decimals).toStdString();
}

std::string QtRegional::BooleanText(bool value) const { return value ? "True" : "False"; }

}  // namespace qv
