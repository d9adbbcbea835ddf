#pragma once
#include <QLabel>

namespace qv {

// A label or picture that reports mouse clicks: the title-area images and the count label.
class ClickLabel : public QLabel {
    Q_OBJECT
public:
    using QLabel::QLabel;

signals:
    void clicked();            // left button released over it
    void doubleClicked();      // left button
    void rightPressed();       // right button went down over it
    void rightReleased();      // right button released over it

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
};

}  // namespace qv
