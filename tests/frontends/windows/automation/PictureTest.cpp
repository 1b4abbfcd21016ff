#include "Picture.h"

#include <gtest/gtest.h>

using namespace zandor::automation;
using Calls = Container::Calls;

TEST(APicture, ShowsAControlThatIsNotShown) {
    Container form;
    form.control()->put_OnlyJoin(VARIANT_FALSE);
    const Picture empty = Picture::of(form);
    EXPECT_EQ(empty.drawn(), S_OK);
    bindQuery(*form.control().get());
    const Picture full = Picture::of(form);
    EXPECT_EQ(full.drawn(), S_OK);
    const COLORREF ground = GetSysColor(COLOR_BTNFACE);
    EXPECT_GT(full.otherThan(ground), empty.otherThan(ground) + 5000); // two tables and a line
    full.keep("not-shown");
}

TEST(APicture, ShowsAControlOnTheScreen) {
    Container form;
    form.control()->put_OnlyJoin(VARIANT_FALSE);
    bindQuery(*form.control().get());
    form.tell(OLEIVERB_SHOW);
    form.pump();
    const Picture picture(*form.as<IViewObject2>().get(), {600, 400});
    EXPECT_GT(picture.otherThan(GetSysColor(COLOR_BTNFACE)), 5000);
    picture.keep("shown");
}

TEST(APicture, IsAsLargeAsItIsWanted) {
    Container form;
    bindQuery(*form.control().get());
    const Picture large = Picture::of(form);
    const Picture small(*form.as<IViewObject2>().get(), {160, 120});
    const COLORREF ground = GetSysColor(COLOR_BTNFACE);
    EXPECT_GT(small.otherThan(ground), 0);
    EXPECT_LT(small.otherThan(ground), large.otherThan(ground) / 4);
    small.keep("small");
}

TEST(APicture, CanBeStopped) {
    Container form;
    const HDC screen = GetDC(nullptr);
    const RECTL place{0, 0, 100, 100};
    const auto stop = [](ULONG_PTR argument) STDMETHODCALLTYPE -> BOOL {
        ++*reinterpret_cast<int*>(argument);
        return FALSE;
    };
    int asked = 0;
    EXPECT_EQ(form.as<IViewObject2>()->Draw(DVASPECT_CONTENT, -1, nullptr, nullptr, nullptr, screen,
                                            &place, nullptr, stop,
                                            reinterpret_cast<ULONG_PTR>(&asked)),
              E_ABORT);
    EXPECT_EQ(asked, 1);
    ReleaseDC(nullptr, screen);
}

TEST(APicture, IsOfNothingElse) {
    Container form;
    const HDC screen = GetDC(nullptr);
    const RECTL place{0, 0, 100, 100};
    const auto view = form.as<IViewObject2>();
    const auto draw = [&](DWORD aspect, LONG index, HDC target) {
        return view->Draw(aspect, index, nullptr, nullptr, nullptr, target, &place, nullptr,
                          nullptr, 0);
    };
    EXPECT_EQ(draw(DVASPECT_ICON, -1, screen), DV_E_DVASPECT);
    EXPECT_EQ(draw(DVASPECT_CONTENT, 3, screen), DV_E_LINDEX);
    EXPECT_EQ(draw(DVASPECT_CONTENT, -1, nullptr), E_INVALIDARG);
    ReleaseDC(nullptr, screen);
}

TEST(APicture, ChangesWithTheControlWhileThatIsNotShown) {
    Container form;
    const auto view = form.as<IViewObject2>();
    EXPECT_EQ(view->SetAdvise(DVASPECT_CONTENT, ADVF_PRIMEFIRST, &form), S_OK);
    EXPECT_EQ(form.calls(), Calls{"OnViewChange"});
    bindQuery(*form.control().get());
    EXPECT_EQ(form.calls(), Calls{"OnViewChange"});
    SIZEL extent{10000, 8000};
    form.as<IOleObject>()->SetExtent(DVASPECT_CONTENT, &extent);
    EXPECT_EQ(form.calls(), Calls{"OnViewChange"});
    form.tell(OLEIVERB_SHOW);
    form.calls();
    form.control()->put_OnlyJoin(VARIANT_FALSE);
    EXPECT_EQ(form.calls(), Calls{}); // it is seen
    DWORD aspects = 0;
    Held<IAdviseSink> sink;
    EXPECT_EQ(view->GetAdvise(&aspects, nullptr, sink.slot()), S_OK);
    EXPECT_EQ(aspects, DWORD{DVASPECT_CONTENT});
    EXPECT_TRUE(sink);
    EXPECT_EQ(view->SetAdvise(DVASPECT_ICON, 0, &form), DV_E_DVASPECT);
    EXPECT_EQ(view->SetAdvise(0, 0, nullptr), S_OK);
}
