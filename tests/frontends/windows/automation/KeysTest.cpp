#include "Container.h"

#include <gtest/gtest.h>

using namespace zandor::automation;
using Calls = Container::Calls;

namespace {

class TheKeys : public testing::Test {
protected:
    TheKeys() {
        form.control()->put_OnlyJoin(VARIANT_FALSE);
        bindQuery(*form.control().get());
        form.tell(OLEIVERB_UIACTIVATE);
        form.pump();
        form.calls();
    }
    bool isInControl() const { return IsChild(form.controlWindow(), GetFocus()); }
    /// Walks through the control by Tab until it would leave it; how many steps that took.
    int walkThrough() {
        int steps = 0;
        do {
            form.press(VK_TAB);
            if (++steps > 20) break;
        } while (form.calls().empty());
        return steps;
    }

    Container form;
};

} // namespace

TEST_F(TheKeys, AreTheControlsFirst) {
    const HWND before = GetFocus();
    form.press(VK_TAB);
    EXPECT_TRUE(isInControl());
    const HWND first = GetFocus();
    EXPECT_NE(first, before);
    for (const int key : {VK_DOWN, VK_HOME, VK_RIGHT}) form.press(key);
    EXPECT_EQ(GetFocus(), first);
    form.press(VK_TAB);
    EXPECT_NE(GetFocus(), first);
    EXPECT_EQ(form.calls(), Calls{});
}

TEST_F(TheKeys, AreTheContainersWhereTheyMeanNothingInTheControl) {
    form.own = {VK_F5, 'S'};
    form.press(VK_F5);
    form.press('S', 2);
    form.press(VK_F8); // nobody's
    EXPECT_EQ(form.calls(), (Calls{"key 116 with 0", "key 83 with 2", "key 119 with 0"}));
    form.press(VK_ESCAPE); // with nothing to be left
    EXPECT_EQ(form.calls(), Calls{"key 27 with 0"});
}

TEST_F(TheKeys, LeaveTheControlBehindItsLastStop) {
    const HWND button = CreateWindowExW(0, L"BUTTON", L"Beside", WS_CHILD | WS_VISIBLE | WS_TABSTOP,
                                        0, 0, 80, 20, form.window(), nullptr, nullptr, nullptr);
    // A container that has no use for them: what stands beside has the focus.
    EXPECT_GT(walkThrough(), 3); // two tables, a line, the grid
    EXPECT_EQ(GetFocus(), button);
    // One that has: it does with it as it likes.
    form.tell(OLEIVERB_UIACTIVATE);
    form.calls();
    form.own = {VK_TAB};
    walkThrough();
    EXPECT_NE(GetFocus(), button);
}

TEST_F(TheKeys, OpenAnEditorAndAreItsOwn) {
    const HWND grid = FindWindowExW(form.controlWindow(), nullptr, nullptr, L"Output columns");
    ASSERT_TRUE(grid);
    SetFocus(grid);
    form.press(VK_F2);
    const HWND editor = GetFocus();
    ASSERT_NE(editor, grid);
    form.calls();
    form.own = {'C', 'V', VK_ESCAPE};
    form.press('C', 2);
    form.press(VK_ESCAPE);
    EXPECT_EQ(form.calls(), Calls{});
    EXPECT_NE(GetFocus(), editor);
}

TEST_F(TheKeys, AreTheSystemsWithAltEvenInAnEditor) {
    const HWND grid = FindWindowExW(form.controlWindow(), nullptr, nullptr, L"Output columns");
    SetFocus(grid);
    form.press(VK_F2);
    ASSERT_NE(GetFocus(), grid);
    form.calls();
    form.own = {VK_F4};
    form.press(VK_F4, 4); // closes a form
    EXPECT_EQ(form.calls(), Calls{"key 115 with 4"});
    form.press(VK_F4); // drops a list down
    EXPECT_EQ(form.calls(), Calls{});
}

TEST_F(TheKeys, OfAnInputMethodComeWholeIntoAnEditor) {
    const HWND grid = FindWindowExW(form.controlWindow(), nullptr, nullptr, L"Output columns");
    SetFocus(grid);
    form.press(VK_F2);
    const HWND editor = GetFocus();
    wchar_t kind[16] = {};
    GetClassNameW(editor, kind, 16);
    ASSERT_EQ(lstrcmpiW(kind, L"EDIT"), 0);
    SetWindowTextW(editor, L"");
    const HIMC method = ImmGetContext(editor);
    ASSERT_TRUE(method);
    wchar_t composed[] = L"\u65E5\u672C";
    EXPECT_TRUE(
        ImmSetCompositionStringW(method, SCS_SETSTR, composed, sizeof composed - 2, nullptr, 0));
    form.pump();
    EXPECT_EQ(GetFocus(), editor) << "the editor stays open meanwhile";
    ImmNotifyIME(method, NI_COMPOSITIONSTR, CPS_COMPLETE, 0);
    form.pump();
    ImmReleaseContext(editor, method);
    wchar_t text[40] = {};
    GetWindowTextW(editor, text, 40);
    EXPECT_STREQ(text, composed);
    EXPECT_EQ(GetFocus(), editor);
}

TEST_F(TheKeys, OfAFormsOwnButtonsAreNotTaken) {
    CONTROLINFO info{};
    EXPECT_EQ(form.as<IOleControl>()->GetControlInfo(&info), S_OK);
    EXPECT_EQ(info.dwFlags, DWORD{CTRLINFO_EATS_RETURN | CTRLINFO_EATS_ESCAPE});
    EXPECT_EQ(info.cAccel, 0);
    MSG elsewhere{};
    elsewhere.hwnd = form.window();
    elsewhere.message = WM_KEYDOWN;
    elsewhere.wParam = VK_RETURN;
    EXPECT_EQ(form.as<IOleInPlaceActiveObject>()->TranslateAccelerator(&elsewhere), S_FALSE);
}
