#include "frontends/windows/automation/container/Ambience.h"

namespace zandor::automation {

namespace {

/// A property of a site; nothing where it has none.
std::optional<Value> ask(IDispatch& site, DISPID which) {
    DISPPARAMS none{};
    Value value;
    const HRESULT said = site.Invoke(which, IID_NULL, LOCALE_USER_DEFAULT, DISPATCH_PROPERTYGET,
                                     &none, &value, nullptr, nullptr);
    if (FAILED(said)) return {};
    return std::optional<Value>(std::move(value));
}

std::optional<VARIANT_BOOL> askFlag(IDispatch& site, DISPID which) {
    auto value = ask(site, which);
    Value flag;
    if (!value || FAILED(VariantChangeType(&flag, &*value, 0, VT_BOOL))) return {};
    return flag.boolVal;
}

std::optional<OLE_COLOR> askColour(IDispatch& site, DISPID which) {
    const auto value = ask(site, which);
    // The system's own colours are beyond the positive numbers.
    if (!value || (value->vt != VT_I4 && value->vt != VT_UI4)) return {};
    return static_cast<OLE_COLOR>(value->ulVal);
}

std::optional<COLORREF> translated(std::optional<OLE_COLOR> colour) {
    COLORREF found = 0;
    if (!colour || FAILED(OleTranslateColor(*colour, nullptr, &found))) return {};
    return found;
}

} // namespace

void Ambience::read(IUnknown* site, DISPID which) {
    const auto says = Held<IDispatch>::of(site);
    if (!says) return;
    const auto isAsked = [which](DISPID one) { return which == one || which == DISPID_UNKNOWN; };
    if (isAsked(DISPID_AMBIENT_USERMODE))
        if (const auto used = askFlag(*says.get(), DISPID_AMBIENT_USERMODE))
            setDesigning(*used == VARIANT_FALSE);
    if (isAsked(DISPID_AMBIENT_UIDEAD))
        if (const auto dead = askFlag(*says.get(), DISPID_AMBIENT_UIDEAD))
            setDead(*dead != VARIANT_FALSE);
    if (isAsked(DISPID_AMBIENT_FONT))
        if (const auto font = ask(*says.get(), DISPID_AMBIENT_FONT);
            font && (font->vt == VT_DISPATCH || font->vt == VT_UNKNOWN))
            setFont(font->punkVal);
    if (isAsked(DISPID_AMBIENT_BACKCOLOR) || isAsked(DISPID_AMBIENT_FORECOLOR))
        setColours(askColour(*says.get(), DISPID_AMBIENT_BACKCOLOR),
                   askColour(*says.get(), DISPID_AMBIENT_FORECOLOR));
}

void Ambience::setFont(IUnknown* font) const {
    const auto given = Held<IFont>::of(font);
    HFONT handle = nullptr;
    if (given && SUCCEEDED(given->get_hFont(&handle)) && handle) mHouse.shown().setFont(handle);
}

void Ambience::setColours(std::optional<OLE_COLOR> ground, std::optional<OLE_COLOR> ink) {
    if (ground) mGround = translated(ground);
    if (ink) mInk = translated(ink);
    mHouse.shown().setColours(mGround, mInk);
}

void Ambience::setDesigning(bool value) {
    mDesigning = value;
    mHouse.shown().setSilent(value);
    enable();
}

void Ambience::setDead(bool value) {
    mDead = value;
    enable();
}

void Ambience::enable() const {
    if (const HWND window = mHouse.shown().window()) EnableWindow(window, !mDesigning && !mDead);
}

} // namespace zandor::automation
