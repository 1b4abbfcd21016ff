#include "frontends/windows/automation/server/Registration.h"

#include "frontends/windows/automation/com/Failure.h"
#include "frontends/windows/automation/com/Module.h"
#include "frontends/windows/automation/server/entries.h"

#include <algorithm>

namespace zandor::automation::registration {

namespace {

using std::wstring;

/// A key of the registry, closed at the end.
class Key {
public:
    Key(HKEY above, const wstring& path, REGSAM access) {
        if (RegOpenKeyExW(above, path.c_str(), 0, access, &mKey) != ERROR_SUCCESS) mKey = nullptr;
    }
    Key(const Key&) = delete;
    Key& operator=(const Key&) = delete;
    ~Key() {
        if (mKey) RegCloseKey(mKey);
    }
    HKEY get() const { return mKey; }
    explicit operator bool() const { return mKey != nullptr; }

    bool isEmpty() const {
        DWORD below = 0;
        DWORD values = 0;
        RegQueryInfoKeyW(mKey, nullptr, nullptr, nullptr, &below, nullptr, nullptr, &values,
                         nullptr, nullptr, nullptr, nullptr);
        return below == 0 && values == 0;
    }
    DWORD below() const {
        DWORD count = 0;
        RegQueryInfoKeyW(mKey, nullptr, nullptr, nullptr, &count, nullptr, nullptr, nullptr,
                         nullptr, nullptr, nullptr, nullptr);
        return count;
    }

private:
    HKEY mKey = nullptr;
};

constexpr const wchar_t* classes = L"Software\\Classes\\";

LSTATUS write(HKEY root, const Entry& entry) {
    HKEY key = nullptr;
    const LSTATUS made = RegCreateKeyExW(root, (classes + entry.key).c_str(), 0, nullptr, 0,
                                         KEY_SET_VALUE, nullptr, &key, nullptr);
    if (made != ERROR_SUCCESS) return made;
    const auto size = static_cast<DWORD>((entry.text.size() + 1) * sizeof(wchar_t));
    const LSTATUS set =
        RegSetValueExW(key, entry.name.empty() ? nullptr : entry.name.c_str(), 0, REG_SZ,
                       reinterpret_cast<const BYTE*>(entry.text.c_str()), size);
    RegCloseKey(key);
    return set;
}

/// Takes a key away, and those above it, as far as nothing stands in them.
void prune(HKEY root, wstring path) {
    while (!path.empty()) {
        {
            const Key key(root, classes + path, KEY_READ);
            if (key && !key.isEmpty()) return;
        }
        RegDeleteKeyW(root, (classes + path).c_str());
        const auto end = path.find_last_of(L'\\');
        path.resize(end == wstring::npos ? 0 : end);
    }
}

void erase(HKEY root, const Entry& entry) {
    if (const Key key(root, classes + entry.key, KEY_SET_VALUE); key)
        RegDeleteValueW(key.get(), entry.name.empty() ? nullptr : entry.name.c_str());
    prune(root, entry.key);
}

/// Whether the library of the other word size stands there.
bool isShared(HKEY root) {
    const std::vector<wstring> keys = platformKeys();
    return std::any_of(keys.begin(), keys.end(), [&](const wstring& path) {
        const Key key(root, classes + path, KEY_READ);
        return key && key.below() > 0;
    });
}

} // namespace

HRESULT write(HKEY root) {
    LSTATUS failed = ERROR_SUCCESS;
    const HRESULT described = answer([&] {
        for (const Entry& entry : entriesFor(module::path())) {
            failed = write(root, entry);
            if (failed != ERROR_SUCCESS) return;
        }
    });
    if (SUCCEEDED(described) && failed == ERROR_SUCCESS) return S_OK;
    erase(root);
    return FAILED(described) ? described : HRESULT_FROM_WIN32(static_cast<DWORD>(failed));
}

HRESULT erase(HKEY root) {
    return answer([&] {
        std::vector<Entry> entries = entriesFor(module::path());
        // What stands below goes before what it stands in.
        std::reverse(entries.begin(), entries.end());
        for (const Entry& entry : entries)
            if (!entry.shared) erase(root, entry);
        if (isShared(root)) return;
        for (const Entry& entry : entries)
            if (entry.shared) erase(root, entry);
    });
}

} // namespace zandor::automation::registration
