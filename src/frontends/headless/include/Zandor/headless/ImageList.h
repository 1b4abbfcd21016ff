#pragma once

#include <Zandor/headless/Element.h>
#include <Zandor/headless/export.h>
#include <Zandor/platform/ImageList.h>

namespace zandor::platform::headless {

class ZANDOR_HEADLESS_EXPORT ImageList final : public platform::ImageList, public Object {
public:
    ImageList(Toolkit& toolkit, const Design& design, std::vector<Picture> pictures);
    std::optional<Picture> Image(std::int16_t number) const override;

    const std::vector<Picture>& pictures() const { return mPictures; }

private:
    const std::vector<Picture> mPictures;
};

} // namespace zandor::platform::headless
