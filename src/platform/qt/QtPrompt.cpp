#include "platform/qt/QtPrompt.h"

#include <QMessageBox>

namespace qv {

namespace {

QMessageBox::StandardButtons ButtonsOf(PromptButtons buttons) {
    switch (buttons) {
        case PromptButtons::YesNo: return QMessageBox::Yes | QMessageBox::No;
        case PromptButtons::YesNoCancel:
            return QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel;
        case PromptButtons::OkCancel: return QMessageBox::Ok | QMessageBox::Cancel;
        case PromptButtons::Ok: break;
    }
    return QMessageBox::Ok;
}

QMessageBox::Icon IconOf(PromptIcon icon) {
    switch (icon) {
        case PromptIcon::Information: return QMessageBox::Information;
        case PromptIcon::Question: return QMessageBox::Question;
        case PromptIcon::Exclamation: return QMessageBox::Warning;
        case PromptIcon::Critical: return QMessageBox::Critical;
        case PromptIcon::None: break;
    }
    return QMessageBox::NoIcon;
}

PromptAnswer AnswerOf(int button) {
    switch (button) {
        case QMessageBox::Yes: return PromptAnswer::Yes;
        case QMessageBox::No: return PromptAnswer::No;
        case QMessageBox::Cancel: return PromptAnswer::Cancel;
        default: return PromptAnswer::Ok;
    }
}

}  // namespace

QtPrompt::QtPrompt(QWidget* parent) : parent_(parent) {}

PromptAnswer QtPrompt::Ask(const std::string& title, const std::string& text,
                           PromptButtons buttons, PromptIcon icon) {
    QMessageBox box(IconOf(icon),
                    title.empty() ? QStringLiteral("Quorvane") : QString::fromStdString(title),
                    QString::fromStdString(text), ButtonsOf(buttons), parent_.data());
    const int pressed = box.exec();
    // Closing the box with Escape or its close button counts as the safe answer.
    if (pressed == QMessageBox::NoButton || pressed == -1)
        return buttons == PromptButtons::YesNo ? PromptAnswer::No
               : buttons == PromptButtons::Ok  ? PromptAnswer::Ok
                                               : PromptAnswer::Cancel;
    return AnswerOf(pressed);
}

}  // namespace qv
