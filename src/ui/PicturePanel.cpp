#include "ui/PicturePanel.h"

#include <QLabel>
#include <QMouseEvent>
#include <QPainter>

namespace qv {
namespace {

int ButtonBits(Qt::MouseButtons buttons) {
    int bits = 0;
    if (buttons & Qt::LeftButton) bits |= mousebuttons::Left;
    if (buttons & Qt::RightButton) bits |= mousebuttons::Right;
    if (buttons & Qt::MiddleButton) bits |= mousebuttons::Middle;
    return bits;
}

}  // namespace

PictureBoxWidget::PictureBoxWidget(PictureSlot slot, QWidget* parent)
    : QWidget(parent), slot_(slot) {
    setObjectName(slot == PictureSlot::Marquee ? QStringLiteral("Picture1")
                                               : QStringLiteral("Picture2"));
    setCursor(Qt::OpenHandCursor);
    hide();
}

void PictureBoxWidget::Render(const PictureBox& box, const QImage& picture) {
    picture_ = picture;
    drawAt_ = QPoint(box.DrawX, box.DrawY);
    setGeometry(box.Left, box.Top, box.Width, box.Height);
    setVisible(box.Visible && !picture.isNull());
    update();
}

void PictureBoxWidget::paintEvent(QPaintEvent*) {
    if (picture_.isNull()) return;
    QPainter painter(this);
    painter.drawImage(drawAt_, picture_);
}

void PictureBoxWidget::mousePressEvent(QMouseEvent* event) {
    emit pressed(slot_, ButtonBits(event->buttons()), event->position());
}

void PictureBoxWidget::mouseMoveEvent(QMouseEvent* event) {
    emit moved(slot_, ButtonBits(event->buttons()), event->position());
}

void PictureBoxWidget::mouseReleaseEvent(QMouseEvent* event) {
    emit released(slot_, ButtonBits(event->button()), event->position());
}

void PictureBoxWidget::mouseDoubleClickEvent(QMouseEvent* event) {
    if (event->button() == Qt::LeftButton) emit doubleClicked(slot_);
}

PicturePanel::PicturePanel(QWidget* parent) : QWidget(parent) {
    setObjectName(QStringLiteral("ImagePanel"));
    setFixedSize(kWidth, kHeight);
    setAttribute(Qt::WA_StyledBackground, true);
    label_ = new QLabel(QString::fromLatin1(kNoScreenshotText), this);
    label_->setObjectName(QStringLiteral("LabelNoScreenshot"));
    label_->setStyleSheet(QStringLiteral("color: rgb(255, 0, 0);"));
    label_->setAlignment(Qt::AlignCenter);
    label_->setGeometry(0, kHeight / 2 - 12, kWidth, 24);
    label_->hide();
    // The screenshot is drawn above the marquee where they overlap after a drag.
    marquee_ = new PictureBoxWidget(PictureSlot::Marquee, this);
    screenshot_ = new PictureBoxWidget(PictureSlot::Screenshot, this);
}

void PicturePanel::Render(const ImagePanel& panel, const QImage& marquee,
                          const QImage& screenshot) {
    label_->setVisible(panel.NoScreenshotLabel);
    marquee_->Render(panel.Marquee, marquee);
    screenshot_->Render(panel.Screenshot, screenshot);
}

}  // namespace qv
