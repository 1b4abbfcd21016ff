#include <Zandor/headless/ImageList.h>

#include <Zandor/headless/Toolkit.h>

#include <utility>

namespace zandor::platform::headless {

ImageList::ImageList(Toolkit& toolkit, const Design& design, std::vector<Picture> pictures)
    : Object(toolkit, toUtf8(design.Name)), mPictures(std::move(pictures)) {}

std::optional<Picture> ImageList::Image(std::int16_t number) const {
    called("Image");
    if (number < 1 || static_cast<std::size_t>(number) > mPictures.size()) return {};
    return mPictures[static_cast<std::size_t>(number) - 1];
}

} // namespace zandor::platform::headless
