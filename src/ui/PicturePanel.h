#pragma once
#include <QImage>
#include <QPointF>
#include <QWidget>

#include "platform/PictureReader.h"
#include "reference/PictureLayout.h"

class QLabel;

namespace qv {

// One picture box: draws its picture at the computed offset and reports the mouse.
class PictureBoxWidget final : public QWidget {
    Q_OBJECT
public:
    PictureBoxWidget(PictureSlot slot, QWidget* parent);
    void Render(const PictureBox& box, const QImage& picture);
    PictureSlot Slot() const { return slot_; }

signals:
    // buttons: mousebuttons bits; for a release, the button that was released.
    void pressed(qv::PictureSlot slot, int buttons, QPointF at);
    void moved(qv::PictureSlot slot, int buttons, QPointF at);
    void released(qv::PictureSlot slot, int buttons, QPointF at);
    void doubleClicked(qv::PictureSlot slot);

protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;

private:
    PictureSlot slot_;
    QImage picture_;
    QPoint drawAt_;
};

// The image panel of fixed size: marquee box (Picture1), screenshot box (Picture2) and the
// "No screenshot available." label.
class PicturePanel final : public QWidget {
    Q_OBJECT
public:
    static constexpr int kWidth = 480;
    static constexpr int kHeight = 360;

    explicit PicturePanel(QWidget* parent = nullptr);
    void Render(const ImagePanel& panel, const QImage& marquee, const QImage& screenshot);
    PixelSize Size() const { return {kWidth, kHeight}; }
    PictureBoxWidget* Box(PictureSlot slot) const {
        return slot == PictureSlot::Marquee ? marquee_ : screenshot_;
    }
    QLabel* NoScreenshotLabel() const { return label_; }

private:
    PictureBoxWidget* marquee_;
    PictureBoxWidget* screenshot_;
    QLabel* label_;
};

}  // namespace qv
