#pragma once

#include "frontends/windows/toolkit/system.h"

#include <Zandor/platform/ImageList.h>

#include <vector>

namespace zandor::platform::windows {

class Images final : public ImageList {
public:
    explicit Images(std::vector<Picture> pictures) : mPictures(std::move(pictures)) {}

    std::optional<Picture> Image(std::int16_t number) const override {
        if (number < 1 || static_cast<std::size_t>(number) > mPictures.size()) return {};
        return mPictures[static_cast<std::size_t>(number) - 1];
    }

private:
    const std::vector<Picture> mPictures;
};

/// Into a square, on a ground of another colour.
void paintPicture(HDC dc, Picture picture, const RECT& square, COLORREF colour, COLORREF ground);
/// The mark of what comes out.
void paintOutputMark(HDC dc, const RECT& square, COLORREF colour);

} // namespace zandor::platform::windows
