#include "Queries.h"

#include <gtest/gtest.h>

using namespace zandor;

platform::Ref<model::Query> draw(const QString& address, const QStringList& tables,
                                 const std::vector<Drawn>& columns) {
    auto query = platform::makeRef<model::Query>();
    const auto connection = reader::openDatabase(address);
    if (!connection) {
        ADD_FAILURE() << connection.error().toStdString();
        return query;
    }
    const auto schema = reader::makeReader(connection->database());
    for (const QString& name : tables) {
        const auto table = schema->table({u"", name.toStdU16String()});
        if (!table) {
            ADD_FAILURE() << table.error().toStdString();
            return query;
        }
        query->addTable(*table);
    }
    for (const Drawn& column : columns) addColumn(*query, column);
    return query;
}

void addColumn(model::Query& query, const Drawn& column) {
    const auto table = query.tableNamed(column.column.section(u'.', 0, 0).toStdU16String());
    ASSERT_TRUE(table) << column.column.toStdString();
    const auto found = table->columnNamed(column.column.section(u'.', 1).toStdU16String());
    ASSERT_TRUE(found) << column.column.toStdString();
    const auto definition = platform::makeRef<model::ColumnDefinition>();
    definition->Column(found);
    definition->SortOrder(static_cast<std::int16_t>(column.sorting));
    std::int32_t row = model::Criteria::firstRow;
    for (const QString& criterion : column.criteria)
        definition->AddCriterium(criterion.toStdU16String(), platform::decimal(row++));
    query.AddColumnDefinition(definition);
}

QStringList numbersTable(int count) {
    return {QStringLiteral("CREATE TABLE numbers (n INTEGER, word VARCHAR(20), missing INTEGER)"),
            QStringLiteral("INSERT INTO numbers WITH RECURSIVE counted(n) AS (SELECT 0 UNION ALL "
                           "SELECT n + 1 FROM counted WHERE n + 1 < %1) SELECT n, 'word ' || n, "
                           "NULL FROM counted")
                .arg(count)};
}

platform::Ref<model::Query> drawForMinutes(const QString& address) {
    const QString numbers = QStringLiteral("numbers");
    return draw(address, {numbers, numbers, numbers, numbers},
                {{"numbers.n", {"< numbers_1.n"}},
                 {"numbers_1.n", {"< numbers_2.n"}},
                 {"numbers_2.n", {"< numbers_3.n"}},
                 {"numbers_3.n", {"< numbers.n"}}});
}

std::optional<QString> Keeper::add(const designer::Row& row) {
    if (static_cast<int>(cells.size()) == refuseAfter) return QStringLiteral("enough");
    cells.push_back(row);
    QStringList texts;
    for (const designer::Cell& cell : row) {
        static const char letters[] = {'0', 't', 'n', 'b', 'B'};
        texts << QLatin1Char(letters[static_cast<int>(cell.kind)]) + QStringLiteral(":") +
                     (cell.kind == designer::Cell::Kind::blob
                          ? QString::fromLatin1(cell.blob.toHex())
                          : cell.text);
    }
    rows << texts.join(QStringLiteral(" | "));
    if (rows.size() == 1 && afterFirst) afterFirst();
    return {};
}

designer::Command commandFor(const platform::Ref<model::Query>& query, model::sql::Dialect dialect,
                             std::optional<qint64> limit) {
    const auto text = designer::statementFor(*query, dialect, limit);
    EXPECT_TRUE(text.runnable());
    return designer::makeCommand(text, dialect, {}, limit);
}

void expectFoundByWhatIsShown(const QString& address, const QString& table,
                              model::sql::Dialect dialect, const QStringList& outside) {
    const auto rowsOf = [&](const platform::Ref<model::Query>& query) {
        Keeper keeper;
        const std::atomic<bool> stop = false;
        const auto outcome = designer::fetch(designer::Database::connectorTo(address, {}),
                                             commandFor(query, dialect), keeper, stop);
        EXPECT_EQ(outcome.end, designer::Outcome::End::complete) << outcome.message.toStdString();
        return keeper;
    };
    const Keeper all = rowsOf(draw(address, {table}));
    ASSERT_FALSE(all.cells.empty());
    for (qsizetype column = 0; column < all.columns.size(); ++column) {
        const QString name = table + u'.' + all.columns[column];
        for (const designer::Row& row : all.cells) {
            const designer::Cell& cell = row[static_cast<std::size_t>(column)];
            SCOPED_TRACE((name + QStringLiteral(": ") + cell.text).toStdString());
            const QString criterion = outside.contains(all.columns[column])
                                          ? QStringLiteral("Text(%1) = '%2'").arg(name, cell.text)
                                          : cell.text;
            const Keeper found = rowsOf(draw(address, {table}, {{name, {criterion}}}));
            EXPECT_EQ(found.cells, std::vector<designer::Row>{{cell}});
        }
    }
}
