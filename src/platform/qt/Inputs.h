#pragma once

#include "platform/Intrinsic.h"
#include "platform/qt/Adapter.h"

#include <QAbstractButton>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>

namespace platform::qt {

class ButtonAdapter final : public Adapter<platform::CommandButton, QAbstractButton> {
public:
    ButtonAdapter(QAbstractButton* widget, FocusTracker& focus, CommandButtonEvents events);

    void Caption(const String& value) override;
    void Enabled(bool value) override { enable(value); }
    void Default(bool value) override;
    void Font(const platform::Font& value) override;
};

class ComboBoxAdapter final : public Adapter<platform::ComboBox, QComboBox> {
public:
    ComboBoxAdapter(QComboBox* widget, FocusTracker& focus, const std::vector<String>& items,
                    KeyEvent KeyDown);

    std::int16_t ListIndex() const override;
    void ListIndex(std::int16_t value) override;
    String Text() const override;
    void Clear() override;
    void AddItem(const String& text) override;
    void Enabled(bool value) override { enable(value); }
    void Font(const platform::Font& value) override;
    void SetFocus() override { mFocus.take(mWidget); }
};

class TextBoxAdapter final : public Adapter<platform::TextBox, QLineEdit> {
public:
    TextBoxAdapter(QLineEdit* widget, FocusTracker& focus, KeyEvent KeyDown);

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

} // namespace platform::qt
