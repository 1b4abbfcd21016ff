#include "Container.h"

#include "Boxes.h"
#include "Sink.h"

#include <gtest/gtest.h>

using namespace zandor::automation;
using Calls = Container::Calls;

namespace {

class AForm : public testing::Test {
protected:
    /// The control's window as it stands in the form's.
    RECT placeInForm() const {
        RECT place{};
        GetWindowRect(form.controlWindow(), &place);
        MapWindowPoints(nullptr, form.window(), reinterpret_cast<POINT*>(&place), 2);
        return place;
    }
    bool hasFocus() const {
        const HWND own = form.controlWindow();
        return own && (GetFocus() == own || IsChild(own, GetFocus()));
    }

    Container form;
};

constexpr GUID asked[] = {
    // clang-format off
    {0x00000112, 0, 0, {0xC0, 0, 0, 0, 0, 0, 0, 0x46}}, // IOleObject
    {0x00000113, 0, 0, {0xC0, 0, 0, 0, 0, 0, 0, 0x46}}, // IOleInPlaceObject
    {0x00000114, 0, 0, {0xC0, 0, 0, 0, 0, 0, 0, 0x46}}, // IOleWindow
    {0x00000117, 0, 0, {0xC0, 0, 0, 0, 0, 0, 0, 0x46}}, // IOleInPlaceActiveObject
    {0x0000010D, 0, 0, {0xC0, 0, 0, 0, 0, 0, 0, 0x46}}, // IViewObject
    {0x00000127, 0, 0, {0xC0, 0, 0, 0, 0, 0, 0, 0x46}}, // IViewObject2
    // clang-format on
};

} // namespace

TEST_F(AForm, FindsAllThatItNeedsOfAControlUnderOneIdentity) {
    const auto self = form.as<IUnknown>();
    for (const GUID& id : asked) {
        Held<IUnknown> found;
        ASSERT_EQ(form.control()->QueryInterface(id, found.slotOfAny()), S_OK);
        EXPECT_EQ(Held<IUnknown>::of(found.get()).get(), self.get());
    }
    EXPECT_TRUE(form.as<IOleControl>());
    EXPECT_TRUE(form.as<IQuickActivate>());
}

TEST_F(AForm, ActivatesItsControlInPlace) {
    EXPECT_EQ(form.tell(OLEIVERB_INPLACEACTIVATE), S_OK);
    EXPECT_EQ(form.calls(),
              (Calls{"CanInPlaceActivate", "OnInPlaceActivate", "GetWindowContext", "ShowObject"}));
    ASSERT_TRUE(form.controlWindow());
    EXPECT_EQ(GetParent(form.controlWindow()), form.window());
    EXPECT_TRUE(IsWindowVisible(form.controlWindow()));
    const RECT stands = placeInForm();
    EXPECT_TRUE(EqualRect(&stands, &form.place));
    EXPECT_FALSE(hasFocus());
    // Once more is not too much.
    EXPECT_EQ(form.tell(OLEIVERB_SHOW), S_OK);
    EXPECT_EQ(form.calls(), Calls{"ShowObject"});
}

TEST_F(AForm, GivesItsControlTheKeyboardAndTakesItBack) {
    EXPECT_EQ(form.tell(OLEIVERB_UIACTIVATE), S_OK);
    EXPECT_EQ(form.calls(), (Calls{"CanInPlaceActivate", "OnInPlaceActivate", "GetWindowContext",
                                   "OnUIActivate", "SetActiveObject", "OnFocus", "ShowObject"}));
    EXPECT_TRUE(hasFocus());
    EXPECT_EQ(form.as<IOleInPlaceObject>()->UIDeactivate(), S_OK);
    EXPECT_EQ(form.calls(), (Calls{"SetActiveObject(nothing)", "OnUIDeactivate"}));
    EXPECT_EQ(form.as<IOleInPlaceObject>()->UIDeactivate(), S_OK);
    EXPECT_EQ(form.calls(), Calls{});
}

TEST_F(AForm, HearsThatItsControlWasClickedAndLeft) {
    form.tell(OLEIVERB_INPLACEACTIVATE);
    form.calls();
    form.click({5, 5});
    EXPECT_EQ(form.calls(), (Calls{"OnUIActivate", "SetActiveObject", "OnFocus"}));
    SetFocus(form.window());
    EXPECT_EQ(form.calls(), Calls{"OnFocus(lost)"});
    // It is the form's to say that another one is active now.
    form.click({5, 5});
    EXPECT_EQ(form.calls(), Calls{"OnFocus"});
}

TEST_F(AForm, MovesItsControlAndShowsOnlyAPartOfIt) {
    const auto object = form.as<IOleInPlaceObject>();
    EXPECT_EQ(object->SetObjectRects(&form.place, &form.clip), E_UNEXPECTED);
    form.tell(OLEIVERB_INPLACEACTIVATE);
    const RECT place{10, 10, 310, 210};
    RECT clip{0, 0, 1000, 1000};
    EXPECT_EQ(object->SetObjectRects(&place, &clip), S_OK);
    RECT stands = placeInForm();
    EXPECT_TRUE(EqualRect(&stands, &place));
    RECT seen{};
    EXPECT_EQ(GetWindowRgnBox(form.controlWindow(), &seen), ERROR);
    clip = {0, 0, 110, 60};
    EXPECT_EQ(object->SetObjectRects(&place, &clip), S_OK);
    EXPECT_EQ(GetWindowRgnBox(form.controlWindow(), &seen), SIMPLEREGION);
    const RECT part{0, 0, 100, 50};
    EXPECT_TRUE(EqualRect(&seen, &part));
    stands = placeInForm();
    EXPECT_TRUE(EqualRect(&stands, &place));
}

TEST_F(AForm, MeasuresItsControlInHundredthsOfAMillimetre) {
    const auto object = form.as<IOleObject>();
    SIZEL extent{};
    EXPECT_EQ(object->GetExtent(DVASPECT_CONTENT, &extent), S_OK);
    EXPECT_GT(extent.cx, 0);
    extent = {5080, 2540};
    EXPECT_EQ(object->SetExtent(DVASPECT_CONTENT, &extent), S_OK);
    extent = {};
    EXPECT_EQ(object->GetExtent(DVASPECT_CONTENT, &extent), S_OK);
    EXPECT_EQ(extent.cx, 5080);
    EXPECT_EQ(extent.cy, 2540);
    EXPECT_EQ(form.as<IViewObject2>()->GetExtent(DVASPECT_CONTENT, -1, nullptr, &extent), S_OK);
    EXPECT_EQ(extent.cx, 5080);
    extent = {-1, 0};
    EXPECT_EQ(object->SetExtent(DVASPECT_CONTENT, &extent), E_INVALIDARG);
    EXPECT_EQ(object->SetExtent(DVASPECT_ICON, &extent), DV_E_DVASPECT);
    EXPECT_EQ(object->GetExtent(DVASPECT_ICON, &extent), DV_E_DVASPECT);
}

TEST_F(AForm, HidesItsControlAndShowsItAgain) {
    form.tell(OLEIVERB_UIACTIVATE);
    const HWND own = form.controlWindow();
    form.calls();
    EXPECT_EQ(form.tell(OLEIVERB_HIDE), S_OK);
    EXPECT_FALSE(IsWindowVisible(own));
    EXPECT_EQ(form.calls(), (Calls{"SetActiveObject(nothing)", "OnUIDeactivate", "OnFocus(lost)"}));
    EXPECT_EQ(form.tell(OLEIVERB_SHOW), S_OK);
    EXPECT_TRUE(IsWindowVisible(own));
}

TEST_F(AForm, IsToldWhichVerbsThereAre) {
    EXPECT_EQ(form.tell(OLEIVERB_OPEN), E_NOTIMPL);
    EXPECT_EQ(form.tell(OLEIVERB_DISCARDUNDOSTATE), E_NOTIMPL);
    EXPECT_FALSE(form.controlWindow());
    EXPECT_EQ(form.tell(77), OLEOBJ_S_INVALIDVERB);
    EXPECT_TRUE(form.controlWindow()); // as by the first one
}

TEST_F(AForm, ClosesItsControlAndMayUseItAfterwards) {
    DWORD cookie = 0;
    EXPECT_EQ(form.as<IOleObject>()->Advise(&form, &cookie), S_OK);
    bindQuery(*form.control().get());
    form.tell(OLEIVERB_UIACTIVATE);
    const HWND own = form.controlWindow();
    form.calls();
    EXPECT_EQ(form.as<IOleObject>()->Close(OLECLOSE_NOSAVE), S_OK);
    EXPECT_EQ(form.calls(), (Calls{"SetActiveObject(nothing)", "OnUIDeactivate", "OnFocus(lost)",
                                   "OnInPlaceDeactivate", "OnClose"}));
    EXPECT_FALSE(IsWindowVisible(own));
    EXPECT_NE(GetParent(own), form.window());
    EXPECT_EQ(form.as<IOleObject>()->Close(OLECLOSE_NOSAVE), S_OK);
    EXPECT_EQ(form.as<IOleInPlaceObject>()->InPlaceDeactivate(), S_OK);
    MSG message{};
    EXPECT_EQ(form.as<IOleInPlaceActiveObject>()->TranslateAccelerator(&message), S_FALSE);
    EXPECT_EQ(form.control()->put_HorizontalScrollbarPos(0), S_OK);
    form.as<IOleObject>()->Unadvise(cookie);
    form.calls();
    EXPECT_EQ(form.tell(OLEIVERB_SHOW), S_OK);
    EXPECT_EQ(form.controlWindow(), own);
    EXPECT_TRUE(IsWindowVisible(own));
}

TEST_F(AForm, IsAskedToSaveAChangedControlThatIsClosed) {
    form.tell(OLEIVERB_INPLACEACTIVATE);
    const auto object = form.as<IOleObject>();
    EXPECT_EQ(object->Close(7), E_INVALIDARG);
    EXPECT_TRUE(form.controlWindow());
    Held<IStream> stream;
    ASSERT_EQ(CreateStreamOnHGlobal(nullptr, TRUE, stream.slot()), S_OK);
    EXPECT_EQ(form.as<IPersistStreamInit>()->Save(stream.get(), TRUE), S_OK);
    form.calls();
    EXPECT_EQ(object->Close(OLECLOSE_SAVEIFDIRTY), S_OK); // nothing has changed since
    EXPECT_EQ(form.calls(), Calls{"OnInPlaceDeactivate"});

    VARIANT_BOOL before = VARIANT_FALSE;
    EXPECT_EQ(form.control()->get_OnlyJoin(&before), S_OK);
    EXPECT_EQ(form.control()->put_OnlyJoin(before ? VARIANT_FALSE : VARIANT_TRUE), S_OK);
    form.tell(OLEIVERB_INPLACEACTIVATE);
    form.calls();
    form.on["SaveObject"] = [] { return STG_E_MEDIUMFULL; };
    EXPECT_EQ(object->Close(OLECLOSE_SAVEIFDIRTY), STG_E_MEDIUMFULL);
    EXPECT_EQ(form.calls(), Calls{"SaveObject"});
    EXPECT_TRUE(IsWindowVisible(form.controlWindow())) << "what is not saved is not lost";
    EXPECT_EQ(object->Close(OLECLOSE_PROMPTSAVE), S_OK);
    EXPECT_EQ(form.calls(), (Calls{"SaveObject", "OnInPlaceDeactivate"}));
    form.tell(OLEIVERB_INPLACEACTIVATE);
    form.calls();
    EXPECT_EQ(object->Close(OLECLOSE_NOSAVE), S_OK);
    EXPECT_EQ(form.calls(), Calls{"OnInPlaceDeactivate"});
}

TEST_F(AForm, MayRefuseEachStep) {
    form.on["CanInPlaceActivate"] = [] { return S_FALSE; };
    EXPECT_EQ(form.tell(OLEIVERB_SHOW), E_FAIL);
    form.on["OnInPlaceActivate"] = [] { return E_ACCESSDENIED; };
    EXPECT_EQ(form.tell(OLEIVERB_SHOW), E_ACCESSDENIED);
    form.on["GetWindowContext"] = [] { return E_OUTOFMEMORY; };
    EXPECT_EQ(form.tell(OLEIVERB_SHOW), E_OUTOFMEMORY);
    EXPECT_FALSE(form.controlWindow());
    form.on["OnUIActivate"] = [] { return E_FAIL; };
    EXPECT_EQ(form.tell(OLEIVERB_UIACTIVATE), E_FAIL);
    EXPECT_TRUE(form.controlWindow());
    form.as<IOleObject>()->SetClientSite(nullptr);
    EXPECT_EQ(form.tell(OLEIVERB_SHOW), E_NOINTERFACE);
}

TEST_F(AForm, MayCloseItsControlInEachStep) {
    for (const char* step :
         {"CanInPlaceActivate", "OnInPlaceActivate", "GetWindowContext", "OnUIActivate",
          "SetActiveObject", "OnFocus", "ShowObject", "SetActiveObject(nothing)", "OnUIDeactivate",
          "OnFocus(lost)", "OnInPlaceDeactivate"}) {
        bool closed = false;
        form.on[step] = [&] {
            closed = true;
            return form.as<IOleObject>()->Close(OLECLOSE_NOSAVE);
        };
        form.tell(OLEIVERB_UIACTIVATE);
        form.as<IOleObject>()->Close(OLECLOSE_NOSAVE);
        EXPECT_TRUE(closed) << step;
        EXPECT_FALSE(form.controlWindow()) << step;
        // And goes on as before.
        EXPECT_EQ(form.tell(OLEIVERB_SHOW), S_OK) << step;
        EXPECT_TRUE(form.controlWindow()) << step;
        form.as<IOleObject>()->Close(OLECLOSE_NOSAVE);
    }
}

TEST(AFormThatLetsGoOfItsControl, MayDoSoInEachStep) {
    for (const char* step : {"CanInPlaceActivate", "OnInPlaceActivate", "GetWindowContext",
                             "OnUIActivate", "SetActiveObject", "OnFocus", "ShowObject"}) {
        Container form;
        const auto object = form.as<IOleObject>();
        bool dropped = false;
        form.on[step] = [&] {
            dropped = true;
            form.unload();
            return S_OK;
        };
        object->DoVerb(OLEIVERB_UIACTIVATE, nullptr, nullptr, 0, form.window(), &form.place);
        EXPECT_TRUE(dropped) << step;
    }
    EXPECT_TRUE(Dll::get().canUnload());
}

TEST(AFormThatLetsGoOfItsControl, MayDoSoInTheMiddleOfAnEvent) {
    Container form;
    bindQuery(*form.control().get());
    form.tell(OLEIVERB_UIACTIVATE);
    Sink sink(form.control().get());
    sink.then = [&] {
        sink.unadvise();
        form.unload();
    };
    form.control()->putref_Zandor(nullptr);
    EXPECT_EQ(sink.heard().size(), 1U);
    form.pump();
    EXPECT_FALSE(form.control());
    EXPECT_TRUE(Dll::get().canUnload());
}

TEST(AFormThatLetsGoOfItsControl, NeedNotCloseItBefore) {
    Container form;
    bindQuery(*form.control().get());
    form.tell(OLEIVERB_UIACTIVATE);
    const HWND own = form.controlWindow();
    form.on["SetActiveObject(nothing)"] = [] { return S_OK; };
    form.as<IOleInPlaceObject>()->UIDeactivate(); // by which it lets go of the active object
    form.drop();
    form.pump();
    EXPECT_FALSE(IsWindow(own));
    EXPECT_TRUE(Dll::get().canUnload());
}

TEST_F(AForm, MayCloseItsWindowUnderItsControl) {
    bindQuery(*form.control().get());
    form.tell(OLEIVERB_UIACTIVATE);
    DestroyWindow(form.window());
    EXPECT_EQ(form.control()->put_HorizontalScrollbarPos(0), S_OK);
    EXPECT_EQ(form.control()->Terminate(), S_OK);
    EXPECT_EQ(form.tell(OLEIVERB_SHOW), E_UNEXPECTED);
    SIZEL extent{2540, 2540};
    EXPECT_EQ(form.as<IOleObject>()->SetExtent(DVASPECT_CONTENT, &extent), S_OK);
    Boxes::taken();
}

TEST_F(AForm, HearsNothingWhileEventsAreFrozenAndAllOfItAfterwards) {
    const auto control = form.as<IOleControl>();
    Sink sink(form.control().get());
    EXPECT_EQ(control->FreezeEvents(TRUE), S_OK);
    EXPECT_EQ(control->FreezeEvents(TRUE), S_OK);
    form.control()->putref_Zandor(nullptr);
    form.control()->putref_Zandor(nullptr);
    EXPECT_EQ(control->FreezeEvents(FALSE), S_OK);
    EXPECT_EQ(sink.heard().size(), 0U);
    EXPECT_EQ(control->FreezeEvents(FALSE), S_OK);
    EXPECT_EQ(sink.heard().size(), 2U);
    EXPECT_EQ(control->FreezeEvents(FALSE), S_OK); // once too often
    form.control()->putref_Zandor(nullptr);
    EXPECT_EQ(sink.heard().size(), 3U);
}

TEST_F(AForm, ActivatesQuickly) {
    form.as<IOleObject>()->SetClientSite(nullptr);
    QACONTAINER container{};
    container.cbSize = sizeof container;
    container.pClientSite = &form;
    container.pAdviseSink =
        reinterpret_cast<decltype(container.pAdviseSink)>(static_cast<IAdviseSink*>(&form));
    container.dwAmbientFlags = QACONTAINER_USERMODE;
    QACONTROL control{};
    control.cbSize = sizeof control;
    const auto quick = form.as<IQuickActivate>();
    ASSERT_EQ(quick->QuickActivate(&container, &control), S_OK);
    DWORD status = 0;
    EXPECT_EQ(form.as<IOleObject>()->GetMiscStatus(DVASPECT_CONTENT, &status), S_OK);
    EXPECT_EQ(control.dwMiscStatus, status);
    EXPECT_TRUE(status & OLEMISC_INSIDEOUT);
    form.control()->put_OnlyJoin(VARIANT_FALSE);
    EXPECT_EQ(form.calls(), Calls{"OnViewChange"});
    EXPECT_EQ(form.tell(OLEIVERB_SHOW), S_OK);
    form.as<IViewObject2>()->SetAdvise(DVASPECT_CONTENT, 0, nullptr);
    EXPECT_EQ(quick->QuickActivate(nullptr, &control), E_POINTER);
    EXPECT_EQ(quick->QuickActivate(&container, nullptr), E_POINTER);
    control.cbSize = 1;
    EXPECT_EQ(quick->QuickActivate(&container, &control), E_INVALIDARG);
}

TEST_F(AForm, MayAskForNothingAtAll) {
    const auto object = form.as<IOleObject>();
    EXPECT_EQ(object->GetClientSite(nullptr), E_POINTER);
    EXPECT_EQ(object->SetHostNames(nullptr, nullptr), E_POINTER);
    EXPECT_EQ(object->GetMoniker(0, 0, nullptr), E_POINTER);
    EXPECT_EQ(object->GetClipboardData(0, nullptr), E_POINTER);
    EXPECT_EQ(object->EnumVerbs(nullptr), E_POINTER);
    EXPECT_EQ(object->GetUserClassID(nullptr), E_POINTER);
    EXPECT_EQ(object->GetUserType(0, nullptr), E_POINTER);
    EXPECT_EQ(object->SetExtent(DVASPECT_CONTENT, nullptr), E_POINTER);
    EXPECT_EQ(object->GetExtent(DVASPECT_CONTENT, nullptr), E_POINTER);
    EXPECT_EQ(object->Advise(nullptr, nullptr), E_POINTER);
    EXPECT_EQ(object->EnumAdvise(nullptr), E_POINTER);
    EXPECT_EQ(object->GetMiscStatus(DVASPECT_CONTENT, nullptr), E_POINTER);
    EXPECT_EQ(object->Unadvise(7), OLE_E_NOCONNECTION);
    EXPECT_EQ(object->DoVerb(OLEIVERB_SHOW, nullptr, nullptr, 5, nullptr, nullptr), DV_E_LINDEX);
    const auto inPlace = form.as<IOleInPlaceObject>();
    EXPECT_EQ(inPlace->GetWindow(nullptr), E_POINTER);
    EXPECT_EQ(inPlace->SetObjectRects(nullptr, nullptr), E_POINTER);
    EXPECT_EQ(inPlace->ReactivateAndUndo(), INPLACE_E_NOTUNDOABLE);
    EXPECT_EQ(form.as<IOleInPlaceActiveObject>()->TranslateAccelerator(nullptr), E_POINTER);
    const auto control = form.as<IOleControl>();
    EXPECT_EQ(control->GetControlInfo(nullptr), E_POINTER);
    EXPECT_EQ(control->OnMnemonic(nullptr), E_POINTER);
    const auto view = form.as<IViewObject2>();
    EXPECT_EQ(view->Draw(DVASPECT_CONTENT, -1, nullptr, nullptr, nullptr, nullptr, nullptr, nullptr,
                         nullptr, 0),
              E_POINTER);
    EXPECT_EQ(view->GetColorSet(DVASPECT_CONTENT, -1, nullptr, nullptr, nullptr, nullptr),
              E_POINTER);
    EXPECT_EQ(view->GetExtent(DVASPECT_CONTENT, -1, nullptr, nullptr), E_POINTER);
    EXPECT_EQ(view->GetAdvise(nullptr, nullptr, nullptr), S_OK);
    const auto quick = form.as<IQuickActivate>();
    EXPECT_EQ(quick->SetContentExtent(nullptr), E_POINTER);
    EXPECT_EQ(quick->GetContentExtent(nullptr), E_POINTER);
}
