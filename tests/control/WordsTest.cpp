#include "GridStage.h"

using namespace zandor;

namespace gridstage {

/// Three output columns: sorted, descending and not visible, and one as it was dropped.
class TheWords : public GridTest {
protected:
    TheWords() {
        first = model->definition(orders, u"ID");
        first->sortOrder = 1;
        second = model->definition(orders, u"TOTAL");
        second->sortOrder = 2;
        second->visible = false;
        bind();
        drag(2, {name}, 3);
        german.None = u"(Keine)";
        german.Ascending = u"Aufsteigend";
        german.Descending = u"Absteigend";
        german.Visible = u"Sichtbar";
        german.NotVisible = u"Nicht sichtbar";
        german.Invisible = u"Unsichtbar";
        german.Set = u"&Setzen";
        forget();
    }

    using Texts = std::vector<String>;
    Texts row(std::int32_t at) {
        return {stage->cell(at, 1), stage->cell(at, 2), stage->cell(at, 3), stage->cell(at, 4)};
    }

    platform::Words german;
    Ref<fake::Definition> first, second;
};

TEST_F(TheWords, AreTheControlsOwnUntilAHostHasOthers) {
    EXPECT_EQ(control().Words(), platform::Words());
    EXPECT_EQ(row(sortRow), (Texts{u"Ascending", u"Descending", u"", u""}));
    EXPECT_EQ(row(visibleRow), (Texts{u"Visible", u"Invisible", u"Visible", u""}));
}

TEST_F(TheWords, ChangeInCellsAndEditorsAtOnce) {
    control().Words(german);
    EXPECT_EQ(control().Words(), german);
    EXPECT_EQ(row(sortRow), (Texts{u"Aufsteigend", u"Absteigend", u"", u""}));
    EXPECT_EQ(row(visibleRow), (Texts{u"Sichtbar", u"Unsichtbar", u"Sichtbar", u""}));
    EXPECT_EQ(stage->look("cobSortOrder").items,
              (Texts{u"(Keine)", u"Aufsteigend", u"Absteigend"}));
    EXPECT_EQ(stage->look("cobVisibility").items, (Texts{u"Sichtbar", u"Nicht sichtbar"}));
    for (const char* button : {"cmdSetSortOrder", "cmdSetVisibility", "cmdSetTextValue"})
        EXPECT_EQ(stage->look(button).text, u"&Setzen") << button;
    EXPECT_EQ(events(), Names{});
    EXPECT_EQ(stage->boxes, Boxes{});
    control().Words({});
    EXPECT_EQ(row(visibleRow), (Texts{u"Visible", u"Invisible", u"Visible", u""}));
}

TEST_F(TheWords, AreUnderstoodByTheEditors) {
    control().Words(german);
    press(left, sortRow, 2);
    EXPECT_EQ(stage->look("cobSortOrder").listIndex, 2);
    stage->choose("cobSortOrder", 0);
    stage->clickButton("cmdSetSortOrder");
    EXPECT_EQ(second->sortOrder, 0);
    EXPECT_EQ(stage->cell(sortRow, 2), u"(Keine)");

    press(left, visibleRow, 1);
    EXPECT_EQ(stage->look("cobVisibility").listIndex, 0);
    stage->choose("cobVisibility", 1);
    stage->clickButton("cmdSetVisibility");
    EXPECT_FALSE(first->visible);
    EXPECT_EQ(stage->cell(visibleRow, 1), u"Nicht sichtbar");
    control().Words({});
    EXPECT_EQ(row(sortRow), (Texts{u"Ascending", u"(None)", u"", u""}));
    EXPECT_EQ(row(visibleRow), (Texts{u"Not Visible", u"Invisible", u"Visible", u""}));
}

TEST_F(TheWords, AreThoseOfWhatIsShownLater) {
    control().Words(german);
    bind();
    EXPECT_EQ(stage->cell(sortRow, 1), u"Aufsteigend");
    EXPECT_EQ(stage->cell(visibleRow, 2), u"Unsichtbar");
    second->sortOrder = 1;
    second->visible = false;
    control().ShowAnew();
    EXPECT_EQ(stage->cell(sortRow, 2), u"Aufsteigend");
    EXPECT_EQ(stage->cell(visibleRow, 2), u"Nicht sichtbar");
    drag(1, {total}, 4);
    EXPECT_EQ(stage->cell(visibleRow, 4), u"Sichtbar");
}

TEST_F(TheWords, LeaveAnOpenEditorWithWhatIsChosenInIt) {
    press(left, sortRow, 3);
    stage->choose("cobSortOrder", 2);
    control().Words(german);
    EXPECT_TRUE(stage->look("fraSortOrder").visible);
    EXPECT_EQ(stage->look("cobSortOrder").listIndex, 2);
    EXPECT_EQ(stage->look("cobSortOrder").text, u"Absteigend");
}

TEST_F(TheWords, AreNoneOfWhatSomebodyHasTyped) {
    first->synonym = u"Visible";
    first->AddCriterium(u"Ascending", u"4");
    control().ShowAnew();
    control().Words(german);
    EXPECT_EQ(stage->cell(synonymRow, 1), u"Visible");
    EXPECT_EQ(stage->cell(criteriaRow, 1), u"Ascending");
}

} // namespace gridstage
