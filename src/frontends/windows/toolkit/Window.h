#pragma once

#include "frontends/windows/toolkit/system.h"

#include <Zandor/platform/Control.h>

#include <memory>
#include <optional>

namespace zandor::platform::windows {

class Surroundings;

/// A message as a window gets it.
struct Message {
    UINT id = 0;
    WPARAM w = 0;
    LPARAM l = 0;

    /// Of a message of the mouse, in the window's own pixels.
    POINT at() const { return {GET_X_LPARAM(l), GET_Y_LPARAM(l)}; }
};

/// A window of ours, or one of the system's whose messages pass by here first. The object is held
/// by whoever made it and by each of its messages that is being dealt with, so that a handler may
/// end it; the system's window goes when the last of those has returned.
class Window : public std::enable_shared_from_this<Window> {
public:
    Window(const Window&) = delete;
    Window& operator=(const Window&) = delete;
    virtual ~Window();

    /// nullptr once the system's window has gone, with its parent or by itself.
    HWND hwnd() const { return mHandle; }
    const String& name() const { return mName; }
    void setName(StringView name) { mName = name; }
    Surroundings& surroundings() const { return *mSurroundings; }

    /// Leaves the screen for good; whoever still runs in it comes to an end.
    void end();
    /// Whether it has not been told to end.
    bool isAlive() const { return mHandle && !mEnded; }

    void setFont(const std::optional<Font>& font);
    /// Its own; the control's where it has none.
    Font font() const;
    HFONT fontHandle() const;
    bool hasOwnFont() const { return mFont.has_value(); }
    /// The control's font, or the monitor, is another.
    void applyFont();

    void show(bool value);
    bool isShown() const { return mHandle && GetWindowLongW(mHandle, GWL_STYLE) & WS_VISIBLE; }
    void raise();
    void place(const RECT& place);
    /// In its parent.
    RECT placeInParent() const;
    /// In twips, exactly as they were set; as the window stands until they were.
    Bounds bounds() const;
    void setBounds(const Bounds& bounds);
    /// The monitor is another.
    void applyScale();
    /// What it stands in places it from now on.
    void beLaidOut() { mLaidOut = true; }
    bool isLaidOut() const { return mLaidOut; }
    void enable(bool value);
    bool isEnabled() const;
    RECT area() const;
    void repaint() const;

    /// The window of ours behind a handle; nullptr: it is none.
    static Window* of(HWND handle);
    /// The same for the nearest one that a handle stands in.
    static Window* around(HWND handle);

    /// What its parent was told of it: WM_COMMAND, WM_DRAWITEM, WM_HSCROLL and the like.
    virtual std::optional<LRESULT> told(const Message&) { return {}; }
    /// The size that it needs, in pixels, where it is laid out by what it stands in.
    virtual SIZE wanted() const { return {}; }
    /// Whether a key that goes down with this Shift means something here, be it that it is typed;
    /// who has keys of its own asks before.
    virtual bool hasUseFor(WPARAM key, std::int16_t shift) const;
    /// The keyboard's focus has come to it from another part of the control.
    virtual void gotFocus() {}

protected:
    explicit Window(std::shared_ptr<Surroundings> surroundings);

    /// Makes a window of our own class, above its siblings.
    void create(HWND parent, DWORD style, DWORD extended = 0);
    /// Makes one of a class of the system's, above its siblings.
    void createNative(const wchar_t* nativeClass, HWND parent, DWORD style, DWORD extended = 0,
                      const String& text = {});
    /// Takes over a window that the system has made.
    void adopt(HWND handle);

    virtual LRESULT handle(const Message& message);
    /// As the system deals with it.
    LRESULT passOn(const Message& message) const;
    /// Nobody is to be told of anything any more.
    virtual void forget() {}
    virtual void fontChanged() {}

private:
    static LRESULT CALLBACK procedure(HWND handle, UINT message, WPARAM w, LPARAM l);
    LRESULT dispatch(const Message& message);
    void destroyIfIdle();
    void lostFocus(HWND to);
    void tellHostOfFocus(const Message& message) const;

    const std::shared_ptr<Surroundings> mSurroundings;
    std::shared_ptr<Window> mSelf; ///< from its end until the system's window has gone
    HWND mHandle = nullptr;
    WNDPROC mNative = nullptr;
    String mName;
    std::optional<Font> mFont;
    std::optional<Bounds> mBounds;
    bool mLaidOut = false;
    int mDepth = 0; ///< of messages being dealt with
    bool mEnded = false;
};

/// Button of the platform's events: what a message of the mouse is about; 0: none.
std::int16_t buttonOf(UINT message);
/// The buttons held, added up.
std::int16_t buttonsOf(WPARAM keys);
/// Shift of the platform's events, as the keyboard is at the message.
std::int16_t shiftState();
/// The same, of a message of the mouse.
std::int16_t shiftState(WPARAM keys);
bool isPress(UINT message);
/// Of the keys that others have no use for, those of what is typed in: it is left, a list drops
/// down, and its text is edited.
bool hasUseAsEditor(WPARAM key, std::int16_t shift);
bool isRelease(UINT message);

} // namespace zandor::platform::windows
