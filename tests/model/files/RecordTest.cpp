#include "Files.h"

#include "model/Expect.h"
#include "model/SmallQuery.h"

using namespace zandor;

TEST(ARecord, WithAFaultMakesNoQuery) {
    SmallQuery small;
    auto record = small.query->record();
    EXPECT_NO_THROW(model::Query::restored(record));
    record.tables[1].name = u"ORDERS";
    EXPECT_EQ(errorOf([&] { model::Query::restored(record); }), 5);
    const auto fault = model::faultOf(record);
    ASSERT_TRUE(fault);
    EXPECT_EQ(fault->path, "tables/1/name");
    EXPECT_EQ(fault->message, model::say<model::MessageCode::nameOfTwoTables>("/tables/1/name"));
}

TEST(ARecord, ThatIsNotTheSameIsNotEqual) {
    const auto different = [](auto&& change) {
        SmallQuery small;
        small.query->AddJoin(small.newJoin(small.orders, small.customers));
        small.query->AddColumnDefinition(small.newDefinition(small.orders));
        const auto before = small.query->record();
        change(small);
        return before != small.query->record();
    };
    EXPECT_FALSE(different([](SmallQuery&) {}));
    EXPECT_TRUE(different([](SmallQuery& small) { small.orders->Top(7); }));
    EXPECT_TRUE(different([](SmallQuery& small) { small.orders->Selected(-1); }));
    EXPECT_TRUE(different([](SmallQuery& small) { small.id(small.orders)->Selected(true); }));
    EXPECT_TRUE(different([](SmallQuery& small) { small.query->renameTable(small.orders, u"o"); }));
    EXPECT_TRUE(different([](SmallQuery& s) { s.query->Joins().Item(1)->JoinType(1); }));
    EXPECT_TRUE(different([](SmallQuery& s) { s.query->Joins().Item(1)->CompareOperator(1); }));
    EXPECT_TRUE(different(
        [](SmallQuery& s) { s.query->ColumnDefinitions().Item(1)->AddCriterium(u"1", u"4"); }));
    EXPECT_TRUE(
        different([](SmallQuery& s) { s.query->ColumnDefinitions().Item(1)->Visible(false); }));
    EXPECT_TRUE(different([](SmallQuery& s) {
        const auto definition = s.query->ColumnDefinitions().Item(1);
        dynamic_cast<model::ColumnDefinition&>(*definition).Width(1500);
    }));
    EXPECT_TRUE(different([](SmallQuery& s) {
        const auto definition = s.query->ColumnDefinitions().Item(1);
        dynamic_cast<model::ColumnDefinition&>(*definition).format(model::Format::IsoDate);
    }));
    EXPECT_TRUE(different([](SmallQuery& s) {
        const auto definition = s.query->ColumnDefinitions().Item(1);
        dynamic_cast<model::ColumnDefinition&>(*definition).decimals(2);
    }));
}

TEST(ARecord, HasNoFormatThatNobodyKnows) {
    SmallQuery small;
    small.query->AddColumnDefinition(small.newDefinition(small.orders));
    auto record = small.query->record();
    record.definitions[0].format = static_cast<model::Format>(11);
    EXPECT_EQ(model::faultOf(record).value().message,
              model::say<model::MessageCode::noFormat>("/definitions/0/format"));
    record = small.query->record();
    for (const int decimals : {-2, 16}) {
        record.definitions[0].decimals = static_cast<std::int16_t>(decimals);
        EXPECT_EQ(model::faultOf(record).value().message,
                  model::say<model::MessageCode::notInRange>("/definitions/0/decimals", -1, 15));
    }
}

TEST(TheKeysOfAQuery, EndWithAnErrorAndNotWithANumberTwice) {
    model::QueryRecord record;
    record.lastKeys.table = model::greatestKeyNumber;
    const auto query = model::Query::restored(record);
    EXPECT_EQ(query->addTable(SmallQuery::described(u"a"))->Key(), u"t1000000001");
}

TEST(AKeyNumber, IsWrittenInOneWayOnly) {
    EXPECT_EQ(model::keyNumber(u"t1", u't'), 1);
    EXPECT_EQ(model::keyNumber(u"t1000000000", u't'), 1'000'000'000);
    for (const char16_t* key : {u"", u"t", u"t0", u"t01", u"t-1", u"t 1", u"x1", u"t1000000001",
                                u"t99999999999999999999", u"T1", u"t1x"})
        EXPECT_FALSE(model::keyNumber(key, u't')) << platform::toUtf8(key);
}
