#include "OpenWindow.h"

#include "designer/document/Document.h"
#include "designer/properties/MenuQuestions.h"
#include "designer/properties/TotalCommands.h"

#include <gmock/gmock.h>

#include <QUndoStack>

using namespace zandor;

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

/// The menu over the line between the first two tables of the sample that are joined.
class TheMenuOfAJoin : public OpenWindow {
protected:
    TheMenuOfAJoin() { open({.file = sampleDatabase(), .tables = {"customers", "orders"}}); }
    ~TheMenuOfAJoin() override { window->document().setModified(false); }

    std::vector<TalvikDBxZandor::HostEntry> entries() {
        TalvikDBxZandor::MenuPlace place;
        place.Join = query().Joins().Item(1);
        return designer::MenuQuestions(
                   *window->findChild<designer::TotalCommands*>(),
                   designer::JoinCommands(window->document(), window->drawing()), [] {})
            .MenuEntries(place);
    }
    std::vector<std::string> words() {
        std::vector<std::string> result;
        for (const auto& entry : entries()) result.push_back(platform::toUtf8(entry.Caption));
        return result;
    }
    void choose(std::size_t entry) {
        const auto offered = entries();
        offered.at(entry).Chosen();
        calm();
    }
    std::int16_t type() { return query().Joins().Item(1)->JoinType(); }
};

} // namespace

TEST_F(TheMenuOfAJoin, NamesTheTableThatKeepsAllOfItsRows) {
    // The foreign key has orders at its left end.
    ASSERT_EQ(query().Joins().Item(1)->LeftTable()->Name(), u"orders");
    EXPECT_THAT(words(), ElementsAre("All rows of orders", "All rows of customers"));
    const int before = window->document().steps().index();
    choose(1);
    EXPECT_EQ(type(), 2) << "right outer";
    EXPECT_EQ(window->document().steps().index(), before + 1);
    EXPECT_THAT(words(), ElementsAre("All rows of orders", "Only matching rows of customers"));
    choose(0);
    EXPECT_EQ(type(), 3);
    choose(1);
    EXPECT_EQ(type(), 1);
    choose(0);
    EXPECT_EQ(type(), 0);
    window->document().undo();
    calm();
    EXPECT_EQ(type(), 1);
}

TEST_F(TheMenuOfAJoin, OffersWhatTheDialogDoes) {
    window->drawing().setOptions({{"UseJoinTypeRight", false}, {"JoinModifyDisabled", 1}});
    calm();
    EXPECT_THAT(words(), ElementsAre("All rows of orders"));
    window->drawing().setOptions({{"JoinModifyDisabled", 0}});
    calm();
    EXPECT_THAT(words(), IsEmpty());
}

TEST_F(TheMenuOfAJoin, ShowsNamesAsTheyAreAndNothingHappensOnceTheJoinIsGone) {
    window->document().change({}, [](model::Query& query) {
        query.renameTable(query.tableNamed(u"orders"), u"orders & more");
    });
    calm();
    EXPECT_THAT(words(), ElementsAre("All rows of orders && more", "All rows of customers"));
    const auto offered = entries();
    window->document().change(
        {}, [](model::Query& query) { query.Joins().Remove(query.Joins().Item(1)->Key()); });
    calm();
    offered.front().Chosen();
    EXPECT_EQ(query().Joins().Count(), 0);
}
