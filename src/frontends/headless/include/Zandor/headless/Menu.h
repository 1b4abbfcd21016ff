#pragma once

#include <Zandor/headless/Element.h>
#include <Zandor/headless/export.h>

namespace zandor::platform::headless {

class ZANDOR_HEADLESS_EXPORT MenuEntry final : public platform::MenuEntry, public Object {
public:
    MenuEntry(Toolkit& toolkit, const Design& design, PlainEvent Click);
    void Caption(const String& value) override;
    void Enabled(bool value) override;
    void Visible(bool value) override;

    /// Whether a user who sees the menu open could choose the entry.
    bool choosable() const;
    const PlainEvent Click;
};

class ZANDOR_HEADLESS_EXPORT PopupMenu final : public platform::PopupMenu, public Object {
public:
    PopupMenu(Toolkit& toolkit, const Design& design, PlainEvent Click);
    ~PopupMenu() override;
    std::unique_ptr<platform::MenuEntry> makeEntry(const Design& design, PlainEvent Click,
                                                   const platform::MenuEntry* before) override;
    void PopupMenuAtMouse() override;

    /// The names of its entries, in their order.
    const std::vector<std::string>& entries() const { return mEntries; }

private:
    PlainEvent mClick;
    std::vector<std::string> mEntries;
};

} // namespace zandor::platform::headless
