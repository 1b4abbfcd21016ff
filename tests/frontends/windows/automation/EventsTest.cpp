#include "Dll.h"
#include "Late.h"
#include "Sink.h"

#include <gtest/gtest.h>

using namespace zandor::automation;

namespace {

const std::string nothingAsModel = "-126(New Zanodr is nothing!, -1)";

Held<IConnectionPoint> pointOf(IUnknown* control) {
    Held<IConnectionPoint> point;
    Held<IConnectionPointContainer>::of(control)->FindConnectionPoint(ids::controlEvents,
                                                                      point.slot());
    return point;
}

} // namespace

TEST(TheEvents, TellOfNothingAsAModel) {
    const auto control = newControl();
    const Sink sink(control.get());
    EXPECT_EQ(control->putref_Zandor(nullptr), S_OK);
    EXPECT_EQ(sink.heard(), std::vector{nothingAsModel});
    EXPECT_TRUE(Late(control.get()).set(L"Zandor", nullptr));
    EXPECT_EQ(sink.heard().size(), 2U);
}

TEST(TheEvents, ReachAllThatListenUntilTheyGo) {
    const auto control = newControl();
    const Sink first(control.get());
    Sink second(control.get());
    control->putref_Zandor(nullptr);
    second.unadvise();
    control->putref_Zandor(nullptr);
    EXPECT_EQ(first.heard().size(), 2U);
    EXPECT_EQ(second.heard().size(), 1U);
}

TEST(TheEvents, DoNotReachOneThatAnotherSendsAway) {
    const auto control = newControl();
    Sink first(control.get());
    Sink second(control.get());
    first.then = [&] { second.unadvise(); };
    control->putref_Zandor(nullptr);
    EXPECT_EQ(first.heard().size(), 1U);
    EXPECT_EQ(second.heard().size(), 0U);
}

TEST(TheEvents, MayBeTheEndOfTheControl) {
    Held<_Zandor> control = newControl();
    Sink sink(control.get());
    sink.then = [&] {
        sink.unadvise();
        control = {};
    };
    const Late late(control.get());
    late.set(L"Zandor", nullptr);
    EXPECT_EQ(sink.heard().size(), 1U);
    EXPECT_TRUE(late.get(L"LNGJoinOk"));
}

TEST(TheEvents, MayEndTheControlByItsLastReference) {
    _Zandor* control = newControl().detach();
    Sink sink(control);
    sink.then = [&] {
        sink.unadvise();
        control->Release();
    };
    control->putref_Zandor(nullptr);
    EXPECT_EQ(sink.heard().size(), 1U);
    EXPECT_TRUE(Dll::get().canUnload());
}

TEST(TheEvents, HaveOneConnectionPoint) {
    const auto control = newControl();
    Held<IEnumConnectionPoints> points;
    ASSERT_EQ(
        Held<IConnectionPointContainer>::of(control.get())->EnumConnectionPoints(points.slot()),
        S_OK);
    IConnectionPoint* found[2] = {};
    ULONG count = 0;
    EXPECT_EQ(points->Next(2, found, &count), S_FALSE);
    ASSERT_EQ(count, 1U);
    const auto point = Held<IConnectionPoint>::taken(found[0]);
    IID iid{};
    EXPECT_EQ(point->GetConnectionInterface(&iid), S_OK);
    EXPECT_EQ(iid, ids::controlEvents);
    Held<IConnectionPointContainer> container;
    EXPECT_EQ(point->GetConnectionPointContainer(container.slot()), S_OK);
    EXPECT_EQ(Held<IUnknown>::of(container.get()).get(), Held<IUnknown>::of(control.get()).get());
}

TEST(TheEvents, ListWhoListens) {
    const auto control = newControl();
    const Sink sink(control.get());
    Held<IEnumConnections> connections;
    ASSERT_EQ(pointOf(control.get())->EnumConnections(connections.slot()), S_OK);
    CONNECTDATA found{};
    ULONG count = 0;
    ASSERT_EQ(connections->Next(1, &found, &count), S_OK);
    EXPECT_NE(found.dwCookie, 0U);
    found.pUnk->Release();
    EXPECT_EQ(connections->Next(1, &found, &count), S_FALSE);
}

TEST(TheEvents, RefuseWhoCannotListen) {
    const auto control = newControl();
    DWORD cookie = 5;
    const auto factory = Dll::get().factoryOf(ids::control);
    EXPECT_EQ(pointOf(control.get())->Advise(factory.get(), &cookie), CONNECT_E_CANNOTCONNECT);
    EXPECT_EQ(cookie, 0U);
    EXPECT_EQ(pointOf(control.get())->Advise(nullptr, &cookie), E_POINTER);
    EXPECT_EQ(pointOf(control.get())->Unadvise(77), CONNECT_E_NOCONNECTION);
    Held<IConnectionPoint> other;
    EXPECT_EQ(Held<IConnectionPointContainer>::of(control.get())
                  ->FindConnectionPoint(IID_IStorage, other.slot()),
              CONNECT_E_NOCONNECTION);
}
