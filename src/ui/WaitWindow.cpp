#include "ui/WaitWindow.h"

#include <QGuiApplication>
#include <QLabel>
#include <QScreen>
#include <QVBoxLayout>

#include "ui/ProgramIdentity.h"

namespace qv {

WaitWindow::WaitWindow(EventYield* yield, QWidget* parent)
    : QWidget(parent, Qt::SplashScreen | Qt::FramelessWindowHint | Qt::WindowStaysOnTopHint),
      yield_(yield) {
    setObjectName(QStringLiteral("Wait"));
    setCursor(Qt::WaitCursor);
    setStyleSheet(QStringLiteral("qv--WaitWindow { background: white; border: 1px solid #1d2b53; }"));
    setAttribute(Qt::WA_StyledBackground);

    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(24, 24, 24, 16);
    layout->addWidget(identity::MakeLogo(this));

    auto* version = new QLabel(QStringLiteral("Version: ") + identity::ShortVersion(), this);
    version->setObjectName(QStringLiteral("lblVersion"));
    version->setToolTip(QStringLiteral("Version: ") + identity::LongVersion());
    version->setAlignment(Qt::AlignCenter);
    layout->addWidget(version);

    auto* credit = new QLabel(identity::CreditLine(), this);
    credit->setObjectName(QStringLiteral("lblCredit"));
    credit->setAlignment(Qt::AlignCenter);
    layout->addWidget(credit);

    status_ = new QLabel(QStringLiteral("Loading ..."), this);
    status_->setObjectName(QStringLiteral("lblStatus"));
    status_->setAlignment(Qt::AlignCenter);
    status_->setMinimumWidth(320);
    layout->addWidget(status_);

    timer_.setObjectName(QStringLiteral("tmrWait"));
    timer_.setInterval(500);
    connect(&timer_, &QTimer::timeout, this, [this] { Repaint(); });

    adjustSize();
    if (const QScreen* screen = QGuiApplication::primaryScreen())
        move(screen->availableGeometry().center() - rect().center());
}

bool WaitWindow::IsVisible() const { return isVisible(); }

void WaitWindow::SetStatus(const std::string& text) {
    status_->setText(QString::fromStdString(text));
    Repaint();
}

QString WaitWindow::Status() const { return status_->text(); }

void WaitWindow::showEvent(QShowEvent* event) {
    QWidget::showEvent(event);
    timer_.start();
}

void WaitWindow::hideEvent(QHideEvent* event) {
    timer_.stop();
    QWidget::hideEvent(event);
}

void WaitWindow::Repaint() {
    if (!isVisible()) return;
    status_->repaint();
    if (yield_) yield_->Yield();
}

}  // namespace qv
