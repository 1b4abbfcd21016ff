#include "RandomTotals.h"

#include <Zandor/model/Functions.h>

using namespace zandor;

using model::Total;
using platform::StringView;

RandomTotals::RandomTotals(std::uint32_t seed, reader::DatabaseReader& database) : mDice(seed) {
    for (const StringView name : {u"orders", u"customers", u"order_lines", u"employees"}) {
        const auto table = database.table({u"", platform::String(name)});
        if (!table) throw std::runtime_error(table.error().toStdString());
        mTables.emplace(name, *table);
    }
}

platform::Ref<model::Query> RandomTotals::next() { return drawn(0); }

platform::Ref<model::Query> RandomTotals::drawn(int depth) {
    const bool readsFromSaved = depth < 3 && mDice.oneIn(3);
    const auto saved = readsFromSaved ? drawn(depth + 1) : nullptr;
    const auto query = platform::makeRef<model::Query>();
    query->addTable(mTables.at(u"orders"));
    mNumbers = {u"orders.id", u"orders.customer_id", u"orders.contact_id", u"[employee_id]"};
    mTexts = {u"orders.status", u"[status]"};
    mDates = {u"orders.due_on"};
    if (mDice.oneIn(2)) {
        query->addTable(mTables.at(u"customers"));
        join(*query, u"orders", u"customer_id", u"customers", u"id");
        mNumbers.insert(mNumbers.end(), {u"customers.id", u"customers.account_manager_id"});
        mDates.push_back(u"customers.customer_since");
    }
    if (mDice.oneIn(2)) {
        query->addTable(mTables.at(u"order_lines"));
        join(*query, u"orders", u"id", u"order_lines", u"order_id");
        mNumbers.insert(mNumbers.end(), {u"order_lines.quantity", u"order_lines.line_no"});
    }
    if (mDice.oneIn(3)) {
        query->addTable(mTables.at(u"employees"));
        join(*query, u"orders", u"employee_id", u"employees", u"id");
        mNumbers.push_back(u"employees.manager_id");
        mDates.push_back(u"employees.hired_on");
    }
    if (saved) addSaved(*query, *saved);
    for (std::size_t n = 1 + mDice.roll(4); n > 0; --n) addDefinition(*query);
    if (mDice.oneIn(4)) query->options({.distinct = true});
    return query;
}

/// Joined by a whole number, if it has one.
void RandomTotals::addSaved(model::Query& query, const model::Query& saved) {
    model::SavedQuery record{.file = {}, .record = saved.record()};
    if (model::Query::refusalOf(record)) return;
    model::Query alone;
    const auto columns = alone.addQuery(u"saved", record)->contents()->columns;
    const auto ofType = [&](model::ColumnType type) {
        std::vector<String> names;
        for (std::int32_t position = 2; position <= columns.Count(); ++position) {
            const auto column = std::static_pointer_cast<model::Column>(columns.Item(position));
            if (column->description().type == type) names.push_back(column->Name());
        }
        return names;
    };
    const auto numbers = ofType(model::ColumnType::Integer);
    if (numbers.empty()) return;
    query.addQuery(u"saved", record);
    join(query, u"orders", u"id", u"saved", mDice.pick(numbers));
    const auto write = [](std::vector<String>& to, const std::vector<String>& names) {
        for (const String& name : names)
            to.push_back(u"saved." + model::criteria::writtenName(name));
    };
    write(mNumbers, numbers);
    write(mTexts, ofType(model::ColumnType::Text));
    write(mDates, ofType(model::ColumnType::Date));
}

void RandomTotals::join(model::Query& query, StringView left, StringView leftColumn,
                        StringView right, StringView rightColumn) {
    static constexpr std::int16_t types[] = {0, 0, 1, 1, 2, 3};
    const auto join = platform::makeRef<model::Join>();
    join->LeftColumn(query.tableNamed(left)->columnNamed(leftColumn));
    join->RightColumn(query.tableNamed(right)->columnNamed(rightColumn));
    join->JoinType(mDice.pick(types));
    query.AddJoin(join);
}

void RandomTotals::addDefinition(model::Query& query) {
    static constexpr Total ofAny[] = {Total::None,  Total::None,  Total::None,
                                      Total::Group, Total::Count, Total::Condition};
    static constexpr Total ofOrdered[] = {Total::None,     Total::None,    Total::Count,
                                          Total::Smallest, Total::Largest, Total::Condition};
    static constexpr Total ofNumbers[] = {Total::None,    Total::Count,    Total::CountDifferent,
                                          Total::Sum,     Total::Average,  Total::Smallest,
                                          Total::Largest, Total::Condition};
    const auto definition = platform::makeRef<model::ColumnDefinition>();
    char16_t kind = u"nnntdc"[mDice.roll(6)];
    switch (kind) {
    case u'n':
        definition->expression(mDice.oneIn(6) ? number(1) + u" / " + number(1) : number(3));
        definition->total(mDice.pick(ofNumbers));
        break;
    case u't':
        definition->expression(text(2));
        definition->total(mDice.pick(ofAny));
        break;
    case u'd':
        definition->expression(date(2));
        definition->total(mDice.pick(ofOrdered));
        break;
    default:
        definition->expression(condition(2));
        definition->total(mDice.pick(ofAny));
        break;
    }
    const bool counted =
        definition->total() == Total::Count || definition->total() == Total::CountDifferent;
    if (counted) kind = u'n';
    definition->Visible(!mDice.oneIn(6));
    for (int row = 4; row < 6; ++row)
        if (mDice.oneIn(3))
            definition->AddCriterium(criterion(model::aggregates(definition->total()), kind),
                                     platform::decimal(row));
    query.AddColumnDefinition(definition);
}

RandomTotals::String RandomTotals::number(int depth) {
    static constexpr StringView operators[] = {u" + ", u" - ", u" * "};
    const auto small = [&] { return platform::decimal(static_cast<int>(mDice.roll(12))); };
    if (depth <= 0) return mDice.oneIn(3) ? small() : mDice.pick(mNumbers);
    switch (mDice.roll(10)) {
    case 0: return u"Abs(" + number(depth - 1) + u")";
    case 1: return u"Length(" + text(depth - 1) + u")";
    case 2:
        return u"If(" + condition(depth - 1) + u", " + number(depth - 1) +
               (mDice.oneIn(2) ? u", " + number(depth - 1) : String()) + u")";
    case 3: return u"Coalesce(" + number(depth - 1) + u", " + number(depth - 1) + u")";
    case 4: return (mDice.oneIn(2) ? u"Year(" : u"Month(") + date(depth - 1) + u")";
    case 5: return u"DateDiff(" + date(depth - 1) + u", " + date(depth - 1) + u")";
    case 6: return u"-(" + number(depth - 1) + u")";
    case 7: return mDice.pick(mNumbers);
    default:
        return u"(" + number(depth - 1) + String(mDice.pick(operators)) + number(depth - 1) + u")";
    }
}

RandomTotals::String RandomTotals::text(int depth) {
    static constexpr StringView words[] = {u"'open'", u"'paid'", u"'x'"};
    const auto count = [&] { return platform::decimal(static_cast<int>(mDice.roll(6)) - 1); };
    if (depth <= 0) return mDice.oneIn(3) ? String(mDice.pick(words)) : mDice.pick(mTexts);
    switch (mDice.roll(7)) {
    case 0: return u"(" + text(depth - 1) + u" & " + text(depth - 1) + u")";
    case 1: return u"Left(" + text(depth - 1) + u", " + count() + u")";
    case 2: return u"Right(" + text(depth - 1) + u", " + count() + u")";
    case 3: return u"Mid(" + text(depth - 1) + u", " + count() + u", " + count() + u")";
    case 4:
        return u"If(" + condition(depth - 1) + u", " + text(depth - 1) + u", " + text(depth - 1) +
               u")";
    case 5: return u"('x' & " + mDice.pick(mNumbers) + u")";
    default: return mDice.pick(mTexts);
    }
}

RandomTotals::String RandomTotals::date(int depth) {
    if (depth <= 0) return mDice.oneIn(4) ? u"#2021-05-01#" : mDice.pick(mDates);
    if (mDice.oneIn(2)) return mDice.pick(mDates);
    return u"(" + date(depth - 1) + (mDice.oneIn(2) ? u" + " : u" - ") +
           platform::decimal(static_cast<int>(mDice.roll(400))) + u")";
}

RandomTotals::String RandomTotals::condition(int depth) {
    static constexpr StringView comparisons[] = {u" = ", u" <> ", u" < ", u" > ", u" <= ", u" >= "};
    const String compared(mDice.pick(comparisons));
    if (depth <= 0) return mDice.pick(mNumbers) + compared + number(0);
    switch (mDice.roll(9)) {
    case 0: return text(depth - 1) + (mDice.oneIn(2) ? u" = " : u" <> ") + text(depth - 1);
    case 1: return text(depth - 1) + (mDice.oneIn(2) ? u" Like '*a?d*'" : u" Not Like 'o*'");
    case 2:
        return number(depth - 1) + (mDice.oneIn(2) ? u" Between " : u" Not Between ") +
               number(depth - 1) + u" And " + number(depth - 1);
    case 3:
        return number(depth - 1) + (mDice.oneIn(2) ? u" In (" : u" Not In (") + number(depth - 1) +
               u", 3, 7)";
    case 4: return mDice.pick(mNumbers) + (mDice.oneIn(2) ? u" Is Null" : u" Is Not Null");
    case 5: return u"Not (" + condition(depth - 1) + u")";
    case 6:
        return u"(" + condition(depth - 1) + (mDice.oneIn(2) ? u" And " : u" Or ") +
               condition(depth - 1) + u")";
    case 7: return date(depth - 1) + compared + date(depth - 1);
    default: return number(depth - 1) + compared + number(depth - 1);
    }
}

/// Of a total that is asked of rows put together, only constants can be said.
RandomTotals::String RandomTotals::criterion(bool total, char16_t kind) {
    if (mDice.oneIn(6)) return mDice.oneIn(2) ? u"Is Null" : u"Is Not Null";
    const String own = platform::decimal(static_cast<int>(mDice.roll(30)));
    switch (kind) {
    case u'n':
        if (!total && mDice.oneIn(3)) return u"> (" + number(1) + u")";
        return (mDice.oneIn(2) ? u"> " : u"<= ") + own + (mDice.oneIn(3) ? u" Or 3" : u" * 2");
    case u't': return mDice.oneIn(2) ? u"Like *a*" : u"<> open";
    case u'd': return u">= 2021-02-01 And < 2023-02-01 Or #2024-01-01#";
    default: return mDice.oneIn(2) ? u"true" : u"Not true";
    }
}
