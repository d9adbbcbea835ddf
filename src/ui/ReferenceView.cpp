#include "ui/ReferenceView.h"

#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QPainter>
#include <QPixmap>
#include <QStackedWidget>
#include <QVBoxLayout>

#include "reference/ReferenceViews.h"
#include "ui/ClickLabel.h"
#include "ui/DetailsTextEdit.h"
#include "ui/PicturePanel.h"

namespace qv {
namespace {

struct TabLook {
    const char* normalName;
    const char* selectedName;
    const char* glyph;
    const char* tip;
};
constexpr TabLook kTabs[] = {
    {"IScreen", "IScreen2", "\u25A3", "Screenshot"},
    {"IHistory", "IHistory2", "H", "History"},
    {"IMAMEInfo", "IMAMEInfo2", "i", "MAME Info"},
    {"INotes", "INotes2", "\u270E", "Notes"},
};

// The tab pictures are drawn here: a rounded key cap with a glyph, lit when selected.
QPixmap TabPicture(const char* glyph, bool selected) {
    QPixmap pixmap(40, 40);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(selected ? QColor(245, 196, 0) : QColor(90, 96, 150), 2));
    painter.setBrush(selected ? QColor(70, 60, 10) : QColor(35, 40, 75));
    painter.drawRoundedRect(QRectF(2, 2, 36, 36), 7, 7);
    QFont font = painter.font();
    font.setPixelSize(20);
    font.setBold(true);
    painter.setFont(font);
    painter.setPen(selected ? QColor(255, 230, 120) : QColor(200, 205, 240));
    painter.drawText(QRectF(2, 2, 36, 36), Qt::AlignCenter, QString::fromUtf8(glyph));
    return pixmap;
}

QPixmap DownloadPicture() {
    QPixmap pixmap(20, 20);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(QColor(150, 150, 170), 2));
    painter.drawLine(10, 3, 10, 14);
    painter.drawLine(5, 9, 10, 14);
    painter.drawLine(15, 9, 10, 14);
    painter.drawLine(4, 17, 16, 17);
    return pixmap;
}

}  // namespace

ReferenceView::ReferenceView(QWidget* parent) : QWidget(parent) {
    setObjectName(QStringLiteral("ReferenceView"));
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(6);

    auto* row = new QHBoxLayout;
    row->setSpacing(6);
    for (int i = 0; i < 4; ++i) {
        auto* cell = new QWidget(this);
        auto* grid = new QGridLayout(cell);
        grid->setContentsMargins(0, 0, 0, 0);
        normal_[i] = MakeTab(static_cast<ViewTab>(i), false, cell);
        selected_[i] = MakeTab(static_cast<ViewTab>(i), true, cell);
        grid->addWidget(normal_[i], 0, 0);
        grid->addWidget(selected_[i], 0, 0);
        row->addWidget(cell);
    }
    row->addStretch(1);
    // Picture downloads arrive with the internet commands; until then they only show.
    auto* download = new QLabel(QStringLiteral("Download:"), this);
    download->setObjectName(QStringLiteral("LabelDownload"));
    download->setStyleSheet(QStringLiteral("color: rgb(170, 175, 210);"));
    row->addWidget(download);
    for (auto [icon, label, caption] :
         {std::tuple{"IDownMarquee", "LabelMarquee", "Marquee"},
          std::tuple{"IDownSnap", "LabelScreenshot", "Screenshot"}}) {
        auto* image = new ClickLabel(this);
        image->setObjectName(QString::fromLatin1(icon));
        image->setPixmap(DownloadPicture());
        image->setEnabled(false);
        auto* text = new ClickLabel(QString::fromLatin1(caption), this);
        text->setObjectName(QString::fromLatin1(label));
        text->setEnabled(false);
        row->addWidget(image);
        row->addWidget(text);
    }
    column->addLayout(row);

    stack_ = new QStackedWidget(this);
    text_ = new DetailsTextEdit(stack_);
    auto* picturePage = new QWidget(stack_);
    auto* pictureLayout = new QGridLayout(picturePage);
    pictureLayout->setContentsMargins(0, 0, 0, 0);
    pictures_ = new PicturePanel(picturePage);
    pictureLayout->addWidget(pictures_, 0, 0, Qt::AlignCenter);
    stack_->addWidget(text_);
    stack_->addWidget(picturePage);
    stack_->setMinimumHeight(PicturePanel::kHeight);
    column->addWidget(stack_, 1);

    ResetViewTabs();
    RenderText(DetailsText{});
}

ClickLabel* ReferenceView::MakeTab(ViewTab tab, bool selected, QWidget* cell) {
    const TabLook& look = kTabs[static_cast<int>(tab)];
    auto* label = new ClickLabel(cell);
    label->setObjectName(QString::fromLatin1(selected ? look.selectedName : look.normalName));
    label->setPixmap(TabPicture(look.glyph, selected));
    label->setToolTip(QString::fromLatin1(look.tip));
    label->setCursor(Qt::PointingHandCursor);
    connect(label, &ClickLabel::clicked, this, [this, tab] { emit tabClicked(tab); });
    if (tab == ViewTab::Notes)
        connect(label, &ClickLabel::doubleClicked, this, [this] { emit notesTabDoubleClicked(); });
    return label;
}

void ReferenceView::RenderText(const DetailsText& area) { text_->Render(area); }

void ReferenceView::RenderPictures(const ImagePanel& panel, const QImage& marquee,
                                   const QImage& screenshot) {
    pictures_->Render(panel, marquee, screenshot);
}

void ReferenceView::ResetViewTabs() {
    for (int i = 0; i < 4; ++i) {
        normal_[i]->show();
        selected_[i]->hide();
    }
}

void ReferenceView::SelectViewTab(ViewTab tab) {
    const int i = static_cast<int>(tab);
    normal_[i]->hide();
    selected_[i]->show();
}

bool ReferenceView::TabSelected(ViewTab tab) const {
    return !selected_[static_cast<int>(tab)]->isHidden();
}

void ReferenceView::ShowTextArea() { stack_->setCurrentIndex(0); }
void ReferenceView::ShowImagePanel() { stack_->setCurrentIndex(1); }
bool ReferenceView::TextAreaShown() const { return stack_->currentIndex() == 0; }

void ReferenceView::MarkUnavailable(ViewTab tab) {
    const int i = static_cast<int>(tab);
    unavailable_[i] = true;
    normal_[i]->setToolTip(QString::fromLatin1(kUnavailableMark));
    selected_[i]->setToolTip(QString::fromLatin1(kUnavailableMark));
}

bool ReferenceView::Unavailable(ViewTab tab) const { return unavailable_[static_cast<int>(tab)]; }

}  // namespace qv
