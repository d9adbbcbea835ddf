#include "ui/AboutWindow.h"

#include <QEvent>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QMouseEvent>
#include <QPixmap>
#include <QVBoxLayout>

#include "ui/ProgramIdentity.h"

namespace qv {

namespace {
QLabel* Label(const QString& text, const char* name, QWidget* parent) {
    auto* label = new QLabel(text, parent);
    label->setObjectName(QLatin1String(name));
    label->setAlignment(Qt::AlignCenter);
    return label;
}
}  // namespace

AboutWindow::AboutWindow(SpeakFunction speak, QWidget* parent)
    : QDialog(parent), speak_(std::move(speak)) {
    setObjectName(QStringLiteral("About"));
    setWindowTitle(QStringLiteral("Quorvane"));
    setModal(true);

    logo_ = identity::MakeLogo(this);
    logo_->setCursor(Qt::PointingHandCursor);
    logo_->setToolTip(QStringLiteral("Click to hear about Quorvane"));

    close_ = Label(QString(), "imgClose", this);
    close_->setPixmap(QPixmap(QStringLiteral(":/icons/exit.png")));
    if (close_->pixmap().isNull()) close_->setText(QStringLiteral("X"));
    close_->setCursor(Qt::PointingHandCursor);
    close_->setToolTip(QStringLiteral("Close (C)"));

    version_ = Label(QStringLiteral("Version ") + identity::ShortVersion(), "lblVersion", this);
    version_->setToolTip(identity::LongVersion());
    credit_ = Label(identity::CreditLine(), "lblCredit", this);
    auto* description = Label(
        QStringLiteral("A front-end that lists, describes and starts your MAME arcade games.\n"
                       "Support: see the help pages or write to support@quorvane.org"),
        "lblDescription", this);

    auto* powered = Label(QStringLiteral("Powered by ..."), "lblPowered", this);
    emulatorLogo_ = Label(QStringLiteral("MAME"), "imgMAME", this);
    emulatorLogo_->setStyleSheet(QStringLiteral(
        "QLabel { color: #b00000; font-size: 22px; font-weight: bold; font-style: italic; }"));
    emulatorLogo_->setCursor(Qt::PointingHandCursor);
    auto* site = Label(identity::EmulatorSite(), "lblWebSite", this);

    auto* top = new QHBoxLayout;
    top->addStretch();
    top->addWidget(close_);
    auto* layout = new QVBoxLayout(this);
    layout->addLayout(top);
    layout->addWidget(logo_);
    layout->addWidget(version_);
    layout->addWidget(credit_);
    layout->addSpacing(8);
    layout->addWidget(description);
    layout->addSpacing(8);
    layout->addWidget(powered);
    layout->addWidget(emulatorLogo_);
    layout->addWidget(site);

    for (QLabel* clickable : {logo_, emulatorLogo_, close_}) clickable->installEventFilter(this);
}

std::string AboutWindow::LogoText() const {
    return "Quorvane . " + version_->text().toStdString() + "   .   " +
           credit_->text().toStdString();
}

std::string AboutWindow::EmulatorSentence() {
    return "Quorvane is powered by MAME, the Multiple Arcade Machine Emulator. "
           "More about the emulator can be found at mamedev dot org.";
}

void AboutWindow::Say(const std::string& text) {
    if (speak_) speak_(text);
}

void AboutWindow::showEvent(QShowEvent* event) {
    QDialog::showEvent(event);
    if (!spoken_) {
        spoken_ = true;
        Say(LogoText());
    }
}

void AboutWindow::keyPressEvent(QKeyEvent* event) {
    if (event->key() == Qt::Key_C) {
        accept();
        return;
    }
    QDialog::keyPressEvent(event);
}

bool AboutWindow::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::MouseButtonRelease &&
        static_cast<QMouseEvent*>(event)->button() == Qt::LeftButton) {
        if (watched == logo_) Say(LogoText());
        else if (watched == emulatorLogo_) Say(EmulatorSentence());
        else if (watched == close_) accept();
        return watched == close_;
    }
    return QDialog::eventFilter(watched, event);
}

}  // namespace qv
