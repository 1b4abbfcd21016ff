#pragma once

#include <Zandor/platform/ImageList.h>

#include <vector>

class QColor;
class QPainter;
class QRectF;

namespace zandor::platform::qt {

class Images final : public ImageList {
public:
    explicit Images(std::vector<Picture> pictures) : mPictures(std::move(pictures)) {}

    std::optional<Picture> Image(std::int16_t number) const override;

private:
    const std::vector<Picture> mPictures;
};

/// Paints what an image shows into a square; crisp at every scale.
void paintPicture(QPainter& painter, Picture picture, const QRectF& square, const QColor& colour);

} // namespace zandor::platform::qt
