#include "HostModel.h"
#include "Dll.h"
#include "Late.h"

#include "frontends/windows/automation/com/Failure.h"
#include "frontends/windows/automation/control/House.h"
#include "frontends/windows/automation/host/HostQuery.h"

#include <Zandor/Query.h>

#include <gtest/gtest.h>

#include <algorithm>

using namespace zandor;
using namespace zandor::automation;

namespace {

using Word = platform::StringView;

bool has(const std::vector<std::string>& calls, const std::string& call) {
    return std::find(calls.begin(), calls.end(), call) != calls.end();
}

class AHostsOwnModel : public testing::Test {
protected:
    // What is compiled into this program has its type libraries where the library has them.
    AHostsOwnModel() { module::remember(Dll::get().module()); }

    HostModel host;
};

} // namespace

TEST_F(AHostsOwnModel, IsBoundAndReadBackAsTheHostsObject) {
    const Held<_Zandor> control = newControl();
    const Late late(control.get());
    host.join();
    host.definition();
    ASSERT_TRUE(late.set(L"Zandor", host.query()));
    EXPECT_EQ(late.get(L"Zandor").value.pdispVal, host.query());
    // Early-bound there is no interface to give it under.
    Held<_ZDQuery> typed;
    EXPECT_EQ(control->get_Zandor(typed.slot()), codeOf(13));
    EXPECT_TRUE(has(host.table(0).calls, "Columns"));
    // The first is made the current one, for none is selected.
    EXPECT_EQ(host.table(0).numberAt(L"Selected"), 1);
    EXPECT_EQ(host.table(1).numberAt(L"Selected"), 0);
}

TEST_F(AHostsOwnModel, IsSelectedInByName) {
    const Late late(newControl().get());
    ASSERT_TRUE(late.set(L"Zandor", host.query()));
    ASSERT_TRUE(late.call(L"SelectColumnNames", Word(u"orders"), Word(u"name")));
    EXPECT_EQ(host.column(0, 1).textAt(L"Selected"), "True");
    EXPECT_EQ(host.column(0, 0).textAt(L"Selected"), "False");
    ASSERT_TRUE(late.call(L"SetCurrentTable", Word(u"customers")));
    EXPECT_EQ(host.table(1).numberAt(L"Selected"), 1);
}

TEST_F(AHostsOwnModel, HasItsPlacesWrittenByNameInSinglePrecision) {
    const auto query = fromHost<TalvikZandorLib::Zandor>(host.query());
    query->Tables().Item(1)->Left(123.5F);
    query->Tables().Item(1)->Height(1000);
    EXPECT_EQ(host.table(0).numberAt(L"Left"), 123.5);
    EXPECT_TRUE(has(host.table(0).calls, "Left=R4"));
    EXPECT_TRUE(has(host.table(0).calls, "Height=R4"));
    query->Tables().Item(1)->Columns().Item(u"orders.id")->activated(1);
    EXPECT_TRUE(has(host.column(0, 0).calls, "activated=I2"));
    EXPECT_EQ(host.column(0, 0).numberAt(L"activated"), 1);
}

TEST_F(AHostsOwnModel, IsReadWithWhatItsMembersSay) {
    host.join();
    const auto theirs = host.definition();
    const auto query = fromHost<TalvikZandorLib::Zandor>(host.query());
    const auto join = query->Joins().Item(u"j1");
    EXPECT_EQ(join->JoinType(), 1);
    EXPECT_EQ(join->LeftTable()->Name(), u"orders");
    EXPECT_EQ(join->RightColumn()->Key(), u"customers.id");
    const auto definition = query->ColumnDefinitions().Item(1);
    EXPECT_EQ(definition->Synonym(), u"who");
    EXPECT_EQ(definition->SortOrder(), 2);
    EXPECT_TRUE(definition->Visible());
    EXPECT_EQ(definition->Criteria().Item(1)->Criterium(), u"> 5");
    definition->Criteria().Item(u"4")->Criterium(u"> 6");
    definition->Visible(false);
    EXPECT_EQ(theirs->textAt(L"Visible"), "False");
    EXPECT_FALSE(
        query->Tables().Item(1)->Columns().Item(1)->Marker()); // which they know nothing of
}

TEST_F(AHostsOwnModel, StoresWhatTheControlHasMade) {
    const auto house = House::build({});
    house->control().DebugSwitch(0);
    const auto query = fromHost<TalvikZandorLib::Zandor>(host.query());
    house->control().P_SET_Zandor(query);
    Library library;
    library.serve(house->control());
    const auto join = library.NewZDJoin();
    join->LeftTable(query->Tables().Item(1));
    join->LeftColumn(query->Tables().Item(1)->Columns().Item(2));
    const auto stored = query->AddJoin(join);
    EXPECT_EQ(stored->Key(), u"j1"); // which the host has given it
    ASSERT_EQ(host.joins().size(), 1U);
    const Late theirs(host.joins()[0]);
    EXPECT_EQ(theirs.get(L"LeftTable").value.pdispVal, &host.table(0));
    EXPECT_EQ(theirs.get(L"LeftColumn").value.pdispVal, &host.column(0, 1));
    house->control().P_SET_Zandor(platform::makeRef<model::Query>());
    EXPECT_TRUE(std::dynamic_pointer_cast<model::Join>(library.NewZDJoin()));
    house->end();
}

TEST_F(AHostsOwnModel, LosesATableByTheHostsOwnHand) {
    const auto query = fromHost<TalvikZandorLib::Zandor>(host.query());
    query->DeleteTable(query->Tables().Item(1));
    EXPECT_EQ(query->Tables().Count(), 1);
    EXPECT_EQ(query->Tables().Item(1)->Name(), u"customers");
}

TEST_F(AHostsOwnModel, FailsWithItsOwnNumberAndWords) {
    const auto query = fromHost<TalvikZandorLib::Zandor>(host.query());
    try {
        query->Tables().Item(u"nobody");
        FAIL();
    } catch (const platform::RuntimeError& error) {
        EXPECT_EQ(error.Number, 5);
        EXPECT_EQ(error.Description, u"Nobody has this key");
    }
    host.queryObject().have(L"Anything", [](WORD, const Scripted::Arguments&) { return Value(); });
    const auto empty = Scripted::make();
    try {
        fromHost<TalvikZandorLib::ZDTable>(empty.get())->Name();
        FAIL();
    } catch (const platform::RuntimeError& error) {
        EXPECT_EQ(error.Number, 438);
    }
    const auto strange = Scripted::make();
    strange->have(L"Name", [](WORD, const Scripted::Arguments&) -> Value {
        throw Scripted::Failure{HRESULT(0x80041234), u"The server has gone"};
    });
    try {
        fromHost<TalvikZandorLib::ZDTable>(strange.get())->Name();
        FAIL();
    } catch (const platform::RuntimeError& error) {
        EXPECT_EQ(error.Number, HRESULT(0x80041234));
        EXPECT_EQ(error.Description, u"The server has gone");
    }
}

TEST_F(AHostsOwnModel, GivesNothingWhereItHasNothing) {
    host.join()->haveObject(L"Other");
    const auto empty = Scripted::make();
    empty->haveObject(L"LeftTable");
    EXPECT_FALSE(fromHost<TalvikZandorLib::ZDJoin>(empty.get())->LeftTable());
    const auto query = Scripted::make();
    query->haveObject(L"Tables");
    try {
        fromHost<TalvikZandorLib::Zandor>(query.get())->Tables().Count();
        FAIL();
    } catch (const platform::RuntimeError& error) {
        EXPECT_EQ(error.Number, 91);
    }
}

TEST_F(AHostsOwnModel, MayHaveInterfacesAndIsReadThroughThem) {
    // The library's own objects from its file are a stranger's to the code in this program, for
    // each knows its own by what is compiled into it.
    const Held<_ZDQuery> theirs = newQuery();
    struct Stranger final : IDispatch {
        explicit Stranger(IDispatch* object) : mObject(object) {}
        STDMETHODIMP QueryInterface(REFIID iid, void** object) override {
            if (iid == ids::own) return E_NOINTERFACE;
            if (iid != IID_IUnknown && iid != IID_IDispatch) {
                interfaces.push_back(iid);
                return mObject->QueryInterface(iid, object);
            }
            *object = this;
            return S_OK;
        }
        STDMETHODIMP_(ULONG) AddRef() override { return 1; }
        STDMETHODIMP_(ULONG) Release() override { return 1; }
        STDMETHODIMP GetTypeInfoCount(UINT*) override { return E_NOTIMPL; }
        STDMETHODIMP GetTypeInfo(UINT, LCID, ITypeInfo**) override { return E_NOTIMPL; }
        STDMETHODIMP GetIDsOfNames(REFIID, LPOLESTR*, UINT, LCID, DISPID*) override {
            ADD_FAILURE() << "late-bound";
            return E_NOTIMPL;
        }
        STDMETHODIMP Invoke(DISPID, REFIID, LCID, WORD, DISPPARAMS*, VARIANT*, EXCEPINFO*,
                            UINT*) override {
            return E_NOTIMPL;
        }
        std::vector<IID> interfaces;
        IDispatch* mObject;
    } stranger(theirs.get());
    const auto query = fromHost<TalvikZandorLib::Zandor>(&stranger);
    EXPECT_EQ(query->Tables().Count(), 0);
    ASSERT_FALSE(stranger.interfaces.empty());
    EXPECT_EQ(stranger.interfaces[0], __uuidof(_ZDQuery));
}
