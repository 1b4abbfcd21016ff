#pragma once

#include "frontends/qt/KeyboardMenu.h"

#include <Zandor/platform/Intrinsic.h>

#include <QMenu>

namespace zandor::platform::qt {

class PopupMenuAdapter final : public platform::PopupMenu {
public:
    PopupMenuAdapter(QWidget& surface, KeyboardMenu& keys, const Design& design, PlainEvent Click,
                     const void* owner);

    std::unique_ptr<MenuEntry> makeEntry(const Design& design, PlainEvent Click,
                                         const MenuEntry* before) override;
    void PopupMenuAtMouse() override;

private:
    QAction* chosenByKey(const QString& name) const;
    QAction* firstOnOffer() const;
    QAction* chosenByUser(std::optional<QPoint> at);

    QWidget& mSurface;
    KeyboardMenu& mKeys;
    QMenu mMenu;
    PlainEvent mClick;
    std::vector<std::pair<QAction*, PlainEvent>> mHandlers;
};

} // namespace zandor::platform::qt
