#include "Boxes.h"
#include "Dll.h"
#include "Late.h"

#include <Zandor/Interface.h>

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

using namespace zandor;
using namespace zandor::automation;
using TalvikDBxZandor::automation::Kind;
using TalvikDBxZandor::automation::Member;
using TalvikDBxZandor::automation::Setter;
using TalvikDBxZandor::automation::Type;

namespace {

class TheControl : public testing::Test {
protected:
    const Held<_Zandor> early = newControl();
    const Late control{early.get()};
};

std::wstring wideName(const Member& member) {
    return {reinterpret_cast<const wchar_t*>(member.name.data()), member.name.size()};
}

} // namespace

TEST_F(TheControl, FindsEveryMemberByNameWhateverTheCase) {
    for (const Member& member : TalvikDBxZandor::automation::members()) {
        std::wstring name = wideName(member);
        EXPECT_EQ(control.idOf(name.c_str()), static_cast<DISPID>(member.dispatchId));
        for (wchar_t& letter : name) letter = static_cast<wchar_t>(towlower(letter));
        EXPECT_EQ(control.idOf(name.c_str()), static_cast<DISPID>(member.dispatchId));
    }
    EXPECT_EQ(control.idOf(L"LNGJoinFrom"), DISPID_UNKNOWN);
}

TEST_F(TheControl, KnowsTheParametersOfItsMethodsByName) {
    wchar_t names[][20] = {L"SelectColumnNames", L"ColName", L"TabName"};
    LPOLESTR asked[] = {names[0], names[1], names[2]};
    DISPID found[3] = {};
    ASSERT_EQ(control.object()->GetIDsOfNames(IID_NULL, asked, 3, LOCALE_USER_DEFAULT, found),
              S_OK);
    EXPECT_EQ(found[0], 0x60030061);
    EXPECT_EQ(found[1], 1);
    EXPECT_EQ(found[2], 0);
}

TEST_F(TheControl, ReadsAndWritesEveryPlainMemberLateBound) {
    for (const Member& member : TalvikDBxZandor::automation::members()) {
        const std::wstring name = wideName(member);
        if (member.setter == Setter::none || member.setter == Setter::object) continue;
        const Outcome before = control.get(name.c_str());
        ASSERT_TRUE(before) << platform::toUtf8(member.name);
        switch (member.type) {
        case Type::String:
            ASSERT_EQ(before.value.vt, VT_BSTR);
            ASSERT_TRUE(control.put(name.c_str(), platform::StringView(u"\u00DC ber")));
            EXPECT_EQ(control.get(name.c_str()).text(), "\u00DC ber");
            break;
        case Type::Boolean:
            ASSERT_EQ(before.value.vt, VT_BOOL);
            EXPECT_EQ(before.value.boolVal, VARIANT_TRUE);
            ASSERT_TRUE(control.put(name.c_str(), false));
            EXPECT_EQ(control.get(name.c_str()).value.boolVal, VARIANT_FALSE);
            ASSERT_TRUE(control.put(name.c_str(), true)); // which may have another name
            break;
        case Type::Integer:
            ASSERT_EQ(before.value.vt, VT_I2);
            ASSERT_TRUE(control.put(name.c_str(), before.value.iVal));
            EXPECT_EQ(control.get(name.c_str()).value.iVal, before.value.iVal);
            break;
        default: FAIL() << platform::toUtf8(member.name);
        }
    }
}

TEST_F(TheControl, ReadsAndWritesEveryPlainMemberEarlyBound) {
    // Which calls each method by its place in the interface.
    Held<ITypeInfo> info;
    ASSERT_EQ(early->GetTypeInfo(0, LOCALE_USER_DEFAULT, info.slot()), S_OK);
    const auto run = [&](const Member& member, WORD how, DISPPARAMS given, Value& result) {
        return info->Invoke(early.get(), static_cast<MEMBERID>(member.dispatchId), how, &given,
                            &result, nullptr, nullptr);
    };
    for (const Member& member : TalvikDBxZandor::automation::members()) {
        if (member.setter == Setter::none || member.setter == Setter::object) continue;
        const std::string name = platform::toUtf8(member.name);
        Value before;
        ASSERT_EQ(run(member, DISPATCH_PROPERTYGET, {}, before), S_OK) << name;
        EXPECT_EQ(control.get(wideName(member).c_str()).value.vt, before.vt) << name;
        const auto write = [&](Value value) {
            DISPID written = DISPID_PROPERTYPUT;
            Value ignored;
            return run(member, DISPATCH_PROPERTYPUT, {&value, &written, 1, 1}, ignored);
        };
        Value after;
        switch (member.type) {
        case Type::String:
            ASSERT_EQ(write(Value(platform::StringView(u"\u00DC ber"))), S_OK) << name;
            ASSERT_EQ(run(member, DISPATCH_PROPERTYGET, {}, after), S_OK) << name;
            EXPECT_EQ(textOf(after.bstrVal), u"\u00DC ber") << name;
            break;
        case Type::Boolean:
            ASSERT_EQ(write(Value(false)), S_OK) << name;
            ASSERT_EQ(run(member, DISPATCH_PROPERTYGET, {}, after), S_OK) << name;
            EXPECT_EQ(after.boolVal, VARIANT_FALSE) << name;
            ASSERT_EQ(write(Value(true)), S_OK) << name; // which may have another name
            break;
        default:
            ASSERT_EQ(write(Value(before.iVal)), S_OK) << name;
            ASSERT_EQ(run(member, DISPATCH_PROPERTYGET, {}, after), S_OK) << name;
            EXPECT_EQ(after.iVal, before.iVal) << name;
        }
    }
    // What is an object of a kind is called itself.
    Held<_ZDJoin> join;
    Held<_ZDTable> table;
    Held<_ZDColumn> column;
    EXPECT_EQ(early->get_lastjoin(join.slot()), S_OK);
    EXPECT_EQ(early->get_activetable(table.slot()), S_OK);
    EXPECT_EQ(early->get_ActiveColumn(column.slot()), S_OK);
    EXPECT_FALSE(join || table || column);
    const auto query = newQuery();
    Held<_ZDQuery> bound;
    EXPECT_EQ(early->putref_Zandor(query.get()), S_OK);
    EXPECT_EQ(early->get_Zandor(bound.slot()), S_OK);
    EXPECT_EQ(bound.get(), query.get());
}

TEST_F(TheControl, HasTrueAsMinusOne) {
    VARIANT_BOOL value = 5;
    ASSERT_EQ(early->get_UseJoinTypeLeft(&value), S_OK);
    EXPECT_EQ(value, -1);
    EXPECT_EQ(control.get(L"UseJoinTypeLeft").value.boolVal, -1);
    ASSERT_EQ(early->put_UseJoinTypeLeft(1), S_OK); // any number but 0
    ASSERT_EQ(early->get_UseJoinTypeLeft(&value), S_OK);
    EXPECT_EQ(value, -1);
}

TEST_F(TheControl, IsTheSameEarlyAndLateBound) {
    ASSERT_TRUE(control.put(L"LNGJoinOk", platform::StringView(u"Gut")));
    Text text;
    ASSERT_EQ(early->get_LNGJoinOk(text.slot()), S_OK);
    EXPECT_EQ(text.string(), u"Gut");
    short number = 7;
    ASSERT_EQ(early->put_DebugSwitch(&number), S_OK);
    EXPECT_EQ(control.get(L"DebugSwitch").value.iVal, 7);
    number = 0;
    ASSERT_EQ(early->put_DebugSwitch(&number), S_OK);
}

TEST_F(TheControl, HasTwoNamesForOneFlag) {
    ASSERT_TRUE(control.put(L"UseJoinCompareOperatorLE", false));
    EXPECT_EQ(control.get(L"UseJoinCompareOperatorLessEquals").value.boolVal, VARIANT_FALSE);
}

TEST_F(TheControl, ConvertsWhatAHostWrites) {
    ASSERT_TRUE(control.put(L"JoinModifyDisabled", platform::StringView(u"12")));
    EXPECT_EQ(control.get(L"JoinModifyDisabled").value.iVal, 12);
    ASSERT_TRUE(control.put(L"JoinModifyDisabled", 2.5F));
    EXPECT_EQ(control.get(L"JoinModifyDisabled").value.iVal, 2);
    ASSERT_TRUE(control.put(L"JoinModifyDisabled", 3.5F));
    EXPECT_EQ(control.get(L"JoinModifyDisabled").value.iVal, 4);
    ASSERT_TRUE(control.put(L"JoinModifyDisabled", true));
    EXPECT_EQ(control.get(L"JoinModifyDisabled").value.iVal, -1);
    ASSERT_TRUE(control.put(L"LNGJoinOk", std::int32_t{17}));
    EXPECT_EQ(control.get(L"LNGJoinOk").text(), "17");
    ASSERT_TRUE(control.put(L"OnlyJoin", std::int32_t{2}));
    EXPECT_EQ(control.get(L"OnlyJoin").value.boolVal, VARIANT_TRUE);
}

TEST_F(TheControl, RefusesANumberBeyond16BitsAsAnOverflow) {
    for (const std::int32_t number : {32768, -32769, 100000}) {
        const Outcome outcome = control.put(L"MXHorzFrameSize", number);
        EXPECT_EQ(outcome.code, DISP_E_OVERFLOW) << number;
        EXPECT_EQ(outcome.wrong, 0U);
    }
    EXPECT_EQ(control.get(L"MXHorzFrameSize").value.iVal, 16000);
    EXPECT_TRUE(control.put(L"MXHorzFrameSize", std::int32_t{32767}));
}

TEST_F(TheControl, RefusesAValueOfAnotherKindAsATypeMismatch) {
    EXPECT_EQ(control.put(L"JoinModifyDisabled", platform::StringView(u"twelve")).code,
              DISP_E_TYPEMISMATCH);
    EXPECT_EQ(control.put(L"LNGJoinOk", Held<IDispatch>()).code, DISP_E_TYPEMISMATCH);
    Late::Values null(1);
    null[0].vt = VT_NULL;
    EXPECT_EQ(control.invoke(L"LNGJoinOk", DISPATCH_PROPERTYPUT, std::move(null)).code,
              DISP_E_TYPEMISMATCH);
    EXPECT_EQ(control.put(L"Zandor", std::int32_t{1}).code, DISP_E_TYPEMISMATCH);
    EXPECT_EQ(control.get(L"LNGJoinOk").text(), "&Ok");
}

TEST_F(TheControl, FollowsAReferenceToAValue) {
    Late::Values given(1);
    short number = 9;
    given[0].vt = VT_I2 | VT_BYREF;
    given[0].piVal = &number;
    ASSERT_TRUE(control.invoke(L"JoinModifyDisabled", DISPATCH_PROPERTYPUT, std::move(given)));
    EXPECT_EQ(control.get(L"JoinModifyDisabled").value.iVal, 9);

    VARIANT inner;
    inner.vt = VT_I4;
    inner.lVal = 70000;
    Late::Values nested(1);
    nested[0].vt = VT_VARIANT | VT_BYREF;
    nested[0].pvarVal = &inner;
    EXPECT_EQ(control.invoke(L"JoinModifyDisabled", DISPATCH_PROPERTYPUT, std::move(nested)).code,
              DISP_E_OVERFLOW);
}

TEST_F(TheControl, TakesNamedArguments) {
    EXPECT_TRUE(control.invoke(
        L"SelectColumnNames", DISPATCH_METHOD,
        Late::list(platform::StringView(u"id"), platform::StringView(u"orders")), {1, 0}));
    EXPECT_EQ(control
                  .invoke(L"SelectColumnNames", DISPATCH_METHOD,
                          Late::list(platform::StringView(u"id"), platform::StringView(u"orders")),
                          {1, 1})
                  .code,
              DISP_E_PARAMNOTFOUND);
    EXPECT_EQ(control
                  .invoke(L"SelectColumnNames", DISPATCH_METHOD,
                          Late::list(platform::StringView(u"id"), platform::StringView(u"orders")),
                          {1, 7})
                  .code,
              DISP_E_PARAMNOTFOUND);
}

TEST_F(TheControl, MissesArgumentsThatAreLeftOut) {
    EXPECT_EQ(control.call(L"SetCurrentTable").code, DISP_E_PARAMNOTOPTIONAL);
    EXPECT_EQ(control.call(L"SelectColumnNames", platform::StringView(u"orders")).code,
              DISP_E_PARAMNOTOPTIONAL);
    Late::Values left(2);
    left[0].vt = VT_ERROR;
    left[0].scode = DISP_E_PARAMNOTFOUND;
    const Outcome outcome = control.invoke(L"SelectColumnNames", DISPATCH_METHOD, std::move(left));
    EXPECT_EQ(outcome.code, DISP_E_PARAMNOTOPTIONAL);
    EXPECT_EQ(outcome.wrong, 1U);
}

TEST_F(TheControl, RefusesArgumentsTooMany) {
    EXPECT_EQ(control.call(L"Terminate", std::int32_t{1}).code, DISP_E_BADPARAMCOUNT);
    EXPECT_EQ(control.call(L"LNGJoinOk", std::int32_t{1}).code, DISP_E_BADPARAMCOUNT);
}

TEST_F(TheControl, HasNoWayToWriteWhatIsOnlyRead) {
    for (const wchar_t* name : {L"lastjoin", L"activetable", L"ActiveColumn"}) {
        EXPECT_EQ(control.set(name, control.object()).code, DISP_E_MEMBERNOTFOUND);
        const Outcome outcome = control.get(name);
        EXPECT_TRUE(outcome);
        EXPECT_EQ(outcome.value.vt, VT_DISPATCH);
        EXPECT_EQ(outcome.value.pdispVal, nullptr);
    }
    EXPECT_EQ(control.set(L"OnlyJoin", control.object()).code, DISP_E_MEMBERNOTFOUND);
}

TEST_F(TheControl, StandsHostilesWhoCallItWithNothing) {
    IDispatch* const object = control.object();
    EXPECT_EQ(object->Invoke(0x68030018, IID_NULL, 0, DISPATCH_PROPERTYGET, nullptr, nullptr,
                             nullptr, nullptr),
              E_POINTER);
    DISPPARAMS none{};
    EXPECT_EQ(object->Invoke(0x68030018, IID_NULL, 0, DISPATCH_PROPERTYGET, &none, nullptr, nullptr,
                             nullptr),
              S_OK);
    EXPECT_EQ(object->Invoke(0x68030018, IID_IUnknown, 0, DISPATCH_PROPERTYGET, &none, nullptr,
                             nullptr, nullptr),
              DISP_E_UNKNOWNINTERFACE);
    EXPECT_EQ(object->Invoke(12345, IID_NULL, 0, DISPATCH_METHOD, &none, nullptr, nullptr, nullptr),
              DISP_E_MEMBERNOTFOUND);
    DISPPARAMS lying{nullptr, nullptr, 1, 0};
    EXPECT_EQ(
        object->Invoke(0x60030062, IID_NULL, 0, DISPATCH_METHOD, &lying, nullptr, nullptr, nullptr),
        E_INVALIDARG);
    lying = {nullptr, nullptr, 0, 3};
    EXPECT_EQ(
        object->Invoke(0x60030062, IID_NULL, 0, DISPATCH_METHOD, &lying, nullptr, nullptr, nullptr),
        E_INVALIDARG);
    EXPECT_HRESULT_FAILED(early->get_LNGJoinOk(nullptr));
    EXPECT_HRESULT_FAILED(early->put_DebugSwitch(nullptr));
    EXPECT_HRESULT_FAILED(early->SelectColumnNames(nullptr, nullptr));
    EXPECT_EQ(early->SetCurrentTable(nullptr), S_OK); // an empty text
    EXPECT_EQ(object->QueryInterface(IID_IUnknown, nullptr), E_POINTER);
}

TEST_F(TheControl, LeavesWordsForACallerWhoErrs) {
    ASSERT_HRESULT_FAILED(early->put_DebugSwitch(nullptr));
    Held<IErrorInfo> words;
    ASSERT_EQ(GetErrorInfo(0, words.slot()), S_OK);
    Text text;
    words->GetDescription(text.slot());
    EXPECT_EQ(text.string(), u"Invalid procedure call or argument");
}

TEST_F(TheControl, FailsForNobodyWhereItReportsToItsUser) {
    // Beyond the scroll range: a box for the user, and the value stays.
    SetErrorInfo(0, nullptr);
    Boxes::taken();
    EXPECT_EQ(early->put_HorizontalScrollbarPos(32000), S_OK);
    EXPECT_TRUE(control.put(L"VerticalScrollbarPos", std::int32_t{-5}));
    EXPECT_EQ(Boxes::taken(), (std::vector<std::string>{"Unexpected Error:", "Unexpected Error:"}));
    Held<IErrorInfo> words;
    EXPECT_EQ(GetErrorInfo(0, words.slot()), S_FALSE);
    short value = -1;
    EXPECT_EQ(early->get_HorizontalScrollbarPos(&value), S_OK);
    EXPECT_EQ(value, 0);
}

TEST_F(TheControl, HasOneIdentityThroughAllOfItsInterfaces) {
    const auto asUnknown = [](IUnknown* object) { return Held<IUnknown>::of(object).get(); };
    const auto safety = Held<IObjectSafety>::of(early.get());
    const auto points = Held<IConnectionPointContainer>::of(early.get());
    ASSERT_TRUE(safety && points);
    EXPECT_EQ(asUnknown(safety.get()), asUnknown(early.get()));
    EXPECT_EQ(asUnknown(points.get()), asUnknown(early.get()));
}

TEST_F(TheControl, IsSafeForScripts) {
    const auto safety = Held<IObjectSafety>::of(early.get());
    DWORD supported = 0;
    DWORD enabled = 9;
    ASSERT_EQ(safety->GetInterfaceSafetyOptions(IID_IDispatch, &supported, &enabled), S_OK);
    EXPECT_EQ(supported, 3U);
    EXPECT_EQ(enabled, 0U);
    EXPECT_EQ(safety->SetInterfaceSafetyOptions(IID_IDispatch, 1, 1), S_OK);
    EXPECT_EQ(safety->GetInterfaceSafetyOptions(IID_IDispatch, &supported, &enabled), S_OK);
    EXPECT_EQ(enabled, 1U);
    EXPECT_EQ(safety->SetInterfaceSafetyOptions(IID_IStorage, 1, 1), E_NOINTERFACE);
}
