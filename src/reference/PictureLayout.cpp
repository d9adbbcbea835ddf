#include "reference/PictureLayout.h"

#include <algorithm>
#include <cfenv>
#include <cmath>
#include <limits>

#include "app/TextFile.h"

namespace qv {
namespace {

std::int16_t ToInt16(double value) {
    const double rounded = std::nearbyint(value);
    return static_cast<std::int16_t>(std::clamp<double>(
        rounded, std::numeric_limits<std::int16_t>::min(), std::numeric_limits<std::int16_t>::max()));
}

// Box of the picture's own size with the picture centred in it.
PictureBox SizedBox(PixelSize picture) {
    PictureBox box;
    box.Width = picture.width;
    box.Height = picture.height;
    box.DrawX = std::max(0, RoundHalfEven((box.Width - picture.width) / 2.0));
    box.DrawY = std::max(0, RoundHalfEven((box.Height - picture.height) / 2.0));
    box.Visible = true;
    return box;
}

std::optional<PixelSize> Load(const std::filesystem::path& file, PictureSlot slot,
                              PictureReader& reader, ActivityLog& log, const char* procedure) {
    std::optional<PixelSize> size = reader.ReadPicture(file, slot);
    if (!size || size->width <= 0 || size->height <= 0) {
        log.LogError("PlayForm", procedure,
                     {0, "Cannot read picture " + file.string(), "Quorvane"});
        return std::nullopt;
    }
    return size;
}

}  // namespace

std::string PictureFileName(std::string_view key) {
    std::string name = LowerAscii(key);
    for (std::size_t at = name.find(".zip"); at != std::string::npos; at = name.find(".zip", at + 4))
        name.replace(at, 4, ".png");
    return name;
}

int RoundHalfEven(double value) {
    const int saved = std::fegetround();
    std::fesetround(FE_TONEAREST);
    const double rounded = std::nearbyint(value);
    std::fesetround(saved);
    return static_cast<int>(rounded);
}

PictureBox PlaceMarquee(PixelSize panel, PixelSize picture) {
    PictureBox box = SizedBox(picture);
    box.Left = std::max(0, RoundHalfEven((panel.width - box.Width) / 2.0));
    box.Top = 0;
    return box;
}

PictureBox PlaceScreenshot(PixelSize panel, PixelSize picture, const PictureBox& marquee) {
    PictureBox box = SizedBox(picture);
    box.Left = std::max(0, RoundHalfEven((panel.width - box.Width) / 2.0));
    int top = marquee.Visible ? marquee.Height : RoundHalfEven((panel.height - box.Height) / 2.0);
    top = std::max(0, top);
    if (panel.height < top) top = RoundHalfEven((panel.height - box.Height) / 2.0);
    box.Top = top;
    return box;
}

void ShowPNGMarquee(ImagePanel& panel, const Options& options, const HostConventions& host,
                    const std::string& name, PictureReader& reader, ActivityLog& log) {
    const std::filesystem::path file = host.Join(options.MarqueeDir, PictureFileName(name));
    if (!FileExists(file)) {
        panel.Marquee.Visible = false;
        panel.NoScreenshotLabel = true;
        return;
    }
    const std::optional<PixelSize> size =
        Load(file, PictureSlot::Marquee, reader, log, "ShowPNGMarquee");
    if (!size) {
        panel.Marquee.Visible = false;
        panel.NoScreenshotLabel = true;
        return;
    }
    panel.Marquee = PlaceMarquee(panel.Size, *size);
}

void ShowPNG(ImagePanel& panel, const Options& options, const HostConventions& host,
             const std::string& name, PictureReader& reader, ActivityLog& log) {
    const std::filesystem::path file = host.Join(options.SnapDir, PictureFileName(name));
    if (!FileExists(file)) {
        panel.Screenshot.Visible = false;
        panel.NoScreenshotLabel = true;
        return;
    }
    panel.NoScreenshotLabel = false;
    const std::optional<PixelSize> size =
        Load(file, PictureSlot::Screenshot, reader, log, "ShowPNG");
    if (!size) {
        panel.Screenshot.Visible = false;
        panel.NoScreenshotLabel = true;
        return;
    }
    panel.Screenshot = PlaceScreenshot(panel.Size, *size, panel.Marquee);
}

void ShowPictures(ImagePanel& panel, const Options& options, const HostConventions& host,
                  const std::string& name, PictureReader& reader, ActivityLog& log) {
    if (!options.MarqueeDir.empty())
        ShowPNGMarquee(panel, options, host, name, reader, log);
    else
        panel.Marquee.Visible = false;
    ShowPNG(panel, options, host, name, reader, log);
}

void PressPicture(DragAnchor& anchor, int buttons, double x, double y) {
    if (buttons != mousebuttons::Left) return;
    anchor.x = ToInt16(x);
    anchor.y = ToInt16(y);
}

bool DragPicture(const DragAnchor& anchor, int buttons, double x, double y, PictureBox& box) {
    if (buttons != mousebuttons::Left) return false;
    box.Left += static_cast<int>(std::lround(x)) - anchor.x;
    box.Top += static_cast<int>(std::lround(y)) - anchor.y;
    return true;
}

}  // namespace qv
