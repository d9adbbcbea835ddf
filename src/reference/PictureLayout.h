#pragma once
#include <cstdint>
#include <string>
#include <string_view>

#include "app/ActivityLog.h"
#include "app/HostConventions.h"
#include "app/Options.h"
#include "platform/PictureReader.h"

namespace qv {

// One picture box of the image panel, in pixels relative to the panel.
struct PictureBox {
    bool Visible = false;
    int Left = 0;
    int Top = 0;
    int Width = 0;
    int Height = 0;
    int DrawX = 0;  // where the picture is drawn inside the box
    int DrawY = 0;
};

// The image panel: the marquee along the top, the screenshot below it or centred, and the
// "No screenshot available." label.
struct ImagePanel {
    PixelSize Size;
    PictureBox Marquee;
    PictureBox Screenshot;
    bool NoScreenshotLabel = false;
};

inline constexpr const char* kNoScreenshotText = "No screenshot available.";

// Picture file of a game: lower case, every ".zip" replaced by ".png".
std::string PictureFileName(std::string_view key);

// Round to nearest, halves to even (the layout formulas' rounding).
int RoundHalfEven(double value);

// Layout of a picture of the given size in the panel (the formulas of the panel, in pixels).
PictureBox PlaceMarquee(PixelSize panel, PixelSize picture);
PictureBox PlaceScreenshot(PixelSize panel, PixelSize picture, const PictureBox& marquee);

// ShowPNGMarquee / ShowPNG: a missing file shows the label; an unreadable one is logged with
// LogError and shows the label too.
void ShowPNGMarquee(ImagePanel& panel, const Options& options, const HostConventions& host,
                    const std::string& name, PictureReader& reader, ActivityLog& log);
void ShowPNG(ImagePanel& panel, const Options& options, const HostConventions& host,
             const std::string& name, PictureReader& reader, ActivityLog& log);
// Marquee first (hidden when MarqueeDir is empty), then the screenshot: after this the label
// is visible exactly when the screenshot is missing.
void ShowPictures(ImagePanel& panel, const Options& options, const HostConventions& host,
                  const std::string& name, PictureReader& reader, ActivityLog& log);

// Dragging a picture box with the left mouse button.
namespace mousebuttons {
inline constexpr int Left = 1;
inline constexpr int Right = 2;
inline constexpr int Middle = 4;
}  // namespace mousebuttons

struct DragAnchor {
    std::int16_t x = 0;
    std::int16_t y = 0;
};
// Button down at (x, y) relative to the box: only exactly the left button sets the anchor.
void PressPicture(DragAnchor& anchor, int buttons, double x, double y);
// Move or button up at (x, y) relative to the box: with exactly the left button the box moves
// by the pointer's offset from the anchor. Returns whether it moved.
bool DragPicture(const DragAnchor& anchor, int buttons, double x, double y, PictureBox& box);

}  // namespace qv
