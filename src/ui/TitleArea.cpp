#include "ui/TitleArea.h"

#include <QHBoxLayout>

#include "app/AppVersion.h"
#include "ui/ClickLabel.h"
#include "ui/IconSet.h"

namespace qv {

namespace {
ClickLabel* Picture(QWidget* parent, const char* name, const QIcon& icon, int size,
                    const char* tip) {
    auto* label = new ClickLabel(parent);
    label->setObjectName(QString::fromLatin1(name));
    label->setPixmap(icon.pixmap(size, size));
    label->setFixedSize(size, size);
    label->setToolTip(QString::fromUtf8(tip));
    label->setCursor(Qt::PointingHandCursor);
    return label;
}
}  // namespace

TitleArea::TitleArea(IconSet& icons, QWidget* parent) : QWidget(parent) {
    setObjectName(QStringLiteral("TitleArea"));
    setAttribute(Qt::WA_StyledBackground, true);
    setFixedHeight(64);

    logo_ = Picture(this, "Image3", icons.Icon("logo"), 48, "Show or hide the menus");
    banner_ = new ClickLabel(this);
    banner_->setObjectName(QStringLiteral("Image1"));
    banner_->setText(QStringLiteral("QUORVANE"));
    banner_->setToolTip(QStringLiteral("Version %1").arg(QString::fromLatin1(app_version::Version)));
    minimize_ = Picture(this, "Image2", icons.Icon("minimize"), 20, "Minimize");
    exit_ = Picture(this, "Image4", icons.Icon("exit"), 20, "Exit");

    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(10, 8, 10, 8);
    row->setSpacing(12);
    row->addWidget(logo_);
    row->addWidget(banner_);
    row->addStretch(1);
    row->addWidget(minimize_, 0, Qt::AlignTop);
    row->addWidget(exit_, 0, Qt::AlignTop);
}

}  // namespace qv
