#include "Drawing.h"

#include <algorithm>
#include <map>
#include <random>

using namespace zandor;

namespace {

/// Draws at random, through the interface that the control uses and through that of the panels.
class RandomHand {
public:
    RandomHand(Drawing& drawing, std::uint32_t seed) : mDrawing(drawing), mRandom(seed) {}

    /// One gesture: a few changes of any kind.
    void gesture() {
        if (chance(20)) return panel();
        for (int n = 1 + upTo(2); n > 0; --n) act();
        mDrawing.document.changedByControl();
        if (chance(50)) returnToTheEventLoop();
    }

private:
    int upTo(int most) { return std::uniform_int_distribution(0, most)(mRandom); }
    bool chance(int percent) { return upTo(99) < percent; }
    float place() { return static_cast<float>(upTo(20000)); }
    platform::String name() { return u"name" + platform::decimal(upTo(1'000'000)); }

    template <class Item, class Items>
    platform::Ref<Item> any(Items& items) {
        if (items.Count() == 0) return {};
        return std::static_pointer_cast<Item>(items.Item(1 + upTo(items.Count() - 1)));
    }
    Drawing::TableRef table() { return any<model::Table>(mDrawing.query().Tables()); }
    platform::Ref<model::Join> join() { return any<model::Join>(mDrawing.query().Joins()); }
    platform::Ref<model::ColumnDefinition> definition() {
        return any<model::ColumnDefinition>(mDrawing.query().ColumnDefinitions());
    }

    void panel() {
        const auto step = QStringLiteral("Panel");
        mDrawing.document.change(step, [&](model::Query& query) {
            if (chance(50) && table())
                query.renameTable(table(), name());
            else
                act();
        });
    }

    void act() {
        model::Query& query = mDrawing.query();
        switch (upTo(12)) {
        case 0:
        case 1:
            if (query.Tables().Count() < 16) query.addTable(Drawing::described(name()));
            return;
        case 2:
            if (chance(40) && table()) return query.DeleteTable(mGone = table());
            return;
        case 3:
        case 4: return addJoin();
        case 5:
        case 6: return addDefinition();
        case 7: return changeJoin();
        case 8:
        case 9: return changeDefinition();
        case 10: return putAside();
        case 11: return moveDefinition();
        default:
            if (const auto moved = table()) {
                moved->Left(place());
                if (chance(50)) moved->Height(place());
            }
        }
    }

    void addJoin() {
        if (!table()) return;
        const auto join = mDrawing.library.NewZDJoin();
        join->LeftColumn(any<model::Column>(table()->Columns()));
        join->RightColumn(any<model::Column>(table()->Columns()));
        mDrawing.query().AddJoin(join);
    }

    void addDefinition() {
        if (!table()) return;
        const auto definition = mDrawing.library.NewZDColumnDefinition();
        definition->Column(any<model::Column>(table()->Columns()));
        mDrawing.query().AddColumnDefinition(definition);
    }

    void changeJoin() {
        if (!join()) return;
        join()->JoinType(static_cast<std::int16_t>(upTo(3)));
        if (chance(20)) join()->RightTable(chance(50) && mGone ? mGone : table());
    }

    void changeDefinition() {
        const auto changed = definition();
        if (!changed) return;
        const platform::String row = platform::decimal(4 + upTo(3));
        const auto named = table();
        const platform::String text = named ? u"> [" + named->Name() + u"].id" : u"7";
        if (chance(30)) changed->Synonym(name());
        if (chance(20)) changed->Visible(chance(50));
        if (!changed->HasCriterium(row))
            changed->AddCriterium(text, row);
        else if (chance(50))
            changed->Criteria().Item(row)->Criterium(text);
        else
            changed->Criteria().Remove(row);
    }

    void moveDefinition() {
        const auto moved = definition();
        const auto predecessor = chance(20) ? decltype(moved)() : definition();
        if (moved && moved != predecessor) mDrawing.query().StandsBehind(moved, predecessor);
    }

    /// What was removed may come back, and then stands last.
    void putAside() {
        model::Query& query = mDrawing.query();
        if (const auto aside = definition()) {
            query.ColumnDefinitions().Remove(aside->Key());
            if (chance(50) && aside->Column()) query.AddColumnDefinition(aside);
        }
        if (const auto aside = join()) {
            query.Joins().Remove(aside->Key());
            if (chance(50) && aside->LeftColumn() && aside->RightColumn()) query.AddJoin(aside);
        }
    }

    Drawing& mDrawing;
    std::mt19937 mRandom;
    Drawing::TableRef mGone;
};

/// The record by the number of steps that lead to it.
using History = std::map<int, model::QueryRecord>;

void walk(Drawing& drawing, const History& history, int to) {
    QUndoStack& steps = drawing.document.steps();
    while (steps.index() != to) {
        steps.index() > to ? drawing.document.undo() : drawing.document.redo();
        ASSERT_EQ(drawing.query().record(), history.at(steps.index())) << "step " << steps.index();
    }
}

} // namespace

TEST(ARandomHistory, IsUndoneAllTheWayAndDoneAgain) {
    const std::uint32_t seed = std::random_device()();
    SCOPED_TRACE("seed " + std::to_string(seed));
    Drawing drawing;
    RandomHand hand(drawing, seed);
    History history{{0, drawing.query().record()}};
    std::mt19937 random(seed);
    for (int n = 0; n < 1500; ++n) {
        hand.gesture();
        const int index = drawing.document.steps().index();
        history.insert_or_assign(index, drawing.query().record());
        // Now and then some steps back, and on from there.
        if (random() % 200 != 0) continue;
        walk(drawing, history, index - std::min<int>(index, static_cast<int>(random() % 40)));
        if (HasFatalFailure()) return;
    }
    const int last = drawing.document.steps().index();
    ASSERT_GT(last, 50);
    for (const int to : {0, last}) {
        walk(drawing, history, to);
        if (HasFatalFailure()) return;
    }
}
