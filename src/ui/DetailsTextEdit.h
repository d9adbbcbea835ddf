#pragma once
#include <QPlainTextEdit>

#include "reference/DetailsText.h"

namespace qv {

// The details text area (Text2): shows a DetailsText on black and reports the user's typing
// and double clicks. Text is kept with CR LF line ends on the core side.
class DetailsTextEdit final : public QPlainTextEdit {
    Q_OBJECT
public:
    explicit DetailsTextEdit(QWidget* parent = nullptr);
    void Render(const DetailsText& area);
    // The shown text with CR LF line ends.
    std::string TextCrlf() const;
    const QString& Marker() const { return marker_; }

signals:
    void doubleClicked();
    // Only typing by the user, never a Render.
    void edited();

protected:
    void mouseDoubleClickEvent(QMouseEvent* event) override;

private:
    bool rendering_ = false;
    QString marker_;
};

}  // namespace qv
