#include "Boxes.h"
#include "Dll.h"
#include "Late.h"
#include "Scripted.h"

#include "support/WindowsHands.h"

#include <gtest/gtest.h>

#include <cstring>

using namespace zandor;
using namespace zandor::automation;

namespace {

using Word = platform::StringView;

/// A dialog as a template describes it, with one thing in it.
class Template {
public:
    Template(const wchar_t* kind, const wchar_t* text) {
        DLGTEMPLATE dialog{};
        dialog.style = WS_POPUP | WS_CAPTION | WS_SYSMENU | DS_MODALFRAME;
        dialog.cdit = 1;
        dialog.cx = 300;
        dialog.cy = 240;
        add(&dialog, sizeof dialog);
        add(L"\0\0Form", 7 * sizeof(wchar_t)); // no menu, the system's class, the title
        DLGITEMTEMPLATE item{};
        item.style = WS_CHILD | WS_VISIBLE | WS_TABSTOP;
        item.x = 5;
        item.y = 5;
        item.cx = 290;
        item.cy = 230;
        item.id = 100;
        mBytes.resize((mBytes.size() + 3) / 4 * 4);
        add(&item, sizeof item);
        add(kind, (std::wcslen(kind) + 1) * sizeof(wchar_t));
        add(text, (std::wcslen(text) + 1) * sizeof(wchar_t));
        add(L"", sizeof(WORD)); // nothing more about it
    }
    const DLGTEMPLATE* get() const { return reinterpret_cast<const DLGTEMPLATE*>(mBytes.data()); }

private:
    void add(const void* data, std::size_t size) {
        const std::size_t at = mBytes.size();
        mBytes.resize(at + size);
        std::memcpy(mBytes.data() + at, data, size);
    }
    std::vector<std::byte> mBytes;
};

/// The container for dialogs that Windows' makers hand out, by which a template names a control;
/// whoever has the dialog knows the control by IDispatch alone.
class ADialog : public testing::Test {
protected:
    ADialog() {
        const HMODULE atl = LoadLibraryW(L"atl.dll");
        static const auto init = reinterpret_cast<BOOL(WINAPI*)()>(
            reinterpret_cast<void*>(GetProcAddress(atl, "AtlAxWinInit")));
        static const bool ready = init && init();
        const auto control = reinterpret_cast<HRESULT(WINAPI*)(HWND, IUnknown**)>(
            reinterpret_cast<void*>(GetProcAddress(atl, "AtlAxGetControl")));
        EXPECT_TRUE(ready);
        const Template made(L"AtlAxWin", L"TalvikDBxZandor.Zandor");
        struct Idle {
            static INT_PTR CALLBACK deal(HWND, UINT, WPARAM, LPARAM) { return 0; }
        };
        dialog = CreateDialogIndirectParamW(GetModuleHandleW(nullptr), made.get(), nullptr,
                                            &Idle::deal, 0);
        holder = GetDlgItem(dialog, 100);
        Held<IUnknown> found;
        EXPECT_EQ(control ? control(holder, found.slot()) : E_NOTIMPL, S_OK);
        designer = Late(found.get());
        ShowWindow(dialog, SW_SHOW);
        designer.put(L"DebugSwitch", std::int16_t{0});
        designer.put(L"OnlyJoin", false);
    }
    ~ADialog() override { close(); }

    void close() {
        designer = Late(nullptr);
        query = Late(nullptr);
        if (dialog) DestroyWindow(dialog);
        dialog = nullptr;
        hands::pump();
    }

    static Late make(const wchar_t* name) {
        CLSID id{};
        EXPECT_EQ(CLSIDFromProgID(name, &id), S_OK);
        Held<IDispatch> made;
        CoCreateInstance(id, nullptr, CLSCTX_INPROC_SERVER, IID_IDispatch, made.slotOfAny());
        return Late(made);
    }
    void bind() {
        query = make(L"TalvikZandorLib.Zandor");
        for (const Word name : {Word(u"customers"), Word(u"orders")}) {
            const Late table = make(L"TalvikZandorLib.ZDTableDescription");
            table.put(L"Name", name);
            for (const Word column : {Word(u"id"), Word(u"name")})
                table.call(L"AddColumn", column, std::int16_t{2});
            const Late stored = query.at(L"AddTable", Held<IDispatch>(table.object()));
            stored.put(L"Left", name == u"orders" ? 2700 : 150);
            stored.put(L"Top", 150);
        }
        EXPECT_TRUE(designer.set(L"Zandor", query.object()));
    }
    HWND part(const wchar_t* title) const {
        struct Search {
            const wchar_t* title;
            HWND found;
            static BOOL CALLBACK test(HWND child, LPARAM l) {
                auto& wanted = *reinterpret_cast<Search*>(l);
                wchar_t text[80] = {};
                GetWindowTextW(child, text, 80);
                if (std::wcscmp(text, wanted.title) == 0 && !wanted.found) wanted.found = child;
                return TRUE;
            }
        } search{title, nullptr};
        EnumChildWindows(dialog, &Search::test, reinterpret_cast<LPARAM>(&search));
        return search.found;
    }

    HWND dialog = nullptr;
    HWND holder = nullptr;
    Late designer{nullptr};
    Late query{nullptr};
};

} // namespace

TEST_F(ADialog, HasTheControlThatItsTemplateNames) {
    ASSERT_TRUE(designer);
    const HWND control = part(L"Query designer");
    ASSERT_TRUE(control);
    EXPECT_TRUE(IsWindowVisible(control));
    RECT room{};
    RECT stands{};
    GetClientRect(holder, &room);
    GetClientRect(control, &stands);
    EXPECT_TRUE(EqualRect(&room, &stands));
}

TEST_F(ADialog, ReadsAndWritesByNameAlone) {
    EXPECT_TRUE(designer.put(L"LNGJoinOk", Word(u"Fertig")));
    EXPECT_EQ(designer.get(L"LNGJoinOk").text(), "Fertig");
    EXPECT_EQ(designer.put(L"MXHorzFrameSize", std::int32_t{40000}).code, DISP_E_OVERFLOW);
    EXPECT_EQ(designer.get(L"NoSuchMember").code, DISP_E_UNKNOWNNAME);
    bind();
    EXPECT_EQ(designer.at(L"Zandor").at(L"Tables").get(L"Count").text(), "2");
    EXPECT_TRUE(part(L"orders"));
    EXPECT_TRUE(designer.call(L"SetCurrentTable", Word(u"orders")));
    const Late orders = query.at(L"Tables").at(L"Item", std::int16_t{2});
    EXPECT_NE(orders.get(L"Selected").text(), "0");
    EXPECT_TRUE(designer.call(L"Terminate"));
    EXPECT_FALSE(part(L"orders"));
}

TEST_F(ADialog, HearsWhatItsUserDoes) {
    bind();
    std::vector<std::string> heard;
    const auto sink = Scripted::make();
    sink->have(
        L"TableDeleted",
        [&](WORD, const Scripted::Arguments&) {
            heard.push_back(designer.get(L"DeletedTable").text());
            return Value();
        },
        -120);
    Held<IConnectionPoint> point;
    ASSERT_EQ(Held<IConnectionPointContainer>::of(designer.object())
                  ->FindConnectionPoint(IID_IDispatch, point.slot()),
              S_OK);
    DWORD cookie = 0;
    ASSERT_EQ(point->Advise(sink.get(), &cookie), S_OK);
    const HWND orders = part(L"orders");
    RECT area{};
    GetClientRect(orders, &area);
    hands::click(orders, {area.right - 12, 11});
    hands::pump(dialog);
    EXPECT_EQ(heard, std::vector<std::string>{"orders"});
    EXPECT_EQ(query.at(L"Tables").get(L"Count").text(), "1");
    point->Unadvise(cookie);
}

TEST_F(ADialog, LetsTheLibraryGoWithItself) {
    bind();
    close();
    EXPECT_TRUE(Dll::get().canUnload());
}
