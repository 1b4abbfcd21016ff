#include "Boxes.h"
#include "Container.h"
#include "Picture.h"
#include "Sink.h"

#include "support/SystemObjects.h"

#include <gtest/gtest.h>

#include <thread>

#include <oleacc.h>

using namespace zandor::automation;

namespace {

/// A form with a control over a query: shown, drawn, heard, resized and closed.
void openAndClose() {
    Container form;
    form.control()->put_OnlyJoin(VARIANT_FALSE);
    const Sink sink(form.control().get());
    bindQuery(*form.control().get());
    form.tell(OLEIVERB_UIACTIVATE);
    const RECT smaller{0, 0, 400, 300};
    const RECT clip{0, 0, 200, 200};
    form.as<IOleInPlaceObject>()->SetObjectRects(&smaller, &clip);
    form.pump();
    EXPECT_EQ(Picture(*form.as<IViewObject2>().get(), {100, 80}).drawn(), S_OK);
}

} // namespace

TEST(TwoControls, StandInOneProcessWithoutKnowingEachOther) {
    Container one;
    Container other;
    bindQuery(*one.control().get());
    const Sink heard(other.control().get());
    one.tell(OLEIVERB_UIACTIVATE);
    other.tell(OLEIVERB_UIACTIVATE);
    one.control()->putref_Zandor(nullptr);
    EXPECT_EQ(heard.heard().size(), 0U);
    one.unload();
    bindQuery(*other.control().get());
    EXPECT_TRUE(IsWindowVisible(other.controlWindow()));
    EXPECT_FALSE(Dll::get().canUnload());
    other.control()->putref_Zandor(nullptr);
    EXPECT_EQ(heard.heard().size(), 1U);
}

TEST(TwoControls, StandInTwoThreads) {
    const auto live = [] {
        OleInitialize(nullptr);
        {
            const Boxes closed;
            for (int i = 0; i < 20; ++i) openAndClose();
        }
        OleUninitialize();
    };
    std::thread one(live);
    std::thread other(live);
    one.join();
    other.join();
    EXPECT_TRUE(Dll::get().canUnload());
}

TEST(ControlsMadeAndReleased, LeaveNothingBehindWithoutAForm) {
    expectNothingLeftBehind([] {
        const auto control = newControl();
        bindQuery(*control.get());
        control->Terminate();
    });
    EXPECT_TRUE(Dll::get().canUnload());
}

TEST(WhatAScreenReaderKeeps, KeepsTheLibraryAndSaysThatThereIsNothingAnyMore) {
    Held<IAccessible> kept;
    Held<IAccessible> keptOfATable;
    {
        Container form;
        form.control()->put_OnlyJoin(VARIANT_FALSE);
        bindQuery(*form.control().get());
        form.tell(OLEIVERB_UIACTIVATE);
        form.pump();
        const HWND canvas =
            FindWindowExW(form.controlWindow(), nullptr, nullptr, L"Tables and joins");
        const HWND table = FindWindowExW(canvas, nullptr, L"ZandorPart", L"orders");
        ASSERT_TRUE(table);
        const auto client = static_cast<DWORD>(OBJID_CLIENT);
        ASSERT_EQ(
            AccessibleObjectFromWindow(canvas, client, __uuidof(IAccessible), kept.slotOfAny()),
            S_OK);
        ASSERT_EQ(AccessibleObjectFromWindow(table, client, __uuidof(IAccessible),
                                             keptOfATable.slotOfAny()),
                  S_OK);
        LONG count = 0;
        EXPECT_EQ(kept->get_accChildCount(&count), S_OK);
        EXPECT_GT(count, 0);
    }
    EXPECT_FALSE(Dll::get().canUnload());
    for (const auto* const object : {&kept, &keptOfATable}) {
        VARIANT self{};
        self.vt = VT_I4;
        LONG count = -1;
        EXPECT_TRUE(FAILED((*object)->get_accChildCount(&count)));
        BSTR name = nullptr;
        EXPECT_TRUE(FAILED((*object)->get_accName(self, &name)));
        EXPECT_EQ(name, nullptr);
        VARIANT found{};
        EXPECT_TRUE(FAILED((*object)->accHitTest(10, 10, &found)));
        EXPECT_TRUE(FAILED((*object)->accDoDefaultAction(self)));
        IDispatch* parent = nullptr;
        EXPECT_TRUE(FAILED((*object)->get_accParent(&parent)));
    }
    kept = {};
    EXPECT_FALSE(Dll::get().canUnload());
    keptOfATable = {};
    EXPECT_TRUE(Dll::get().canUnload());
}

TEST(FormsOpenedAndClosed, LeaveNothingBehind) {
    expectNothingLeftBehind(openAndClose);
    EXPECT_TRUE(Dll::get().canUnload());
}
