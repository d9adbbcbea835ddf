#pragma once
#include <QImage>

#include "platform/PictureReader.h"

namespace qv {

// PNG decoding with QImage; keeps the last picture of each box for drawing.
class QtPictureReader final : public PictureReader {
public:
    std::optional<PixelSize> ReadPicture(const std::filesystem::path& file,
                                         PictureSlot slot) override;
    const QImage& Picture(PictureSlot slot) const {
        return slot == PictureSlot::Marquee ? marquee_ : screenshot_;
    }

private:
    QImage marquee_;
    QImage screenshot_;
};

}  // namespace qv
