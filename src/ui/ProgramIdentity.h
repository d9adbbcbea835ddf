#pragma once
#include <QString>

class QLabel;
class QWidget;

namespace qv::identity {

// "2.25 Build N" and "2.25.031704 Build N": the version as the small windows show it.
QString ShortVersion();
QString LongVersion();
// The credit line of the about box and the wait window.
QString CreditLine();
// The program's logo: its name set large on the brand colour.
QLabel* MakeLogo(QWidget* parent);
// The emulator project's web address (about box, help window fallback).
QString EmulatorSite();

}  // namespace qv::identity
