#include "Container.h"
#include "EventScripts.h"
#include "Late.h"
#include "ScriptHost.h"
#include "Sink.h"
#include "User.h"

#include <Zandor/windows/Counted.h>

#include <gtest/gtest.h>

#include <thread>

using namespace zandor;
using namespace zandor::automation;

namespace {

using Word = platform::StringView;

/// From three tables to a query and part of the way back, on a form.
class AJourney : public testing::Test {
protected:
    AJourney() {
        form.place = {0, 0, 690, 490};
        form.control()->put_OnlyJoin(VARIANT_FALSE);
        form.control()->put_JoinModifyDisabled(1); // any number but 0 allows it
        add(u"customers", {u"id", u"name", u"country"});
        add(u"suppliers", {u"id", u"country"});
        add(u"orders", {u"id", u"ordered_at", u"status"});
        Late(form.control().get()).set(L"Zandor", query.object());
        form.tell(OLEIVERB_UIACTIVATE);
        for (auto* const script : {&basic, &java}) script->lend(L"control", form.control().get());
        EXPECT_TRUE(basic.run(inVBScript)) << basic.failure();
        EXPECT_TRUE(java.run(inJScript)) << java.failure();
    }

    void add(Word name, std::initializer_list<Word> columns) const {
        const Late table(Dll::get().make<_ZDTableDescription>(ids::tableDescription).get());
        table.put(L"Name", name);
        for (const Word column : columns) table.call(L"AddColumn", column, std::int16_t{1});
        query.call(L"AddTable", Held<IDispatch>(table.object()));
    }

    // Where things are on the screen

    /// The window of a title below another one, however deep.
    static HWND windowOf(HWND above, const wchar_t* title, const wchar_t* kind = nullptr) {
        struct Search {
            const wchar_t* title;
            const wchar_t* kind;
            HWND found;
            static BOOL CALLBACK test(HWND window, LPARAM l) {
                auto& search = *reinterpret_cast<Search*>(l);
                wchar_t text[80] = {};
                wchar_t name[40] = {};
                GetWindowTextW(window, text, 80);
                GetClassNameW(window, name, 40);
                if (!IsWindowVisible(window)) return TRUE;
                if (search.title && lstrcmpW(text, search.title) != 0) return TRUE;
                if (search.kind && lstrcmpiW(name, search.kind) != 0) return TRUE;
                search.found = window;
                return FALSE;
            }
        } search{title, kind, nullptr};
        EnumChildWindows(above, &Search::test, reinterpret_cast<LPARAM>(&search));
        return search.found;
    }
    static POINT onScreen(HWND window, POINT at) {
        ClientToScreen(window, &at);
        return at;
    }
    static POINT middleOf(HWND window) {
        RECT area{};
        GetClientRect(window, &area);
        return onScreen(window, {area.right / 2, area.bottom / 2});
    }
    HWND table(const wchar_t* name) const { return windowOf(form.window(), name, L"ZandorPart"); }
    POINT title(const wchar_t* name) const { return onScreen(table(name), {30, 10}); }
    POINT cross(const wchar_t* name) const {
        RECT area{};
        GetClientRect(table(name), &area);
        return onScreen(table(name), {area.right - 12, 11});
    }
    POINT entry(const wchar_t* name, int row, int x = 40) const {
        const HWND list = windowOf(form.window(), name, L"LISTBOX");
        RECT place{};
        SendMessageW(list, LB_GETITEMRECT, static_cast<WPARAM>(row),
                     reinterpret_cast<LPARAM>(&place));
        return onScreen(list, {x, (place.top + place.bottom) / 2});
    }
    POINT cell(int row, int column) const {
        const HWND grid = windowOf(form.window(), L"Output columns");
        return onScreen(grid, {110 + 90 * (column - 1), 10 + 21 * row});
    }
    HWND editor(const wchar_t* kind) const { return windowOf(form.window(), nullptr, kind); }

    // What has become of it

    void awaitEvent(const std::string& number, std::size_t count = 1) {
        user.await("event " + number, [&] {
            std::size_t found = 0;
            user.ask([&] {
                for (const std::string& event : sink.heard())
                    if (event.rfind(number, 0) == 0) ++found;
            });
            return found == count;
        });
    }
    std::string sql() const { return query.call(L"SQL", std::int16_t{0}).text(); }

    // The steps

    void moveTables() {
        user.drag(title(L"orders"), {title(L"orders").x + 400, title(L"orders").y - 20});
        user.drag(title(L"suppliers"), {title(L"suppliers").x + 180, title(L"suppliers").y - 5});
        awaitEvent("-121", 2);
        user.picture("container-1-start");
    }
    void joinTwoTables() {
        user.click(entry(L"customers", 3));
        user.settle();
        user.drag(entry(L"customers", 3), entry(L"suppliers", 2),
                  [this] { user.picture("container-2-carried-to-a-column"); });
        awaitEvent("-127");
    }
    void defineTheJoin() {
        RECT left{};
        RECT right{};
        GetWindowRect(table(L"customers"), &left);
        GetWindowRect(table(L"suppliers"), &right);
        const POINT line{(left.right + right.left) / 2,
                         (entry(L"customers", 3).y + entry(L"suppliers", 2).y) / 2};
        mLine = line;
        user.click(line, true);
        user.choose(L"Show Join Definition", [this] { user.picture("container-3-menu"); });
        const auto dialog = [] { return FindWindowW(nullptr, L"Join Defintion"); };
        user.await("the dialog", [&] { return IsWindowVisible(dialog()); });
        user.click(middleOf(windowOf(dialog(), nullptr, L"COMBOBOX")));
        user.key(VK_DOWN);
        const HWND type = windowOf(dialog(), nullptr, L"COMBOBOX");
        user.await("the type", [&] { return SendMessageW(type, CB_GETCURSEL, 0, 0) == 1; });
        user.key(VK_RETURN); // the list closes
        user.await("the list is closed",
                   [&] { return !SendMessageW(type, CB_GETDROPPEDSTATE, 0, 0); });
        user.picture("container-4-definition");
        user.click(middleOf(windowOf(dialog(), L"&Ok")));
        user.await("the dialog is closed", [&] { return !IsWindowVisible(dialog()); });
        awaitEvent("-128");
    }
    /// Wine forgets a key that is held without the screen knowing of it, so what is clicked with
    /// Control is told to the list as the system tells it.
    void selectThreeColumns() {
        const HWND list = windowOf(form.window(), L"orders", L"LISTBOX");
        user.click(entry(L"orders", 1));
        for (const int row : {2, 3}) {
            user.settle();
            POINT at = entry(L"orders", row);
            ScreenToClient(list, &at);
            PostMessageW(list, WM_LBUTTONDOWN, MK_LBUTTON | MK_CONTROL, MAKELPARAM(at.x, at.y));
            PostMessageW(list, WM_LBUTTONUP, MK_CONTROL, MAKELPARAM(at.x, at.y));
        }
        user.await("three are selected",
                   [&] { return SendMessageW(list, LB_GETSELCOUNT, 0, 0) == 3; });
        user.settle();
    }
    void putColumnsOnTheGrid() {
        selectThreeColumns();
        user.drag(entry(L"orders", 2), cell(4, 1),
                  [this] { user.picture("container-5-three-columns"); });
        awaitEvent("-123", 3);
    }
    void awaitEditor(const wchar_t* kind) {
        user.await("an editor", [&] { return editor(kind) != nullptr; });
        const DWORD thread = GetWindowThreadProcessId(form.window(), nullptr);
        user.await("the editor has the keyboard", [&] {
            GUITHREADINFO info{};
            info.cbSize = sizeof info;
            const HWND open = editor(kind);
            return GetGUIThreadInfo(thread, &info) &&
                   (info.hwndFocus == open || IsChild(open, info.hwndFocus));
        });
        user.settle();
    }
    void giveCriterion() {
        user.click(cell(4, 3));
        awaitEditor(L"EDIT");
        user.type(u"= 'open'");
        user.settle();
        user.picture("container-6-criterion");
        user.key(VK_RETURN);
        user.await("no editor", [&] { return editor(L"EDIT") == nullptr; });
        awaitEvent("-124");
    }
    void sort() {
        user.click(cell(2, 2));
        awaitEditor(L"COMBOBOX");
        user.key(VK_DOWN);
        user.await("an order",
                   [&] { return SendMessageW(editor(L"COMBOBOX"), CB_GETCURSEL, 0, 0) == 1; });
        user.key(VK_RETURN);
        user.await("no editor", [&] { return editor(L"COMBOBOX") == nullptr; });
        awaitEvent("-124", 2);
    }
    void copyPasteAndDelete() {
        user.click(entry(L"customers", 2));
        user.click(entry(L"customers", 2), true);
        user.choose(L"Copy Column");
        user.click(cell(1, 1), true);
        user.choose(L"Paste Column");
        awaitEvent("-123", 4);
        user.click(cell(1, 3), true);
        user.choose(L"Delete Coumn", [this] { user.picture("container-7-menu-of-a-column"); });
        awaitEvent("-125");
        user.picture("container-8-finished");
    }
    void deleteATable() {
        user.click(cross(L"orders"));
        awaitEvent("-120");
        user.await("it is gone", [&] { return !table(L"orders"); });
        user.picture("container-9-table-deleted");
    }
    void deleteTheJoin() {
        user.click(mLine, true);
        user.choose(L"Delete Join");
        awaitEvent("-129");
    }

    Container form;
    const Late query{newQuery().get()};
    Sink sink{form.control().get()};
    User user{form.window()};
    // Who hears it all by name.
    ScriptHost basic{L"VBScript"};
    ScriptHost java{L"JScript"};

private:
    POINT mLine{};
};

} // namespace

TEST_F(AJourney, OnAFormWithMouseAndKeyboardLeavesTheQueryThatWasMade) {
    user.live([this] {
        user.settle();
        moveTables();
        joinTwoTables();
        defineTheJoin();
        putColumnsOnTheGrid();
        giveCriterion();
        sort();
        user.ask([this] {
            EXPECT_NE(sql().find("ORDER BY orders.ordered_at"), std::string::npos) << sql();
        });
        copyPasteAndDelete();
    });
    EXPECT_EQ(sql(), "SELECT\n"
                     "    customers.name,\n"
                     "    orders.id,\n"
                     "    orders.status\n"
                     "FROM customers\n"
                     "    LEFT JOIN suppliers ON customers.country = suppliers.country\n"
                     "    CROSS JOIN orders\n"
                     "WHERE orders.status = 'open'");
    user.live([this] { deleteATable(); });
    EXPECT_EQ(sql(), "SELECT\n"
                     "    customers.name\n"
                     "FROM customers\n"
                     "    LEFT JOIN suppliers ON customers.country = suppliers.country");
    user.live([this] { deleteTheJoin(); });
    Late(form.control().get()).set(L"Zandor", nullptr);

    EXPECT_EQ(basic.said(), std::vector<std::string>({"TableMoved",
                                                      "TableMoved",
                                                      "JoinCreated 0",
                                                      "Activate",
                                                      "Activate",
                                                      "JoinModified 1",
                                                      "ColumnCreated orders.id",
                                                      "ColumnCreated orders.ordered_at",
                                                      "ColumnCreated orders.status",
                                                      "Activate",
                                                      "ColumnModified orders.status",
                                                      "ColumnModified orders.ordered_at",
                                                      "Activate",
                                                      "Activate",
                                                      "ColumnCreated customers.name",
                                                      "Activate",
                                                      "ColumnRemoved orders.ordered_at",
                                                      "TableDeleted orders",
                                                      "Activate",
                                                      "JoinRemoved 1",
                                                      "Error New Zanodr is nothing! -1"}));
    EXPECT_EQ(java.said(), basic.said());
}

namespace {

/// A window beside the form that takes whatever is dropped on it.
class Taker final : public platform::windows::Counted<IDropTarget> {
public:
    Taker()
        : window(CreateWindowExW(0, L"STATIC", L"Beside", WS_POPUP | WS_VISIBLE | SS_NOTIFY, 800,
                                 60, 200, 200, nullptr, nullptr, nullptr, nullptr)) {
        RegisterDragDrop(window, this);
    }
    ~Taker() override { DestroyWindow(window); }

    STDMETHODIMP DragEnter(IDataObject* data, DWORD, POINTL, DWORD* effect) override {
        ++entered;
        for (const CLIPFORMAT known : {CF_TEXT, CF_UNICODETEXT, CF_HDROP}) {
            FORMATETC wanted{known, nullptr, DVASPECT_CONTENT, -1, TYMED_HGLOBAL};
            if (data->QueryGetData(&wanted) == S_OK) ++readable;
        }
        *effect = DROPEFFECT_COPY;
        return S_OK;
    }
    STDMETHODIMP DragOver(DWORD, POINTL, DWORD* effect) override {
        *effect = DROPEFFECT_COPY;
        return S_OK;
    }
    STDMETHODIMP DragLeave() override { return S_OK; }
    STDMETHODIMP Drop(IDataObject*, DWORD, POINTL, DWORD* effect) override {
        ++dropped;
        *effect = DROPEFFECT_COPY;
        return S_OK;
    }

    const HWND window;
    int entered = 0;
    int readable = 0;
    int dropped = 0;
};

/// Words that are dragged from elsewhere, until the button comes up.
class Words final : public platform::windows::Counted<IDataObject> {
public:
    STDMETHODIMP GetData(FORMATETC*, STGMEDIUM*) override { return DV_E_FORMATETC; }
    STDMETHODIMP GetDataHere(FORMATETC*, STGMEDIUM*) override { return DV_E_FORMATETC; }
    STDMETHODIMP QueryGetData(FORMATETC* format) override {
        return format->cfFormat == CF_UNICODETEXT ? S_OK : DV_E_FORMATETC;
    }
    STDMETHODIMP GetCanonicalFormatEtc(FORMATETC*, FORMATETC*) override { return E_NOTIMPL; }
    STDMETHODIMP SetData(FORMATETC*, STGMEDIUM*, BOOL) override { return E_NOTIMPL; }
    STDMETHODIMP EnumFormatEtc(DWORD, IEnumFORMATETC**) override { return E_NOTIMPL; }
    STDMETHODIMP DAdvise(FORMATETC*, DWORD, IAdviseSink*, DWORD*) override { return E_NOTIMPL; }
    STDMETHODIMP DUnadvise(DWORD) override { return E_NOTIMPL; }
    STDMETHODIMP EnumDAdvise(IEnumSTATDATA**) override { return E_NOTIMPL; }
};

class UntilLetGo final : public platform::windows::Counted<IDropSource> {
public:
    STDMETHODIMP QueryContinueDrag(BOOL escape, DWORD keys) override {
        if (escape) return DRAGDROP_S_CANCEL;
        return keys & MK_LBUTTON ? S_OK : DRAGDROP_S_DROP;
    }
    STDMETHODIMP GiveFeedback(DWORD) override { return DRAGDROP_S_USEDEFAULTCURSORS; }
};

} // namespace

TEST_F(AJourney, CarriesNothingOutOfTheForm) {
    const Held<Taker> beside(new Taker);
    user.live([&] {
        user.settle();
        user.click(entry(L"customers", 2));
        user.settle();
        user.drag(entry(L"customers", 2), middleOf(beside->window));
        user.await("the drop", [&] { return beside->dropped == 1; });
        // And by Escape a drag ends where it is.
        user.moveTo(entry(L"customers", 2));
        user.press();
        user.settle();
        for (const int step : {8, 4, 0}) {
            user.moveTo({cell(4, 1).x, cell(4, 1).y + step});
            user.settle();
        }
        user.key(VK_ESCAPE);
        user.settle();
        user.letGo();
        user.settle();
    });
    EXPECT_EQ(beside->entered, 1);
    EXPECT_EQ(beside->readable, 0);
    EXPECT_EQ(sink.heard(), std::vector<std::string>());
    RevokeDragDrop(beside->window);
}

TEST_F(AJourney, IsNotDisturbedByWhatIsDraggedFromElsewhere) {
    const HWND list = windowOf(form.window(), L"customers", L"LISTBOX");
    const Held<Taker> beside(new Taker);
    DWORD effect = DROPEFFECT_COPY;
    HRESULT ended = E_FAIL;
    user.live([&] {
        user.settle();
        for (const POINT to : {entry(L"customers", 2), cell(4, 1)}) {
            user.moveTo(middleOf(beside->window));
            user.press();
            user.settle();
            std::thread carrying([&] {
                user.ask([&] {
                    const Held<IDataObject> words(new Words);
                    const Held<IDropSource> source(new UntilLetGo);
                    ended = DoDragDrop(words.get(), source.get(), DROPEFFECT_COPY, &effect);
                });
            });
            for (const int step : {6, 3, 0}) {
                user.moveTo({to.x, to.y + step});
                user.settle();
            }
            user.letGo();
            carrying.join();
            EXPECT_TRUE(SUCCEEDED(ended));
            EXPECT_EQ(effect, DWORD{DROPEFFECT_NONE});
            EXPECT_EQ(SendMessageW(list, LB_GETSELCOUNT, 0, 0), 0);
        }
    });
    EXPECT_EQ(sink.heard(), std::vector<std::string>());
    RevokeDragDrop(beside->window);
}

int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    OleInitialize(nullptr);
    const int result = RUN_ALL_TESTS();
    OleUninitialize();
    return result;
}
