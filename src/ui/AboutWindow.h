#pragma once
#include <QDialog>
#include <functional>
#include <string>

class QLabel;

namespace qv {

// The about box: logo, version, credit and description. Clicking the logos speaks about the
// program or the emulator; C or the close image closes it.
class AboutWindow : public QDialog {
    Q_OBJECT
public:
    using SpeakFunction = std::function<void(const std::string&)>;

    // speak may be empty: the box is then silent.
    explicit AboutWindow(SpeakFunction speak, QWidget* parent = nullptr);

    // "Quorvane . <version caption>   .   <credit>", spoken on opening and on a logo click.
    std::string LogoText() const;
    static std::string EmulatorSentence();

protected:
    void showEvent(QShowEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void Say(const std::string& text);

    SpeakFunction speak_;
    QLabel* logo_;
    QLabel* version_;
    QLabel* credit_;
    QLabel* emulatorLogo_;
    QLabel* close_;
    bool spoken_ = false;
};

}  // namespace qv
