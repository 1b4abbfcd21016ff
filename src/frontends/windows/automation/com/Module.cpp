#include "frontends/windows/automation/com/Module.h"

#include "frontends/windows/automation/com/Failure.h"

#include <atomic>

namespace zandor::automation::module {

namespace {

HINSTANCE loaded = nullptr;
std::atomic<long> kept = 0;

} // namespace

void remember(HINSTANCE instance) { loaded = instance; }

HINSTANCE instance() { return loaded; }

std::wstring path() {
    std::wstring path(MAX_PATH, L'\0');
    for (;;) {
        const DWORD length =
            GetModuleFileNameW(loaded, path.data(), static_cast<DWORD>(path.size()));
        if (length < path.size()) {
            path.resize(length);
            return path;
        }
        path.resize(path.size() * 2);
    }
}

void retain() { ++kept; }

void release() { --kept; }

bool isIdle() { return kept == 0; }

Held<ITypeLib> typeLibrary(int number) {
    Held<ITypeLib> library;
    const std::wstring place = path() + L'\\' + std::to_wstring(number);
    require(LoadTypeLibEx(place.c_str(), REGKIND_NONE, library.slot()));
    return library;
}

Held<ITypeInfo> typeInfo(REFGUID id) {
    // The system keeps a library that is loaded, so that this is a look-up.
    for (const int number : {1, 2}) {
        Held<ITypeInfo> info;
        if (SUCCEEDED(typeLibrary(number)->GetTypeInfoOfGuid(id, info.slot()))) return info;
    }
    throw platform::errors::automation(u"The type library is missing");
}

} // namespace zandor::automation::module
