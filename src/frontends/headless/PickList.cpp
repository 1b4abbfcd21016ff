#include <Zandor/headless/PickList.h>

namespace zandor::platform::headless {

PickList::PickList(Toolkit& toolkit, const Design& design, Element* container,
                   PickListEvents events)
    : Placed(toolkit, design, container), mEvents(std::move(events)) {
    setVisible(false);
}

void PickList::Open(const Bounds& over, const std::vector<String>& items, const String& typed,
                    std::int32_t) {
    called("Open");
    place(over);
    mItems = items;
    mLook.text = typed;
    setVisible(true);
    bringToFront();
    takeFocus();
}

void PickList::Close() {
    called("Close");
    setVisible(false);
}

bool PickList::IsOpen() const {
    called("IsOpen");
    return mLook.visible;
}

void PickList::pick(std::int32_t position) {
    setVisible(false);
    // The handler may take the list away.
    if (const auto picked = mEvents.Picked) picked(position);
}

} // namespace zandor::platform::headless
