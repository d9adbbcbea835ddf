#pragma once
#include <filesystem>
#include <optional>

namespace qv {

struct PixelSize {
    int width = 0;
    int height = 0;
    bool operator==(const PixelSize&) const = default;
};

// Which picture box a decoded picture is for.
enum class PictureSlot { Marquee, Screenshot };

// The PNG decoder: loads a picture for a box and reports its size; nothing when the file
// cannot be read or is not a valid picture. The implementation keeps the decoded picture for
// drawing.
class PictureReader {
public:
    virtual ~PictureReader() = default;
    virtual std::optional<PixelSize> ReadPicture(const std::filesystem::path& file,
                                                 PictureSlot slot) = 0;
};

}  // namespace qv
