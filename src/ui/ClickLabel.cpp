#include "ui/ClickLabel.h"

#include <QMouseEvent>

namespace qv {

void ClickLabel::mousePressEvent(QMouseEvent* event) {
    if (event->button() == Qt::RightButton) emit rightPressed();
    event->accept();
}

void ClickLabel::mouseReleaseEvent(QMouseEvent* event) {
    if (!rect().contains(event->position().toPoint())) return;
    if (event->button() == Qt::LeftButton) emit clicked();
    if (event->button() == Qt::RightButton) emit rightReleased();
    event->accept();
}

void ClickLabel::mouseDoubleClickEvent(QMouseEvent* event) {
    if (event->button() == Qt::LeftButton) emit doubleClicked();
    event->accept();
}

}  // namespace qv
