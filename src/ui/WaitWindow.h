#pragma once
#include <QTimer>
#include <QWidget>

#include "platform/EventYield.h"
#include "platform/StatusDisplay.h"

class QLabel;

namespace qv {

// The splash shown while start-up runs on the window thread: logo, version, credit and a
// status line that repaints as soon as it changes.
class WaitWindow : public QWidget, public StatusDisplay {
    Q_OBJECT
public:
    // yield lets the window repaint in the middle of start-up work; it may be null.
    explicit WaitWindow(EventYield* yield, QWidget* parent = nullptr);

    bool IsVisible() const override;
    void SetStatus(const std::string& text) override;
    QString Status() const;

protected:
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    void Repaint();

    EventYield* yield_;
    QLabel* status_;
    QTimer timer_;
};

}  // namespace qv
