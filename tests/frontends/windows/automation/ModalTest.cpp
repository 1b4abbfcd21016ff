#include "Boxes.h"
#include "Container.h"
#include "Late.h"

#include "support/WindowsHands.h"

#include <gtest/gtest.h>

#include <oleacc.h>

using namespace zandor;
using namespace zandor::automation;

// What a host may do while a box, a dialog or a menu of its control stands open.

namespace {

HWND openMenu() {
    const HWND menu = FindWindowW(L"#32768", nullptr);
    return menu && IsWindowVisible(menu) ? menu : nullptr;
}

std::map<UINT_PTR, std::function<void()>> deedsToDo;

void CALLBACK doDeed(HWND, UINT, UINT_PTR timer, DWORD) {
    KillTimer(nullptr, timer);
    const auto found = deedsToDo.extract(timer);
    if (!found.empty()) found.mapped()();
}

/// Done once from the loop that is running then.
void later(std::function<void()> deed) {
    deedsToDo[SetTimer(nullptr, 0, 1, &doDeed)] = std::move(deed);
}

void onceOpen(const std::function<void()>& deed, int tries = 200) {
    later([deed, tries] {
        if (!openMenu() && tries > 0) return onceOpen(deed, tries - 1);
        EXPECT_TRUE(openMenu());
        deed();
    });
}

/// A form with a bound control that its user works with.
struct Form {
    Form() {
        form.control()->put_OnlyJoin(VARIANT_FALSE);
        bindQuery(*form.control().get());
        form.tell(OLEIVERB_UIACTIVATE);
        form.pump();
        form.calls();
        Boxes::taken();
    }

    HWND part(const wchar_t* title, const wchar_t* kind = L"ZandorPart") const {
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
        EnumChildWindows(form.window(), &Search::test, reinterpret_cast<LPARAM>(&search));
        return search.found;
    }

    Container form;
};

/// Something modal: how a user or a host has it open, and how it is left.
struct Place {
    const char* name;
    /// Opens it; `inside` is done while it stands open, before it is left.
    void (*open)(Form& form, const std::function<void()>& inside);
};

void meetBox(const std::function<void()>& inside) {
    Boxes::meetNext([inside](HWND box) {
        later([inside, box] {
            inside();
            if (IsWindow(box)) PostMessageW(box, WM_COMMAND, IDCANCEL, 0);
        });
    });
}

void openReport(Form& form, const std::function<void()>& inside) {
    meetBox(inside);
    const auto control = form.form.control();
    control->put_HorizontalScrollbarPos(-7);
}

void trace(Form& form) {
    SHORT on = 1;
    form.form.control()->put_DebugSwitch(&on);
}

void openTraceOfAPress(Form& form, const std::function<void()>& inside) {
    trace(form);
    meetBox(inside);
    const HWND list = form.part(L"orders", L"LISTBOX");
    hands::mouse(list, WM_LBUTTONDOWN, {30, 20}, MK_LBUTTON);
    hands::mouse(list, WM_LBUTTONUP, {30, 20}, 0);
    form.form.pump();
}

void openTraceOfABinding(Form& form, const std::function<void()>& inside) {
    trace(form);
    meetBox(inside);
    const auto control = form.form.control();
    bindQuery(*control.get());
}

void openMenuOverATable(Form& form, const std::function<void()>& inside) {
    onceOpen([inside] {
        inside();
        EndMenu();
    });
    const HWND list = form.part(L"orders", L"LISTBOX");
    hands::mouse(list, WM_RBUTTONDOWN, {30, 20}, MK_RBUTTON);
    hands::mouse(list, WM_RBUTTONUP, {30, 20}, 0);
    form.form.pump();
}

void openDefinition(Form& form, const std::function<void()>& inside) {
    meetBox(inside);
    // As somebody does who works by a screen reader.
    Held<IAccessible> canvas;
    ASSERT_EQ(AccessibleObjectFromWindow(form.part(L"Tables and joins"),
                                         static_cast<DWORD>(OBJID_CLIENT), __uuidof(IAccessible),
                                         canvas.slotOfAny()),
              S_OK);
    VARIANT line{};
    line.vt = VT_I4;
    line.lVal = 3; // behind two tables
    EXPECT_EQ(canvas->accDoDefaultAction(line), S_OK);
}

constexpr Place places[] = {{"a report", &openReport},
                            {"a trace of a press", &openTraceOfAPress},
                            {"a trace while a query is bound", &openTraceOfABinding},
                            {"the menu", &openMenuOverATable},
                            {"the definition", &openDefinition}};

struct Deed {
    const char* name;
    void (*act)(Form& form);
    bool keepsControl = true;
};

constexpr Deed deeds[] = {
    {"nothing", [](Form&) {}},
    {"binds another query",
     [](Form& form) {
         if (form.form.control()) bindQuery(*form.form.control().get());
     }},
    {"clears the query", [](Form& form) { form.form.control()->putref_Zandor(nullptr); }},
    {"ends the binding", [](Form& form) { form.form.control()->Terminate(); }},
    {"deletes a table",
     [](Form& form) {
         const Late query = Late(form.form.control().get()).at(L"Zandor");
         const Late table = query.at(L"Tables").at(L"Item", std::int16_t{1});
         EXPECT_TRUE(query.call(L"DeleteTable", Held<IDispatch>(table.object())));
     }},
    {"closes the control", [](Form& form) { form.form.as<IOleObject>()->Close(OLECLOSE_NOSAVE); }},
    {"hides the control", [](Form& form) { form.form.tell(OLEIVERB_HIDE); }},
    {"lets go of the control", [](Form& form) { form.form.unload(); }, false},
};

} // namespace

TEST(AHostMeanwhile, IsToldThatSomethingModalOpensAndThatItHasClosed) {
    for (const Place& place : places) {
        Form form;
        int meanwhile = -1;
        place.open(form, [&] { meanwhile = form.form.modal(); });
        EXPECT_EQ(meanwhile, 1) << place.name;
        EXPECT_EQ(form.form.modal(), 0) << place.name;
        SHORT off = 0;
        form.form.control()->put_DebugSwitch(&off);
        Boxes::taken();
    }
}

TEST(AHostMeanwhile, MayDoAnythingWhileSomethingModalStandsOpen) {
    int tried = 0;
    for (const Place& place : places)
        for (const Deed& deed : deeds) {
            SCOPED_TRACE(std::string(place.name) + ", and the host " + deed.name);
            {
                Form form;
                bool done = false;
                place.open(form, [&] {
                    // What it sets off is not traced.
                    SHORT off = 0;
                    form.form.control()->put_DebugSwitch(&off);
                    deed.act(form);
                    done = true;
                });
                EXPECT_TRUE(done);
                form.form.pump();
                EXPECT_EQ(form.form.modal(), 0);
                EXPECT_FALSE(openMenu());
                EXPECT_TRUE(IsWindowEnabled(form.form.window()));
                EXPECT_EQ(bool(form.form.control()), deed.keepsControl);
                if (deed.keepsControl) {
                    // And goes on as before.
                    EXPECT_EQ(form.form.tell(OLEIVERB_UIACTIVATE), S_OK);
                    bindQuery(*form.form.control().get());
                    form.form.pump();
                    EXPECT_TRUE(form.part(L"orders"));
                }
                Boxes::taken();
                ++tried;
            }
            EXPECT_TRUE(Dll::get().canUnload());
        }
    std::printf("%d cells\n", tried);
}

TEST(AHostMeanwhile, MayLetGoOfTheControlAsItIsToldOfSomethingModal) {
    for (const Place& place : places)
        for (const char* const call : {"EnableModeless(not)", "EnableModeless"}) {
            SCOPED_TRACE(std::string(place.name) + ", " + call);
            {
                Form form;
                form.form.on[call] = [&] {
                    form.form.unload();
                    return S_OK;
                };
                place.open(form, [] {});
                Boxes::meetNext({});
                form.form.pump();
                EXPECT_FALSE(form.form.control());
                EXPECT_EQ(form.form.modal(), 0);
                EXPECT_TRUE(IsWindowEnabled(form.form.window()));
                Boxes::taken();
            }
            EXPECT_TRUE(Dll::get().canUnload());
        }
}

namespace {

struct Told {
    WPARAM w;
    std::int32_t scratch;
};

std::vector<Told> told;
WNDPROC before = nullptr;

/// The message that other parts of a host, an input filter say, hear the menu's begin and end by.
LRESULT CALLBACK listening(HWND window, UINT message, WPARAM w, LPARAM l) {
    static const UINT registered = RegisterWindowMessageA("TALVIKDISABLEVELT");
    if (message == registered) {
        auto* const scratch = reinterpret_cast<std::int32_t*>(l);
        EXPECT_FALSE(IsBadWritePtr(scratch, sizeof *scratch));
        told.push_back({w, *scratch});
        *scratch = 77; // which is the listener's to write to
    }
    return CallWindowProcW(before, window, message, w, l);
}

} // namespace

TEST(AHostMeanwhile, HearsTheMenuBeginAndEndByAMessageToTheControlsWindow) {
    Form form;
    told.clear();
    before = reinterpret_cast<WNDPROC>(SetWindowLongPtrW(form.form.controlWindow(), GWLP_WNDPROC,
                                                         reinterpret_cast<LONG_PTR>(&listening)));
    std::size_t atOpen = 0;
    openMenuOverATable(form, [&] { atOpen = told.size(); });
    EXPECT_EQ(atOpen, 1U) << "the first comes before the menu";
    ASSERT_EQ(told.size(), 2U);
    EXPECT_EQ(told[0].w, 0U);
    EXPECT_EQ(told[1].w, 1U);
    // A host's own procedure in front changes nothing else.
    openMenuOverATable(form, [] {});
    EXPECT_EQ(told.size(), 4U);
    SetWindowLongPtrW(form.form.controlWindow(), GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(before));
}
