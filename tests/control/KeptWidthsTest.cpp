#include "GridStage.h"

using namespace zandor;

namespace gridstage {

namespace {

/// A definition that keeps the width of its column.
class SizedDefinition final : public fake::Definition, public TalvikZandorLib::SizedDefinition {
public:
    using Definition::Definition;

    std::int32_t Width() const override { return width; }
    void Width(std::int32_t value) override {
        if (refuses) throw refusal();
        if (meanwhile) meanwhile();
        width = value;
    }

    std::int32_t width = 0;
    bool refuses = false;
    std::function<void()> meanwhile;
};

} // namespace

class TheWidthThatADefinitionKeeps : public GridTest {
protected:
    TheWidthThatADefinitionKeeps() {
        first = add(customers, u"NAME", u"x7");
        second = add(orders, u"ID", u"x8");
        stage->comforts().setFlags({.KeepsTyping = true, .FitsColumns = true});
        bind();
    }

    Ref<SizedDefinition> add(const Ref<fake::Table>& table, const String& column,
                             const String& key) {
        const auto definition = platform::makeRef<SizedDefinition>(library.calls);
        definition->column = std::shared_ptr<TalvikZandorLib::ZDColumn>(table->columnRef(column));
        definition->key = key;
        model->definitions.items.Add(
            std::shared_ptr<TalvikZandorLib::ZDColumnDefinition>(definition), key);
        return definition;
    }

    float width(std::int32_t col) { return grid().ColWidth(col); }

    static constexpr float narrowest = 1200;
    static constexpr std::int32_t greatest = TalvikZandorLib::SizedDefinition::greatestWidth;

    Ref<SizedDefinition> first, second;
};

TEST_F(TheWidthThatADefinitionKeeps, IsShownWhenItsModelIsBound) {
    first->width = 2250;
    bind();
    EXPECT_EQ(width(1), 2250);
    EXPECT_EQ(width(2), narrowest);
}

TEST_F(TheWidthThatADefinitionKeeps, IsShownWhenTheModelIsShownAnew) {
    first->width = 2250;
    second->width = 3000;
    control().ShowAnew();
    EXPECT_EQ(width(1), 2250);
    EXPECT_EQ(width(2), 3000);
    first->width = 0;
    control().ShowAnew();
    EXPECT_EQ(width(1), narrowest);
    EXPECT_EQ(width(2), 3000);
}

TEST_F(TheWidthThatADefinitionKeeps, IsThatOfTheBorderThatIsDragged) {
    stage->dragBorder(1, 2250);
    EXPECT_EQ(first->width, 2250);
    EXPECT_EQ(second->width, 0);
    EXPECT_EQ(width(1), 2250);
    EXPECT_EQ(events(), Names{"ColumnModified"});
    control().ShowAnew();
    EXPECT_EQ(width(1), 2250);
}

TEST_F(TheWidthThatADefinitionKeeps, IsNoneOnceItsColumnWasFitted) {
    stage->dragBorder(1, 2250);
    forget();
    stage->dragBorder(1, 0);
    EXPECT_EQ(first->width, 0);
    EXPECT_EQ(width(1), narrowest);
    EXPECT_EQ(events(), Names{"ColumnModified"});
    forget();
    stage->dragBorder(1, 0);
    EXPECT_EQ(events(), Names{}) << "it was fitted already";
}

TEST_F(TheWidthThatADefinitionKeeps, GoesWithItsColumnWhereverThatIsShown) {
    stage->dragBorder(2, 2250);
    model->definitions.items.Remove(u"x7");
    control().ShowAnew();
    EXPECT_EQ(width(1), 2250);
}

TEST_F(TheWidthThatADefinitionKeeps, IsNeverOneThatNobodyCouldDragBack) {
    stage->dragBorder(1, 15);
    EXPECT_EQ(first->width, 300);
    EXPECT_EQ(width(1), 300);
    stage->dragBorder(1, greatest + 15000);
    EXPECT_EQ(first->width, greatest);
    EXPECT_EQ(width(1), greatest);
}

TEST_F(TheWidthThatADefinitionKeeps, IsShownWithinItsBoundsWhateverTheModelSays) {
    first->width = -1;
    second->width = INT32_MAX;
    bind();
    EXPECT_EQ(width(1), narrowest);
    EXPECT_EQ(width(2), greatest);
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(TheWidthThatADefinitionKeeps, StaysWhereTheModelRefusesAnother) {
    stage->dragBorder(1, 2250);
    forget();
    first->refuses = true;
    stage->dragBorder(1, 3000);
    EXPECT_EQ(stage->boxes, Boxes{report(u"borderDragged", refusal(), u"comforts.Comforts")});
    EXPECT_EQ(width(1), 2250);
    EXPECT_EQ(events(), Names{});
}

TEST_F(TheWidthThatADefinitionKeeps, IsNotChangedInADrawingThatIsOnlyRead) {
    control().ReadOnly(true);
    stage->dragBorder(1, 3000);
    EXPECT_EQ(first->width, 0);
    EXPECT_EQ(events(), Names{});
    EXPECT_NEAR(width(1), 3000, 15) << "who looks may make it wider";
}

TEST_F(TheWidthThatADefinitionKeeps, IsNotThatOfAnotherModelThatIsBoundMeanwhile) {
    const auto other = library.newModel();
    const auto table = other->table(u"OTHERS", {u"*", u"ID"});
    for (int n = 0; n < 8; ++n) other->definition(table, u"ID");
    first->meanwhile = [&] {
        control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(other));
    };
    stage->dragBorder(1, 2250);
    // The eighth has the key that the first column had.
    for (std::int32_t col = 1; col <= 8; ++col) EXPECT_EQ(width(col), narrowest) << col;
    control().ShowAnew();
    for (std::int32_t col = 1; col <= 8; ++col) EXPECT_EQ(width(col), narrowest) << col;
    EXPECT_EQ(events(), Names{});
}

TEST_F(TheWidthThatADefinitionKeeps, MeansNothingToTheBareControl) {
    stage->comforts().setFlags({});
    first->width = 2250;
    bind();
    EXPECT_EQ(width(1), stage->toolkit().TextWidth(u"NAME") + 120);
    control().ShowAnew();
    EXPECT_EQ(width(1), stage->toolkit().TextWidth(u"NAME") + 120);
}

} // namespace gridstage
