#include "frontends/windows/automation/control/Safety.h"

#include "frontends/windows/automation/com/Held.h"

namespace zandor::automation {

namespace {

constexpr DWORD safety = INTERFACESAFE_FOR_UNTRUSTED_CALLER | INTERFACESAFE_FOR_UNTRUSTED_DATA;

} // namespace

bool Safety::has(REFIID iid) const {
    Held<IUnknown> there;
    return SUCCEEDED(whole().QueryInterface(iid, there.slotOfAny()));
}

STDMETHODIMP Safety::GetInterfaceSafetyOptions(REFIID iid, DWORD* supported, DWORD* enabled) {
    if (!supported || !enabled) return E_POINTER;
    *supported = *enabled = 0;
    if (!has(iid)) return E_NOINTERFACE;
    *supported = safety;
    *enabled = mEnabled;
    return S_OK;
}

STDMETHODIMP Safety::SetInterfaceSafetyOptions(REFIID iid, DWORD mask, DWORD enabled) {
    if (!has(iid)) return E_NOINTERFACE;
    if (mask & enabled & ~safety) return E_FAIL;
    mEnabled = (mEnabled & ~mask) | (enabled & mask);
    return S_OK;
}

} // namespace zandor::automation
