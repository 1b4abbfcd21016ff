#pragma once

#include "platform/Intrinsic.h"
#include "platform/qt/KeyboardMenu.h"

#include <QMenu>

namespace platform::qt {

class PopupMenuAdapter final : public platform::PopupMenu {
public:
    PopupMenuAdapter(QWidget& surface, KeyboardMenu& keys, const Design& design, PlainEvent Click,
                     const void* owner);

    std::unique_ptr<MenuEntry> makeEntry(const Design& design, PlainEvent Click) override;
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

} // namespace platform::qt
