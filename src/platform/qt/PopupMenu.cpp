#include "platform/qt/PopupMenu.h"

#include "platform/qt/Text.h"

#include <QCursor>
#include <QPointer>

namespace platform::qt {

namespace {

class EntryAdapter final : public MenuEntry {
public:
    explicit EntryAdapter(QAction* action) : mAction(action) {}

    void Caption(const String& value) override {
        if (!mAction) return;
        // Some styles show the text of a separator, too.
        mAction->setSeparator(value == u"-");
        mAction->setText(mAction->isSeparator() ? QString() : toQt(value));
    }
    void Enabled(bool value) override {
        if (mAction) mAction->setEnabled(value);
    }
    void Visible(bool value) override {
        if (mAction) mAction->setVisible(value);
    }

private:
    QPointer<QAction> mAction;
};

} // namespace

PopupMenuAdapter::PopupMenuAdapter(QWidget& surface, const Design& design, PlainEvent Click)
    : mSurface(surface), mClick(std::move(Click)) {
    mMenu.setObjectName(toQt(design.Name));
}

std::unique_ptr<MenuEntry> PopupMenuAdapter::makeEntry(const Design& design, PlainEvent Click) {
    QAction* action = mMenu.addAction(QString());
    action->setObjectName(toQt(design.Name));
    mHandlers.emplace_back(action, std::move(Click));
    auto entry = std::make_unique<EntryAdapter>(action);
    entry->Caption(String(design.Caption));
    return entry;
}

void PopupMenuAdapter::PopupMenuAtMouse() {
    if (mClick) mClick();
    // The menu has no parent, so it does not follow the widget's looks by itself.
    mMenu.setPalette(mSurface.palette());
    mMenu.setFont(mSurface.font());
    const QAction* chosen = mMenu.exec(QCursor::pos());
    if (!chosen) return;
    for (const auto& [action, handler] : mHandlers) {
        if (action != chosen) continue;
        // A copy: the handler may end the control and with it this menu.
        const PlainEvent click = handler;
        if (click) click();
        return;
    }
}

} // namespace platform::qt
