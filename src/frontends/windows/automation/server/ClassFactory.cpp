#include "frontends/windows/automation/server/ClassFactory.h"

#include "frontends/windows/automation/com/Failure.h"

namespace zandor::automation {

STDMETHODIMP ClassFactory::CreateInstance(IUnknown* outer, REFIID iid, void** object) {
    if (!object) return E_POINTER;
    *object = nullptr;
    if (outer) return CLASS_E_NOAGGREGATION;
    HRESULT found = E_NOINTERFACE;
    const HRESULT made = answer([&] { found = mMade.make()->QueryInterface(iid, object); });
    return FAILED(made) ? made : found;
}

STDMETHODIMP ClassFactory::LockServer(BOOL lock) {
    if (lock)
        module::retain();
    else
        module::release();
    return S_OK;
}

} // namespace zandor::automation
