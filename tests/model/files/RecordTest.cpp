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

TEST(ARecord, IsRefusedForAnEndOrACodeThatIsNone) {
    SmallQuery small;
    small.query->AddJoin(small.newJoin(small.orders, small.customers));
    small.query->AddColumnDefinition(small.newDefinition(small.orders));
    const auto faultAfter = [&](auto&& change) {
        auto record = small.query->record();
        change(record);
        const auto fault = model::faultOf(record);
        return fault ? fault->message : model::Message();
    };
    using model::MessageCode;
    using model::QueryRecord;
    using model::say;
    EXPECT_EQ(faultAfter([](QueryRecord&) {}), model::Message());
    EXPECT_EQ(faultAfter([](QueryRecord& r) { r.joins[0].right.table = u"t99"; }),
              say<MessageCode::keyOfNoTable>("/joins/0/right/table"));
    EXPECT_EQ(faultAfter([](QueryRecord& r) { r.joins[0].right.column = u"c99"; }),
              say<MessageCode::keyOfNoColumnThere>("/joins/0/right/column"));
    EXPECT_EQ(faultAfter([](QueryRecord& r) { r.joins[0].right.column = r.joins[0].left.column; }),
              say<MessageCode::keyOfNoColumnThere>("/joins/0/right/column"));
    for (const int outside : {-1, 4})
        EXPECT_EQ(faultAfter([&](QueryRecord& r) {
                      r.joins[0].type = static_cast<std::int16_t>(outside);
                  }),
                  say<MessageCode::noJoinType>("/joins/0/type"));
    for (const int outside : {-1, 6})
        EXPECT_EQ(faultAfter([&](QueryRecord& r) {
                      r.joins[0].comparison = static_cast<std::int16_t>(outside);
                  }),
                  say<MessageCode::noComparison>("/joins/0/operator"));
    for (const int outside : {-1, 3})
        EXPECT_EQ(faultAfter([&](QueryRecord& r) {
                      r.definitions[0].sortOrder = static_cast<std::int16_t>(outside);
                  }),
                  say<MessageCode::noSortOrder>("/definitions/0/sort"));
}

TEST(ARecord, HasNoTotalAndNoNameThatIsNone) {
    SmallQuery small;
    small.query->AddColumnDefinition(small.newDefinition(small.orders));
    const auto faultAfter = [&](auto&& change) {
        auto record = small.query->record();
        change(record);
        const auto fault = model::faultOf(record);
        return fault ? fault->message : model::Message();
    };
    using model::MessageCode;
    using model::QueryRecord;
    using model::say;
    EXPECT_EQ(faultAfter([](QueryRecord& record) {
                  record.definitions[0].total =
                      static_cast<model::Total>(static_cast<int>(model::lastTotal) + 1);
              }),
              say<MessageCode::noTotal>("/definitions/0/total"));
    const auto named = [&](const model::NameRecord& name) {
        return faultAfter([&](QueryRecord& changed) {
            changed.lastKeys.column += 5;
            changed.definitions[0].criteria = {{4, u"orders.id", {name}}};
        });
    };
    const auto record = small.query->record();
    const auto& table = record.tables[0];
    EXPECT_EQ(named({0, 6, table.key, table.columns[1].key}), model::Message());
    EXPECT_EQ(named({3, 1, table.key, table.columns[1].key}),
              say<MessageCode::placeOutOfOrder>("/definitions/0/criteria/0/names/0/at"));
    const auto given = static_cast<std::int64_t>(record.lastKeys.column) + 3;
    EXPECT_EQ(named({0, 6, table.key, u"c" + platform::decimal(given)}),
              say<MessageCode::keyOfNoColumnThere>("/definitions/0/criteria/0/names/0/column"))
        << "a column that was given and is gone, of a table that is there";
}

TEST(ARecord, HasCountsWithinTheirRanges) {
    using model::MessageCode;
    using model::say;
    const std::int32_t greatest = model::greatestKeyNumber;
    const auto message = [](auto&& change) {
        model::QueryRecord record;
        change(record);
        const auto fault = model::faultOf(record);
        return fault ? fault->message : model::Message();
    };
    EXPECT_EQ(message([](auto&) {}), model::Message());
    for (const auto& [key, name] :
         {std::pair(&model::LastKeys::table, "table"),
          std::pair(&model::LastKeys::column, "column"), std::pair(&model::LastKeys::join, "join"),
          std::pair(&model::LastKeys::definition, "definition")})
        for (const std::int32_t outside : {-1, greatest + 1})
            EXPECT_EQ(message([&](model::QueryRecord& record) { record.lastKeys.*key = outside; }),
                      say<MessageCode::notInRange>(std::string("/lastKeys/") + name, 0, greatest))
                << name;
    const std::int32_t most = model::QueryOptions::greatestFirst;
    for (const std::int32_t outside : {-1, most + 1})
        EXPECT_EQ(message([&](model::QueryRecord& record) { record.options.first = outside; }),
                  say<MessageCode::notInRange>("/first", 0, most));
}

TEST(ARecord, IsAsDeepAsTheDeepestOfItsSavedQueries) {
    const auto around = [](const model::QueryRecord& first, const model::QueryRecord& second) {
        model::QueryRecord record;
        for (const auto& inner : {first, second}) {
            model::SavedQuery saved;
            saved.record = inner;
            record.tables.emplace_back().query = model::SavedQueryRef(saved);
        }
        return record;
    };
    const model::QueryRecord flat;
    const auto one = around(flat, flat);
    const auto two = around(one, flat);
    EXPECT_EQ(model::depthOf(flat), 0);
    EXPECT_EQ(model::depthOf(one), 1);
    EXPECT_EQ(model::depthOf(two), 2);
    EXPECT_EQ(model::depthOf(around(flat, two)), 3);
    EXPECT_EQ(model::depthOf(around(two, flat)), 3);
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
