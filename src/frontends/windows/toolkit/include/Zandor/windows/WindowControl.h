#pragma once

#include <Zandor/Zandor.h>
#include <Zandor/comforts/Comforts.h>
#include <Zandor/platform/Toolkit.h>
#include <Zandor/platform/Words.h>

#include <functional>
#include <memory>
#include <optional>

#include <windows.h>

// Names of ours, which the system takes for two forms of its own.
#undef MessageBox
#undef RegisterWindowMessage
#undef SendMessage

namespace zandor::platform::windows {

/// One control in a window of its own, a child of its host's, with its toolkit and its comforts. Of
/// one thread, which runs the host's message loop; the loop needs nothing of ours, for keys that a
/// dialog's loop would take are claimed by WM_GETDLGCODE. What the control stands on is kept until
/// the last of its procedures has returned, so that a host may end it at any time.
class WindowControl {
public:
    /// The window begins without a size and hidden, until `setBounds` and `show`. Library and
    /// events outlive this; `events` is told what the comforts leave of them. `keeper` is held
    /// until the last message of the last of its windows has been dealt with, which may be after
    /// this has gone. std::bad_alloc where the system has no window to give.
    WindowControl(HWND parent, TalvikZandorLib::Library& library,
                  TalvikDBxZandor::ZandorEvents& events, std::shared_ptr<void> keeper = {});
    WindowControl(const WindowControl&) = delete;
    WindowControl& operator=(const WindowControl&) = delete;
    /// Ends the control; its closing boxes are shown. Its boxes, its dialog, its menu and its drag
    /// end, too, untold.
    ~WindowControl();

    TalvikDBxZandor::Zandor& control() const; ///< lives as long as this
    Toolkit& toolkit() const;                 ///< lives as long as this
    comforts::Comforts& comforts() const;     ///< all off at first

    /// The control's own window, which the message "TALVIKDISABLEVELT" is sent to; nullptr once it
    /// has gone with its host's. A host asks for a paint of the control by RedrawWindow with
    /// RDW_INTERNALPAINT.
    HWND window() const;
    /// In the host's pixels. The control lays itself out before this returns.
    void setBounds(const RECT& place) const;
    void show(bool value) const; ///< with it comes a paint, from the message loop
    /// Of the host's surroundings; the host keeps its handle. nullptr changes nothing: at first it
    /// is the font of the system's message boxes.
    void setFont(HFONT font) const;
    /// What the canvas and its lines are painted with; none: the system's own.
    void setColours(std::optional<COLORREF> ground, std::optional<COLORREF> ink) const;
    /// Message boxes are left out.
    void setSilent(bool value) const;
    /// A picture of the control as large as it is, shown or not: from the device's origin on.
    void print(HDC dc) const;
    /// Of control, comforts and toolkit.
    void setWords(const Words& words) const;
    /// Tab or Shift+Tab has left the last stop; the answer says whether the focus has gone on.
    /// Unset: the next tab stop of the window around has it.
    void onLeave(std::function<bool(bool next)> leave) const;
    /// The focus has come into the control from elsewhere, or has gone there.
    void onFocus(std::function<void(bool has)> change) const;
    /// A box, a dialog or a menu of the control is about to open; what comes back is called when it
    /// has closed, even if the control has ended meanwhile.
    void onModal(std::function<std::function<void()>()> open) const;
    /// Whether a message is a key that means something where it goes in the control: what is typed
    /// and what walks, Enter and Delete, Escape where there is something to leave, and the editing
    /// keys while an editor is open. A host with keys of its own in its message loop asks before.
    bool hasUseFor(const MSG& message) const;
    /// The host's window is about to go: boxes shown from now on stand on their own.
    void close() const;

private:
    struct House;
    std::shared_ptr<House> mHouse;
};

} // namespace zandor::platform::windows
