#include "ui/HelpWindow.h"

#include <QCloseEvent>
#include <QDesktopServices>
#include <QFileInfo>
#include <QHBoxLayout>
#include <QPushButton>
#include <QTextBrowser>
#include <QVBoxLayout>

#include "ui/ProgramIdentity.h"

namespace qv {

HelpWindow::HelpWindow(std::filesystem::path appFolder, QWidget* parent, UrlOpener openExternal)
    : QWidget(parent, Qt::Window),
      appFolder_(std::move(appFolder)),
      openExternal_(std::move(openExternal)) {
    if (!openExternal_) openExternal_ = [](const QUrl& url) { QDesktopServices::openUrl(url); };
    setObjectName(QStringLiteral("Help"));
    setWindowTitle(QStringLiteral("Quorvane - Help"));

    browser_ = new QTextBrowser(this);
    browser_->setObjectName(QStringLiteral("WebBrowser1"));
    browser_->setOpenExternalLinks(true);

    refresh_ = new QPushButton(QStringLiteral("Refresh"), this);
    refresh_->setObjectName(QStringLiteral("cmdRefresh"));
    close_ = new QPushButton(QStringLiteral("&Close"), this);
    close_->setObjectName(QStringLiteral("cmdClose"));
    connect(refresh_, &QPushButton::clicked, this, [this] { Refresh(); });
    connect(close_, &QPushButton::clicked, this, [this] { close(); });

    // The browser fills the window's width from its top-left corner.
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 6);
    layout->addWidget(browser_, 1);
    auto* buttons = new QHBoxLayout;
    buttons->addStretch();
    buttons->addWidget(refresh_);
    buttons->addWidget(close_);
    buttons->setContentsMargins(6, 0, 6, 0);
    layout->addLayout(buttons);
    resize(760, 560);
}

void HelpWindow::ShowTopic(const std::string& topic) {
    setWindowTitle(QStringLiteral("Quorvane - Help"));
    const auto help = appFolder_ / "help";
    if (topic == "QUORVANE") {
        Load(QString::fromStdString((help / "quorvane.html").string()));
    } else if (topic == "MAME") {
        Load(QString::fromStdString((help / "mame.html").string()));
    } else {
        page_ = identity::EmulatorSite();
        browser_->setHtml(QStringLiteral("<p>The emulator's web site has been opened in your "
                                         "browser: <a href=\"%1\">%1</a></p>")
                              .arg(page_));
        openExternal_(QUrl(page_));
    }
}

QString HelpWindow::CurrentPage() const { return page_; }

void HelpWindow::Load(const QString& file) {
    page_ = file;
    if (!QFileInfo(file).isFile()) {
        browser_->setHtml(
            QStringLiteral("<h2>Page not found</h2><p>The help page %1 cannot be found.</p>")
                .arg(file.toHtmlEscaped()));
        return;
    }
    browser_->setSource(QUrl::fromLocalFile(file));
    browser_->reload();
}

// Local pages are read again; the web site lives in the desktop's browser.
void HelpWindow::Refresh() {
    if (!page_.isEmpty() && !page_.startsWith(QStringLiteral("http"))) Load(page_);
}

void HelpWindow::closeEvent(QCloseEvent* event) {
    QWidget::closeEvent(event);
    emit closed();
}

}  // namespace qv
