#include "frontends/windows/automation/server/entries.h"

#include "frontends/windows/automation/com/Failure.h"
#include "frontends/windows/automation/com/Module.h"
#include "frontends/windows/automation/com/Text.h"
#include "frontends/windows/automation/com/ids.h"
#include "frontends/windows/automation/container/status.h"
#include "frontends/windows/automation/server/classes.h"

#include <array>
#include <iterator>

namespace zandor::automation::registration {

namespace {

using std::wstring;

wstring textOf(const GUID& id) {
    wchar_t text[40];
    StringFromGUID2(id, text, int{std::size(text)});
    return text;
}

constexpr const wchar_t* version = L"1.0";
constexpr const wchar_t* word = sizeof(void*) == 8 ? L"win64" : L"win32";
/// How the system carries calls of an interface from one apartment to another: by its type library.
constexpr const wchar_t* marshaler = L"{00020424-0000-0000-C000-000000000046}";
/// Control, safe for scripting, safe for initializing
constexpr const wchar_t* categories[] = {L"{40FC6ED4-2438-11CF-A3DB-080036F12502}",
                                         L"{7DD95801-9882-11CF-9FA9-00AA006C42C4}",
                                         L"{7DD95802-9882-11CF-9FA9-00AA006C42C4}"};
struct Library {
    const GUID* id;
    int number; ///< of the resource
    const wchar_t* title;
};
constexpr Library libraries[] = {{&ids::controlLibrary, 1, L"Zandor visual query designer"},
                                 {&ids::modelLibrary, 2, L"Zandor query model"}};

void add(std::vector<Entry>& entries, const CreatableClass& made, const wstring& file) {
    const wstring id = textOf(made.id);
    const wstring key = L"CLSID\\" + id;
    if (made.name) {
        entries.push_back({made.name, L"", made.title});
        entries.push_back({wstring(made.name) + L"\\CLSID", L"", id});
    }
    entries.push_back({key, L"", made.title});
    entries.push_back({key + L"\\InprocServer32", L"", file});
    entries.push_back({key + L"\\InprocServer32", L"ThreadingModel", L"Apartment"});
    if (!made.name) return;
    entries.push_back({key + L"\\ProgID", L"", made.name});
    entries.push_back({key + L"\\TypeLib", L"", textOf(*made.library)});
    entries.push_back({key + L"\\Version", L"", version});
    entries.push_back({key + L"\\Programmable", L"", L""});
    if (!made.isControl) return;
    entries.push_back({key + L"\\Control", L"", L""});
    entries.push_back({key + L"\\MiscStatus", L"", L"0"});
    entries.push_back({key + L"\\MiscStatus\\1", L"", std::to_wstring(miscStatus)});
    entries.push_back({key + L"\\Verb", L"", L""});
    entries.push_back({key + L"\\Verb\\0", L"", L"&Edit,0,2"});
    static_assert(OLEIVERB_PROPERTIES == -7);
    entries.push_back({key + L"\\Verb\\-7", L"", L"&Properties...,0,2"});
    entries.push_back({key + L"\\ToolboxBitmap32", L"", file + L", 101"});
    for (const wchar_t* const category : categories)
        entries.push_back({key + L"\\Implemented Categories\\" + category, L"", L""});
}

/// The interfaces that a library declares.
void addInterfaces(std::vector<Entry>& entries, const Library& library) {
    const auto types = module::typeLibrary(library.number);
    for (UINT n = 0; n < types->GetTypeInfoCount(); ++n) {
        Held<ITypeInfo> info;
        require(types->GetTypeInfo(n, info.slot()));
        TYPEATTR* attributes = nullptr;
        require(info->GetTypeAttr(&attributes));
        const TYPEKIND kind = attributes->typekind;
        const wstring id = textOf(attributes->guid);
        info->ReleaseTypeAttr(attributes);
        if (kind != TKIND_DISPATCH && kind != TKIND_INTERFACE) continue;
        Text name;
        require(
            types->GetDocumentation(static_cast<INT>(n), name.slot(), nullptr, nullptr, nullptr));
        const wstring key = L"Interface\\" + id;
        entries.push_back({key, L"", name.get()});
        entries.push_back({key + L"\\ProxyStubClsid32", L"", marshaler});
        entries.push_back({key + L"\\TypeLib", L"", textOf(*library.id)});
        entries.push_back({key + L"\\TypeLib", L"Version", version});
    }
}

wstring versionKey(const Library& library) {
    return L"TypeLib\\" + textOf(*library.id) + L"\\" + version;
}

void add(std::vector<Entry>& entries, const Library& library, const wstring& file) {
    const wstring key = versionKey(library);
    const wstring folder = file.substr(0, file.find_last_of(L"\\/"));
    const bool control = library.number == 1;
    entries.push_back({key, L"", library.title, true});
    entries.push_back({key + L"\\FLAGS", L"", control ? L"2" : L"0", true});
    entries.push_back({key + L"\\HELPDIR", L"", folder, true});
    entries.push_back({key + L"\\0\\" + word, L"", file + L"\\" + std::to_wstring(library.number)});
    addInterfaces(entries, library);
}

} // namespace

std::vector<Entry> entriesFor(const wstring& file) {
    std::vector<Entry> entries;
    for (const CreatableClass& made : creatableClasses()) add(entries, made, file);
    for (const Library& library : libraries) add(entries, library, file);
    return entries;
}

std::vector<wstring> platformKeys() {
    std::vector<wstring> keys;
    for (const Library& library : libraries) keys.push_back(versionKey(library) + L"\\0");
    return keys;
}

} // namespace zandor::automation::registration
