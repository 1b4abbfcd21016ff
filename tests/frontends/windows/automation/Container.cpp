#include "Container.h"

#include "Late.h"

#include "support/WindowsHands.h"

#include <gtest/gtest.h>

#include <algorithm>

using namespace zandor;
using namespace zandor::automation;

Container::Container(std::map<DISPID, Value> ambient)
    : ambient(std::move(ambient)),
      mWindow(CreateWindowExW(0, hands::hostClass(&DefWindowProcW), L"Form", WS_OVERLAPPEDWINDOW,
                              40, 40, 700, 520, nullptr, nullptr, GetModuleHandleW(nullptr),
                              nullptr)),
      mControl(newControl()) {
    ShowWindow(mWindow, SW_SHOW);
    as<IOleObject>()->SetClientSite(this);
}

Container::~Container() {
    unload();
    DestroyWindow(mWindow);
    pump();
    EXPECT_EQ(mReferences, 0);
}

HWND Container::controlWindow() const {
    HWND window = nullptr;
    if (mControl) as<IOleInPlaceObject>()->GetWindow(&window);
    return window;
}

HRESULT Container::tell(LONG verb) const {
    IOleClientSite* const site = const_cast<Container*>(this);
    return as<IOleObject>()->DoVerb(verb, nullptr, site, 0, mWindow, &place);
}

void Container::unload() {
    if (!mControl) return;
    const auto object = as<IOleObject>();
    object->Close(OLECLOSE_NOSAVE);
    object->SetClientSite(nullptr);
    mControl = {};
    mActive = {};
}

void Container::pump() const {
    MSG message{};
    while (PeekMessageW(&message, nullptr, 0, 0, PM_REMOVE)) {
        if (message.message >= WM_MOUSEFIRST && message.message <= WM_MOUSELAST) {
            if (!(message.wParam & hands::ours)) continue;
            message.wParam &= ~hands::ours;
        }
        const auto active = mActive;
        const bool isKey = message.message >= WM_KEYFIRST && message.message <= WM_KEYLAST;
        if (isKey && active && active->TranslateAccelerator(&message) == S_OK) continue;
        TranslateMessage(&message);
        DispatchMessageW(&message);
    }
}

void Container::press(int key, int shift) const {
    hands::key(GetFocus(), key, shift, [this] { pump(); });
}

void Container::click(POINT at) const {
    const HWND outer = controlWindow();
    const HWND part = hands::windowAt(outer, at);
    MapWindowPoints(outer, part, &at, 1);
    // As the system asks for each press.
    SendMessageW(part, WM_MOUSEACTIVATE, reinterpret_cast<WPARAM>(mWindow),
                 MAKELPARAM(HTCLIENT, WM_LBUTTONDOWN));
    hands::click(part, at);
    pump();
}

HRESULT Container::heard(const char* call) {
    mCalls.emplace_back(call);
    const auto found = on.find(call);
    if (found == on.end()) return S_OK;
    const auto then = std::move(found->second);
    on.erase(found);
    return then();
}

STDMETHODIMP Container::QueryInterface(REFIID iid, void** object) {
    if (!object) return E_POINTER;
    *object = nullptr;
    if (iid == IID_IUnknown || iid == IID_IOleClientSite)
        *object = static_cast<IOleClientSite*>(this);
    else if (iid == IID_IOleInPlaceSite || iid == IID_IOleWindow)
        *object = static_cast<IOleInPlaceSite*>(this);
    else if (iid == IID_IOleControlSite)
        *object = static_cast<IOleControlSite*>(this);
    else if (iid == IID_IDispatch)
        *object = static_cast<IDispatch*>(this);
    else if (iid == IID_IAdviseSink)
        *object = static_cast<IAdviseSink*>(this);
    if (!*object) return E_NOINTERFACE;
    AddRef();
    return S_OK;
}

STDMETHODIMP Container::GetContainer(IOleContainer** container) {
    *container = nullptr;
    return E_NOINTERFACE;
}

STDMETHODIMP Container::GetWindow(HWND* window) {
    *window = mWindow;
    return S_OK;
}

STDMETHODIMP Container::GetWindowContext(IOleInPlaceFrame** frame, IOleInPlaceUIWindow** document,
                                         RECT* at, RECT* seen, OLEINPLACEFRAMEINFO* info) {
    EXPECT_EQ(info->cb, sizeof *info);
    *frame = Held<IOleInPlaceFrame>(this).detach();
    *document = nullptr; // the frame is the document
    *at = place;
    *seen = clip;
    info->fMDIApp = FALSE;
    info->hwndFrame = mWindow;
    info->haccel = nullptr;
    info->cAccelEntries = 0;
    return heard("GetWindowContext");
}

STDMETHODIMP Container::SetActiveObject(IOleInPlaceActiveObject* active, LPCOLESTR) {
    mActive = active;
    return heard(active ? "SetActiveObject" : "SetActiveObject(nothing)");
}

STDMETHODIMP Container::TranslateAccelerator(MSG* message, DWORD modifiers) {
    mCalls.push_back("key " + std::to_string(message->wParam) + " with " +
                     std::to_string(modifiers));
    const bool isOwn = std::find(own.begin(), own.end(), message->wParam) != own.end();
    return isOwn ? S_OK : S_FALSE;
}

STDMETHODIMP Container::Invoke(DISPID id, REFIID, LCID, WORD how, DISPPARAMS*, VARIANT* result,
                               EXCEPINFO*, UINT*) {
    const auto found = ambient.find(id);
    if (!(how & DISPATCH_PROPERTYGET) || found == ambient.end()) return DISP_E_MEMBERNOTFOUND;
    return VariantCopy(result, &found->second);
}

void bindQuery(_Zandor& control) {
    const Late query(newQuery().get());
    const auto add = [&](const char16_t* name, std::initializer_list<const char16_t*> columns) {
        const Late table(Dll::get().make<_ZDTableDescription>(ids::tableDescription).get());
        table.put(L"Name", platform::StringView(name));
        for (const char16_t* column : columns)
            table.call(L"AddColumn", platform::StringView(column), std::int16_t{2});
        return query.at(L"AddTable", Held<IDispatch>(table.object()));
    };
    const Late orders = add(u"orders", {u"id", u"customer", u"total"});
    const Late customers = add(u"customers", {u"id", u"name"});
    const Late join(Dll::get().make<_ZDJoin>(ids::join).get());
    join.set(L"LeftTable", orders.object());
    join.set(L"LeftColumn", orders.at(L"Columns").at(L"Item", std::int16_t{3}).object());
    join.set(L"RightTable", customers.object());
    join.set(L"RightColumn", customers.at(L"Columns").at(L"Item", std::int16_t{2}).object());
    EXPECT_TRUE(query.call(L"AddJoin", Held<IDispatch>(join.object())));
    const Late output(Dll::get().make<_ZDColumnDefinition>(ids::columnDefinition).get());
    output.set(L"Column", orders.at(L"Columns").at(L"Item", std::int16_t{4}).object());
    const Late stored = query.at(L"AddColumnDefinition", Held<IDispatch>(output.object()));
    stored.call(L"AddCriterium", platform::StringView(u"> 100"), platform::StringView(u"4"));
    EXPECT_TRUE(Late(&control).set(L"Zandor", query.object()));
}
