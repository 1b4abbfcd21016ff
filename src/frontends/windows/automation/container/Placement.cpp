#include "frontends/windows/automation/container/Placement.h"

#include "frontends/windows/automation/container/himetric.h"

#include <utility>

namespace zandor::automation {

namespace {

/// Until somebody says otherwise: 640 by 480 logical pixels.
constexpr SIZE firstExtent{16933, 12700};

DWORD modifiers() {
    const auto held = [](int key, DWORD flag) { return GetKeyState(key) < 0 ? flag : 0; };
    return held(VK_SHIFT, 1) | held(VK_CONTROL, 2) | held(VK_MENU, 4);
}

} // namespace

Placement::Placement(IUnknown& whole, House& house, std::function<void()> changed)
    : mWhole(whole), mHouse(house), mChanged(std::move(changed)), mAmbience(house),
      mExtent(firstExtent) {
    const auto& shown = mHouse.shown();
    shown.onFocus([this](bool has) { focusChanged(has); });
    shown.onLeave([this](bool next) { return leave(next); });
    shown.onModal([this] { return disableFrame(); });
    const SIZE size = toPixels(mExtent);
    shown.setBounds({0, 0, size.cx, size.cy});
}

void Placement::end() {
    mHouse.shown().onFocus(nullptr);
    mHouse.shown().onLeave(nullptr);
    mHouse.shown().onModal(nullptr);
    mHasUi = false;
    mInPlace = {};
    mFrame = {};
    mDocument = {};
    mControlSite = {};
    mSite = {};
}

void Placement::setSite(IOleClientSite* site) {
    if (site == mSite.get()) return;
    deactivate();
    mSite = site;
    mControlSite = Held<IOleControlSite>::of(site);
    mAmbience.read(site, DISPID_UNKNOWN);
}

HRESULT Placement::activate(bool ui) {
    if (!window()) return E_UNEXPECTED;
    if (mInPlace) {
        mHouse.shown().show(true);
    } else {
        const auto site = Held<IOleInPlaceSite>::of(mSite.get());
        if (!site) return E_NOINTERFACE;
        if (site->CanInPlaceActivate() != S_OK) return E_FAIL;
        if (mInPlace || !mSite) return E_ABORT;
        mInPlace = site;
        const HRESULT allowed = site->OnInPlaceActivate();
        if (FAILED(allowed)) {
            mInPlace = {};
            return allowed;
        }
        if (mInPlace.get() != site.get()) return E_ABORT;
        const HRESULT stands = stand(*site.get());
        if (FAILED(stands)) {
            deactivate();
            return stands;
        }
    }
    // At design time the keyboard stays the container's.
    return ui && !mAmbience.isDesigning() ? activateUi() : S_OK;
}

HRESULT Placement::stand(IOleInPlaceSite& site) {
    HWND around = nullptr;
    const HRESULT said = site.GetWindow(&around);
    if (FAILED(said)) return said;
    Held<IOleInPlaceFrame> frame;
    Held<IOleInPlaceUIWindow> document;
    RECT place{};
    RECT clip{};
    OLEINPLACEFRAMEINFO info{};
    info.cb = sizeof info;
    const HRESULT known =
        site.GetWindowContext(frame.slot(), document.slot(), &place, &clip, &info);
    if (FAILED(known)) return known;
    if (mInPlace.get() != &site || !window()) return E_ABORT;
    mFrame = frame;
    mDocument = document;
    if (!SetParent(window(), around)) return E_UNEXPECTED;
    setRects(place, clip);
    mHouse.shown().show(true);
    return mInPlace.get() == &site ? S_OK : E_ABORT;
}

HRESULT Placement::activateUi() {
    if (!mInPlace) return E_UNEXPECTED;
    if (!std::exchange(mHasUi, true)) {
        const Held<IOleInPlaceSite> site = mInPlace;
        const HRESULT allowed = site->OnUIActivate();
        if (FAILED(allowed)) {
            mHasUi = false;
            return allowed;
        }
        if (!mHasUi || mInPlace.get() != site.get()) return E_ABORT;
        const auto active = Held<IOleInPlaceActiveObject>::of(&mWhole);
        for (const Held<IOleInPlaceUIWindow>& around :
             {Held<IOleInPlaceUIWindow>(mFrame.get()), mDocument}) {
            if (!around || !mHasUi) continue;
            around->SetActiveObject(active.get(), L"Zandor");
            // It has no tools that stand at the window's border.
            around->SetBorderSpace(nullptr);
        }
        if (!mHasUi) return E_ABORT;
    }
    takeFocus();
    return mHasUi ? S_OK : E_ABORT;
}

void Placement::deactivateUi() {
    if (!std::exchange(mHasUi, false)) return;
    const Held<IOleInPlaceSite> site = mInPlace;
    for (const Held<IOleInPlaceUIWindow>& around :
         {Held<IOleInPlaceUIWindow>(mFrame.get()), mDocument})
        if (around) around->SetActiveObject(nullptr, nullptr);
    if (site) site->OnUIDeactivate(FALSE);
}

void Placement::deactivate() {
    deactivateUi();
    const Held<IOleInPlaceSite> site = std::exchange(mInPlace, {});
    if (!site) return;
    mFrame = {};
    mDocument = {};
    goBack();
    site->OnInPlaceDeactivate();
}

void Placement::goBack() const {
    const HWND own = window();
    if (!own) return;
    if (hasFocus()) SetFocus(GetAncestor(own, GA_PARENT));
    mHouse.shown().show(false);
    SetWindowRgn(own, nullptr, FALSE);
    SetParent(own, mHouse.hidden());
}

void Placement::hide() {
    deactivateUi();
    if (!mInPlace) return;
    if (hasFocus()) SetFocus(GetAncestor(window(), GA_PARENT));
    mHouse.shown().show(false);
}

void Placement::setRects(const RECT& place, const RECT& clip) const {
    const HWND own = window();
    if (!own) return;
    RECT seen{};
    IntersectRect(&seen, &place, &clip);
    if (EqualRect(&seen, &place)) {
        SetWindowRgn(own, nullptr, TRUE);
    } else {
        OffsetRect(&seen, -place.left, -place.top);
        SetWindowRgn(own, CreateRectRgnIndirect(&seen), TRUE); // which is the system's then
    }
    mHouse.shown().setBounds(place);
}

void Placement::setExtent(SIZE extent) {
    mExtent = extent;
    if (isActive()) return; // its container says where
    const SIZE size = toPixels(extent);
    mHouse.shown().setBounds({0, 0, size.cx, size.cy});
    mChanged();
}

SIZE Placement::pixels() const {
    RECT area{};
    if (const HWND own = window()) GetClientRect(own, &area);
    return {area.right, area.bottom};
}

void Placement::focusChanged(bool has) {
    const Held<IUnknown> meanwhile(&mWhole);
    if (has && mInPlace) activateUi();
    if (const Held<IOleControlSite> site = mControlSite) site->OnFocus(has);
}

std::function<void()> Placement::disableFrame() const {
    const Held<IUnknown> meanwhile(&mWhole);
    // The same one is enabled again, wherever the control stands by then.
    const Held<IOleInPlaceFrame> frame = mFrame;
    if (!frame) return {};
    frame->EnableModeless(FALSE);
    return [frame] { frame->EnableModeless(TRUE); };
}

bool Placement::hasFocus() const {
    const HWND focus = GetFocus();
    return focus && (focus == window() || IsChild(window(), focus));
}

void Placement::takeFocus() const {
    if (window() && !hasFocus()) SetFocus(window());
}

bool Placement::leave(bool next) {
    const Held<IUnknown> meanwhile(&mWhole);
    MSG tab{};
    tab.hwnd = GetFocus();
    tab.message = WM_KEYDOWN;
    tab.wParam = VK_TAB;
    tab.lParam = 1;
    if (offerToContainer(tab)) return true;
    const HWND own = window();
    if (!own) return true;
    const HWND to = GetNextDlgTabItem(GetAncestor(own, GA_ROOT), own, !next);
    if (!to || to == own || IsChild(own, to)) return false;
    SetFocus(to);
    return true;
}

bool Placement::offerToContainer(MSG& message) const {
    const Held<IOleControlSite> site = mControlSite;
    return site && site->TranslateAccelerator(&message, modifiers()) == S_OK;
}

} // namespace zandor::automation
