#include "support/FakeModel.h"
#include "support/WindowsHands.h"

#include <Zandor/windows/WindowControl.h>

#include <gtest/gtest.h>

#include <vector>

using namespace zandor;

namespace {

class NobodyAsks final : public TalvikDBxZandor::ZandorEvents {
public:
    void Raise(TalvikDBxZandor::Event, const TalvikDBxZandor::EventArguments&) override {}
};

BOOL CALLBACK addList(HWND window, LPARAM lists) {
    wchar_t kind[16] = {};
    if (GetClassNameW(window, kind, 16) && lstrcmpiW(kind, L"COMBOBOX") == 0)
        reinterpret_cast<std::vector<HWND>*>(lists)->push_back(window);
    return TRUE;
}

} // namespace

TEST(AListThatDropsDown, IsOneLineHighHoweverOftenItsControlIsLaidOut) {
    fake::Library library;
    NobodyAsks nobody;
    const HWND host =
        CreateWindowExW(0, hands::hostClass(&DefWindowProcW), L"Host", WS_OVERLAPPEDWINDOW, 0, 0,
                        800, 600, nullptr, nullptr, GetModuleHandleW(nullptr), nullptr);
    platform::windows::WindowControl control(host, library, nobody);
    control.control().DebugSwitch(0);
    for (int width = 600; width < 700; width += 20) control.setBounds({0, 0, width, 500});
    std::vector<HWND> lists;
    EnumChildWindows(control.window(), &addList, reinterpret_cast<LPARAM>(&lists));
    ASSERT_EQ(lists.size(), 2U);
    for (const HWND list : lists) {
        RECT place{};
        GetWindowRect(list, &place);
        const LRESULT line = SendMessageW(list, CB_GETITEMHEIGHT, static_cast<WPARAM>(-1), 0);
        EXPECT_LT(place.bottom - place.top, 2 * line);
    }
}
