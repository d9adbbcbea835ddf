#pragma once
#include <QUrl>
#include <QWidget>
#include <filesystem>
#include <functional>
#include <string>

class QTextBrowser;
class QPushButton;

namespace qv {

// The help pages in a browser: "QUORVANE" shows help/quorvane.html, "MAME" help/mame.html,
// any other topic opens the emulator project's web site in the desktop's browser.
class HelpWindow : public QWidget {
    Q_OBJECT
public:
    using UrlOpener = std::function<void(const QUrl&)>;

    // openExternal defaults to the desktop's browser.
    explicit HelpWindow(std::filesystem::path appFolder, QWidget* parent = nullptr,
                        UrlOpener openExternal = {});

    void ShowTopic(const std::string& topic);
    QString CurrentPage() const;

signals:
    void closed();

protected:
    void closeEvent(QCloseEvent* event) override;

private:
    void Load(const QString& file);
    void Refresh();

    std::filesystem::path appFolder_;
    UrlOpener openExternal_;
    QTextBrowser* browser_;
    QPushButton* refresh_;
    QPushButton* close_;
    QString page_;
};

}  // namespace qv
