#include "Dll.h"

#include <gtest/gtest.h>

#include <map>
#include <set>
#include <string>

using namespace zandor::automation;

namespace {

/// Keys with their values, as an export has them.
using Export = std::map<std::wstring, std::wstring>;

void read(HKEY root, const std::wstring& path, Export& found) {
    HKEY key = nullptr;
    if (RegOpenKeyExW(root, path.c_str(), 0, KEY_READ, &key) != ERROR_SUCCESS) return;
    found[path] = L"";
    wchar_t name[256];
    for (DWORD n = 0;; ++n) {
        DWORD length = 256;
        DWORD type = 0;
        BYTE data[2048];
        DWORD size = sizeof data;
        if (RegEnumValueW(key, n, name, &length, nullptr, &type, data, &size) != ERROR_SUCCESS)
            break;
        found[path + L"@" + name] =
            std::to_wstring(type) + L":" +
            std::wstring(reinterpret_cast<const wchar_t*>(data), size / sizeof(wchar_t));
    }
    for (DWORD n = 0;; ++n) {
        DWORD length = 256;
        if (RegEnumKeyExW(key, n, name, &length, nullptr, nullptr, nullptr, nullptr) !=
            ERROR_SUCCESS)
            break;
        read(root, path + L"\\" + name, found);
    }
    RegCloseKey(key);
}

/// All that the classes of a root are, of everybody or of the user.
Export exported(HKEY root) {
    Export found;
    read(root, L"Software\\Classes", found);
    return found;
}

std::wstring valueAt(const Export& all, const std::wstring& place) {
    const auto found = all.find(L"Software\\Classes\\" + place);
    if (found == all.end()) return L"(none)";
    return found->second.substr(2, found->second.size() - 3); // without the type and the end
}

std::wstring spelled(const GUID& id) {
    wchar_t text[40];
    StringFromGUID2(id, text, 40);
    return text;
}

bool isThere(const std::wstring& path) {
    HKEY key = nullptr;
    if (RegOpenKeyExW(HKEY_LOCAL_MACHINE, path.c_str(), 0, KEY_READ, &key) != ERROR_SUCCESS)
        return false;
    RegCloseKey(key);
    return true;
}

using Registrar = HRESULT(STDAPICALLTYPE*)();
using Installer = HRESULT(STDAPICALLTYPE*)(BOOL, const wchar_t*);

HRESULT enrol() { return Dll::get().entry<Registrar>("DllRegisterServer")(); }
HRESULT strike() { return Dll::get().entry<Registrar>("DllUnregisterServer")(); }
HRESULT install(bool there, const wchar_t* how) {
    return Dll::get().entry<Installer>("DllInstall")(there, how);
}

} // namespace

TEST(Registering, SaysWhereTheControlIsAndWhatItIs) {
    ASSERT_EQ(enrol(), S_OK);
    const Export all = exported(HKEY_LOCAL_MACHINE);
    const std::wstring key = L"CLSID\\" + spelled(ids::control);
    EXPECT_EQ(valueAt(all, key + L"\\InprocServer32@"), Dll::get().path());
    EXPECT_EQ(valueAt(all, key + L"\\InprocServer32@ThreadingModel"), L"Apartment");
    EXPECT_EQ(valueAt(all, key + L"\\ProgID@"), L"TalvikDBxZandor.Zandor");
    EXPECT_EQ(valueAt(all, key + L"\\TypeLib@"), spelled(ids::controlLibrary));
    EXPECT_EQ(valueAt(all, L"TalvikDBxZandor.Zandor\\CLSID@"), spelled(ids::control));
    EXPECT_EQ(valueAt(all, L"TalvikZandorLib.Zandor\\CLSID@"), spelled(ids::query));
    EXPECT_EQ(valueAt(all, L"Interface\\" + spelled(__uuidof(_Zandor)) + L"\\TypeLib@"),
              spelled(ids::controlLibrary));
    EXPECT_EQ(strike(), S_OK);
}

TEST(Registering, SaysWhatAFormEditorAsksForAndTheLibraryHasIt) {
    ASSERT_EQ(enrol(), S_OK);
    const Export all = exported(HKEY_LOCAL_MACHINE);
    const std::wstring key = L"CLSID\\" + spelled(ids::control);
    EXPECT_EQ(valueAt(all, key + L"\\ToolboxBitmap32@"), Dll::get().path() + L", 101");
    EXPECT_EQ(valueAt(all, key + L"\\Version@"), L"1.0");
    EXPECT_EQ(valueAt(all, key + L"\\MiscStatus@"), L"0");
    EXPECT_NE(valueAt(all, key + L"\\MiscStatus\\1@"), L"(none)");
    EXPECT_EQ(valueAt(all, key + L"\\Verb\\-7@"), L"&Properties...,0,2");
    EXPECT_TRUE(isThere(L"Software\\Classes\\" + key + L"\\Control"));
    EXPECT_FALSE(isThere(L"Software\\Classes\\" + key + L"\\Insertable"));
    const HBITMAP picture = LoadBitmapW(Dll::get().module(), MAKEINTRESOURCEW(101));
    BITMAP about{};
    EXPECT_NE(GetObjectW(picture, sizeof about, &about), 0);
    EXPECT_EQ(about.bmWidth, 16);
    EXPECT_EQ(about.bmHeight, 15);
    DeleteObject(picture);
    EXPECT_TRUE(FindResourceW(Dll::get().module(), MAKEINTRESOURCEW(1), RT_VERSION));
    EXPECT_EQ(strike(), S_OK);
}

TEST(Registering, SaysWhereThePropertyPageIsAndNothingThatAScriptWouldMakeItBy) {
    ASSERT_EQ(enrol(), S_OK);
    const Export all = exported(HKEY_LOCAL_MACHINE);
    const std::wstring key = L"CLSID\\" + spelled(ids::propertyPage);
    EXPECT_EQ(valueAt(all, key + L"\\InprocServer32@"), Dll::get().path());
    EXPECT_EQ(valueAt(all, key + L"\\InprocServer32@ThreadingModel"), L"Apartment");
    EXPECT_EQ(valueAt(all, key + L"\\ProgID@"), L"(none)");
    Held<IPropertyPage> page;
    EXPECT_EQ(CoCreateInstance(ids::propertyPage, nullptr, CLSCTX_INPROC_SERVER, IID_IPropertyPage,
                               page.slotOfAny()),
              S_OK);
    EXPECT_TRUE(page);
    Held<IEnumOLEVERB> verbs;
    ASSERT_EQ(OleRegEnumVerbs(ids::control, verbs.slot()), S_OK);
    std::set<LONG> numbers;
    OLEVERB verb{};
    while (verbs->Next(1, &verb, nullptr) == S_OK) {
        numbers.insert(verb.lVerb);
        CoTaskMemFree(verb.lpszVerbName);
    }
    EXPECT_EQ(numbers, (std::set<LONG>{OLEIVERB_PRIMARY, OLEIVERB_PROPERTIES}));
    EXPECT_EQ(strike(), S_OK);
}

TEST(Registering, LeavesTheLibrariesWhereTheSystemLoadsThemFrom) {
    ASSERT_EQ(enrol(), S_OK);
    for (const GUID& id : {ids::controlLibrary, ids::modelLibrary}) {
        Held<ITypeLib> library;
        EXPECT_HRESULT_SUCCEEDED(LoadRegTypeLib(id, 1, 0, 0, library.slot()));
    }
    EXPECT_EQ(strike(), S_OK);
    Held<ITypeLib> library;
    EXPECT_HRESULT_FAILED(LoadRegTypeLib(ids::controlLibrary, 1, 0, 0, library.slot()));
}

TEST(Registering, AndTakingItBackLeavesTheRegistryAsItWas) {
    const Export before = exported(HKEY_LOCAL_MACHINE);
    ASSERT_EQ(enrol(), S_OK);
    EXPECT_NE(exported(HKEY_LOCAL_MACHINE), before);
    ASSERT_EQ(strike(), S_OK);
    EXPECT_EQ(exported(HKEY_LOCAL_MACHINE), before);
}

TEST(Registering, TwiceIsAsOnce) {
    const Export before = exported(HKEY_LOCAL_MACHINE);
    ASSERT_EQ(enrol(), S_OK);
    const Export once = exported(HKEY_LOCAL_MACHINE);
    ASSERT_EQ(enrol(), S_OK);
    EXPECT_EQ(exported(HKEY_LOCAL_MACHINE), once);
    ASSERT_EQ(strike(), S_OK);
    ASSERT_EQ(strike(), S_OK);
    EXPECT_EQ(exported(HKEY_LOCAL_MACHINE), before);
}

TEST(Registering, ForAUserAloneTouchesNobodyElse) {
    HKEY users = nullptr; // which a user of long standing has
    RegCreateKeyW(HKEY_CURRENT_USER, L"Software\\Classes", &users);
    RegCloseKey(users);
    const Export everybody = exported(HKEY_LOCAL_MACHINE);
    const Export before = exported(HKEY_CURRENT_USER);
    ASSERT_EQ(install(true, L"user"), S_OK);
    EXPECT_EQ(exported(HKEY_LOCAL_MACHINE), everybody);
    EXPECT_EQ(valueAt(exported(HKEY_CURRENT_USER), L"TalvikDBxZandor.Zandor\\CLSID@"),
              spelled(ids::control));
    ASSERT_EQ(install(false, L"user"), S_OK);
    EXPECT_EQ(exported(HKEY_CURRENT_USER), before);
}

TEST(Registering, RefusesAWayThatItDoesNotKnow) {
    const Export before = exported(HKEY_CURRENT_USER);
    EXPECT_EQ(install(true, L"somewhere"), E_INVALIDARG);
    EXPECT_EQ(exported(HKEY_CURRENT_USER), before);
}

TEST(Registering, KeepsWhatSomebodyElseHasPutBesideIt) {
    const std::wstring place = L"Software\\Classes\\CLSID\\" + spelled(ids::control);
    ASSERT_EQ(enrol(), S_OK);
    HKEY key = nullptr;
    RegCreateKeyExW(HKEY_LOCAL_MACHINE, (place + L"\\Theirs").c_str(), 0, nullptr, 0,
                    KEY_ALL_ACCESS, nullptr, &key, nullptr);
    RegCloseKey(key);
    ASSERT_EQ(strike(), S_OK);
    const Export all = exported(HKEY_LOCAL_MACHINE);
    EXPECT_TRUE(all.count(place + L"\\Theirs"));
    EXPECT_FALSE(all.count(place + L"\\InprocServer32"));
    RegDeleteKeyW(HKEY_LOCAL_MACHINE, (place + L"\\Theirs").c_str());
    RegDeleteKeyW(HKEY_LOCAL_MACHINE, place.c_str());
}

TEST(Registering, KeepsTheTypeLibraryThatTheOtherWordSizeHas) {
    const std::wstring place =
        L"Software\\Classes\\TypeLib\\" + spelled(ids::modelLibrary) + L"\\1.0";
    const wchar_t* const other = sizeof(void*) == 8 ? L"win32" : L"win64";
    const Export before = exported(HKEY_LOCAL_MACHINE);
    ASSERT_EQ(enrol(), S_OK);
    HKEY key = nullptr;
    ASSERT_EQ(RegCreateKeyExW(HKEY_LOCAL_MACHINE, (place + L"\\0\\" + other).c_str(), 0, nullptr, 0,
                              KEY_ALL_ACCESS, nullptr, &key, nullptr),
              ERROR_SUCCESS);
    RegSetValueW(key, nullptr, REG_SZ, L"C:\\other.dll", 0);
    RegCloseKey(key);
    ASSERT_EQ(strike(), S_OK);
    EXPECT_TRUE(isThere(place + L"\\0\\" + other));
    EXPECT_TRUE(isThere(place + L"\\FLAGS"));
    RegDeleteKeyW(HKEY_LOCAL_MACHINE, (place + L"\\0\\" + other).c_str());
    ASSERT_EQ(enrol(), S_OK);
    ASSERT_EQ(strike(), S_OK);
    EXPECT_EQ(exported(HKEY_LOCAL_MACHINE), before);
}
