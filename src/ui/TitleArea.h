#pragma once
#include <QWidget>

namespace qv {

class ClickLabel;
class IconSet;

// The window's own title strip: the logo (Image3), the program's name (Image1), and the
// minimize (Image2) and exit (Image4) pictures. It only reports clicks.
class TitleArea final : public QWidget {
    Q_OBJECT
public:
    TitleArea(IconSet& icons, QWidget* parent = nullptr);

    ClickLabel* Logo() const { return logo_; }
    ClickLabel* Banner() const { return banner_; }
    ClickLabel* MinimizeImage() const { return minimize_; }
    ClickLabel* ExitImage() const { return exit_; }

private:
    ClickLabel* logo_;
    ClickLabel* banner_;
    ClickLabel* minimize_;
    ClickLabel* exit_;
};

}  // namespace qv
