#pragma once

#include "frontends/windows/toolkit/Surroundings.h"

#include <Zandor/platform/Intrinsic.h>

#include <memory>
#include <vector>

namespace zandor::platform::windows {

/// What there is to know of an entry, whoever holds it.
struct MenuItem {
    String name;
    String caption;
    bool enabled = true;
    bool visible = true;
    PlainEvent Click;

    bool isSeparator() const { return caption == u"-"; }
    bool isChoosable() const { return enabled && visible && !isSeparator(); }
};

/// The system's popup menu, built anew each time it opens.
class PopupMenu final : public platform::PopupMenu {
public:
    PopupMenu(std::shared_ptr<Surroundings> surroundings, PlainEvent Click);
    ~PopupMenu() override;

    std::unique_ptr<MenuEntry> makeEntry(const Design& design, PlainEvent Click,
                                         const MenuEntry* before) override;
    void PopupMenuAtMouse() override;

    /// In their order.
    std::vector<std::shared_ptr<const MenuItem>> items() const;

private:
    using Items = std::vector<std::weak_ptr<MenuItem>>;

    std::shared_ptr<MenuItem> chosenByKey(StringView name) const;
    std::shared_ptr<MenuItem> chosenByUser(std::optional<POINT> at);

    const std::shared_ptr<Surroundings> mSurroundings;
    PlainEvent mClick;
    Items mItems;
};

} // namespace zandor::platform::windows
