#include "Boxes.h"
#include "Container.h"
#include "Late.h"
#include "writeBitmap.h"

#include "frontends/windows/automation/pages/resource.h"

#include <gtest/gtest.h>

using namespace zandor;
using namespace zandor::automation;

namespace {

/// A form whose control is asked for its properties. The system makes pages by their ids.
class AFormThatAsksForProperties : public testing::Test {
protected:
    AFormThatAsksForProperties() {
        EXPECT_EQ(CoRegisterClassObject(ids::propertyPage,
                                        Dll::get().factoryOf(ids::propertyPage).get(),
                                        CLSCTX_INPROC_SERVER, REGCLS_MULTIPLEUSE, &mRegistered),
                  S_OK);
        form.control()->put_OnlyJoin(VARIANT_FALSE);
        form.tell(OLEIVERB_INPLACEACTIVATE);
        form.calls();
        form.on["ShowPropertyFrame"] = [] { return E_NOTIMPL; };
        Boxes::taken();
    }
    ~AFormThatAsksForProperties() override { CoRevokeClassObject(mRegistered); }

    static HWND below(HWND window, int number) {
        struct Search {
            int number;
            HWND found;
            static BOOL CALLBACK test(HWND child, LPARAM l) {
                auto& search = *reinterpret_cast<Search*>(l);
                if (GetDlgCtrlID(child) == search.number) search.found = child;
                return !search.found;
            }
        } search{number, nullptr};
        EnumChildWindows(window, &Search::test, reinterpret_cast<LPARAM>(&search));
        return search.found;
    }

    /// Has the frame's user do something once it stands there.
    void meetFrame(std::function<void(HWND frame)> user) {
        struct Meeting {
            std::function<void(HWND)> then;
            HWND frame = nullptr;
        };
        static Meeting meeting;
        struct Timer {
            static void CALLBACK elapsed(HWND, UINT, UINT_PTR timer, DWORD) {
                KillTimer(nullptr, timer);
                std::exchange(meeting.then, {})(meeting.frame);
            }
        };
        meeting.then = std::move(user);
        Boxes::meetNext([](HWND sheet) {
            meeting.frame = sheet;
            SetTimer(nullptr, 0, 1, &Timer::elapsed);
        });
    }

    Container form;

private:
    DWORD mRegistered = 0;
};

} // namespace

TEST_F(AFormThatAsksForProperties, ShowsItsOwnFrameWhereItHasOne) {
    form.on["ShowPropertyFrame"] = [] { return S_OK; };
    EXPECT_EQ(form.tell(OLEIVERB_PROPERTIES), S_OK);
    EXPECT_EQ(form.calls(), Container::Calls{"ShowPropertyFrame"});
    EXPECT_EQ(Boxes::taken(), std::vector<std::string>{});
}

/// Wine's shows pages and has no use for what is changed there; a frame that applies it stands in
/// the tests of the page.
TEST_F(AFormThatAsksForProperties, HasTheSystemsFrameOtherwise) {
    wchar_t shown[80] = {};
    meetFrame([&](HWND frame) {
        GetWindowTextW(below(frame, ZANDOR_PAGE_TEXT), shown, 80); // of the first member
        RECT place{};
        GetWindowRect(frame, &place);
        const HDC screen = GetDC(nullptr);
        UpdateWindow(frame);
        writeBitmap(screen, place, "property-frame");
        ReleaseDC(nullptr, screen);
        PostMessageW(frame, WM_COMMAND, IDOK, 0);
    });
    EXPECT_EQ(form.tell(OLEIVERB_PROPERTIES), S_OK);
    EXPECT_STREQ(shown, L"Join Defintion");
    EXPECT_EQ(Boxes::taken().size(), 1U);
    form.pump();
}

TEST_F(AFormThatAsksForProperties, KeepsThemWhereTheFrameIsLeft) {
    meetFrame([&](HWND frame) {
        SetWindowTextW(below(frame, ZANDOR_PAGE_TEXT), L"Verbund");
        PostMessageW(frame, WM_COMMAND, IDCANCEL, 0);
    });
    const std::string before = Late(form.control().get()).get(L"LNGJoinForm").text();
    EXPECT_EQ(form.tell(OLEIVERB_PROPERTIES), S_OK);
    EXPECT_EQ(Late(form.control().get()).get(L"LNGJoinForm").text(), before);
    Boxes::taken();
}

TEST_F(AFormThatAsksForProperties, MayLetGoOfItsControlMeanwhile) {
    meetFrame([&](HWND frame) {
        form.unload();
        SetWindowTextW(below(frame, ZANDOR_PAGE_TEXT), L"Verbund");
        PostMessageW(frame, WM_COMMAND, IDOK, 0);
    });
    const auto object = form.as<IOleObject>();
    EXPECT_EQ(object->DoVerb(OLEIVERB_PROPERTIES, nullptr, &form, 0, form.window(), &form.place),
              S_OK);
    EXPECT_FALSE(form.control());
    Boxes::taken();
    form.pump();
}
