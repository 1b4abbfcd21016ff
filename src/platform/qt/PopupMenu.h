#pragma once

#include "platform/Intrinsic.h"

#include <QMenu>

namespace platform::qt {

class PopupMenuAdapter final : public platform::PopupMenu {
public:
    PopupMenuAdapter(QWidget& surface, const Design& design, PlainEvent Click);

    std::unique_ptr<MenuEntry> makeEntry(const Design& design, PlainEvent Click) override;
    void PopupMenuAtMouse() override;

private:
    QWidget& mSurface;
    QMenu mMenu;
    PlainEvent mClick;
    std::vector<std::pair<QAction*, PlainEvent>> mHandlers;
};

} // namespace platform::qt
