#include "frontends/windows/automation/writeBitmap.h"
#include "frontends/windows/toolkit/Canvas.h"
#include "frontends/windows/toolkit/ControlWindow.h"
#include "frontends/windows/toolkit/GridWindow.h"
#include "support/FakeModel.h"
#include "support/WindowsHands.h"
#include "support/WindowsLook.h"

#include <Zandor/windows/WindowControl.h>

#include <gtest/gtest.h>

using namespace zandor;
using namespace zandor::platform::windows;

// A control on monitors of other dots to an inch shows the same in as many more of them.

namespace {

class NobodyLooks final : public TalvikDBxZandor::ZandorEvents {
public:
    void Raise(TalvikDBxZandor::Event, const TalvikDBxZandor::EventArguments&) override {}
};

class OnAMonitor : public testing::TestWithParam<int> {
protected:
    OnAMonitor() {
        const auto orders = model->table(u"ORDERS", {u"*", u"ID", u"CUSTOMER"});
        const auto customers = model->table(u"CUSTOMERS", {u"*", u"ID", u"NAME"});
        model->join(orders, u"CUSTOMER", customers, u"ID");
        model->definition(orders, u"ID");
        control.control().DebugSwitch(0);
        control.control().OnlyJoin(false);
        customers->Left(4000);
        control.setBounds({0, 0, 640, 480});
        control.show(true);
        control.control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(model));
        hands::pump();
    }
    ~OnAMonitor() override {
        control.control().Terminate();
        DestroyWindow(mHost);
    }

    /// The control comes to another monitor, where its host gives it as much room as before.
    void move(int dpi) const {
        dynamic_cast<ControlWindow&>(*Window::of(control.window())).setDpi(dpi);
        control.setBounds({0, 0, MulDiv(640, dpi, 96), MulDiv(480, dpi, 96)});
        hands::pump();
    }

    template <class W>
    W& part(const char* name) const {
        return dynamic_cast<W&>(*hands::findPart(platform::fromUtf8(name), control.window()));
    }
    TableWindow& table(int index) const {
        return part<TableWindow>(index == 1 ? "lstTable(1)" : "lstTable(2)");
    }
    GridWindow& grid() const { return part<GridWindow>("sprColumn"); }
    CanvasLine& join() const {
        return *Window::of(control.window())->surroundings().canvas->lines().front();
    }
    /// Where the middle of an entry is, in the canvas, in twips.
    float heightOf(int index, int row) const {
        const TableWindow& box = table(index);
        const RECT place = box.list().placeOf(row);
        POINT middle{0, (place.top + place.bottom) / 2};
        MapWindowPoints(box.list().hwnd(), GetParent(box.hwnd()), &middle, 1);
        return box.surroundings().scale.toTwips(middle.y);
    }
    static void click(const Window& window, const RECT& place) {
        hands::click(window.hwnd(),
                     {(place.left + place.right) / 2, (place.top + place.bottom) / 2});
        hands::pump();
    }

    fake::Library library;
    NobodyLooks nobody;
    platform::Ref<fake::Model> model = library.newModel();

private:
    HWND mHost = CreateWindowExW(0, hands::hostClass(&DefWindowProcW), L"Host",
                                 WS_POPUP | WS_VISIBLE | WS_CLIPCHILDREN, 0, 0, 1300, 1000, nullptr,
                                 nullptr, GetModuleHandleW(nullptr), nullptr);

public:
    WindowControl control{mHost, library, nobody};
};

} // namespace

TEST_P(OnAMonitor, EverythingIsAsLargeAsItIsElsewhere) {
    const int dpi = GetParam();
    const platform::Bounds boxBefore = table(1).bounds();
    const RECT pixelsBefore = table(1).placeInParent();
    const int gridRow = grid().rowHeight();
    const int gridColumn = grid().columnWidth(2);
    const int entry = table(1).list().rowHeight();
    const int letters = table(1).surroundings().fonts.heightOf(table(1).fontHandle());
    const RECT title = table(1).titleBar();
    move(dpi);
    // In twips nothing is different, and in pixels all of it.
    EXPECT_FLOAT_EQ(control.toolkit().ScaleWidth(), 9600);
    EXPECT_FLOAT_EQ(control.toolkit().ScaleHeight(), 7200);
    EXPECT_EQ(table(1).bounds(), boxBefore);
    const auto scaled = [dpi](LONG pixels) { return MulDiv(pixels, dpi, 96); };
    const RECT pixels = table(1).placeInParent();
    EXPECT_NEAR(pixels.left, scaled(pixelsBefore.left), 1);
    EXPECT_NEAR(pixels.right, scaled(pixelsBefore.right), 1);
    EXPECT_NEAR(pixels.bottom, scaled(pixelsBefore.bottom), 1);
    // What goes by the height of letters goes by the font that there is for them.
    const int tolerance = dpi / 48;
    EXPECT_NEAR(table(1).surroundings().fonts.heightOf(table(1).fontHandle()), scaled(letters),
                tolerance);
    EXPECT_NEAR(table(1).list().rowHeight(), scaled(entry), tolerance);
    EXPECT_NEAR(table(1).titleBar().bottom, scaled(title.bottom), 2 * tolerance);
    EXPECT_NEAR(grid().rowHeight(), scaled(gridRow), tolerance);
    EXPECT_EQ(grid().columnWidth(2), scaled(gridColumn));
    EXPECT_GT(grid().rowHeight() * 96, (gridRow - 1) * dpi);
    EXPECT_GT(table(1).list().rowHeight() * 96, (entry - 1) * dpi);
}

TEST_P(OnAMonitor, LinesLeadToTheirEntries) {
    move(GetParam());
    const float pixel = table(1).surroundings().scale.toTwips(1);
    EXPECT_NEAR(join().Y1(), heightOf(1, 2), 1.5F * pixel);
    EXPECT_NEAR(join().Y2(), heightOf(2, 1), 1.5F * pixel);
}

TEST_P(OnAMonitor, WhatIsPressedIsWhatIsSeen) {
    // How far the middle of an editor is from that of its cell, in twips.
    const auto openEditor = [this] {
        const RECT cell = grid().cellPlace(1, 1);
        click(grid(), cell);
        const Window& editor = part<Window>("fraValue");
        EXPECT_TRUE(IsWindowVisible(editor.hwnd()));
        POINT middle{(cell.left + cell.right) / 2, (cell.top + cell.bottom) / 2};
        MapWindowPoints(grid().hwnd(), control.window(), &middle, 1);
        const RECT place = editor.placeInParent();
        const Scale& scale = grid().surroundings().scale;
        return std::pair(scale.toTwips((place.left + place.right) / 2.0 - middle.x),
                         scale.toTwips((place.top + place.bottom) / 2.0 - middle.y));
    };
    const auto before = openEditor();
    move(GetParam());
    click(table(2).list(), table(2).list().placeOf(2));
    EXPECT_EQ(table(2).list().selected(), std::vector<int>{2});
    const RECT cell = grid().cellPlace(1, 1);
    EXPECT_EQ(grid().cellAt({(cell.left + cell.right) / 2, (cell.top + cell.bottom) / 2}),
              std::make_pair(1, 1));
    const auto after = openEditor();
    EXPECT_NEAR(after.first, before.first, 45);
    EXPECT_NEAR(after.second, before.second, 45);
    // The line in its middle, and not a bit beside it.
    Canvas& canvas = *grid().surroundings().canvas;
    const auto middle = join().at(0.5F);
    const Scale& scale = grid().surroundings().scale;
    const POINT at{scale.toPixels(middle.X), scale.toPixels(middle.Y)};
    hands::click(canvas.hwnd(), {at.x, at.y + scale.pixels(40)});
    hands::pump();
    EXPECT_EQ(join().borderWidth(), 1);
    hands::click(canvas.hwnd(), at);
    hands::pump();
    EXPECT_GT(join().borderWidth(), 1);
    // To be looked at.
    RECT all{};
    GetClientRect(control.window(), &all);
    const HDC dc = GetDC(control.window());
    RedrawWindow(control.window(), nullptr, nullptr, RDW_UPDATENOW | RDW_ALLCHILDREN);
    writeBitmap(dc, all, "monitor-" + std::to_string(GetParam()));
    ReleaseDC(control.window(), dc);
}

TEST_P(OnAMonitor, AColumnThatFitsItsFieldStillDoes) {
    // What is cut off is said in a hint.
    const auto hintAt = [this](std::int32_t row) {
        const RECT cell = grid().cellPlace(row, 1);
        hands::mouse(grid().hwnd(), WM_MOUSEMOVE,
                     {(cell.left + cell.right) / 2, (cell.top + cell.bottom) / 2}, 0);
        hands::pump();
        return platform::toUtf8(grid().surroundings().hints.text());
    };
    EXPECT_EQ(hintAt(0), "");
    EXPECT_EQ(hintAt(3), "Visible");
    move(GetParam());
    EXPECT_EQ(hintAt(0), "");
    EXPECT_EQ(hintAt(3), "Visible");
}

TEST_P(OnAMonitor, TheWayBackLeavesEverythingAsItWas) {
    const RECT before = table(2).placeInParent();
    const int row = grid().rowHeight();
    move(GetParam());
    move(96);
    const RECT after = table(2).placeInParent();
    EXPECT_TRUE(EqualRect(&before, &after));
    EXPECT_EQ(grid().rowHeight(), row);
    EXPECT_NEAR(join().Y1(), heightOf(1, 2), 15);
}

INSTANTIATE_TEST_SUITE_P(OfManyDots, OnAMonitor, testing::Values(96, 120, 144, 192));
