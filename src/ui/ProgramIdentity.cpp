#include "ui/ProgramIdentity.h"

#include <QLabel>

#include "app/AppVersion.h"

namespace qv::identity {

QString ShortVersion() {
    return QStringLiteral("%1 Build %2")
        .arg(QLatin1String(app_version::Version))
        .arg(app_version::Build);
}

QString LongVersion() {
    return QStringLiteral("%1.%2 Build %3")
        .arg(QLatin1String(app_version::Version), QLatin1String(app_version::DateStamp))
        .arg(app_version::Build);
}

QString CreditLine() { return QStringLiteral("Written by the Quorvane developers"); }

QLabel* MakeLogo(QWidget* parent) {
    auto* logo = new QLabel(
        QStringLiteral("<img src=\":/icons/logo.png\" align=\"middle\"> Quorvane"), parent);
    logo->setObjectName(QStringLiteral("imgLogo"));
    logo->setAlignment(Qt::AlignCenter);
    logo->setStyleSheet(QStringLiteral(
        "QLabel { background: #1d2b53; color: #ffcc00; font-size: 32px; font-weight: bold;"
        " padding: 12px 24px; border-radius: 6px; }"));
    return logo;
}

QString EmulatorSite() { return QStringLiteral("https://www.mamedev.org/"); }

}  // namespace qv::identity
