#include "platform/qt/QtPictureReader.h"

#include <QString>

namespace qv {

std::optional<PixelSize> QtPictureReader::ReadPicture(const std::filesystem::path& file,
                                                      PictureSlot slot) {
    QImage image;
    QImage& target = slot == PictureSlot::Marquee ? marquee_ : screenshot_;
    if (!image.load(QString::fromStdString(file.string())) || image.isNull()) {
        target = QImage();
        return std::nullopt;
    }
    target = image;
    return PixelSize{image.width(), image.height()};
}

}  // namespace qv
