#include "ui/DetailsTextEdit.h"

#include "app/TextFile.h"

namespace qv {

DetailsTextEdit::DetailsTextEdit(QWidget* parent) : QPlainTextEdit(parent) {
    setObjectName(QStringLiteral("Text2"));
    setReadOnly(true);
    setLineWrapMode(QPlainTextEdit::WidgetWidth);
    connect(this, &QPlainTextEdit::textChanged, this, [this] {
        if (!rendering_) emit edited();
    });
}

void DetailsTextEdit::Render(const DetailsText& area) {
    rendering_ = true;
    QString text = QString::fromStdString(DisplayUtf8(area.Text));
    text.replace(QStringLiteral("\r\n"), QStringLiteral("\n"));
    if (toPlainText() != text) setPlainText(text);
    rendering_ = false;
    setReadOnly(area.ReadOnly);
    setStyleSheet(QStringLiteral("QPlainTextEdit#Text2 { background: black; color: rgb(%1, %2, %3); }")
                      .arg(area.Colour.r).arg(area.Colour.g).arg(area.Colour.b));
    marker_ = QString::fromStdString(area.Marker);
    setProperty("viewMarker", marker_);
}

std::string DetailsTextEdit::TextCrlf() const {
    QString text = toPlainText();
    text.replace(QStringLiteral("\n"), QStringLiteral("\r\n"));
    return text.toStdString();
}

void DetailsTextEdit::mouseDoubleClickEvent(QMouseEvent* event) {
    QPlainTextEdit::mouseDoubleClickEvent(event);
    emit doubleClicked();
}

}  // namespace qv
