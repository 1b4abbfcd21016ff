#include "frontends/windows/automation/com/Module.h"
#include "frontends/windows/automation/server/ClassFactory.h"
#include "frontends/windows/automation/server/Registration.h"

#include <new>
#include <string_view>

// What the system asks the library for.

using namespace zandor::automation;

extern "C" {

BOOL WINAPI DllMain(HINSTANCE instance, DWORD reason, void*) {
    if (reason == DLL_PROCESS_ATTACH) {
        module::remember(instance);
        DisableThreadLibraryCalls(instance);
    }
    return TRUE;
}

STDAPI DllGetClassObject(REFCLSID id, REFIID iid, void** object) {
    if (!object) return E_POINTER;
    *object = nullptr;
    for (const CreatableClass& made : creatableClasses()) {
        if (made.id != id) continue;
        const Held<IClassFactory> factory(new (std::nothrow) ClassFactory(made));
        return factory ? factory->QueryInterface(iid, object) : E_OUTOFMEMORY;
    }
    return CLASS_E_CLASSNOTAVAILABLE;
}

STDAPI DllCanUnloadNow() { return module::isIdle() ? S_OK : S_FALSE; }

STDAPI DllRegisterServer() { return registration::write(HKEY_LOCAL_MACHINE); }

STDAPI DllUnregisterServer() { return registration::erase(HKEY_LOCAL_MACHINE); }

/// `regsvr32 /n /i:user ZandorControl.dll`: for the user alone; without "user" for everybody.
STDAPI DllInstall(BOOL install, const wchar_t* how) {
    const std::wstring_view asked = how ? how : L"";
    if (!asked.empty() && asked != L"user") return E_INVALIDARG;
    const HKEY root = asked.empty() ? HKEY_LOCAL_MACHINE : HKEY_CURRENT_USER;
    return install ? registration::write(root) : registration::erase(root);
}

} // extern "C"
