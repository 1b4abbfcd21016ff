#include "Boxes.h"
#include "Container.h"
#include "Picture.h"

#include <gtest/gtest.h>

#include <olectl.h>

#include <algorithm>

using namespace zandor::automation;

namespace {

/// A font of the system's, of so many points.
Value fontOf(int points) {
    FONTDESC description{};
    description.cbSizeofstruct = sizeof description;
    wchar_t name[] = L"Tahoma";
    description.lpstrName = name;
    description.cySize.int64 = LONGLONG{points} * 10000;
    description.sWeight = FW_NORMAL;
    Held<IDispatch> font;
    EXPECT_EQ(OleCreateFontIndirect(&description, IID_IFontDisp, font.slotOfAny()), S_OK);
    return Value(font);
}

std::map<DISPID, Value> saying(DISPID id, Value value) {
    std::map<DISPID, Value> ambient;
    ambient.emplace(id, std::move(value));
    return ambient;
}

/// How high the letters of an input in the control are.
LONG lettersOf(const Container& form) {
    struct Search {
        static BOOL CALLBACK test(HWND window, LPARAM found) {
            wchar_t kind[16] = {};
            GetClassNameW(window, kind, 16);
            if (lstrcmpiW(kind, L"EDIT") != 0) return TRUE;
            *reinterpret_cast<HWND*>(found) = window;
            return FALSE;
        }
    };
    HWND input = nullptr;
    EnumChildWindows(form.controlWindow(), &Search::test, reinterpret_cast<LPARAM>(&input));
    LOGFONTW look{};
    const auto font = reinterpret_cast<HFONT>(SendMessageW(input, WM_GETFONT, 0, 0));
    EXPECT_TRUE(GetObjectW(font, sizeof look, &look));
    return std::abs(look.lfHeight);
}

/// Something that is reported to the user, and traced.
void err(const Container& form) {
    short on = 1;
    form.control()->put_DebugSwitch(&on);
    form.control()->SetCurrentTable(nullptr);
    form.control()->put_HorizontalScrollbarPos(32000);
}

} // namespace

TEST(TheSurroundings, GiveTheControlTheirFont) {
    Container form(saying(DISPID_AMBIENT_FONT, fontOf(24)));
    form.tell(OLEIVERB_SHOW);
    EXPECT_EQ(lettersOf(form), 32); // of 96 to an inch
    form.ambient[DISPID_AMBIENT_FONT] = fontOf(12);
    EXPECT_EQ(form.as<IOleControl>()->OnAmbientPropertyChange(DISPID_AMBIENT_BACKCOLOR), S_OK);
    EXPECT_EQ(lettersOf(form), 32);
    EXPECT_EQ(form.as<IOleControl>()->OnAmbientPropertyChange(DISPID_AMBIENT_FONT), S_OK);
    EXPECT_EQ(lettersOf(form), 16);
    form.ambient[DISPID_AMBIENT_FONT] = Value(std::int32_t{5}); // none at all
    EXPECT_EQ(form.as<IOleControl>()->OnAmbientPropertyChange(DISPID_UNKNOWN), S_OK);
    EXPECT_EQ(lettersOf(form), 16);
}

TEST(TheSurroundings, GiveTheCanvasTheirColour) {
    Container form(saying(DISPID_AMBIENT_BACKCOLOR, Value(std::int32_t{RGB(10, 120, 30)})));
    const POINT onTheCanvas{300, 100};
    EXPECT_EQ(Picture::of(form).at(onTheCanvas), RGB(10, 120, 30));
    form.ambient[DISPID_AMBIENT_BACKCOLOR] =
        Value(static_cast<std::int32_t>(0x80000000 | COLOR_HIGHLIGHT));
    form.as<IOleControl>()->OnAmbientPropertyChange(DISPID_AMBIENT_BACKCOLOR);
    EXPECT_EQ(Picture::of(form).at(onTheCanvas), GetSysColor(COLOR_HIGHLIGHT));
}

TEST(TheSurroundings, HearOfNothingAtDesignTime) {
    Boxes::taken();
    {
        Container form(saying(DISPID_AMBIENT_USERMODE, Value(false)));
        form.tell(OLEIVERB_UIACTIVATE);
        err(form);
        EXPECT_EQ(Boxes::taken(), std::vector<std::string>{});
        // What is clicked is the form's, and so is the keyboard.
        EXPECT_FALSE(IsWindowEnabled(form.controlWindow()));
        EXPECT_EQ(GetFocus(), form.window());
    }
    EXPECT_EQ(Boxes::taken(), std::vector<std::string>{}); // its last trace, too
}

TEST(TheSurroundings, HearOfAllWhenTheFormIsUsed) {
    {
        Container form(saying(DISPID_AMBIENT_USERMODE, Value(false)));
        form.tell(OLEIVERB_SHOW);
        form.ambient[DISPID_AMBIENT_USERMODE] = Value(true);
        form.as<IOleControl>()->OnAmbientPropertyChange(DISPID_AMBIENT_USERMODE);
        EXPECT_TRUE(IsWindowEnabled(form.controlWindow()));
        Boxes::taken();
        err(form);
        const std::vector<std::string> boxes = Boxes::taken();
        ASSERT_GT(boxes.size(), 1U); // traces, and a report among them
        EXPECT_NE(std::find(boxes.begin(), boxes.end(), "Unexpected Error:"), boxes.end());
        short off = 0;
        form.control()->put_DebugSwitch(&off);
    }
    Boxes::taken();
}

TEST(TheSurroundings, MayBeDeadToTheUser) {
    Container form;
    form.tell(OLEIVERB_SHOW);
    form.ambient[DISPID_AMBIENT_UIDEAD] = Value(true);
    form.as<IOleControl>()->OnAmbientPropertyChange(DISPID_AMBIENT_UIDEAD);
    EXPECT_FALSE(IsWindowEnabled(form.controlWindow()));
    form.ambient[DISPID_AMBIENT_UIDEAD] = Value(false);
    form.as<IOleControl>()->OnAmbientPropertyChange(DISPID_AMBIENT_UIDEAD);
    EXPECT_TRUE(IsWindowEnabled(form.controlWindow()));
}
