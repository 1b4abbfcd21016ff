#pragma once

#include "frontends/qt/Adapter.h"

#include <Zandor/comforts/Comforts.h>
#include <Zandor/platform/Intrinsic.h>

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QComboBox>
#include <QElapsedTimer>
#include <QLabel>
#include <QLineEdit>
#include <QPointer>
#include <QPushButton>

namespace zandor::platform::qt {

/// The button of an editor, which Enter presses. It is never the default button of a dialog around:
/// that one is the host's.
class SetButton : public QPushButton {
public:
    explicit SetButton(QWidget* parent);

    void setPressedByEnter(bool value);
    bool isPressedByEnter() const { return mPressedByEnter; }

protected:
    void initStyleOption(QStyleOptionButton* option) const override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    bool mPressedByEnter = false;
};

class ButtonAdapter final : public Adapter<platform::CommandButton, QAbstractButton> {
public:
    ButtonAdapter(QAbstractButton* widget, FocusTracker& focus, const CommandButtonEvents& events);

    void Caption(const String& value) override;
    void Enabled(bool value) override { enable(value); }
    void Default(bool value) override;
    void Font(const platform::Font& value) override;
};

/// A list that tells an item picked from it from one that a key or the wheel has walked to.
class ChoiceBox : public QComboBox {
public:
    explicit ChoiceBox(QWidget* parent) : QComboBox(parent) {}

    bool isWalking() const { return mWalking; }
    /// As ComboBox::DropDown.
    void dropDown();

    void hidePopup() override;
    bool eventFilter(QObject* watched, QEvent* event) override;

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    void queueDrop();
    void drop();
    bool isSecondClick(const QEvent& event);
    void leaveMouse();
    bool keyInList(QKeyEvent& key);

    bool mWalking = false;
    bool mDrops = false;         ///< as soon as it can
    bool mDroppedItself = false; ///< and is down
    QPoint mClickedAt;           ///< on the screen, to open it
    QElapsedTimer mClicked;      ///< since then, while a second click may follow
    bool mSecondIsDown = false;
    QPointer<QAbstractItemView> mList;
};

class ComboBoxAdapter final : public Adapter<platform::ComboBox, ChoiceBox> {
public:
    ComboBoxAdapter(ChoiceBox* widget, FocusTracker& focus, const std::vector<String>& items,
                    KeyEvent KeyDown, comforts::Comforts& comforts);

    std::int16_t ListIndex() const override;
    void ListIndex(std::int16_t value) override;
    String Text() const override;
    void Clear() override;
    void AddItem(const String& text) override;
    void Enabled(bool value) override { enable(value); }
    void Font(const platform::Font& value) override;
    void SetFocus() override { mFocus.take(mWidget); }
    void DropDown() override;
};

class TextBoxAdapter final : public Adapter<platform::TextBox, QLineEdit> {
public:
    TextBoxAdapter(QLineEdit* widget, FocusTracker& focus, KeyEvent KeyDown,
                   comforts::Comforts& comforts);

    String Text() const override;
    void Text(const String& value) override;
    void SetFocus() override;

private:
    String mText; ///< of a box that is only read
};

class LabelAdapter final : public Adapter<platform::Label, QLabel> {
public:
    using Adapter::Adapter;

    void Caption(const String& value) override;
    void Font(const platform::Font& value) override;
};

} // namespace zandor::platform::qt
