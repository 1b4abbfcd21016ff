#include "frontends/qt/PopupMenu.h"

#include "frontends/qt/MessageBox.h"

#include <Zandor/qt/Text.h>

#include <QCursor>
#include <QPointer>
#include <QVariant>

namespace zandor::platform::qt {

namespace {

class EntryAdapter final : public MenuEntry {
public:
    explicit EntryAdapter(QAction* action) : mAction(action) {}
    QAction* action() const { return mAction; }

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

PopupMenuAdapter::PopupMenuAdapter(QWidget& surface, KeyboardMenu& keys, const Design& design,
                                   PlainEvent Click, const void* owner)
    : mSurface(surface), mKeys(keys), mClick(std::move(Click)) {
    mMenu.setObjectName(toQt(design.Name));
    mMenu.setProperty(ownerProperty, QVariant::fromValue(const_cast<void*>(owner)));
}

std::unique_ptr<MenuEntry> PopupMenuAdapter::makeEntry(const Design& design, PlainEvent Click,
                                                       const MenuEntry* before) {
    auto* const action = new QAction(&mMenu);
    mMenu.insertAction(before ? static_cast<const EntryAdapter*>(before)->action() : nullptr,
                       action);
    action->setObjectName(toQt(design.Name));
    mHandlers.emplace_back(action, std::move(Click));
    auto entry = std::make_unique<EntryAdapter>(action);
    entry->Caption(String(design.Caption));
    return entry;
}

QAction* PopupMenuAdapter::chosenByKey(const QString& name) const {
    for (const auto& [action, handler] : mHandlers)
        if (action->objectName() == name && action->isEnabled() && action->isVisible())
            return action;
    return nullptr;
}

QAction* PopupMenuAdapter::firstOnOffer() const {
    for (QAction* action : mMenu.actions())
        if (action->isEnabled() && action->isVisible() && !action->isSeparator()) return action;
    return nullptr;
}

QAction* PopupMenuAdapter::chosenByUser(std::optional<QPoint> at) {
    // The menu has no parent, so it does not follow the widget's looks by itself.
    mMenu.setPalette(mSurface.palette());
    mMenu.setFont(mSurface.font());
    mMenu.setLayoutDirection(mSurface.layoutDirection());
    // Who opened it by a key goes on by keys, and sees where they begin.
    if (at) mMenu.setActiveAction(firstOnOffer());
    return mMenu.exec(at.value_or(QCursor::pos()));
}

void PopupMenuAdapter::PopupMenuAtMouse() {
    const KeyboardMenu::Request request = mKeys.take();
    if (mClick) mClick();
    const QAction* chosen =
        request.entry.isEmpty() ? chosenByUser(request.at) : chosenByKey(request.entry);
    if (!chosen) return;
    for (const auto& [action, handler] : mHandlers) {
        if (action != chosen) continue;
        // A copy: the handler may end the control and with it this menu.
        const PlainEvent click = handler;
        if (click) click();
        return;
    }
}

} // namespace zandor::platform::qt
