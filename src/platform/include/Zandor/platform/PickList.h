#pragma once

#include <Zandor/platform/Control.h>
#include <Zandor/platform/export.h>

#include <functional>
#include <vector>

namespace zandor::platform {

/// A list that drops down over a place of the control, below a box whose text filters it: the items
/// that hold the text, in whatever case, are left. Escape and a loss of the focus close it.
class ZANDOR_CONTROL_EXPORT PickList : public Control {
public:
    /// Shows the items over a place, with `typed` in the box and the focus in it. The item to begin
    /// with is the one at a position from 0 on if it is left, else the first.
    virtual void Open(const Bounds& over, const std::vector<String>& items, const String& typed,
                      std::int32_t position) = 0;
    virtual void Close() = 0;        ///< nothing has been picked
    virtual bool IsOpen() const = 0; ///< whether it stands open
};

/// What a list tells.
struct PickListEvents {
    /// The user has taken an item, by its position among all; the list has closed.
    std::function<void(std::int32_t position)> Picked;
};

} // namespace zandor::platform
