#pragma once

#include <Zandor/platform/export.h>

#include <cstdint>
#include <optional>

namespace zandor::platform {

/// What an image shows; each toolkit draws it in its own way.
enum class Picture : std::uint8_t { key };

/// Images for other controls, which know them by their numbers from 1 on.
class ZANDOR_CONTROL_EXPORT ImageList {
public:
    virtual ~ImageList() = default;
    /// What the image of a number shows; nothing where there is no such image.
    virtual std::optional<Picture> Image(std::int16_t number) const = 0;
};

} // namespace zandor::platform
