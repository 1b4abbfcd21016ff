#include "frontends/qt/Inputs.h"

#include "frontends/qt/Fonts.h"
#include "frontends/qt/KeyCodes.h"
#include "frontends/qt/ShownText.h"

#include <Zandor/platform/RuntimeError.h>
#include <Zandor/qt/Text.h>

#include <QApplication>
#include <QDialog>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QScopedValueRollback>
#include <QStyleHints>
#include <QStyleOptionButton>

#include <limits>

namespace zandor::platform::qt {

namespace {

/// The keys of an input: reports them, and has Enter press the default button beside it.
class InputKeys : public QObject {
public:
    InputKeys(QWidget* input, KeyEvent KeyDown, comforts::Comforts& comforts)
        : QObject(input), mInput(*input), mKeyDown(std::move(KeyDown)), mComforts(comforts) {
        input->installEventFilter(this);
    }

    bool eventFilter(QObject* watched, QEvent* event) override {
        // In a dialog of its own, Enter and Escape are the dialog's.
        if (qobject_cast<QDialog*>(mInput.parentWidget()))
            return QObject::eventFilter(watched, event);
        const bool override = event->type() == QEvent::ShortcutOverride;
        if (!override && event->type() != QEvent::KeyPress)
            return QObject::eventFilter(watched, event);
        auto& key = *static_cast<QKeyEvent*>(event);
        const bool enter = isEnter(key);
        const bool ours = enter || key.key() == Qt::Key_Escape;
        if (override) {
            // The host's shortcuts on these keys have to wait while an editor is open.
            if (ours) key.accept();
            return ours;
        }
        const auto [atStart, atEnd] = caret();
        if (mComforts.editorKey(keyCode(key), shiftState(key.modifiers()), atStart, atEnd))
            return true;
        if (mKeyDown && keyCode(key) != 0) mKeyDown(keyCode(key), shiftState(key.modifiers()));
        if (enter) pressDefault();
        return ours;
    }

private:
    /// Whether it stands at the start, and at the end, of the text.
    std::pair<bool, bool> caret() const {
        const auto* line = qobject_cast<const QLineEdit*>(&mInput);
        if (!line) return {true, true};
        const int at = line->hasSelectedText() ? -1 : line->cursorPosition();
        return {at == 0, at == line->text().size()};
    }

    void pressDefault() {
        for (QWidget* child : mInput.parentWidget()->findChildren<QWidget*>())
            if (auto* button = dynamic_cast<SetButton*>(child);
                button && button->isPressedByEnter() && button->isEnabled())
                return button->click();
    }

    QWidget& mInput;
    KeyEvent mKeyDown;
    comforts::Comforts& mComforts;
};

} // namespace

SetButton::SetButton(QWidget* parent) : QPushButton(parent) { setAutoDefault(false); }

void SetButton::setPressedByEnter(bool value) {
    mPressedByEnter = value;
    update();
}

void SetButton::initStyleOption(QStyleOptionButton* option) const {
    QPushButton::initStyleOption(option);
    if (mPressedByEnter) option->features |= QStyleOptionButton::DefaultButton;
}

void SetButton::keyPressEvent(QKeyEvent* event) {
    if (isEnter(*event))
        click();
    else
        QPushButton::keyPressEvent(event);
}

ButtonAdapter::ButtonAdapter(QAbstractButton* widget, FocusTracker& focus,
                             const CommandButtonEvents& events)
    : Adapter(widget, focus) {
    QObject::connect(widget, &QAbstractButton::clicked, widget, [click = events.Click] {
        if (click) click();
    });
    if (events.GotFocus) mFocus.watch(widget, events.GotFocus);
}

void ButtonAdapter::Caption(const String& value) {
    if (!mWidget) return;
    mWidget->setText(toQt(value));
    mWidget->parentWidget()->updateGeometry();
}

void ButtonAdapter::Default(bool value) {
    if (!mWidget) return;
    if (auto* set = dynamic_cast<SetButton*>(mWidget.data()))
        set->setPressedByEnter(value);
    else if (auto* button = qobject_cast<QPushButton*>(mWidget.data()))
        button->setDefault(value);
}

void ButtonAdapter::Font(const platform::Font& value) {
    if (mWidget) setFont(*mWidget, value);
}

void ChoiceBox::keyPressEvent(QKeyEvent* event) {
    const QScopedValueRollback walking(mWalking, true);
    QComboBox::keyPressEvent(event);
}

void ChoiceBox::wheelEvent(QWheelEvent* event) {
    const QScopedValueRollback walking(mWalking, true);
    QComboBox::wheelEvent(event);
}

void ChoiceBox::dropDown() {
    leaveMouse();
    mDrops = true;
    queueDrop();
}

void ChoiceBox::queueDrop() {
    QMetaObject::invokeMethod(
        this, [this] { drop(); }, Qt::QueuedConnection);
}

void ChoiceBox::drop() {
    if (!mDrops) return;
    // The release of the press that has opened the box would choose from the list.
    if (QApplication::mouseButtons() != Qt::NoButton) return qApp->installEventFilter(this);
    mDrops = false;
    if (!isVisible() || window()->focusWidget() != this) return;
    showPopup();
    mDroppedItself = true;
    mList = view();
    mList->installEventFilter(this);
}

void ChoiceBox::hidePopup() {
    mDroppedItself = false;
    QComboBox::hidePopup();
}

void ChoiceBox::hideEvent(QHideEvent* event) {
    mDrops = false;
    leaveMouse();
    QComboBox::hideEvent(event);
}

bool ChoiceBox::eventFilter(QObject* watched, QEvent* event) {
    if (mDrops && event->type() == QEvent::MouseButtonRelease) {
        if (!mClicked.isValid()) {
            mClickedAt = static_cast<QMouseEvent*>(event)->globalPosition().toPoint();
            mClicked.start();
        }
        queueDrop();
    }
    if (isSecondClick(*event)) return true;
    const bool keys =
        event->type() == QEvent::KeyPress || event->type() == QEvent::ShortcutOverride;
    if (watched == mList && mDroppedItself && keys && keyInList(static_cast<QKeyEvent&>(*event)))
        return true;
    return QComboBox::eventFilter(watched, event);
}

/// Of a double click where one would do: it chooses nothing from the list that has come below it,
/// and does not close it.
bool ChoiceBox::isSecondClick(const QEvent& event) {
    if (!mClicked.isValid()) return false;
    switch (event.type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick: {
        const QPointF at = static_cast<const QMouseEvent&>(event).globalPosition();
        mSecondIsDown = !mClicked.hasExpired(QApplication::doubleClickInterval()) &&
                        (at.toPoint() - mClickedAt).manhattanLength() <=
                            QGuiApplication::styleHints()->mouseDoubleClickDistance();
        if (!mSecondIsDown) leaveMouse();
        return mSecondIsDown;
    }
    case QEvent::MouseButtonRelease: return mSecondIsDown;
    default: return false;
    }
}

void ChoiceBox::leaveMouse() {
    qApp->removeEventFilter(this);
    mClicked.invalidate();
    mSecondIsDown = false;
}

/// The keys that close a list together with its box.
bool ChoiceBox::keyInList(QKeyEvent& key) {
    const bool tab = key.key() == Qt::Key_Tab || key.key() == Qt::Key_Backtab;
    if (!tab && key.key() != Qt::Key_Escape) return false;
    key.accept();
    // Nobody else is to close the list before the key itself comes.
    if (key.type() == QEvent::ShortcutOverride) return true;
    if (tab) setCurrentIndex(mList->currentIndex().row());
    hidePopup();
    QKeyEvent goesOn(QEvent::KeyPress, key.key(), key.modifiers());
    QCoreApplication::sendEvent(this, &goesOn);
    return true;
}

ComboBoxAdapter::ComboBoxAdapter(ChoiceBox* widget, FocusTracker& focus,
                                 const std::vector<String>& items, KeyEvent KeyDown,
                                 comforts::Comforts& comforts)
    : Adapter(widget, focus) {
    for (const String& item : items) widget->addItem(toQt(item));
    widget->setCurrentIndex(-1);
    new InputKeys(widget, std::move(KeyDown), comforts);
    QObject::connect(widget, &QComboBox::activated, widget, [widget, &comforts] {
        if (!widget->isWalking()) comforts.choiceMade();
    });
}

std::int16_t ComboBoxAdapter::ListIndex() const {
    return mWidget ? static_cast<std::int16_t>(mWidget->currentIndex()) : std::int16_t{-1};
}

void ComboBoxAdapter::ListIndex(std::int16_t value) {
    if (!mWidget) return;
    if (value < -1 || value >= mWidget->count()) throw errors::invalidPropertyValue();
    mWidget->setCurrentIndex(value);
}

void ComboBoxAdapter::DropDown() {
    if (mWidget) mWidget->dropDown();
}

String ComboBoxAdapter::Text() const { return mWidget ? fromQt(mWidget->currentText()) : String(); }

void ComboBoxAdapter::Clear() {
    if (!mWidget) return;
    // Not before, for with it Qt makes the list that drops down.
    mWidget->setSizeAdjustPolicy(QComboBox::AdjustToContents);
    mWidget->clear();
}

void ComboBoxAdapter::AddItem(const String& text) {
    if (!mWidget) return;
    // Qt chooses the first item of its own accord; here nothing is chosen until somebody does.
    const int chosen = mWidget->currentIndex();
    mWidget->addItem(toQt(text));
    mWidget->setCurrentIndex(chosen);
    // What stands around it is asked for its size before it would learn of this.
    mWidget->parentWidget()->updateGeometry();
}

void ComboBoxAdapter::Font(const platform::Font& value) {
    if (mWidget) setFont(*mWidget, value);
}

TextBoxAdapter::TextBoxAdapter(QLineEdit* widget, FocusTracker& focus, KeyEvent KeyDown,
                               comforts::Comforts& comforts)
    : Adapter(widget, focus) {
    // A text ends where the user ends it, and what is looked at has the room that it needs.
    widget->setMaxLength(std::numeric_limits<int>::max());
    if (!widget->isReadOnly()) widget->setMinimumWidth(180);
    new InputKeys(widget, std::move(KeyDown), comforts);
}

String TextBoxAdapter::Text() const {
    if (!mWidget) return {};
    return mWidget->isReadOnly() ? mText : fromQt(mWidget->text());
}

void TextBoxAdapter::Text(const String& value) {
    if (!mWidget) return;
    // What nobody edits is a name to be looked at.
    mText = value;
    mWidget->setText(mWidget->isReadOnly() ? asSigns(toQt(value)) : toQt(value));
}

void TextBoxAdapter::SetFocus() {
    mFocus.take(mWidget);
    mWidget->selectAll();
}

void LabelAdapter::Caption(const String& value) {
    if (mWidget) mWidget->setText(toQt(value));
}

void LabelAdapter::Font(const platform::Font& value) {
    if (mWidget) setFont(*mWidget, value);
}

} // namespace zandor::platform::qt
