#pragma once
#include <QWidget>
#include <array>

#include "launch/DetailsState.h"
#include "launch/PanelSpeech.h"
#include "launch/PanelSwitches.h"

class QLabel;

namespace qv {

class ClickLabel;

// The details panel: the selected game's texts, the status colours, the switch pairs, the
// rating, resolution, executable and play pictures. It renders a DetailsState and reports
// clicks; what a click means is decided by the core.
class DetailsPanel final : public QWidget {
    Q_OBJECT
public:
    explicit DetailsPanel(QWidget* parent = nullptr);

    void Render(const DetailsState& state);

signals:
    void switchClicked(qv::PanelSwitch which);  // its shown image or its label
    void ratingClicked();                       // the shown rating image
    void labelClicked(qv::PanelLabel label);    // a text that speaks itself
    void playClicked();                         // IPlayY
    void playHovered();                         // the mouse over IPlayN
    void backgroundHovered();                   // the mouse over the panel's background
    void executableClicked();                   // Label25 or Image5
    void versionDoubleClicked();                // Label32
    void resolutionClicked();                   // Label21 or Image9

protected:
    void mouseMoveEvent(QMouseEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    struct SwitchWidgets {
        PanelSwitch which;
        ClickLabel* off = nullptr;
        ClickLabel* on = nullptr;
        ClickLabel* label = nullptr;
    };

    QWidget* BuildTexts();
    QWidget* BuildStatus();
    QWidget* BuildSwitches();
    QWidget* BuildBottomRow();
    QWidget* SwitchCell(PanelSwitch which, const char* stem, const char* labelName,
                        const char* initialText);
    ClickLabel* TextLabel(const char* name, const char* text, PanelLabel speaks);

    ClickLabel* title_ = nullptr;
    ClickLabel* maker_ = nullptr;
    ClickLabel* category_ = nullptr;
    ClickLabel* archive_ = nullptr;
    ClickLabel* plays_ = nullptr;
    ClickLabel* frameRate_ = nullptr;
    std::array<QLabel*, 4> status_{};  // Working, Sound, Correct Colors, Screen Flipping
    std::array<SwitchWidgets, 9> switches_{};
    int switchCount_ = 0;
    std::array<ClickLabel*, 6> ratings_{};
    ClickLabel* resolution_ = nullptr;
    ClickLabel* executable_ = nullptr;
    ClickLabel* version_ = nullptr;
    ClickLabel* playN_ = nullptr;
    ClickLabel* playY_ = nullptr;
    ClickLabel* playX_ = nullptr;
};

}  // namespace qv
