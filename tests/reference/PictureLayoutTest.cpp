#include <gtest/gtest.h>

#include <optional>
#include <string>

#include "app/TextFile.h"
#include "reference/PictureLayout.h"
#include "support/FixedLog.h"

namespace qv {
namespace {

// Reads a PNG's size from its header the way a decoder starts; a file without the PNG
// signature is unreadable.
class HeaderReader final : public PictureReader {
public:
    std::optional<PixelSize> ReadPicture(const std::filesystem::path& file, PictureSlot) override {
        const auto bytes = ReadFileBytes(file);
        if (!bytes || bytes->size() < 24 || bytes->compare(0, 8, "\x89PNG\r\n\x1a\n") != 0)
            return std::nullopt;
        auto be32 = [&](std::size_t at) {
            int v = 0;
            for (int i = 0; i < 4; ++i) v = (v << 8) | static_cast<unsigned char>((*bytes)[at + i]);
            return v;
        };
        return PixelSize{be32(16), be32(20)};
    }
};

std::string PngHeader(int width, int height) {
    std::string bytes = "\x89PNG\r\n\x1a\n";
    bytes += std::string("\0\0\0\x0dIHDR", 8);
    for (int v : {width, height})
        for (int shift = 24; shift >= 0; shift -= 8) bytes += static_cast<char>((v >> shift) & 0xff);
    bytes += std::string("\x08\x02\0\0\0", 5);
    return bytes;
}

TEST(PictureNames, LowerCaseAndZipBecomesPng) {
    EXPECT_EQ(PictureFileName("pacman.zip"), "pacman.png");
    EXPECT_EQ(PictureFileName("PacMan.ZIP"), "pacman.png");
    EXPECT_EQ(PictureFileName("a.zip.zip"), "a.png.png");
}

TEST(PictureLayoutRules, MarqueeOnTopScreenshotBelowOrCentred) {
    const PixelSize panel{400, 300};
    const PictureBox marquee = PlaceMarquee(panel, {200, 50});
    EXPECT_EQ(marquee.Left, 100);
    EXPECT_EQ(marquee.Top, 0);
    EXPECT_EQ(marquee.Width, 200);
    EXPECT_EQ(marquee.DrawX, 0);
    const PictureBox none, tall = PlaceMarquee(panel, {100, 350});
    const struct {
        PixelSize shot;
        const PictureBox& marquee;
        int left, top;
    } rows[] = {
        {{256, 224}, marquee, 72, 50},  // below the marquee
        {{256, 224}, none, 72, 38},     // no marquee: centred vertically
        {{255, 223}, none, 72, 38},     // halves round to even: 72.5 -> 72, 38.5 -> 38
        {{253, 221}, none, 74, 40},     // 73.5 -> 74, 39.5 -> 40
        {{640, 480}, none, 0, 0},       // larger than the panel: never above or left of it
        {{100, 100}, tall, 150, 100},   // a marquee taller than the panel: centred instead
        {{100, 400}, tall, 150, -50},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(std::to_string(row.shot.width) + "x" + std::to_string(row.shot.height));
        const PictureBox shot = PlaceScreenshot(panel, row.shot, row.marquee);
        EXPECT_EQ(shot.Left, row.left);
        EXPECT_EQ(shot.Top, row.top);
        EXPECT_EQ(shot.Height, row.shot.height);
    }
}

struct Pictures : test::LogFixture {
    Options options;
    HeaderReader reader;
    ImagePanel panel;
    HostConventions host = HostConventions::Posix();
    Pictures() {
        options.SnapDir = (dir / "snap").string();
        options.MarqueeDir = (dir / "marquee").string();
        panel.Size = {400, 300};
    }
};

TEST(PictureDisplay, LabelVisibleExactlyWhenTheScreenshotIsMissing) {
    Pictures p;
    p.dir.Write("snap/pacman.png", PngHeader(256, 224));
    ShowPictures(p.panel, p.options, p.host, "PacMan.ZIP", p.reader, p.log);
    EXPECT_FALSE(p.panel.Marquee.Visible);
    EXPECT_TRUE(p.panel.Screenshot.Visible);
    EXPECT_FALSE(p.panel.NoScreenshotLabel);
    EXPECT_EQ(p.panel.Screenshot.Top, 38);

    p.dir.Write("marquee/pacman.png", PngHeader(300, 80));
    ShowPictures(p.panel, p.options, p.host, "pacman.zip", p.reader, p.log);
    EXPECT_TRUE(p.panel.Marquee.Visible);
    EXPECT_EQ(p.panel.Marquee.Left, 50);
    EXPECT_EQ(p.panel.Screenshot.Top, 80);

    p.dir.Write("marquee/galaga.png", PngHeader(300, 80));
    ShowPictures(p.panel, p.options, p.host, "galaga.zip", p.reader, p.log);
    EXPECT_TRUE(p.panel.Marquee.Visible);
    EXPECT_FALSE(p.panel.Screenshot.Visible);
    EXPECT_TRUE(p.panel.NoScreenshotLabel);

    p.options.MarqueeDir.clear();
    ShowPictures(p.panel, p.options, p.host, "pacman.zip", p.reader, p.log);
    EXPECT_FALSE(p.panel.Marquee.Visible);
    EXPECT_EQ(p.panel.Screenshot.Top, 38);
    EXPECT_EQ(p.LogText().find("Error"), std::string::npos);  // missing files are not errors
}

TEST(PictureDisplay, UnreadablePictureIsLoggedAndShowsTheLabel) {
    Pictures p;
    p.dir.Write("snap/bad.png", "not a png at all");
    p.dir.Write("marquee/bad.png", "\x89PNG");
    ShowPictures(p.panel, p.options, p.host, "bad.zip", p.reader, p.log);
    EXPECT_FALSE(p.panel.Screenshot.Visible);
    EXPECT_FALSE(p.panel.Marquee.Visible);
    EXPECT_TRUE(p.panel.NoScreenshotLabel);
    const std::string logText = p.LogText();
    EXPECT_NE(logText.find("PlayForm ShowPNG Error"), std::string::npos);
    EXPECT_NE(logText.find("PlayForm ShowPNGMarquee Error"), std::string::npos);
}

TEST(PictureDragging, OnlyExactlyTheLeftButtonDrags) {
    PictureBox box;
    box.Left = 10;
    box.Top = 20;
    DragAnchor anchor;
    PressPicture(anchor, mousebuttons::Left, 5.4, 6.6);
    EXPECT_EQ(anchor.x, 5);
    EXPECT_EQ(anchor.y, 7);
    EXPECT_TRUE(DragPicture(anchor, mousebuttons::Left, 15, 4, box));
    EXPECT_EQ(box.Left, 20);
    EXPECT_EQ(box.Top, 17);
    EXPECT_FALSE(DragPicture(anchor, mousebuttons::Right, 100, 100, box));
    EXPECT_FALSE(DragPicture(anchor, mousebuttons::Left | mousebuttons::Right, 100, 100, box));
    EXPECT_EQ(box.Left, 20);
    PressPicture(anchor, mousebuttons::Right, 50, 50);
    EXPECT_EQ(anchor.x, 5);
    PressPicture(anchor, mousebuttons::Left, 1e9, -1e9);  // clamped, never overflows
    EXPECT_EQ(anchor.x, 32767);
    EXPECT_EQ(anchor.y, -32768);
}

}  // namespace
}  // namespace qv
