#include "Dll.h"
#include "Late.h"

#include <gtest/gtest.h>

using namespace zandor::automation;

namespace {

constexpr GUID nobodys = {0x10203040, 1, 2, {3, 4, 5, 6, 7, 8, 9, 10}};

HRESULT classObject(REFCLSID id, REFIID iid, void** object) {
    return Dll::get().entry<HRESULT(STDAPICALLTYPE*)(REFCLSID, REFIID, void**)>(
        "DllGetClassObject")(id, iid, object);
}

} // namespace

TEST(TheServer, HasAFactoryForEachOfItsClasses) {
    for (const GUID& id :
         {ids::control, ids::query, ids::join, ids::columnDefinition, ids::tableDescription}) {
        const auto factory = Dll::get().factoryOf(id);
        ASSERT_TRUE(factory);
        Held<IDispatch> made;
        EXPECT_EQ(factory->CreateInstance(nullptr, IID_IDispatch, made.slotOfAny()), S_OK);
        EXPECT_TRUE(made);
    }
}

TEST(TheServer, KnowsNoOtherClassAndNoOtherKindOfFactory) {
    void* object = &object;
    EXPECT_EQ(classObject(nobodys, IID_IClassFactory, &object), CLASS_E_CLASSNOTAVAILABLE);
    EXPECT_EQ(object, nullptr);
    object = &object;
    EXPECT_EQ(classObject(ids::control, IID_IDispatch, &object), E_NOINTERFACE);
    EXPECT_EQ(object, nullptr);
    EXPECT_EQ(classObject(ids::control, IID_IClassFactory, nullptr), E_POINTER);
}

TEST(TheServer, MakesNoPartOfAnotherObject) {
    const auto factory = Dll::get().factoryOf(ids::control);
    void* object = &object;
    EXPECT_EQ(factory->CreateInstance(factory.get(), IID_IUnknown, &object), CLASS_E_NOAGGREGATION);
    EXPECT_EQ(object, nullptr);
}

TEST(TheServer, RefusesAnInterfaceThatAnObjectHasNotAndKeepsNothingOfIt) {
    const auto factory = Dll::get().factoryOf(ids::control);
    void* object = &object;
    EXPECT_EQ(factory->CreateInstance(nullptr, IID_IStorage, &object), E_NOINTERFACE);
    EXPECT_EQ(object, nullptr);
}

TEST(TheServer, CanBeUnloadedOnceNothingIsHeld) {
    EXPECT_TRUE(Dll::get().canUnload());
    {
        const auto control = newControl();
        EXPECT_FALSE(Dll::get().canUnload());
    }
    EXPECT_TRUE(Dll::get().canUnload());
    {
        const auto query = newQuery();
        const Late joins = Late(query.get()).at(L"Joins");
        EXPECT_FALSE(Dll::get().canUnload());
    }
    EXPECT_TRUE(Dll::get().canUnload());
    const auto factory = Dll::get().factoryOf(ids::control);
    EXPECT_FALSE(Dll::get().canUnload());
}

TEST(TheServer, StaysLoadedWhileItIsLocked) {
    Dll::get().factoryOf(ids::query)->LockServer(TRUE);
    EXPECT_FALSE(Dll::get().canUnload());
    Dll::get().factoryOf(ids::query)->LockServer(FALSE);
    EXPECT_TRUE(Dll::get().canUnload());
}
