#pragma once
#include <QLocale>

#include "platform/Regional.h"

namespace qv {

// The desktop's regional formats, taken from a QLocale (the user's by default).
class QtRegional final : public Regional {
public:
    explicit QtRegional(QLocale locale = QLocale::system());

    std::string LongTime(std::time_t when) const override;
    std::string GeneralDate(std::time_t when) const override;
    std::string FormatNumber(double value, int decimals) const override;
    std::string BooleanText(bool value) const override;

private:
    QString TimeFormat() const;

    QLocale locale_;
};

}  // namespace qv
