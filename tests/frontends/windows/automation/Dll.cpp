#include "Dll.h"

#include <gtest/gtest.h>

using namespace zandor::automation;

Dll& Dll::get() {
    static Dll dll;
    return dll;
}

Dll::Dll() : mModule(LoadLibraryW(ZANDOR_CONTROL_DLL)) {
    EXPECT_TRUE(mModule) << "error " << GetLastError();
}

std::wstring Dll::path() const {
    wchar_t path[MAX_PATH];
    return {path, GetModuleFileNameW(mModule, path, MAX_PATH)};
}

FARPROC Dll::find(const char* name) const {
    const FARPROC found = GetProcAddress(mModule, name);
    EXPECT_TRUE(found) << name;
    return found;
}

bool Dll::canUnload() const {
    return entry<HRESULT(STDAPICALLTYPE*)()>("DllCanUnloadNow")() == S_OK;
}

Held<IClassFactory> Dll::factoryOf(const GUID& id) const {
    Held<IClassFactory> factory;
    entry<HRESULT(STDAPICALLTYPE*)(REFCLSID, REFIID, void**)>("DllGetClassObject")(
        id, IID_IClassFactory, factory.slotOfAny());
    return factory;
}

Held<_Zandor> newControl() {
    auto control = Dll::get().make<_Zandor>(ids::control);
    EXPECT_TRUE(control);
    short off = 0;
    if (control) control->put_DebugSwitch(&off);
    return control;
}

Held<_ZDQuery> newQuery() {
    auto query = Dll::get().make<_ZDQuery>(ids::query);
    EXPECT_TRUE(query);
    return query;
}
