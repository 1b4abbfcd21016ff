#include <Zandor/headless/Menu.h>

#include <Zandor/headless/Toolkit.h>

#include <algorithm>

namespace zandor::platform::headless {

MenuEntry::MenuEntry(Toolkit& toolkit, const Design& design, PlainEvent Click)
    : Object(toolkit, toUtf8(design.Name)), Click(std::move(Click)) {
    mLook.text = design.Caption;
}

void MenuEntry::Caption(const String& value) {
    called("Caption");
    mLook.text = value;
}

void MenuEntry::Enabled(bool value) {
    called("Enabled");
    mLook.enabled = value;
}

void MenuEntry::Visible(bool value) {
    called("Visible");
    mLook.visible = value;
}

bool MenuEntry::choosable() const { return mLook.visible && mLook.enabled && mLook.text != u"-"; }

PopupMenu::PopupMenu(Toolkit& toolkit, const Design& design, PlainEvent Click)
    : Object(toolkit, toUtf8(design.Name)), mClick(std::move(Click)) {
    mLook.text = design.Caption;
}

PopupMenu::~PopupMenu() = default;

std::unique_ptr<platform::MenuEntry> PopupMenu::makeEntry(const Design& design, PlainEvent Click,
                                                          const platform::MenuEntry* before) {
    called("makeEntry");
    auto entry = std::make_unique<MenuEntry>(mToolkit, design, std::move(Click));
    const auto place =
        before ? std::ranges::find(mEntries, static_cast<const MenuEntry*>(before)->name())
               : mEntries.end();
    mEntries.insert(place, entry->name());
    return entry;
}

void PopupMenu::PopupMenuAtMouse() {
    called("PopupMenuAtMouse");
    if (mClick) mClick();
    const std::string chosen = mToolkit.openMenu(*this);
    if (chosen.empty()) return;
    const auto& entry = mToolkit.find<MenuEntry>(chosen);
    // The handler may take the menu away.
    if (const PlainEvent click = entry.Click; entry.choosable() && click) click();
}

} // namespace zandor::platform::headless
