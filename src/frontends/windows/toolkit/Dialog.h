#pragma once

#include "frontends/windows/toolkit/Constituent.h"

#include <Zandor/platform/Intrinsic.h>

#include <functional>
#include <vector>

namespace zandor::platform::windows {

/// A dialog of the system's as a form: labels and fields pair up in the order of their making,
/// buttons stand in a row below.
class FormWindow final : public Window {
public:
    FormWindow(std::shared_ptr<Surroundings> surroundings, HWND owner, const String& caption,
               DialogEvents events);

    void add(Window& child);
    /// Runs until it is hidden.
    void showModal();
    void hide();
    /// A sentence below the fields, asked for as the dialog is shown and as something is chosen.
    void setSentence(std::function<String(FormWindow&)> sentence) {
        mSentence = std::move(sentence);
    }
    /// A child by its name.
    Window* child(StringView name) const;

protected:
    LRESULT handle(const Message& message) override;
    void forget() override;

private:
    void layOut();
    void say();
    void focusFirst() const;
    void enableOthers(bool value) const;

    std::vector<std::weak_ptr<Window>> mLabels, mFields, mButtons;
    DialogEvents mEvents;
    std::function<String(FormWindow&)> mSentence;
    HWND mSentencePlace = nullptr;
    bool mRunning = false;
};

class Dialog final : public Constituent<platform::Dialog, FormWindow> {
public:
    using Constituent::Constituent;

    void take(Window& child) override { mWindow->add(child); }
    void Caption(const String& value) override;
    void ShowModal() override;
    void Hide() override { mWindow->hide(); }
};

} // namespace zandor::platform::windows
