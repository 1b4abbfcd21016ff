#include "support/FakeModel.h"
#include "support/WindowsHands.h"

#include <Zandor/windows/WindowControl.h>

#include <gtest/gtest.h>

#include <functional>
#include <vector>

#include <oleacc.h>
#include <wrl/client.h>

using namespace zandor;
using Microsoft::WRL::ComPtr;

// What a screen reader is told.

namespace {

class NobodyListens final : public TalvikDBxZandor::ZandorEvents {
public:
    void Raise(TalvikDBxZandor::Event, const TalvikDBxZandor::EventArguments&) override {}
};

VARIANT number(LONG value) {
    VARIANT made{};
    made.vt = VT_I4;
    made.lVal = value;
    return made;
}

/// An object, or a part of one that is known by its number.
struct Node {
    ComPtr<IAccessible> object;
    LONG part = CHILDID_SELF;

    VARIANT which() const { return number(part); }
    std::string text(HRESULT (STDMETHODCALLTYPE IAccessible::*get)(VARIANT, BSTR*)) const {
        BSTR said = nullptr;
        const HRESULT code = (object.Get()->*get)(which(), &said);
        EXPECT_TRUE(code == S_OK || (code == S_FALSE && !said));
        const std::string text = said ? platform::toUtf8(reinterpret_cast<char16_t*>(said)) : "";
        SysFreeString(said);
        return text;
    }
    std::string name() const { return text(&IAccessible::get_accName); }
    std::string description() const { return text(&IAccessible::get_accDescription); }
    LONG role() const {
        VARIANT value{};
        EXPECT_EQ(object->get_accRole(which(), &value), S_OK);
        return value.lVal;
    }
    LONG state() const {
        VARIANT value{};
        EXPECT_EQ(object->get_accState(which(), &value), S_OK);
        return value.lVal;
    }
    RECT place() const {
        LONG left = 0, top = 0, width = 0, height = 0;
        EXPECT_EQ(object->accLocation(&left, &top, &width, &height, which()), S_OK);
        return {left, top, left + width, top + height};
    }
    POINT middle() const {
        const RECT stands = place();
        return {(stands.left + stands.right) / 2, (stands.top + stands.bottom) / 2};
    }
    LONG count() const {
        LONG children = -1;
        EXPECT_EQ(object->get_accChildCount(&children), S_OK);
        return children;
    }
    /// As a reader finds it: by an object of its own, or by a number of this one's.
    Node child(LONG place) const {
        ComPtr<IDispatch> found;
        const HRESULT code = object->get_accChild(number(place), &found);
        EXPECT_TRUE(code == S_OK || code == S_FALSE) << code;
        Node made{object, place};
        if (!found) return made;
        made.part = CHILDID_SELF;
        EXPECT_EQ(found.As(&made.object), S_OK);
        return made;
    }
    /// What an answer of the object stands for.
    Node of(const VARIANT& value) const {
        if (value.vt == VT_I4) return {object, value.lVal};
        Node made;
        if (value.vt == VT_DISPATCH) {
            EXPECT_EQ(value.pdispVal->QueryInterface(IID_PPV_ARGS(&made.object)), S_OK);
            value.pdispVal->Release();
        }
        return made;
    }
    Node focus() const {
        VARIANT value{};
        object->get_accFocus(&value);
        return of(value);
    }
    Node hit(POINT at) const {
        VARIANT value{};
        object->accHitTest(at.x, at.y, &value);
        return of(value);
    }
};

class Accessibility : public testing::Test {
protected:
    Accessibility() {
        OleInitialize(nullptr);
        orders = model->table(u"ORDERS", {u"*", u"ORDER_ID", u"CUSTOMER_ID"});
        customers = model->table(u"CUSTOMERS", {u"*", u"CUSTOMER_ID", u"NAME"});
        orders->column(u"ORDER_ID").marker = true;
        orders->place(300, 300, 2400, 1800);
        customers->place(5000, 300, 2400, 1800);
        model->join(orders, u"CUSTOMER_ID", customers, u"CUSTOMER_ID", 1);
        model->definition(orders, u"ORDER_ID", {u"> 1000"});
        model->definition(customers, u"NAME");
        model->definitionAt(2).sortOrder = 1;
        control.control().DebugSwitch(0);
        control.control().OnlyJoin(false);
        control.comforts().setFlags(comforts::Flags::all());
        control.setBounds({0, 0, 900, 560});
        control.show(true);
        ShowWindow(host, SW_SHOW);
        SetForegroundWindow(host);
        control.control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(model));
        hands::pump();
    }
    ~Accessibility() override {
        DestroyWindow(host);
        OleUninitialize();
    }

    static Node of(HWND window) {
        Node made;
        EXPECT_EQ(AccessibleObjectFromWindow(window, static_cast<DWORD>(OBJID_CLIENT),
                                             IID_PPV_ARGS(&made.object)),
                  S_OK);
        return made;
    }
    Node whole() const { return of(control.window()); }
    static HWND childOf(HWND above, const wchar_t* title, const wchar_t* kind = L"ZandorPart") {
        struct Search {
            const wchar_t* title;
            const wchar_t* kind;
            HWND found = nullptr;
            static BOOL CALLBACK test(HWND child, LPARAM l) {
                auto& wanted = *reinterpret_cast<Search*>(l);
                wchar_t text[80] = {};
                wchar_t name[40] = {};
                GetWindowTextW(child, text, 80);
                GetClassNameW(child, name, 40);
                if (lstrcmpW(text, wanted.title) != 0 || lstrcmpiW(name, wanted.kind) != 0)
                    return TRUE;
                wanted.found = child;
                return FALSE;
            }
        } search{title, kind};
        EnumChildWindows(above, &Search::test, reinterpret_cast<LPARAM>(&search));
        EXPECT_TRUE(search.found);
        return search.found;
    }
    HWND window(const wchar_t* title, const wchar_t* kind = L"ZandorPart") const {
        return childOf(control.window(), title, kind);
    }
    Node canvas() const { return of(window(L"Tables and joins")); }
    Node grid() const { return of(window(L"Output columns")); }
    Node list(const wchar_t* table) const { return of(window(table, L"LISTBOX")); }
    Node line() const { return canvas().child(3); }
    Node cell(int row, int col) const { return grid().child(row * 256 + col + 1); }

    fake::Library library;
    NobodyListens nobody;
    platform::Ref<fake::Model> model = library.newModel();
    platform::Ref<fake::Table> orders, customers;
    HWND host =
        CreateWindowExW(0, hands::hostClass(&DefWindowProcW), L"Host", WS_OVERLAPPEDWINDOW, 0, 0,
                        920, 600, nullptr, nullptr, GetModuleHandleW(nullptr), nullptr);
    platform::windows::WindowControl control{host, library, nobody};
};

/// Everything below an object, and that each part answers all that it can be asked.
void walk(const Node& node, int& parts, int depth = 0) {
    ASSERT_LT(depth, 12);
    ++parts;
    EXPECT_NE(node.role(), 0) << node.name();
    node.state();
    node.place();
    node.description();
    if (node.part != CHILDID_SELF) return;
    const LONG count = node.count();
    for (LONG place = 1; place <= count; ++place) walk(node.child(place), parts, depth + 1);
}

} // namespace

TEST_F(Accessibility, NamesTheControlAndItsParts) {
    EXPECT_EQ(whole().name(), "Query designer");
    EXPECT_EQ(whole().role(), ROLE_SYSTEM_GROUPING);
    EXPECT_EQ(canvas().name(), "Tables and joins");
    EXPECT_EQ(canvas().role(), ROLE_SYSTEM_DIAGRAM);
    EXPECT_EQ(grid().name(), "Output columns");
    EXPECT_EQ(grid().role(), ROLE_SYSTEM_TABLE);
    std::vector<std::string> names;
    for (LONG place = 1; place <= whole().count(); ++place)
        names.push_back(whole().child(place).name());
    for (const char* name :
         {"Output columns", "Scroll across", "Scroll down", "Back to the origin"})
        EXPECT_NE(std::find(names.begin(), names.end(), name), names.end()) << name;
}

TEST_F(Accessibility, HasTheTablesInTheOrderOfTheirSlotsAndThenTheLines) {
    SetWindowPos(window(L"ORDERS"), HWND_TOP, 0, 0, 0, 0, SWP_NOMOVE | SWP_NOSIZE);
    ASSERT_EQ(canvas().count(), 3);
    EXPECT_EQ(canvas().child(1).name(), "ORDERS");
    EXPECT_EQ(canvas().child(2).name(), "CUSTOMERS");
    EXPECT_EQ(canvas().child(1).role(), ROLE_SYSTEM_WINDOW);
    EXPECT_EQ(line().role(), ROLE_SYSTEM_GRAPHIC);
    EXPECT_EQ(line().name(), "Join ORDERS.CUSTOMER_ID = CUSTOMERS.CUSTOMER_ID, Left Outer");
    EXPECT_EQ(line().description(), "all rows of ORDERS, and those of CUSTOMERS that match");
}

TEST_F(Accessibility, TellsOfAJoinWhatTheModelHasAndWhereItFailsWhatTheCanvasKnows) {
    model->joinAt(1).compareOperator = 4;
    model->joinAt(1).joinType = 3;
    EXPECT_EQ(line().name(), "Join ORDERS.CUSTOMER_ID <= CUSTOMERS.CUSTOMER_ID, Both Outer");
    model->fail("ZDJoin.LeftTable", platform::errors::invalidProcedureCall());
    EXPECT_EQ(line().name(), "Join ORDERS.CUSTOMER_ID = CUSTOMERS.CUSTOMER_ID");
}

TEST_F(Accessibility, TellsOfEntriesWhatIsSeenOfThem) {
    const Node entries = list(L"ORDERS");
    EXPECT_EQ(entries.role(), ROLE_SYSTEM_LIST);
    EXPECT_EQ(entries.name(), "ORDERS");
    ASSERT_EQ(entries.count(), 3);
    const char* const names[] = {"*", "ORDER_ID", "CUSTOMER_ID"};
    for (LONG place = 1; place <= 3; ++place) {
        EXPECT_EQ(entries.child(place).name(), names[place - 1]);
        EXPECT_EQ(entries.child(place).role(), ROLE_SYSTEM_LISTITEM);
        const POINT middle = entries.child(place).middle();
        EXPECT_EQ(entries.hit(middle).part, place);
    }
    EXPECT_EQ(entries.child(2).description(), "key column, comes out");
    EXPECT_EQ(entries.child(3).description(), "");
    EXPECT_FALSE(entries.child(2).state() & STATE_SYSTEM_SELECTED);
    EXPECT_EQ(entries.object->accSelect(SELFLAG_TAKEFOCUS | SELFLAG_TAKESELECTION, number(2)),
              S_OK);
    EXPECT_TRUE(entries.child(2).state() & STATE_SYSTEM_SELECTED);
    EXPECT_TRUE(entries.child(2).state() & STATE_SYSTEM_FOCUSED);
    EXPECT_EQ(entries.focus().part, 2);
    EXPECT_EQ(orders->column(u"ORDER_ID").activatedValue, 1) << "as by the keyboard";
}

TEST_F(Accessibility, ListsTheSelectedEntries) {
    const Node entries = list(L"ORDERS");
    VARIANT selection{};
    EXPECT_EQ(entries.object->get_accSelection(&selection), S_FALSE);
    EXPECT_EQ(selection.vt, VT_EMPTY);
    entries.object->accSelect(SELFLAG_TAKESELECTION, number(2));
    ASSERT_EQ(entries.object->get_accSelection(&selection), S_OK);
    EXPECT_EQ(selection.lVal, 2);
    entries.object->accSelect(SELFLAG_ADDSELECTION, number(3));
    ASSERT_EQ(entries.object->get_accSelection(&selection), S_OK);
    ASSERT_EQ(selection.vt, VT_UNKNOWN);
    ComPtr<IEnumVARIANT> several;
    ASSERT_EQ(selection.punkVal->QueryInterface(IID_PPV_ARGS(&several)), S_OK);
    selection.punkVal->Release();
    VARIANT found[3] = {};
    ULONG count = 0;
    EXPECT_EQ(several->Next(3, found, &count), S_FALSE);
    ASSERT_EQ(count, 2U);
    EXPECT_EQ(found[0].lVal, 2);
    EXPECT_EQ(found[1].lVal, 3);
    entries.object->accSelect(SELFLAG_REMOVESELECTION, number(2));
    ASSERT_EQ(entries.object->get_accSelection(&selection), S_OK);
    EXPECT_EQ(selection.lVal, 3);
}

TEST_F(Accessibility, NamesCellsByRowFieldAndText) {
    EXPECT_EQ(cell(4, 1).role(), ROLE_SYSTEM_CELL);
    EXPECT_EQ(cell(4, 1).name(), "Criteria, ORDER_ID: > 1000");
    EXPECT_EQ(cell(4, 1).text(&IAccessible::get_accValue), "> 1000");
    EXPECT_EQ(cell(2, 2).name(), "Sort, NAME: Ascending");
    EXPECT_EQ(cell(1, 2).name(), "Synonym, NAME");
    EXPECT_EQ(cell(7, 9).name(), "Or, column 9");
    EXPECT_EQ(cell(4, 0).name(), "Criteria:");
    EXPECT_EQ(cell(4, 0).role(), ROLE_SYSTEM_ROWHEADER);
    EXPECT_EQ(cell(0, 1).name(), "ORDER_ID");
    EXPECT_EQ(cell(0, 1).role(), ROLE_SYSTEM_COLUMNHEADER);
}

TEST_F(Accessibility, FindsEveryCellInView) {
    const Node cells = grid();
    ASSERT_EQ(cells.count(), 12 * 256);
    int seen = 0;
    RECT area{};
    GetClientRect(window(L"Output columns"), &area);
    for (LONG place = 1; place <= cells.count(); ++place) {
        const Node each = cells.child(place);
        if (each.state() & STATE_SYSTEM_OFFSCREEN) continue;
        ++seen;
        const RECT stands = each.place();
        EXPECT_EQ(cells.hit({stands.left + 2, stands.top + 2}).part, place);
    }
    EXPECT_GT(seen, 30);
    EXPECT_LT(seen, 300);
}

TEST_F(Accessibility, GoesToACellAndOpensItsEditorWhichIsNamedByIt) {
    const Node wanted = cell(4, 1);
    EXPECT_EQ(wanted.object->accSelect(SELFLAG_TAKEFOCUS, wanted.which()), S_OK);
    EXPECT_TRUE(wanted.state() & STATE_SYSTEM_FOCUSED);
    EXPECT_EQ(grid().focus().part, wanted.part);
    EXPECT_EQ(wanted.object->accDoDefaultAction(wanted.which()), S_OK);
    hands::pump();
    const Node editor = of(window(L"Criteria, ORDER_ID"));
    EXPECT_EQ(editor.role(), ROLE_SYSTEM_GROUPING);
    EXPECT_TRUE(whole().focus().object) << "the focus is in it";
    EXPECT_EQ(cell(0, 1).object->accDoDefaultAction(cell(0, 1).which()), DISP_E_MEMBERNOTFOUND);
    EXPECT_EQ(cell(4, 0).object->accSelect(SELFLAG_TAKEFOCUS, cell(4, 0).which()), E_INVALIDARG);
}

TEST_F(Accessibility, FindsALineOnTheScreenAndTakesTheFocusThere) {
    const POINT middle = line().middle();
    EXPECT_EQ(canvas().hit(middle).part, 3);
    EXPECT_FALSE(line().state() & STATE_SYSTEM_FOCUSED);
    EXPECT_EQ(line().object->accSelect(SELFLAG_TAKEFOCUS, number(3)), S_OK);
    EXPECT_TRUE(line().state() & STATE_SYSTEM_FOCUSED);
    EXPECT_EQ(canvas().focus().part, 3);
    EXPECT_EQ(line().object->accSelect(SELFLAG_ADDSELECTION, number(3)), E_INVALIDARG);
}

TEST_F(Accessibility, FindsATableAndWhatIsInItByItsPlace) {
    const Node box = canvas().child(1);
    const Node found = canvas().hit(box.middle());
    EXPECT_EQ(found.name(), "ORDERS");
    EXPECT_EQ(found.part, CHILDID_SELF);
    ASSERT_EQ(found.count(), 2);
    EXPECT_EQ(found.child(1).role(), ROLE_SYSTEM_LIST);
    EXPECT_EQ(found.child(2).role(), ROLE_SYSTEM_PUSHBUTTON);
    EXPECT_EQ(found.child(2).name(), "Remove the table");
    EXPECT_EQ(found.hit(found.child(2).middle()).part, 2);
    ComPtr<IDispatch> above;
    EXPECT_EQ(found.object->get_accParent(&above), S_OK);
    Node parent;
    ASSERT_EQ(above.As(&parent.object), S_OK);
    EXPECT_EQ(parent.name(), "Tables and joins");
}

TEST_F(Accessibility, RemovesATableByItsButton) {
    const Node box = canvas().child(1);
    EXPECT_EQ(box.object->accDoDefaultAction(number(2)), S_OK);
    hands::pump();
    ASSERT_EQ(canvas().count(), 1);
    EXPECT_EQ(canvas().child(1).name(), "CUSTOMERS");
    LONG count = 0;
    EXPECT_EQ(box.object->get_accChildCount(&count), CO_E_OBJNOTCONNECTED);
    BSTR name = nullptr;
    EXPECT_EQ(box.object->get_accName(number(0), &name), CO_E_OBJNOTCONNECTED);
}

TEST_F(Accessibility, IsWalkedThroughFromChildToChild) {
    const Node entries = list(L"ORDERS");
    VARIANT to{};
    EXPECT_EQ(entries.object->accNavigate(NAVDIR_FIRSTCHILD, number(0), &to), S_OK);
    EXPECT_EQ(to.lVal, 1);
    EXPECT_EQ(entries.object->accNavigate(NAVDIR_NEXT, to, &to), S_OK);
    EXPECT_EQ(to.lVal, 2);
    EXPECT_EQ(entries.object->accNavigate(NAVDIR_LASTCHILD, number(0), &to), S_OK);
    EXPECT_EQ(to.lVal, 3);
    EXPECT_EQ(entries.object->accNavigate(NAVDIR_NEXT, to, &to), S_FALSE);
    EXPECT_EQ(to.vt, VT_EMPTY);
    EXPECT_EQ(canvas().object->accNavigate(NAVDIR_FIRSTCHILD, number(0), &to), S_OK);
    EXPECT_EQ(canvas().of(to).name(), "ORDERS");
}

TEST_F(Accessibility, AnswersForEverythingThatThereIs) {
    int parts = 0;
    walk(whole(), parts);
    EXPECT_GT(parts, 12 * 256);
}

TEST_F(Accessibility, RefusesWhatIsNoneOfItsParts) {
    const Node entries = list(L"ORDERS");
    VARIANT value{};
    BSTR text = nullptr;
    EXPECT_EQ(entries.object->get_accName(number(4), &text), E_INVALIDARG);
    EXPECT_EQ(entries.object->get_accName(number(-1), &text), E_INVALIDARG);
    VARIANT wrong{};
    wrong.vt = VT_BSTR;
    EXPECT_EQ(entries.object->get_accRole(wrong, &value), E_INVALIDARG);
    EXPECT_EQ(entries.object->get_accName(number(1), nullptr), E_POINTER);
    EXPECT_EQ(entries.object->get_accRole(number(1), nullptr), E_POINTER);
    EXPECT_EQ(entries.object->get_accState(number(1), nullptr), E_POINTER);
    EXPECT_EQ(entries.object->get_accChild(number(1), nullptr), E_POINTER);
    EXPECT_EQ(entries.object->get_accChildCount(nullptr), E_POINTER);
    EXPECT_EQ(entries.object->get_accParent(nullptr), E_POINTER);
    EXPECT_EQ(entries.object->get_accFocus(nullptr), E_POINTER);
    EXPECT_EQ(entries.object->get_accSelection(nullptr), E_POINTER);
    EXPECT_EQ(entries.object->accHitTest(0, 0, nullptr), E_POINTER);
    EXPECT_EQ(entries.object->accNavigate(NAVDIR_NEXT, number(1), nullptr), E_POINTER);
    EXPECT_EQ(entries.object->accLocation(nullptr, nullptr, nullptr, nullptr, number(1)),
              E_POINTER);
    EXPECT_EQ(entries.object->accHitTest(-5000, -5000, &value), S_FALSE);
    EXPECT_EQ(entries.object->put_accName(number(1), nullptr), DISP_E_MEMBERNOTFOUND);
}

namespace {

std::vector<std::pair<HWND, LONG>> focused;

void CALLBACK listen(HWINEVENTHOOK, DWORD, HWND window, LONG object, LONG child, DWORD, DWORD) {
    if (object == OBJID_CLIENT) focused.emplace_back(window, child);
}

} // namespace

TEST_F(Accessibility, TellsWhereTheFocusGoes) {
    const HWINEVENTHOOK hook =
        SetWinEventHook(EVENT_OBJECT_FOCUS, EVENT_OBJECT_FOCUS, nullptr, &listen,
                        GetCurrentProcessId(), GetCurrentThreadId(), WINEVENT_OUTOFCONTEXT);
    ASSERT_TRUE(hook);
    focused.clear();
    const auto told = [](HWND window, LONG part) {
        hands::pump();
        const std::pair wanted{window, part};
        return std::find(focused.begin(), focused.end(), wanted) != focused.end();
    };
    const HWND cells = window(L"Output columns");
    SetFocus(cells);
    const LONG before = grid().focus().part;
    EXPECT_TRUE(told(cells, before));
    hands::key(cells, VK_RIGHT, 0, [] { hands::pump(); });
    EXPECT_TRUE(told(cells, before + 1));
    const HWND drawing = window(L"Tables and joins");
    line().object->accSelect(SELFLAG_TAKEFOCUS, number(3));
    EXPECT_TRUE(told(drawing, 3));
    UnhookWinEvent(hook);
}
