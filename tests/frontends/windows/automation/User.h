#pragma once

#include "frontends/windows/automation/com/system.h"

#include <atomic>
#include <functional>
#include <string>
#include <string_view>

/// Somebody at the screen: mouse and keyboard as the system has them of its devices, and what is to
/// be seen. Works in a thread of its own beside the form's, and so also while a menu or a dialog
/// stands open there.
class User {
public:
    explicit User(HWND form);
    User(const User&) = delete;
    User& operator=(const User&) = delete;
    ~User();

    /// Runs the form's messages until the user has done all of this.
    void live(const std::function<void()>& life);

    // For the user's life

    void moveTo(POINT onScreen);
    void press(bool right = false) const;
    void letGo(bool right = false) const;
    void click(POINT onScreen, bool right = false);
    /// Picks up at the one place and lets go at the other; `before` that, it is over there.
    void drag(POINT from, POINT to, const std::function<void()>& before = {});
    void hold(int key) const;
    void letGoOf(int key) const;
    void key(int key) const;
    void type(std::u16string_view text) const;

    /// Until the form has dealt with all that was done.
    void settle() const;
    /// Until this is so; whether it came to be. A test fails that waits in vain.
    bool await(const std::string& what, const std::function<bool()>& isSo) const;
    /// In the form's thread, also while a menu or a dialog stands open.
    void ask(const std::function<void()>& question) const;
    /// Waits for a menu and clicks on one of its entries.
    void choose(const wchar_t* entry, const std::function<void()>& before = {});
    /// As a file in the folder that ZANDOR_PICTURES names, of the form and what is above it.
    void picture(const std::string& name) const;

private:
    static LRESULT CALLBACK hear(HWND window, UINT message, WPARAM w, LPARAM l);

    const HWND mForm;
    HWND mEar;
    POINT mAt{};                ///< where the mouse is
    std::atomic<int> mIdle = 0; ///< how often the form had nothing to do
};
