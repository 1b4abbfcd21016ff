#include "frontends/windows/toolkit/OleDrag.h"
#include "frontends/windows/toolkit/Surroundings.h"
#include "support/FakeModel.h"
#include "support/WindowsHands.h"

#include <Zandor/windows/WindowControl.h>

#include <gtest/gtest.h>

using namespace zandor;
using platform::windows::Drags;

namespace {

class NobodyTakes final : public TalvikDBxZandor::ZandorEvents {
public:
    void Raise(TalvikDBxZandor::Event, const TalvikDBxZandor::EventArguments&) override {}
};

BOOL CALLBACK findList(HWND child, LPARAM found) {
    wchar_t kind[16] = {};
    GetClassNameW(child, kind, 16);
    if (lstrcmpiW(kind, L"LISTBOX") != 0 || !IsWindowVisible(child)) return TRUE;
    *reinterpret_cast<HWND*>(found) = child;
    return FALSE;
}

/// A host's window with a control over a table, at a place of its own.
class Form {
public:
    explicit Form(int left)
        : mHost(CreateWindowExW(0, hands::hostClass(&DefWindowProcW), L"Host",
                                WS_POPUP | WS_VISIBLE, left, 0, 500, 500, nullptr, nullptr,
                                GetModuleHandleW(nullptr), nullptr)),
          control(mHost, mLibrary, mNobody) {
        model->table(u"ORDERS", {u"*", u"ID", u"CUSTOMER"});
        control.control().DebugSwitch(0);
        control.control().OnlyJoin(false);
        control.setBounds({0, 0, 500, 500});
        control.show(true);
        control.control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(model));
        hands::pump();
    }
    ~Form() {
        control.control().Terminate();
        DestroyWindow(mHost);
    }

    Drags& drags() const {
        return platform::windows::Window::of(control.window())->surroundings().drags;
    }
    /// A place of the screen over the grid.
    POINTL overGrid() const {
        const HWND grid = FindWindowExW(control.window(), nullptr, nullptr, L"Output columns");
        POINT at{150, 90};
        ClientToScreen(grid, &at);
        return {at.x, at.y};
    }
    /// Presses an entry of its table and moves the mouse, which then goes as the carrier says.
    void drag(Drags::Carrier carrier) const {
        drags().setCarrier(std::move(carrier));
        HWND list = nullptr;
        EnumChildWindows(control.window(), &findList, reinterpret_cast<LPARAM>(&list));
        ASSERT_TRUE(list);
        hands::mouse(list, WM_LBUTTONDOWN, {40, 24}, MK_LBUTTON);
        hands::mouse(list, WM_MOUSEMOVE, {42, 24}, MK_LBUTTON);
        hands::mouse(list, WM_LBUTTONUP, {42, 24}, 0);
        hands::pump();
    }

private:
    fake::Library mLibrary;
    NobodyTakes mNobody;
    HWND mHost;

public:
    const platform::Ref<fake::Model> model = mLibrary.newModel();
    platform::windows::WindowControl control;
};

DWORD effectOf(IDropTarget& target, IDataObject* data, POINTL at) {
    DWORD effect = DROPEFFECT_COPY | DROPEFFECT_MOVE;
    EXPECT_EQ(target.DragEnter(data, MK_LBUTTON, at, &effect), S_OK);
    DWORD over = effect;
    EXPECT_EQ(target.DragOver(MK_LBUTTON, at, &over), S_OK);
    EXPECT_EQ(over, effect);
    target.DragLeave();
    return effect;
}

} // namespace

TEST(ADragOfColumns, IsTakenByItsOwnControlAndByNoOther) {
    const Form one(0);
    const Form other(520);
    int carried = 0;
    one.drag([&](Drags& drags) {
        ++carried;
        const auto own = platform::windows::carriedBy(drags);
        const auto target = platform::windows::targetFor(drags);
        EXPECT_EQ(effectOf(*target.Get(), own.Get(), one.overGrid()), DWORD{DROPEFFECT_COPY});
        // What another control carries, at the same place, and nothing at all.
        const auto foreign = platform::windows::carriedBy(other.drags());
        EXPECT_EQ(effectOf(*target.Get(), foreign.Get(), one.overGrid()), DWORD{DROPEFFECT_NONE});
        EXPECT_EQ(effectOf(*target.Get(), nullptr, one.overGrid()), DWORD{DROPEFFECT_NONE});
        const auto others = platform::windows::targetFor(other.drags());
        EXPECT_EQ(effectOf(*others.Get(), own.Get(), other.overGrid()), DWORD{DROPEFFECT_NONE});
        // Nor is a drop of the others', told of without a word before.
        DWORD effect = DROPEFFECT_COPY;
        EXPECT_EQ(target->Drop(foreign.Get(), 0, one.overGrid(), &effect), S_OK);
        EXPECT_EQ(effect, DWORD{DROPEFFECT_NONE});
    });
    EXPECT_EQ(carried, 1);
    EXPECT_EQ(one.model->definitionCount(), 0);
    // And comes to a column where the button goes up over the grid.
    one.drag([&](Drags& drags) {
        const auto own = platform::windows::carriedBy(drags);
        const auto target = platform::windows::targetFor(drags);
        DWORD effect = DROPEFFECT_COPY;
        EXPECT_EQ(target->DragEnter(own.Get(), MK_LBUTTON, one.overGrid(), &effect), S_OK);
        EXPECT_EQ(target->Drop(own.Get(), 0, one.overGrid(), &effect), S_OK);
        EXPECT_EQ(one.model->definitionCount(), 0) << "not within the drag";
    });
    EXPECT_EQ(one.model->definitionCount(), 1);
}

TEST(ADragOfColumns, CarriesNothingThatSomebodyElseCouldUse) {
    const Form one(0);
    const auto data = platform::windows::carriedBy(one.drags());
    Microsoft::WRL::ComPtr<IEnumFORMATETC> formats;
    ASSERT_EQ(data->EnumFormatEtc(DATADIR_GET, &formats), S_OK);
    FORMATETC format{};
    ASSERT_EQ(formats->Next(1, &format, nullptr), S_OK);
    wchar_t name[40] = {};
    GetClipboardFormatNameW(format.cfFormat, name, 40);
    EXPECT_STREQ(name, L"TalvikZandorColumns");
    EXPECT_EQ(formats->Next(1, &format, nullptr), S_FALSE);
    for (const CLIPFORMAT known : {CF_TEXT, CF_UNICODETEXT, CF_HDROP, CF_BITMAP, CF_DIB}) {
        FORMATETC wanted{known, nullptr, DVASPECT_CONTENT, -1, TYMED_HGLOBAL};
        STGMEDIUM medium{};
        EXPECT_EQ(data->QueryGetData(&wanted), DV_E_FORMATETC);
        EXPECT_EQ(data->GetData(&wanted, &medium), DV_E_FORMATETC);
    }
}
