#pragma once

#include <Zandor/headless/Element.h>
#include <Zandor/headless/export.h>
#include <Zandor/platform/PickList.h>

namespace zandor::platform::headless {

/// Its look's text is what stands in the box; all items stay in sight whatever that is.
class ZANDOR_HEADLESS_EXPORT PickList final : public Placed<platform::PickList> {
public:
    PickList(Toolkit& toolkit, const Design& design, Element* container, PickListEvents events);
    void Open(const Bounds& over, const std::vector<String>& items, const String& typed,
              std::int32_t position) override;
    void Close() override;
    bool IsOpen() const override;

    const std::vector<String>& items() const { return mItems; }
    /// Where the list was opened.
    const Bounds& over() const { return placement(); }
    /// As the user takes the item at a position from 0 on.
    void pick(std::int32_t position);

private:
    void lostFocus() override { setVisible(false); }

    std::vector<String> mItems;
    PickListEvents mEvents;
};

} // namespace zandor::platform::headless
