#include "RandomQuery.h"

#include <random>

using namespace zandor;

namespace {

using platform::makeRef;
using platform::Ref;
using platform::String;

class RandomUser {
public:
    explicit RandomUser(std::uint32_t seed) : mRandom(seed) {}

    Ref<model::Query> work() {
        for (int step = upTo(60); step > 0; --step) act();
        return mQuery;
    }

private:
    int upTo(int most) { return std::uniform_int_distribution(0, most)(mRandom); }
    bool chance(int percent) { return upTo(99) < percent; }

    std::int32_t anyLong() {
        return std::uniform_int_distribution<std::int32_t>(INT32_MIN, INT32_MAX)(mRandom);
    }

    /// Text with all that a file could trip over, but half characters and NUL.
    String text() {
        static const std::vector<String> pieces = {
            u"a",      u"B",      u"9",          u" ",    u"\"",  u"\\",     u"/",
            u"\n",     u"\t",     u"\x1b",       u"\x7f", u"*",   u"\u00e4", u"\u2028",
            u"\ufeff", u"\uffff", u"\U0001F600", u"null", u"{\"", u"]}",     u"~1"};
        String result;
        for (int n = upTo(12); n > 0; --n)
            result += pieces[static_cast<std::size_t>(upTo(static_cast<int>(pieces.size()) - 1))];
        return result;
    }

    String name() {
        const String rest = text();
        return rest.empty() ? String(u"t") : rest;
    }

    template <class Item, class Collection>
    Ref<Item> any(Collection& items) {
        if (items.Count() == 0) return {};
        return std::static_pointer_cast<Item>(items.Item(1 + upTo(items.Count() - 1)));
    }

    Ref<model::Table> table() { return any<model::Table>(mQuery->Tables()); }

    void act() {
        switch (upTo(7)) {
        case 0:
        case 1: return addTable();
        case 2:
        case 3: return addJoin();
        case 4: return addDefinition();
        case 5: return change();
        case 6:
            if (chance(50) && table()) mQuery->renameTable(table(), name() + suffix());
            return;
        default: return remove();
        }
    }

    String suffix() { return platform::decimal(++mNames); }

    void addTable() {
        if (chance(10)) {
            // What it was so far is a saved query in itself from now on.
            model::SavedQuery saved{.file = text(), .record = mQuery->record()};
            if (!model::Query::refusalOf(saved)) mQuery->addQuery(name(), std::move(saved));
            return;
        }
        model::TableDescription source{chance(30) ? text() : String(), name(), {}};
        for (int n = upTo(6); n > 0; --n)
            source.columns.push_back({text(), static_cast<model::ColumnType>(upTo(8)),
                                      chance(50) ? text() : String(), chance(20)});
        const auto added = mQuery->addTable(source);
        if (chance(70)) {
            added->Left(static_cast<float>(anyLong() / 2));
            added->Top(static_cast<float>(upTo(20000)));
            added->Width(static_cast<float>(upTo(9000)));
            added->Height(static_cast<float>(upTo(9000)));
        }
        added->Selected(static_cast<std::int16_t>(anyLong()));
        any<model::Column>(added->Columns())->Selected(true);
    }

    void addJoin() {
        if (!table()) return;
        const auto join = makeRef<model::Join>();
        join->LeftColumn(any<model::Column>(table()->Columns()));
        join->RightColumn(any<model::Column>(table()->Columns()));
        join->JoinType(static_cast<std::int16_t>(upTo(3)));
        join->CompareOperator(static_cast<std::int16_t>(upTo(5)));
        mQuery->AddJoin(join);
        if (chance(15)) join->RightTable(table()); // which may leave the end without a column
    }

    void addDefinition() {
        if (!table()) return;
        const auto definition = makeRef<model::ColumnDefinition>();
        definition->Column(any<model::Column>(table()->Columns()));
        definition->Synonym(text());
        definition->SortOrder(static_cast<std::int16_t>(upTo(2)));
        definition->Visible(chance(80));
        if (chance(30)) definition->total(static_cast<model::Total>(upTo(8)));
        if (chance(20)) definition->sortPriority(static_cast<std::int16_t>(upTo(255)));
        if (chance(30)) definition->format(static_cast<model::Format>(upTo(10)));
        if (chance(30)) definition->decimals(static_cast<std::int16_t>(upTo(16) - 1));
        if (chance(20)) definition->expression(u"Coalesce(t1.c, [t2].[c], " + text() + u")");
        if (chance(40)) definition->Width(upTo(model::ColumnDefinition::greatestWidth));
        mQuery->AddColumnDefinition(definition);
        for (int n = upTo(3); n > 0; --n) {
            const String row = platform::decimal(4 + (chance(95) ? upTo(8) : upTo(32763)));
            if (!definition->HasCriterium(row)) definition->AddCriterium(text(), row);
        }
    }

    std::vector<model::Comment> comments() {
        std::vector<model::Comment> all;
        for (int n = upTo(3); n > 0; --n)
            all.push_back({static_cast<model::CommentPlace>(upTo(6)), text(),
                           static_cast<std::int16_t>(upTo(40)), chance(50), text()});
        return all;
    }

    void change() {
        if (chance(30)) mQuery->options({chance(50), upTo(1000), text(), comments()});
        const auto definition = any<model::ColumnDefinition>(mQuery->ColumnDefinitions());
        if (!definition) return;
        // The tables that are gone already are what makes an object read as nothing.
        if (mGone && chance(30)) definition->Column(mGone);
        const auto join = any<model::Join>(mQuery->Joins());
        if (join && mGone && chance(30)) {
            join->LeftTable(mGoneTable);
            if (chance(50)) join->LeftColumn(mGone);
        }
    }

    void remove() {
        switch (upTo(3)) {
        case 0:
            if (const auto gone = table()) {
                mGone = any<model::Column>(gone->Columns());
                mGoneTable = gone;
                mQuery->DeleteTable(gone);
            }
            return;
        case 1:
            if (const auto join = any<model::Join>(mQuery->Joins()))
                mQuery->Joins().Remove(join->Key());
            return;
        default:
            if (const auto definition = any<model::ColumnDefinition>(mQuery->ColumnDefinitions()))
                mQuery->ColumnDefinitions().Remove(definition->Key());
            return;
        }
    }

    std::mt19937 mRandom;
    Ref<model::Query> mQuery = makeRef<model::Query>();
    Ref<model::Table> mGoneTable;
    Ref<model::Column> mGone;
    int mNames = 0;
};

} // namespace

platform::Ref<model::Query> randomQuery(std::uint32_t seed) { return RandomUser(seed).work(); }
