#include "ui/DetailsPanel.h"

#include <QEvent>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QMouseEvent>
#include <QVBoxLayout>

#include "ui/ClickLabel.h"

namespace qv {

namespace {

const QColor PanelInk(230, 230, 240);

QColor ColourOf(const std::optional<Rgb>& colour) {
    return colour ? QColor(colour->r, colour->g, colour->b) : PanelInk;
}

void Paint(QLabel* label, const std::optional<Rgb>& colour) {
    const QColor wanted = ColourOf(colour);
    if (label->palette().color(QPalette::WindowText) == wanted) return;
    QPalette palette = label->palette();
    palette.setColor(QPalette::WindowText, wanted);
    label->setPalette(palette);
}

void Show(QLabel* label, const PanelText& text) {
    const QString wanted = QString::fromStdString(text.text);
    if (label->text() != wanted) label->setText(wanted);
    Paint(label, text.colour);
}

ClickLabel* Picture(QWidget* parent, const QString& name) {
    auto* picture = new ClickLabel(parent);
    picture->setObjectName(name);
    picture->setPixmap(QPixmap(QStringLiteral(":/icons/") + name + QStringLiteral(".png")));
    picture->setCursor(Qt::PointingHandCursor);
    picture->adjustSize();
    return picture;
}

// A fixed-size spot where the pictures of one group lie on top of each other.
QWidget* Stack(QWidget* parent, std::initializer_list<ClickLabel*> pictures) {
    auto* spot = new QWidget(parent);
    QSize size;
    for (ClickLabel* picture : pictures) {
        picture->setParent(spot);
        picture->move(0, 0);
        size = size.expandedTo(picture->sizeHint());
    }
    spot->setFixedSize(size);
    return spot;
}

}  // namespace

DetailsPanel::DetailsPanel(QWidget* parent) : QWidget(parent) {
    setObjectName(QStringLiteral("DetailsPanel"));
    setMouseTracking(true);
    setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Maximum);
    QPalette palette = this->palette();
    palette.setColor(QPalette::WindowText, PanelInk);
    setPalette(palette);

    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(10);
    layout->addWidget(BuildTexts());
    layout->addWidget(BuildStatus());
    layout->addWidget(BuildSwitches());
    layout->addWidget(BuildBottomRow());
    Render(DetailsState{});
}

ClickLabel* DetailsPanel::TextLabel(const char* name, const char* text, PanelLabel speaks) {
    auto* label = new ClickLabel(QString::fromUtf8(text), this);
    label->setObjectName(QString::fromLatin1(name));
    label->setTextFormat(Qt::PlainText);
    connect(label, &ClickLabel::clicked, this, [this, speaks] { emit labelClicked(speaks); });
    return label;
}

QWidget* DetailsPanel::BuildTexts() {
    auto* box = new QWidget(this);
    auto* column = new QVBoxLayout(box);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(3);
    title_ = TextLabel("Label1", "Name of the Game", PanelLabel::Title);
    QFont big = title_->font();
    big.setPointSizeF(big.pointSizeF() * 1.6);
    big.setBold(true);
    title_->setFont(big);
    maker_ = TextLabel("Label3", "(C) Year, Company ", PanelLabel::Maker);
    category_ = TextLabel("Label23", "Category:", PanelLabel::Category);
    archive_ = TextLabel("Label10", "ROM: name, size KB", PanelLabel::Archive);
    plays_ = TextLabel("Label30", "0 Plays (0 min), Last Played: Never", PanelLabel::Plays);
    frameRate_ = TextLabel("Label28", "FPS:", PanelLabel::FrameRate);
    for (QLabel* label : {static_cast<QLabel*>(title_), static_cast<QLabel*>(maker_),
                          static_cast<QLabel*>(category_), static_cast<QLabel*>(archive_),
                          static_cast<QLabel*>(plays_), static_cast<QLabel*>(frameRate_)}) {
        label->setParent(box);
        column->addWidget(label);
    }
    return box;
}

QWidget* DetailsPanel::BuildStatus() {
    auto* box = new QWidget(this);
    auto* row = new QHBoxLayout(box);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(18);
    const char* names[] = {"Label2", "Label6", "Label5", "Label4"};
    const char* texts[] = {"Working", "Sound", "Correct Colors", "Screen Flipping"};
    for (int i = 0; i < 4; ++i) {
        auto* label = new QLabel(QString::fromLatin1(texts[i]), box);
        label->setObjectName(QString::fromLatin1(names[i]));
        status_[static_cast<std::size_t>(i)] = label;
        row->addWidget(label);
    }
    row->addStretch();
    return box;
}

QWidget* DetailsPanel::SwitchCell(PanelSwitch which, const char* stem, const char* labelName,
                                  const char* initialText) {
    auto* cell = new QWidget(this);
    auto* column = new QVBoxLayout(cell);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(2);
    SwitchWidgets& widgets = switches_[static_cast<std::size_t>(switchCount_++)];
    widgets.which = which;
    widgets.off = Picture(cell, QStringLiteral("I%1N").arg(QString::fromLatin1(stem)));
    widgets.on = Picture(cell, QStringLiteral("I%1Y").arg(QString::fromLatin1(stem)));
    widgets.label = new ClickLabel(QString::fromLatin1(initialText), cell);
    widgets.label->setObjectName(QString::fromLatin1(labelName));
    widgets.label->setAlignment(Qt::AlignHCenter);
    widgets.label->setMinimumWidth(78);
    QWidget* spot = Stack(cell, {widgets.off, widgets.on});
    column->addWidget(spot, 0, Qt::AlignHCenter);
    column->addWidget(widgets.label, 0, Qt::AlignHCenter);
    for (ClickLabel* target : {widgets.off, widgets.on, widgets.label})
        connect(target, &ClickLabel::clicked, this, [this, which] { emit switchClicked(which); });
    return cell;
}

QWidget* DetailsPanel::BuildSwitches() {
    auto* box = new QWidget(this);
    auto* row = new QHBoxLayout(box);
    row->setContentsMargins(0, 4, 0, 4);
    row->setSpacing(4);
    row->addWidget(SwitchCell(PanelSwitch::Working, "Working", "Label7", "Working"));
    row->addWidget(SwitchCell(PanelSwitch::Mouse, "Mouse", "Label8", "Mouse Off"));
    row->addWidget(SwitchCell(PanelSwitch::Hidden, "Hidden", "Label12", "Not Hidden"));
    row->addWidget(SwitchCell(PanelSwitch::Cheats, "Cheat", "Label17", "Cheats Off"));
    row->addWidget(SwitchCell(PanelSwitch::Joystick, "Joy", "Label19", "Joystick Off"));
    row->addWidget(SwitchCell(PanelSwitch::Sound, "USound", "Label16", "No Sound"));
    row->addWidget(SwitchCell(PanelSwitch::Artwork, "Art", "Label22", "Use Artwork"));
    row->addWidget(SwitchCell(PanelSwitch::Priority, "Priority", "Label38", "High Priority"));
    row->addWidget(SwitchCell(PanelSwitch::Window, "Win", "Label39", "Windowed"));
    row->addStretch();
    return box;
}

QWidget* DetailsPanel::BuildBottomRow() {
    auto* box = new QWidget(this);
    auto* row = new QHBoxLayout(box);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(10);

    for (int i = 0; i < 6; ++i) {
        ClickLabel* image = Picture(box, QStringLiteral("IR%1").arg(i));
        ratings_[static_cast<std::size_t>(i)] = image;
        connect(image, &ClickLabel::clicked, this, &DetailsPanel::ratingClicked);
    }
    row->addWidget(Stack(box, {ratings_[0], ratings_[1], ratings_[2], ratings_[3], ratings_[4],
                               ratings_[5]}));
    row->addSpacing(14);

    ClickLabel* image9 = Picture(box, QStringLiteral("Image9"));
    resolution_ = new ClickLabel(QStringLiteral("Auto"), box);
    resolution_->setObjectName(QStringLiteral("Label21"));
    resolution_->setMinimumWidth(80);
    for (ClickLabel* target : {image9, resolution_})
        connect(target, &ClickLabel::clicked, this, &DetailsPanel::resolutionClicked);
    row->addWidget(image9);
    row->addWidget(resolution_);

    ClickLabel* image5 = Picture(box, QStringLiteral("Image5"));
    executable_ = new ClickLabel(box);
    executable_->setObjectName(QStringLiteral("Label25"));
    executable_->setMinimumWidth(60);
    for (ClickLabel* target : {image5, executable_})
        connect(target, &ClickLabel::clicked, this, &DetailsPanel::executableClicked);
    version_ = new ClickLabel(box);
    version_->setObjectName(QStringLiteral("Label32"));
    connect(version_, &ClickLabel::doubleClicked, this, &DetailsPanel::versionDoubleClicked);
    row->addWidget(image5);
    row->addWidget(executable_);
    row->addWidget(version_);
    row->addStretch();

    playN_ = Picture(box, QStringLiteral("IPlayN"));
    playY_ = Picture(box, QStringLiteral("IPlayY"));
    playX_ = Picture(box, QStringLiteral("IPlayX"));
    playX_->setCursor(Qt::ArrowCursor);
    playN_->installEventFilter(this);
    playY_->installEventFilter(this);
    connect(playY_, &ClickLabel::clicked, this, &DetailsPanel::playClicked);
    row->addWidget(Stack(box, {playN_, playY_, playX_}));
    return box;
}

void DetailsPanel::Render(const DetailsState& state) {
    Show(title_, PanelText(CaptionDisplayText(state.titleCaption)));
    title_->setToolTip(QString::fromStdString(state.titleTooltip));
    Show(maker_, state.maker);
    Show(category_, state.category);
    Show(archive_, state.archive);
    Show(plays_, state.plays);
    Show(frameRate_, state.frameRate);
    Paint(status_[0], state.emuWorking);
    Paint(status_[1], state.emuSound);
    Paint(status_[2], state.emuColors);
    Paint(status_[3], state.emuScreenFlip);

    for (const SwitchWidgets& widgets : switches_) {
        const SwitchView& view = SwitchOf(state, widgets.which);
        widgets.off->setVisible(!view.on);
        widgets.on->setVisible(view.on);
        Show(widgets.label, view.label);
    }
    const int rating = state.rating >= 0 && state.rating <= 5 ? state.rating : 0;
    for (int i = 0; i < 6; ++i) ratings_[static_cast<std::size_t>(i)]->setVisible(i == rating);

    Show(resolution_, PanelText(state.resolution));
    Show(executable_, state.executable);
    Show(version_, PanelText(state.version));
    playN_->setVisible(state.play == PlayImage::Normal);
    playY_->setVisible(state.play == PlayImage::Active);
    playX_->setVisible(state.play == PlayImage::Disabled);
}

void DetailsPanel::mouseMoveEvent(QMouseEvent* event) {
    emit backgroundHovered();
    QWidget::mouseMoveEvent(event);
}

bool DetailsPanel::eventFilter(QObject* watched, QEvent* event) {
    if (watched == playN_ && event->type() == QEvent::Enter) emit playHovered();
    if (watched == playY_ && event->type() == QEvent::Leave) emit backgroundHovered();
    return QWidget::eventFilter(watched, event);
}

}  // namespace qv
