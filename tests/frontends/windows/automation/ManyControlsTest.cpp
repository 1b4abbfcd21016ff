#include "Boxes.h"
#include "Container.h"
#include "Picture.h"
#include "Sink.h"

#include "support/SystemObjects.h"

#include <gtest/gtest.h>

#include <thread>

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

TEST(FormsOpenedAndClosed, LeaveNothingBehind) {
    expectNothingLeftBehind(openAndClose);
    EXPECT_TRUE(Dll::get().canUnload());
}
