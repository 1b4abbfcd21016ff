#include "Dll.h"
#include "Late.h"

#include "frontends/windows/automation/com/Failure.h"

#include <gtest/gtest.h>

using namespace zandor;
using namespace zandor::automation;

namespace {

using Word = platform::StringView;

/// A table as a script describes it, with a key "id" and one column more.
Late described(Word name, Word column) {
    const Late table(Dll::get().make<IDispatch>(ids::tableDescription));
    EXPECT_TRUE(table.put(L"Name", name));
    EXPECT_TRUE(table.call(L"AddColumn", Word(u"id"), std::int32_t{zdInteger}, true));
    EXPECT_TRUE(table.call(L"AddColumn", column));
    return table;
}

Held<IDispatch> make(const GUID& id) { return Dll::get().make<IDispatch>(id); }

class TheModel : public testing::Test {
protected:
    TheModel() {
        orders = query.at(L"AddTable", Held<IDispatch>(described(u"orders", u"customer").object()));
        customers =
            query.at(L"AddTable", Held<IDispatch>(described(u"customers", u"name").object()));
    }

    Late column(const Late& table, Word name) const {
        const Late columns = table.at(L"Columns");
        const std::int32_t count = columns.get(L"Count").value.lVal;
        for (std::int32_t n = 1; n <= count; ++n) {
            const Late found = columns.at(L"Item", n);
            if (textOf(found.get(L"Name").value.bstrVal) == name) return found;
        }
        return Late(nullptr);
    }
    Late joined() const {
        const Late join(make(ids::join));
        EXPECT_TRUE(join.set(L"LeftColumn", column(orders, u"customer").object()));
        EXPECT_TRUE(join.set(L"RightColumn", column(customers, u"id").object()));
        return query.at(L"AddJoin", Held<IDispatch>(join.object()));
    }
    Late output(const Late& of) const {
        const Late definition(make(ids::columnDefinition));
        EXPECT_TRUE(definition.set(L"Column", of.object()));
        return query.at(L"AddColumnDefinition", Held<IDispatch>(definition.object()));
    }

    const Late query{newQuery().get()};
    Late orders{nullptr}, customers{nullptr};
};

} // namespace

TEST_F(TheModel, IsFilledByAScript) {
    EXPECT_EQ(query.at(L"Tables").get(L"Count").text(), "2");
    EXPECT_EQ(orders.get(L"Name").text(), "orders");
    EXPECT_EQ(orders.at(L"Columns").get(L"Count").text(), "3"); // with the entry for all
    EXPECT_EQ(column(orders, u"id").get(L"Marker").value.boolVal, VARIANT_TRUE);
    EXPECT_EQ(column(orders, u"id").get(L"Type").text(), "2");
}

TEST_F(TheModel, FindsItemsByNumberAndByKey) {
    const Late tables = query.at(L"Tables");
    const Late second = tables.at(L"Item", std::int32_t{2});
    EXPECT_EQ(second.object(), customers.object());
    const platform::String key = textOf(second.get(L"Key").value.bstrVal);
    EXPECT_EQ(tables.at(L"Item", Word(key)).object(), customers.object());
    // By default, as a script calls a collection.
    EXPECT_EQ(tables.idOf(L"Item"), DISPID_VALUE);
}

TEST_F(TheModel, RefusesItemsThatThereAreNot) {
    const Late tables = query.at(L"Tables");
    EXPECT_EQ(tables.call(L"Item", std::int32_t{3}).code, codeOf(9));
    const Outcome outcome = tables.call(L"Item", Word(u"nobody"));
    EXPECT_EQ(outcome.code, codeOf(5));
    EXPECT_EQ(outcome.failure, "Invalid procedure call or argument");
}

TEST_F(TheModel, HandsOutOneObjectForOneThing) {
    EXPECT_EQ(query.at(L"Tables").at(L"Item", std::int32_t{1}).object(), orders.object());
    const Late join = joined();
    EXPECT_EQ(join.at(L"LeftTable").object(), orders.object());
    EXPECT_EQ(query.at(L"Joins").at(L"Item", std::int32_t{1}).object(), join.object());
}

TEST_F(TheModel, IsWalkedOneByOne) {
    const Outcome outcome = query.at(L"Tables").invoke(L"_NewEnum", DISPATCH_PROPERTYGET, {});
    ASSERT_TRUE(outcome);
    ASSERT_EQ(outcome.value.vt, VT_UNKNOWN);
    const auto walk = Held<IEnumVARIANT>::of(outcome.value.punkVal);
    ASSERT_TRUE(walk);
    Value items[3];
    ULONG fetched = 0;
    EXPECT_EQ(walk->Next(3, items, &fetched), S_FALSE);
    ASSERT_EQ(fetched, 2U);
    EXPECT_EQ(items[0].pdispVal, orders.object());
    EXPECT_EQ(items[1].pdispVal, customers.object());
    EXPECT_EQ(walk->Reset(), S_OK);
    EXPECT_EQ(walk->Skip(1), S_OK);
    Held<IEnumVARIANT> other;
    ASSERT_EQ(walk->Clone(other.slot()), S_OK);
    Value item;
    EXPECT_EQ(other->Next(1, &item, nullptr), S_OK);
    EXPECT_EQ(item.pdispVal, customers.object());
    EXPECT_EQ(walk->Skip(2), S_FALSE);
}

TEST_F(TheModel, GivesValuesHoweverAHostAsksForThem) {
    for (const WORD how : {DISPATCH_METHOD, DISPATCH_PROPERTYGET,
                           DISPATCH_METHOD | DISPATCH_PROPERTYGET}) {
        EXPECT_EQ(query.at(L"Tables").invoke(L"Count", how, {}).text(), "2");
        EXPECT_TRUE(query.at(L"Tables").invoke(L"_NewEnum", how, {}));
        EXPECT_TRUE(query.at(L"Tables").invoke(L"Item", how, Late::list(std::int32_t{1})));
    }
}

TEST_F(TheModel, WritesItsSql) {
    joined();
    const Late name = output(column(customers, u"name"));
    ASSERT_TRUE(name.put(L"SortOrder", std::int16_t{1}));
    ASSERT_TRUE(name.call(L"AddCriterium", Word(u"Like \"A*\""), Word(u"4")));
    const std::string sql = query.call(L"SQL", std::int32_t{zdSQLite}).text();
    EXPECT_NE(sql.find("    customers.name\nFROM"), std::string::npos) << sql;
    EXPECT_NE(sql.find("JOIN"), std::string::npos) << sql;
    EXPECT_NE(sql.find("LIKE 'A%'"), std::string::npos) << sql;
    EXPECT_NE(sql.find("ORDER BY"), std::string::npos) << sql;
    EXPECT_EQ(query.call(L"SQL", std::int32_t{9}).code, codeOf(5));
}

TEST_F(TheModel, SaysWhatThereIsToSay) {
    const Outcome outcome = Late(newQuery().get()).call(L"Findings");
    ASSERT_EQ(outcome.value.vt, VT_ARRAY | VT_VARIANT);
    LONG first = 0;
    Value text;
    ASSERT_EQ(SafeArrayGetElement(outcome.value.parray, &first, &text), S_OK);
    EXPECT_FALSE(stringOf(text).empty());
}

TEST_F(TheModel, TakesWhatHangsOnATableAlong) {
    joined();
    output(column(orders, u"id"));
    ASSERT_TRUE(query.call(L"DeleteTable", Held<IDispatch>(orders.object())));
    EXPECT_EQ(query.at(L"Joins").get(L"Count").text(), "0");
    EXPECT_EQ(query.at(L"ColumnDefinitions").get(L"Count").text(), "0");
    ASSERT_TRUE(query.at(L"Tables").call(L"Remove", std::int32_t{1}));
    EXPECT_EQ(query.at(L"Tables").get(L"Count").text(), "0");
}

TEST_F(TheModel, RemovesByNumberAndByKey) {
    const platform::String key = textOf(joined().get(L"Key").value.bstrVal);
    ASSERT_TRUE(query.at(L"Joins").call(L"Remove", Word(key)));
    output(column(orders, u"id"));
    ASSERT_TRUE(query.at(L"ColumnDefinitions").call(L"Remove", std::int32_t{1}));
    EXPECT_EQ(query.at(L"ColumnDefinitions").call(L"Remove", std::int32_t{1}).code, codeOf(9));
    EXPECT_EQ(orders.at(L"Columns").call(L"Remove", std::int32_t{1}).code, codeOf(438));
}

TEST_F(TheModel, KeepsCriteriaByTheRowsOfTheGrid) {
    const Late definition = output(column(orders, u"id"));
    ASSERT_TRUE(definition.call(L"AddCriterium", Word(u"> 5"), Word(u"5")));
    EXPECT_EQ(definition.call(L"HasCriterium", Word(u"5")).value.boolVal, VARIANT_TRUE);
    EXPECT_EQ(definition.call(L"HasCriterium", Word(u"4")).value.boolVal, VARIANT_FALSE);
    const Late criteria = definition.at(L"Criteria");
    EXPECT_EQ(criteria.get(L"Count").text(), "2");
    EXPECT_EQ(criteria.at(L"Item", std::int32_t{2}).get(L"Criterium").text(), "> 5");
    const Outcome outcome = definition.call(L"AddCriterium", Word(u"> 6"), Word(u"5"));
    EXPECT_EQ(outcome.code, codeOf(457));
    ASSERT_TRUE(criteria.call(L"Remove", std::int32_t{2}));
    EXPECT_EQ(criteria.get(L"Count").text(), "0");
}

TEST_F(TheModel, RefusesWhatItsClassesRefuse) {
    const Late join = joined();
    EXPECT_EQ(join.put(L"JoinType", std::int16_t{4}).code, codeOf(380));
    EXPECT_EQ(query.call(L"AddJoin", Held<IDispatch>(join.object())).code, codeOf(457));
    EXPECT_EQ(query.call(L"AddJoin", Held<IDispatch>()).code, codeOf(91));
    EXPECT_EQ(query.call(L"AddTable", Held<IDispatch>(orders.object())).code, codeOf(13));
    EXPECT_EQ(query.call(L"AddJoin", Held<IDispatch>(orders.object())).code, codeOf(13));
}

TEST_F(TheModel, IsBoundAndReadBackAsTheSameObject) {
    const auto control = newControl();
    const Late late(control.get());
    ASSERT_TRUE(late.set(L"Zandor", query.object()));
    EXPECT_EQ(late.get(L"Zandor").value.pdispVal, query.object());
    Held<_ZDQuery> early;
    ASSERT_EQ(control->get_Zandor(early.slot()), S_OK);
    EXPECT_EQ(Held<IUnknown>::of(early.get()).get(), Held<IUnknown>::of(query.object()).get());
    ASSERT_TRUE(late.call(L"SelectColumnNames", Word(u"orders"), Word(u"id")));
    EXPECT_EQ(column(orders, u"id").get(L"Selected").value.boolVal, VARIANT_TRUE);
    EXPECT_EQ(column(orders, u"customer").get(L"Selected").value.boolVal, VARIANT_FALSE);
    ASSERT_TRUE(late.call(L"SetCurrentTable", Word(u"customers")));
    EXPECT_EQ(customers.get(L"Selected").text(), "1");
    ASSERT_TRUE(late.call(L"Terminate"));
    EXPECT_NE(late.get(L"Zandor").value.pdispVal, query.object());
}

TEST_F(TheModel, LivesAsLongAsAnyOfItsPartsIsHeld) {
    Late tables(nullptr);
    {
        const Late other(newQuery().get());
        ASSERT_TRUE(other.call(L"AddTable", Held<IDispatch>(described(u"a", u"b").object())));
        tables = other.at(L"Tables");
    }
    EXPECT_EQ(tables.at(L"Item", std::int32_t{1}).get(L"Name").text(), "a");
}
