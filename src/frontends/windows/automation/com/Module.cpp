#include "frontends/windows/automation/com/Module.h"

#include "frontends/windows/automation/com/Failure.h"

#include <array>
#include <atomic>
#include <mutex>

namespace zandor::automation::module {

namespace {

HINSTANCE loaded = nullptr;
std::atomic<long> kept = 0;

// Held as long as anything keeps the module: a system that drops a library with its last reference
// may do so while another thread finds it.
std::mutex guard;
std::array<Held<ITypeLib>, 2> libraries;

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

void release() {
    if (--kept != 0) return;
    const std::lock_guard lock(guard);
    libraries = {};
}

bool isIdle() { return kept == 0; }

Held<ITypeLib> typeLibrary(int number) {
    const std::lock_guard lock(guard);
    Held<ITypeLib>& known = libraries.at(static_cast<std::size_t>(number - 1));
    if (known) return known;
    Held<ITypeLib> library;
    const std::wstring place = path() + L'\\' + std::to_wstring(number);
    require(LoadTypeLibEx(place.c_str(), REGKIND_NONE, library.slot()));
    if (!isIdle()) known = library;
    return library;
}

Held<ITypeInfo> typeInfo(REFGUID id) {
    for (const int number : {1, 2}) {
        Held<ITypeInfo> info;
        if (SUCCEEDED(typeLibrary(number)->GetTypeInfoOfGuid(id, info.slot()))) return info;
    }
    throw platform::errors::automation(u"The type library is missing");
}

} // namespace zandor::automation::module
