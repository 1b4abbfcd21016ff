#include "Boxes.h"
#include "Container.h"
#include "Late.h"
#include "writeBitmap.h"

#include "frontends/windows/automation/keeping/State.h"
#include "frontends/windows/automation/pages/resource.h"

#include "support/WindowsHands.h"

#include <gtest/gtest.h>

#include <commctrl.h>

using namespace zandor;
using namespace zandor::automation;

namespace {

/// A frame of property pages: its window and its site, and nothing else.
class Frame final : public IPropertyPageSite {
public:
    Frame()
        : window(CreateWindowExW(0, hands::hostClass(&DefWindowProcW), L"Properties",
                                 WS_OVERLAPPEDWINDOW, 30, 30, 420, 330, nullptr, nullptr,
                                 GetModuleHandleW(nullptr), nullptr)),
          page(Dll::get().make<IPropertyPage2>(ids::propertyPage)) {
        ShowWindow(window, SW_SHOW);
        page->SetPageSite(this);
    }
    ~Frame() {
        if (page) {
            page->Deactivate();
            page->SetObjects(0, nullptr);
            page->SetPageSite(nullptr);
            page = {};
        }
        DestroyWindow(window);
        EXPECT_EQ(mReferences, 1U);
    }
    Frame(const Frame&) = delete;
    Frame& operator=(const Frame&) = delete;

    HRESULT give(std::initializer_list<IUnknown*> objects) const {
        std::vector<IUnknown*> list(objects);
        return page->SetObjects(static_cast<ULONG>(list.size()), list.data());
    }
    HRESULT activate() const {
        RECT place{};
        GetClientRect(window, &place);
        const HRESULT made = page->Activate(window, &place, FALSE);
        page->Show(SW_SHOW);
        return made;
    }

    // The user's
    HWND dialog() const { return GetWindow(window, GW_CHILD); }
    HWND item(int number) const { return GetDlgItem(dialog(), number); }
    std::string shown(std::size_t row, int column) const {
        wchar_t text[200] = {};
        LVITEMW entry{};
        entry.iSubItem = column;
        entry.pszText = text;
        entry.cchTextMax = 200;
        SendMessageW(item(ZANDOR_PAGE_LIST), LVM_GETITEMTEXTW, row,
                     reinterpret_cast<LPARAM>(&entry));
        return platform::toUtf8(reinterpret_cast<const char16_t*>(text));
    }
    void choose(std::size_t row) const {
        LVITEMW entry{};
        entry.state = entry.stateMask = LVIS_SELECTED | LVIS_FOCUSED;
        SendMessageW(item(ZANDOR_PAGE_LIST), LVM_SETITEMSTATE, row,
                     reinterpret_cast<LPARAM>(&entry));
    }
    std::size_t chosen() const {
        return static_cast<std::size_t>(SendMessageW(item(ZANDOR_PAGE_LIST), LVM_GETNEXTITEM,
                                                     static_cast<WPARAM>(-1), LVNI_SELECTED));
    }
    void type(std::size_t row, const wchar_t* text) const {
        choose(row);
        SetWindowTextW(item(ZANDOR_PAGE_TEXT), text);
    }
    void pick(std::size_t row, bool value) const {
        choose(row);
        const HWND flag = item(ZANDOR_PAGE_FLAG);
        SendMessageW(flag, CB_SETCURSEL, value ? 0 : 1, 0);
        SendMessageW(dialog(), WM_COMMAND, MAKEWPARAM(ZANDOR_PAGE_FLAG, CBN_SELCHANGE),
                     reinterpret_cast<LPARAM>(flag));
    }

    std::function<void()> onStatus;
    int statusChanges = 0;
    bool takesTab = false;

    STDMETHODIMP QueryInterface(REFIID iid, void** object) override {
        *object = iid == IID_IUnknown || iid == IID_IPropertyPageSite ? this : nullptr;
        if (!*object) return E_NOINTERFACE;
        AddRef();
        return S_OK;
    }
    STDMETHODIMP_(ULONG) AddRef() override { return ++mReferences; }
    STDMETHODIMP_(ULONG) Release() override { return --mReferences; }
    STDMETHODIMP OnStatusChange(DWORD flags) override {
        EXPECT_TRUE(flags & PROPPAGESTATUS_DIRTY);
        ++statusChanges;
        if (const auto then = std::exchange(onStatus, {})) then();
        return S_OK;
    }
    STDMETHODIMP GetLocaleID(LCID* locale) override {
        *locale = LOCALE_USER_DEFAULT;
        return S_OK;
    }
    STDMETHODIMP GetPageContainer(IUnknown**) override { return E_NOTIMPL; }
    STDMETHODIMP TranslateAccelerator(MSG*) override { return takesTab ? S_OK : S_FALSE; }

    const HWND window;
    Held<IPropertyPage2> page;

private:
    ULONG mReferences = 1;
};

std::size_t rowOf(platform::StringView name) {
    const auto& members = keptMembers();
    for (std::size_t row = 0; row < members.size(); ++row)
        if (members[row]->name == name) return row;
    ADD_FAILURE() << platform::toUtf8(name);
    return 0;
}

class ThePropertyPage : public testing::Test {
protected:
    std::string valueOf(const Held<_Zandor>& control, const wchar_t* name) const {
        return Late(control.get()).get(name).text();
    }

    Held<_Zandor> control = newControl();
    Frame frame;
};

} // namespace

TEST_F(ThePropertyPage, IsTheOnlyOneThatAControlSpecifies) {
    const auto specified = Held<ISpecifyPropertyPages>::of(control.get());
    ASSERT_TRUE(specified);
    CAUUID pages{};
    ASSERT_EQ(specified->GetPages(&pages), S_OK);
    ASSERT_EQ(pages.cElems, 1U);
    EXPECT_EQ(pages.pElems[0], ids::propertyPage);
    CoTaskMemFree(pages.pElems);
    EXPECT_EQ(specified->GetPages(nullptr), E_POINTER);
}

TEST_F(ThePropertyPage, SaysItsTitleAndHowLargeItWouldLikeToBe) {
    PROPPAGEINFO info{};
    info.cb = sizeof info;
    ASSERT_EQ(frame.page->GetPageInfo(&info), S_OK);
    EXPECT_STREQ(info.pszTitle, L"Zandor");
    EXPECT_GT(info.size.cx, 250);
    EXPECT_GT(info.size.cy, 200);
    EXPECT_EQ(info.pszHelpFile, nullptr);
    CoTaskMemFree(info.pszTitle);
    EXPECT_EQ(frame.page->GetPageInfo(nullptr), E_POINTER);
    info.cb = 1;
    EXPECT_EQ(frame.page->GetPageInfo(&info), E_INVALIDARG);
}

TEST_F(ThePropertyPage, ListsEveryMemberThatIsKeptWithItsValue) {
    ASSERT_EQ(frame.give({control.get()}), S_OK);
    ASSERT_EQ(frame.activate(), S_OK);
    const auto& members = keptMembers();
    EXPECT_EQ(SendMessageW(frame.item(ZANDOR_PAGE_LIST), LVM_GETITEMCOUNT, 0, 0),
              static_cast<LRESULT>(members.size()));
    for (std::size_t row = 0; row < members.size(); ++row) {
        const platform::String name(members[row]->name);
        EXPECT_EQ(frame.shown(row, 0), platform::toUtf8(name));
        EXPECT_EQ(frame.shown(row, 1), valueOf(control, wide(name)));
    }
    hands::pump();
    RECT area{};
    GetClientRect(frame.window, &area);
    const HDC seen = GetDC(frame.window);
    writeBitmap(seen, area, "property-page");
    ReleaseDC(frame.window, seen);
}

TEST_F(ThePropertyPage, WritesEveryMemberThatItLists) {
    frame.give({control.get()});
    frame.activate();
    const auto& members = keptMembers();
    for (std::size_t row = 0; row < members.size(); ++row) {
        const platform::String name(members[row]->name);
        const std::string before = valueOf(control, wide(name));
        std::string wanted;
        switch (members[row]->type) {
        case TalvikDBxZandor::automation::Type::Boolean:
            wanted = before == "True" ? "False" : "True";
            frame.pick(row, wanted == "True");
            break;
        case TalvikDBxZandor::automation::Type::Integer:
            // A place is within its scroll bar.
            wanted = name.ends_with(u"ScrollbarPos") ? "0" : "7";
            frame.type(row, wanted == "0" ? L"0" : L"7");
            break;
        default: wanted = "other words"; frame.type(row, L"other words");
        }
        EXPECT_EQ(frame.shown(row, 1), wanted);
        if (before != wanted) {
            EXPECT_EQ(valueOf(control, wide(name)), before) << "not before it is applied";
            EXPECT_EQ(frame.page->IsPageDirty(), S_OK) << frame.shown(row, 0);
        }
        EXPECT_EQ(frame.page->Apply(), S_OK) << frame.shown(row, 0);
        EXPECT_EQ(valueOf(control, wide(name)), wanted) << frame.shown(row, 0);
        EXPECT_EQ(frame.page->IsPageDirty(), S_FALSE);
        // With traces on, boxes would come.
        Late(control.get()).put(L"DebugSwitch", std::int16_t{0});
    }
    EXPECT_GT(frame.statusChanges, 50);
}

TEST_F(ThePropertyPage, IsNotDirtyWhereAValueIsPutBack) {
    frame.give({control.get()});
    frame.activate();
    const std::size_t row = rowOf(u"LNGJoinOk");
    const std::string before = frame.shown(row, 1);
    frame.type(row, L"Fertig");
    EXPECT_EQ(frame.page->IsPageDirty(), S_OK);
    frame.type(row, L"&Ok");
    ASSERT_EQ(before, "&Ok");
    EXPECT_EQ(frame.page->IsPageDirty(), S_FALSE);
}

TEST_F(ThePropertyPage, OfSeveralControlsLeavesEmptyWhatDiffersAndWritesOnlyWhatIsChanged) {
    const auto other = newControl();
    other->put_LNGJoinCancel(Text(u"Abbrechen").get());
    other->put_OnlyJoin(VARIANT_FALSE);
    control->put_OnlyJoin(VARIANT_TRUE);
    ASSERT_EQ(frame.give({control.get(), other.get()}), S_OK);
    frame.activate();
    EXPECT_EQ(frame.shown(rowOf(u"LNGJoinCancel"), 1), "");
    EXPECT_EQ(frame.shown(rowOf(u"OnlyJoin"), 1), "");
    EXPECT_EQ(frame.shown(rowOf(u"LNGJoinOk"), 1), "&Ok");
    frame.choose(rowOf(u"OnlyJoin"));
    EXPECT_EQ(SendMessageW(frame.item(ZANDOR_PAGE_FLAG), CB_GETCURSEL, 0, 0), CB_ERR);
    frame.type(rowOf(u"LNGJoinOk"), L"Fertig");
    ASSERT_EQ(frame.page->Apply(), S_OK);
    for (const auto& each : {control, other}) EXPECT_EQ(valueOf(each, L"LNGJoinOk"), "Fertig");
    EXPECT_EQ(valueOf(control, L"LNGJoinCancel"), "&Cancel");
    EXPECT_EQ(valueOf(other, L"LNGJoinCancel"), "Abbrechen");
    EXPECT_EQ(valueOf(other, L"OnlyJoin"), "False");
    frame.pick(rowOf(u"OnlyJoin"), false);
    ASSERT_EQ(frame.page->Apply(), S_OK);
    EXPECT_EQ(valueOf(control, L"OnlyJoin"), "False");
}

TEST_F(ThePropertyPage, RefusesWhatAMemberCannotBeWithAMessageAndChangesNothing) {
    frame.give({control.get()});
    frame.activate();
    for (const wchar_t* wrong : {L"forty", L"32768", L"-32769", L"", L"99999999999999999999"}) {
        frame.type(rowOf(u"LNGJoinOk"), L"Fertig");
        frame.type(rowOf(u"MXHorzFrameSize"), wrong);
        Boxes::taken();
        std::string said;
        Boxes::meetNext([&](HWND box) {
            wchar_t words[200] = {};
            GetWindowTextW(GetDlgItem(box, 0xFFFF), words, 200);
            said = platform::toUtf8(reinterpret_cast<const char16_t*>(words));
            PostMessageW(box, WM_COMMAND, IDOK, 0);
        });
        EXPECT_EQ(frame.page->Apply(), E_FAIL);
        EXPECT_EQ(said, "MXHorzFrameSize takes a whole number from -32768 to 32767.");
        EXPECT_EQ(Boxes::taken(), std::vector<std::string>{"Zandor"});
        EXPECT_EQ(valueOf(control, L"LNGJoinOk"), "&Ok");
        EXPECT_EQ(frame.page->IsPageDirty(), S_OK) << "what was typed is still there";
        EXPECT_EQ(frame.chosen(), rowOf(u"MXHorzFrameSize"));
    }
    frame.type(rowOf(u"MXHorzFrameSize"), L"11");
    EXPECT_EQ(frame.page->Apply(), S_OK);
    EXPECT_EQ(valueOf(control, L"LNGJoinOk"), "Fertig");
}

TEST_F(ThePropertyPage, RefusesAPlaceBeyondAScrollBar) {
    frame.give({control.get()});
    frame.activate();
    for (const auto& [name, wrong] : {std::pair{u"HorizontalScrollbarPos", L"32767"},
                                      {u"VerticalScrollbarPos", L"-1"},
                                      {u"VisibleFrameLeft", L"-1"},
                                      {u"VisibleFrameTop", L"-7"}}) {
        const std::string before = frame.shown(rowOf(name), 1);
        frame.type(rowOf(name), wrong);
        EXPECT_EQ(frame.page->Apply(), E_FAIL);
        EXPECT_EQ(Boxes::taken(), std::vector<std::string>{"Zandor"}) << "one box, the page's";
        EXPECT_EQ(valueOf(control, wide(name)), before);
        frame.type(rowOf(name), L"0");
    }
}

TEST_F(ThePropertyPage, KeepsWhatIsWantedWhileItIsNotShown) {
    frame.give({control.get()});
    frame.activate();
    frame.type(rowOf(u"LNGJoinOk"), L"Fertig");
    EXPECT_EQ(frame.page->Deactivate(), S_OK);
    EXPECT_FALSE(frame.dialog());
    EXPECT_EQ(frame.page->Deactivate(), E_UNEXPECTED);
    EXPECT_EQ(frame.page->IsPageDirty(), S_OK);
    EXPECT_EQ(frame.activate(), S_OK);
    EXPECT_EQ(frame.shown(rowOf(u"LNGJoinOk"), 1), "Fertig");
    EXPECT_EQ(frame.page->Deactivate(), S_OK);
    EXPECT_EQ(frame.page->Apply(), S_OK);
    EXPECT_EQ(valueOf(control, L"LNGJoinOk"), "Fertig");
}

TEST_F(ThePropertyPage, GoesToAMemberThatAFormEditorNames) {
    frame.give({control.get()});
    EXPECT_EQ(frame.page->EditProperty(0x40030018), E_UNEXPECTED);
    frame.activate();
    EXPECT_EQ(frame.page->EditProperty(0x40030018), S_OK);
    EXPECT_EQ(frame.chosen(), rowOf(u"LNGJoinOk"));
    EXPECT_EQ(GetFocus(), frame.item(ZANDOR_PAGE_TEXT));
    EXPECT_EQ(frame.page->EditProperty(0x68030014), E_INVALIDARG) << "the query is not kept";
    EXPECT_EQ(frame.page->EditProperty(77), E_INVALIDARG);
}

TEST_F(ThePropertyPage, IsWalkedThroughByTabAndLeavesTheRestToItsFrame) {
    frame.give({control.get()});
    frame.activate();
    SetFocus(frame.item(ZANDOR_PAGE_LIST));
    MSG key{};
    key.hwnd = frame.item(ZANDOR_PAGE_LIST);
    key.message = WM_KEYDOWN;
    key.wParam = VK_TAB;
    EXPECT_EQ(frame.page->TranslateAccelerator(&key), S_OK);
    const HWND text = frame.item(ZANDOR_PAGE_TEXT);
    EXPECT_EQ(GetFocus(), text);
    frame.takesTab = true;
    key.hwnd = text;
    EXPECT_EQ(frame.page->TranslateAccelerator(&key), S_OK);
    EXPECT_EQ(GetFocus(), text) << "the frame has it";
    for (const int frames : {VK_RETURN, VK_ESCAPE}) {
        key.wParam = static_cast<WPARAM>(frames);
        EXPECT_EQ(frame.page->TranslateAccelerator(&key), S_FALSE);
    }
    key.hwnd = frame.window;
    EXPECT_EQ(frame.page->TranslateAccelerator(&key), S_FALSE);
    EXPECT_EQ(frame.page->TranslateAccelerator(nullptr), E_POINTER);
}

TEST_F(ThePropertyPage, TurnsAFlagBySpaceAndByADoubleClick) {
    frame.give({control.get()});
    frame.activate();
    const std::size_t row = rowOf(u"UseJoinTypeBoth");
    const std::string before = frame.shown(row, 1);
    frame.choose(row);
    NMLVKEYDOWN space{};
    space.hdr = {frame.item(ZANDOR_PAGE_LIST), ZANDOR_PAGE_LIST, UINT(LVN_KEYDOWN)};
    space.wVKey = VK_SPACE;
    SendMessageW(frame.dialog(), WM_NOTIFY, ZANDOR_PAGE_LIST, reinterpret_cast<LPARAM>(&space));
    EXPECT_NE(frame.shown(row, 1), before);
    EXPECT_EQ(frame.page->IsPageDirty(), S_OK);
    NMITEMACTIVATE clicks{};
    clicks.hdr = {frame.item(ZANDOR_PAGE_LIST), ZANDOR_PAGE_LIST, UINT(NM_DBLCLK)};
    SendMessageW(frame.dialog(), WM_NOTIFY, ZANDOR_PAGE_LIST, reinterpret_cast<LPARAM>(&clicks));
    EXPECT_EQ(frame.shown(row, 1), before);
    EXPECT_EQ(frame.page->IsPageDirty(), S_FALSE);
}

TEST_F(ThePropertyPage, IsMovedShownAndHidden) {
    RECT place{10, 20, 210, 190};
    EXPECT_EQ(frame.page->Move(&place), E_UNEXPECTED);
    EXPECT_EQ(frame.page->Show(SW_SHOW), E_UNEXPECTED);
    frame.activate();
    EXPECT_EQ(frame.activate(), E_UNEXPECTED) << "it is already";
    EXPECT_EQ(frame.page->Move(&place), S_OK);
    RECT stands{};
    GetWindowRect(frame.dialog(), &stands);
    MapWindowPoints(nullptr, frame.window, reinterpret_cast<POINT*>(&stands), 2);
    EXPECT_TRUE(EqualRect(&stands, &place));
    RECT text{};
    GetWindowRect(frame.item(ZANDOR_PAGE_TEXT), &text);
    MapWindowPoints(nullptr, frame.window, reinterpret_cast<POINT*>(&text), 2);
    EXPECT_LE(text.bottom, place.bottom);
    EXPECT_LE(text.right, place.right);
    EXPECT_EQ(frame.page->Show(SW_HIDE), S_OK);
    EXPECT_FALSE(IsWindowVisible(frame.dialog()));
    EXPECT_EQ(frame.page->Show(SW_SHOWNORMAL), S_OK);
    EXPECT_TRUE(IsWindowVisible(frame.dialog()));
    EXPECT_EQ(frame.page->Show(SW_MAXIMIZE), E_INVALIDARG);
    EXPECT_EQ(frame.page->Move(nullptr), E_POINTER);
}

TEST_F(ThePropertyPage, RefusesObjectsThatAreNoSuchControls) {
    EXPECT_EQ(frame.page->SetObjects(1, nullptr), E_POINTER);
    EXPECT_EQ(frame.give({nullptr}), E_POINTER);
    frame.give({control.get()});
    EXPECT_EQ(frame.give({control.get(), newQuery().get()}), E_NOINTERFACE);
    frame.activate();
    EXPECT_EQ(frame.shown(rowOf(u"LNGJoinOk"), 1), "&Ok") << "the one from before is still there";
    EXPECT_EQ(frame.give({}), S_OK);
    EXPECT_EQ(frame.shown(rowOf(u"LNGJoinOk"), 1), "");
    EXPECT_FALSE(IsWindowEnabled(frame.item(ZANDOR_PAGE_TEXT)));
    EXPECT_EQ(frame.page->Apply(), E_UNEXPECTED);
    EXPECT_EQ(frame.page->SetPageSite(&frame), E_UNEXPECTED) << "it has one";
    RECT place{};
    EXPECT_EQ(frame.page->Activate(frame.window, nullptr, FALSE), E_POINTER);
    frame.page->Deactivate();
    EXPECT_EQ(frame.page->Activate(nullptr, &place, FALSE), E_INVALIDARG);
    EXPECT_EQ(frame.page->Help(L""), E_NOTIMPL);
}

TEST_F(ThePropertyPage, MayBeClosedWhileItTellsOfAChange) {
    frame.give({control.get()});
    frame.activate();
    frame.onStatus = [&] {
        frame.page->Deactivate();
        frame.page->SetObjects(0, nullptr);
        frame.page->SetPageSite(nullptr);
        frame.page = {};
    };
    frame.type(rowOf(u"LNGJoinOk"), L"Fertig");
    EXPECT_FALSE(frame.page);
    EXPECT_FALSE(frame.dialog());
    EXPECT_EQ(valueOf(control, L"LNGJoinOk"), "&Ok");
}

TEST_F(ThePropertyPage, MayBeClosedWhileItsMessageStandsOpen) {
    frame.give({control.get()});
    frame.activate();
    frame.type(rowOf(u"MXHorzFrameSize"), L"forty");
    Boxes::meetNext([&](HWND box) {
        IPropertyPage2* const page = frame.page.detach(); // one reference, which goes here
        page->Deactivate();
        page->SetPageSite(nullptr);
        page->Release();
        PostMessageW(box, WM_COMMAND, IDOK, 0);
    });
    EXPECT_EQ(frame.page->Apply(), E_FAIL);
    EXPECT_FALSE(frame.page);
    Boxes::taken();
}

TEST_F(ThePropertyPage, GoesWithItsFramesWindow) {
    frame.give({control.get()});
    frame.activate();
    DestroyWindow(frame.window);
    EXPECT_EQ(frame.page->Show(SW_SHOW), E_UNEXPECTED);
    EXPECT_EQ(frame.page->Apply(), S_OK);
    EXPECT_EQ(frame.page->Deactivate(), S_OK);
}

TEST(PropertyPages, LetTheLibraryGo) {
    {
        const auto control = newControl();
        const Frame frame;
        frame.give({control.get()});
        frame.activate();
        frame.type(rowOf(u"LNGJoinOk"), L"Fertig");
        EXPECT_FALSE(Dll::get().canUnload());
    }
    hands::pump();
    EXPECT_TRUE(Dll::get().canUnload());
}
