#include "frontends/windows/toolkit/PopupMenu.h"

#include "frontends/windows/toolkit/Modal.h"
#include "frontends/windows/toolkit/Text.h"

#include <algorithm>
#include <utility>

namespace zandor::platform::windows {

namespace {

class Entry final : public MenuEntry {
public:
    explicit Entry(std::shared_ptr<MenuItem> item) : mItem(std::move(item)) {}

    const std::shared_ptr<MenuItem>& item() const { return mItem; }
    void Caption(const String& value) override { mItem->caption = value; }
    void Enabled(bool value) override { mItem->enabled = value; }
    void Visible(bool value) override { mItem->visible = value; }

private:
    const std::shared_ptr<MenuItem> mItem;
};

/// The system's menu for as long as it stands open.
class SystemMenu {
public:
    SystemMenu() : mMenu(CreatePopupMenu()) {}
    SystemMenu(const SystemMenu&) = delete;
    SystemMenu& operator=(const SystemMenu&) = delete;
    ~SystemMenu() { DestroyMenu(mMenu); }

    void add(const MenuItem& item, UINT number) const {
        if (item.isSeparator())
            AppendMenuW(mMenu, MF_SEPARATOR, number, nullptr);
        else
            AppendMenuW(mMenu, MF_STRING | (item.enabled ? MF_ENABLED : MF_GRAYED), number,
                        wide(item.caption));
    }
    /// The number of what the user chooses; 0: nothing.
    UINT run(POINT at, HWND owner) const {
        return static_cast<UINT>(TrackPopupMenuEx(
            mMenu, TPM_RETURNCMD | TPM_RIGHTBUTTON | TPM_LEFTALIGN, at.x, at.y, owner, nullptr));
    }

private:
    HMENU mMenu;
};

} // namespace

PopupMenu::PopupMenu(std::shared_ptr<Surroundings> surroundings, PlainEvent Click)
    : mSurroundings(std::move(surroundings)), mClick(std::move(Click)) {
    mSurroundings->contextMenu = this;
}

PopupMenu::~PopupMenu() {
    if (mSurroundings->openMenu == this) mSurroundings->openMenu = nullptr;
    if (mSurroundings->contextMenu == this) mSurroundings->contextMenu = nullptr;
}

std::unique_ptr<MenuEntry> PopupMenu::makeEntry(const Design& design, PlainEvent Click,
                                                const MenuEntry* before) {
    auto item = std::make_shared<MenuItem>();
    item->name = design.Name;
    item->caption = design.Caption;
    item->Click = std::move(Click);
    const auto place = std::ranges::find_if(mItems, [&](const auto& known) {
        return before && known.lock() == static_cast<const Entry*>(before)->item();
    });
    mItems.insert(place, item);
    return std::make_unique<Entry>(std::move(item));
}

std::vector<std::shared_ptr<const MenuItem>> PopupMenu::items() const {
    std::vector<std::shared_ptr<const MenuItem>> all;
    for (const auto& item : mItems)
        if (auto held = item.lock()) all.push_back(std::move(held));
    return all;
}

std::shared_ptr<MenuItem> PopupMenu::chosenByKey(StringView name) const {
    for (const auto& item : mItems)
        if (auto held = item.lock(); held && held->name == name && held->isChoosable()) return held;
    return {};
}

std::shared_ptr<MenuItem> PopupMenu::chosenByUser(std::optional<POINT> at) {
    const auto around = mSurroundings; // the host may end the control while the menu stands open
    const Modal modal(*around);
    const HWND owner = around->surfaceHandle();
    if (!owner) return {};
    const SystemMenu menu;
    std::vector<std::shared_ptr<MenuItem>> shown;
    for (const auto& item : mItems) {
        auto held = item.lock();
        if (!held || !held->visible) continue;
        shown.push_back(std::move(held));
        menu.add(*shown.back(), static_cast<UINT>(shown.size()));
    }
    POINT place = at.value_or(POINT{});
    if (!at) GetCursorPos(&place);
    // Who opened it by a key goes on by keys, and sees where they begin.
    if (at) PostMessageW(owner, WM_KEYDOWN, VK_DOWN, 0);
    around->openMenu = this;
    const UINT chosen = menu.run(place, owner);
    around->openMenu = nullptr;
    return chosen ? shown[chosen - 1] : nullptr;
}

void PopupMenu::PopupMenuAtMouse() {
    const KeyboardMenu::Request request = mSurroundings->menu.take();
    if (mClick) mClick();
    const auto chosen =
        request.entry.empty() ? chosenByUser(request.at) : chosenByKey(request.entry);
    // A copy: the handler may end the control and with it the entry.
    if (const PlainEvent click = chosen ? chosen->Click : nullptr) click();
}

} // namespace zandor::platform::windows
