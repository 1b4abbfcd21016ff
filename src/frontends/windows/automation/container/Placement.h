#pragma once

#include "frontends/windows/automation/com/Held.h"
#include "frontends/windows/automation/container/Ambience.h"
#include "frontends/windows/automation/control/House.h"

#include <functional>

namespace zandor::automation {

/// Where the control stands: in the window that nobody sees, in place in a container's, or there
/// with the container's keyboard and menus. Each call of a container may come back, close the
/// control or let go of it; what was under way then ends with E_ABORT.
class Placement {
public:
    /// `changed` hears when a picture of the control would be another one.
    Placement(IUnknown& whole, House& house, std::function<void()> changed);
    Placement(const Placement&) = delete;
    Placement& operator=(const Placement&) = delete;

    /// The control ends: nobody is asked any more.
    void end();

    Ambience& ambience() { return mAmbience; }
    const Held<IOleClientSite>& site() const { return mSite; }
    const Held<IOleControlSite>& controlSite() const { return mControlSite; }
    /// nullptr: the control is in none any more.
    void setSite(IOleClientSite* site);
    /// The control's own window; nullptr once it has gone with its container's.
    HWND window() const { return mHouse.shown().window(); }
    /// Whether a key means something in the control.
    bool hasUseFor(const MSG& message) const { return mHouse.shown().hasUseFor(message); }

    bool isActive() const { return bool(mInPlace); }
    /// Shows the control in the container's window, and with `ui` gives it the keyboard.
    HRESULT activate(bool ui);
    void deactivate();
    void deactivateUi();
    /// Takes it from the screen, active as it is.
    void hide();

    /// In the container's pixels; of it only what is within the clip is seen.
    void setRects(const RECT& place, const RECT& clip) const;
    /// In hundredths of a millimetre.
    SIZE extent() const { return mExtent; }
    void setExtent(SIZE extent);
    /// As large as a picture of it is, in pixels.
    SIZE pixels() const;

    /// Tab has left the last stop, by this message if one is known. Whether the focus has gone on.
    bool leave(bool next);
    /// A key that the container is to be asked about, before anybody else has it.
    bool offerToContainer(MSG& message) const;

private:
    HRESULT stand(IOleInPlaceSite& site);
    HRESULT activateUi();
    void focusChanged(bool has);
    /// What the frame has without a mode is dead while the control has a box, a dialog or a menu;
    /// what comes back ends that.
    std::function<void()> disableFrame() const;
    void takeFocus() const;
    bool hasFocus() const;
    void goBack() const;

    IUnknown& mWhole;
    House& mHouse;
    const std::function<void()> mChanged;
    Ambience mAmbience;
    Held<IOleClientSite> mSite;
    Held<IOleControlSite> mControlSite;
    Held<IOleInPlaceSite> mInPlace; ///< while it is active
    Held<IOleInPlaceFrame> mFrame;
    Held<IOleInPlaceUIWindow> mDocument;
    bool mHasUi = false;
    SIZE mExtent;
};

} // namespace zandor::automation
