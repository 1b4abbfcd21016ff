#include "Setting.h"

#include <Zandor/Library.h>

namespace report {

using namespace zandor;

QString Setting::tableName(int table) { return QStringLiteral("table_%1").arg(table); }
QString Setting::columnName(int column) { return QStringLiteral("column_%1").arg(column); }

QRect Setting::place(int table) { return {20 + table % 4 * 290, 20 + table / 4 * 190, 190, 150}; }

std::vector<Setting::Join> Setting::allJoins() const {
    std::vector<Join> all;
    if (tables < 2) return all;
    for (int n = 0; n < joins; ++n) {
        const bool moving = n < joinsOfMoving || tables < 3;
        const int left = moving ? 0 : 1 + n % (tables - 1);
        const int right = moving ? 1 + n % (tables - 1) : 1 + (n + 1 + n / tables) % (tables - 1);
        // The one that moves is joined by the rows that it shows, the others by any.
        const int leftColumn = moving ? n / (tables - 1) + n % 4 : n * 7 % columns;
        if (left != right) all.push_back({left, leftColumn % columns, right, n * 3 % columns});
    }
    return all;
}

platform::Ref<model::Query> Setting::query() const {
    const auto query = platform::makeRef<model::Query>();
    for (int t = 0; t < tables; ++t) {
        model::TableDescription source{u"public", tableName(t).toStdU16String(), {}};
        for (int c = 0; c < columns; ++c)
            source.columns.push_back(
                {columnName(c).toStdU16String(), model::ColumnType::Integer, u"INTEGER", c == 0});
        const auto table = query->addTable(source);
        constexpr int twips = 15;
        const QRect box = place(t);
        table->Left(static_cast<float>(box.x() * twips));
        table->Top(static_cast<float>(box.y() * twips));
        table->Width(static_cast<float>(box.width() * twips));
        table->Height(static_cast<float>(box.height() * twips));
    }
    model::Library library;
    const auto column = [&](int table, int position) {
        // The first entry is the one for all columns.
        return query->Tables().Item(table + 1)->Columns().Item(position + 2);
    };
    for (const Join& each : allJoins()) {
        const auto join = library.NewZDJoin();
        join->LeftColumn(column(each.left, each.leftColumn));
        join->RightColumn(column(each.right, each.rightColumn));
        query->AddJoin(join);
    }
    return query;
}

} // namespace report
