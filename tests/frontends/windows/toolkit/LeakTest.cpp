#include "support/FakeModel.h"
#include "support/SystemObjects.h"
#include "support/WindowsHands.h"

#include <Zandor/windows/WindowControl.h>

#include <gtest/gtest.h>

using namespace zandor;

namespace {

class NobodyHears final : public TalvikDBxZandor::ZandorEvents {
public:
    void Raise(TalvikDBxZandor::Event, const TalvikDBxZandor::EventArguments&) override {}
};

/// A host's window with a control over two tables, a join and an output column, shown, scrolled,
/// edited and closed.
void openAndClose() {
    fake::Library library;
    NobodyHears nobody;
    const auto model = library.newModel();
    const auto orders = model->table(u"ORDERS", {u"*", u"ID", u"CUSTOMER"});
    const auto customers = model->table(u"CUSTOMERS", {u"*", u"ID", u"NAME"});
    model->join(orders, u"CUSTOMER", customers, u"ID");
    model->definition(orders, u"ID");
    const HWND host =
        CreateWindowExW(0, hands::hostClass(&DefWindowProcW), L"Host", WS_OVERLAPPEDWINDOW, 0, 0,
                        800, 600, nullptr, nullptr, GetModuleHandleW(nullptr), nullptr);
    {
        platform::windows::WindowControl control(host, library, nobody);
        control.control().DebugSwitch(0);
        control.control().OnlyJoin(false);
        control.setBounds({0, 0, 780, 560});
        control.show(true);
        ShowWindow(host, SW_SHOWNOACTIVATE);
        control.control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(model));
        hands::pump();
        const HWND grid = FindWindowExW(control.window(), nullptr, nullptr, L"Output columns");
        EXPECT_TRUE(grid);
        hands::click(grid, {150, 90});
        hands::pump();
        RedrawWindow(control.window(), nullptr, nullptr, RDW_INVALIDATE | RDW_ALLCHILDREN);
        hands::pump();
        control.control().Terminate();
    }
    DestroyWindow(host);
    hands::pump();
}

} // namespace

TEST(ControlsOpenedAndClosed, LeaveNoObjectOfTheSystemsBehind) {
    expectNothingLeftBehind(openAndClose);
}
