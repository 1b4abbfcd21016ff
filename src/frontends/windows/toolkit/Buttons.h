#pragma once

#include "frontends/windows/toolkit/Constituent.h"

#include <Zandor/platform/Intrinsic.h>

namespace zandor::platform::windows {

/// The system's push button; the home button draws an arrow instead of a caption.
class ButtonWindow final : public Window {
public:
    enum class Kind { caption, home };

    ButtonWindow(std::shared_ptr<Surroundings> surroundings, HWND parent, Kind kind,
                 const String& caption, CommandButtonEvents events);
    ~ButtonWindow() override;

    void setCaption(const String& caption);
    void setDefault(bool value);
    bool isDefault() const { return mDefault; }
    /// As its user does.
    void press();

    std::optional<LRESULT> told(const Message& message) override;
    SIZE wanted() const override;
    void gotFocus() override;

protected:
    LRESULT handle(const Message& message) override;
    void forget() override;

private:
    void drawHome(const DRAWITEMSTRUCT& item) const;

    const Kind mKind;
    CommandButtonEvents mEvents;
    bool mDefault = false;
};

class CommandButton final : public Constituent<platform::CommandButton, ButtonWindow> {
public:
    using Constituent::Constituent;

    void Caption(const String& value) override { mWindow->setCaption(value); }
    void Enabled(bool value) override { mWindow->enable(value); }
    void Default(bool value) override { mWindow->setDefault(value); }
    void Font(const platform::Font& value) override { setFont(value); }
};

} // namespace zandor::platform::windows
