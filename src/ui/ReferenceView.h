#pragma once
#include <QWidget>
#include <array>

#include "reference/DetailsText.h"
#include "reference/PictureLayout.h"

class QStackedWidget;

namespace qv {

class ClickLabel;
class DetailsTextEdit;
class PicturePanel;

// The four view tabs of the details panel.
enum class ViewTab { Screen = 0, History = 1, Info = 2, Notes = 3 };

// The reference side of the details panel: the view tabs (each a pair of images, normal and
// selected), the download icons, and either the text area or the image panel. It renders
// core state and forwards clicks; it decides nothing.
class ReferenceView final : public QWidget {
    Q_OBJECT
public:
    explicit ReferenceView(QWidget* parent = nullptr);

    void RenderText(const DetailsText& area);
    void RenderPictures(const ImagePanel& panel, const QImage& marquee, const QImage& screenshot);

    // The view reset: every tab shows its normal image.
    void ResetViewTabs();
    // The tab shows its selected image ("...2").
    void SelectViewTab(ViewTab tab);
    bool TabSelected(ViewTab tab) const;

    // The text area, or the image panel.
    void ShowTextArea();
    void ShowImagePanel();
    bool TextAreaShown() const;

    // A tab whose database is missing carries the tooltip "Not found".
    void MarkUnavailable(ViewTab tab);
    bool Unavailable(ViewTab tab) const;

    DetailsTextEdit* TextArea() const { return text_; }
    PicturePanel* Pictures() const { return pictures_; }

signals:
    void tabClicked(qv::ViewTab tab);
    void notesTabDoubleClicked();

private:
    ClickLabel* MakeTab(ViewTab tab, bool selected, QWidget* cell);

    std::array<ClickLabel*, 4> normal_{};
    std::array<ClickLabel*, 4> selected_{};
    std::array<bool, 4> unavailable_{};
    QStackedWidget* stack_;
    DetailsTextEdit* text_;
    PicturePanel* pictures_;
};

}  // namespace qv
