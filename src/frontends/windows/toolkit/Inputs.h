#pragma once

#include "frontends/windows/toolkit/Constituent.h"

#include <Zandor/platform/Intrinsic.h>

#include <vector>

namespace zandor::platform::windows {

/// What is typed or chosen in: an editor's, whose keys are reported, or a dialog's.
class Input : public Window {
public:
    /// Escape, from wherever in the editor it was pressed.
    void escape() { report(VK_ESCAPE, 0); }
    bool hasUseFor(WPARAM key, std::int16_t shift) const override {
        return hasUseAsEditor(key, shift) || Window::hasUseFor(key, shift);
    }

protected:
    Input(std::shared_ptr<Surroundings> surroundings, KeyEvent KeyDown)
        : Window(std::move(surroundings)), mKeyDown(std::move(KeyDown)) {}

    LRESULT handle(const Message& message) override;
    void forget() override { mKeyDown = nullptr; }
    /// Whether it stands at the start, and at the end, of the text.
    virtual std::pair<bool, bool> caret() const { return {true, true}; }
    /// The keys of a list that is down come to it before all others. True: dealt with.
    virtual bool keyInList(WPARAM) { return false; }

private:
    bool isInDialog() const { return !surroundings().holds(hwnd()); }
    bool keyPressed(const Message& message);
    void report(WPARAM key, std::int16_t shift);

    KeyEvent mKeyDown;
};

/// The system's list that drops down, without a text of its own.
class ChoiceWindow final : public Input {
public:
    ChoiceWindow(std::shared_ptr<Surroundings> surroundings, HWND parent,
                 const std::vector<String>& items, KeyEvent KeyDown);

    int count() const;
    int chosen() const;
    void choose(int index);
    void clear();
    void add(const String& item);
    String item(int index) const;
    /// As ComboBox::DropDown.
    void dropDown();
    /// The hands of its user are free.
    void dropIfWanted();
    bool isDropped() const;
    /// Told whenever something else is chosen by its user.
    void setListener(PlainEvent changed) { mChanged = std::move(changed); }

    std::optional<LRESULT> told(const Message& message) override;
    SIZE wanted() const override;

protected:
    LRESULT handle(const Message& message) override;
    void forget() override;
    bool keyInList(WPARAM key) override;

private:
    void drop();
    void fitList() const;

    PlainEvent mChanged;
    bool mWalking = false;       ///< a key or the wheel chooses, rather than a pick
    bool mDrops = false;         ///< as soon as it can
    bool mDroppedItself = false; ///< and is down
    int mWidest = 0;             ///< of its items
};

class ComboBox final : public Constituent<platform::ComboBox, ChoiceWindow> {
public:
    using Constituent::Constituent;

    std::int16_t ListIndex() const override;
    void ListIndex(std::int16_t value) override;
    String Text() const override;
    void Clear() override { mWindow->clear(); }
    void AddItem(const String& text) override { mWindow->add(text); }
    void Enabled(bool value) override { mWindow->enable(value); }
    void Font(const platform::Font& value) override { setFont(value); }
    void SetFocus() override { surroundings().focus.take(mWindow.get()); }
    void DropDown() override { mWindow->dropDown(); }
};

/// The system's box for one line of text; in a dialog a name to be looked at.
class TextWindow final : public Input {
public:
    TextWindow(std::shared_ptr<Surroundings> surroundings, HWND parent, bool readOnly,
               KeyEvent KeyDown);

    SIZE wanted() const override;
    bool isReadOnly() const { return mReadOnly; }

protected:
    std::pair<bool, bool> caret() const override;

private:
    const bool mReadOnly;
};

class TextBox final : public Constituent<platform::TextBox, TextWindow> {
public:
    using Constituent::Constituent;

    String Text() const override;
    void Text(const String& value) override;
    void SetFocus() override;
};

/// The system's text that cannot be typed into.
class LabelWindow final : public Window {
public:
    LabelWindow(std::shared_ptr<Surroundings> surroundings, HWND parent, const String& caption);

    void setCaption(const String& caption);
    SIZE wanted() const override;
};

class Label final : public Constituent<platform::Label, LabelWindow> {
public:
    using Constituent::Constituent;

    void Caption(const String& value) override { mWindow->setCaption(value); }
    void Font(const platform::Font& value) override { setFont(value); }
};

} // namespace zandor::platform::windows
