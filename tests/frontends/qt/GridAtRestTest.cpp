#include "frontends/qt/Desk.h"

#include <QTableView>

// A grid whose view has not been made yet, because the host shows the canvas alone.

namespace {

class AGridAtRest : public Desk {
protected:
    bool hasView() { return grid().findChild<QTableView*>(); }

    /// What there is to see of a grid that has been shown late, its view made beforehand or not.
    QImage shown(bool beforehand, const std::function<void()>& change) {
        open();
        if (beforehand) grid().view();
        EXPECT_EQ(hasView(), beforehand);
        change();
        show();
        bind();
        grid().setCurrentCell(4, 2);
        settle();
        EXPECT_TRUE(hasView());
        return grid().grab().toImage();
    }
};

} // namespace

TEST_F(AGridAtRest, LooksWhenItIsShownAsOneThatWasThere) {
    const std::pair<const char*, std::function<void()>> changes[] = {
        {"nothing", [] {}},
        {"a larger font",
         [&] {
             QFont font = widget->font();
             font.setPointSizeF(font.pointSizeF() * 1.5);
             widget->setFont(font);
         }},
        {"a style sheet", [&] { widget->setStyleSheet("QHeaderView { border: 3px solid red }"); }},
        {"a query before it is shown",
         [&] {
             bind();
             widget->setOnlyJoin(true);
         }},
        {"words",
         [&] {
             auto words = widget->words();
             words.Visible = u"Sichtbar in allen Zeilen";
             widget->setWords(words);
         }},
        {"another size", [&] { widget->resize(500, 800); }},
    };
    for (const auto& [name, change] : changes) {
        const QImage there = shown(true, change);
        EXPECT_EQ(shown(false, change), there) << name;
    }
}

TEST_F(AGridAtRest, HoldsWhatIsWrittenIntoIt) {
    widget->setOnlyJoin(true);
    show();
    grid().model().setText(4, 1, QStringLiteral("> 7"));
    grid().setCurrentCell(4, 1);
    EXPECT_FALSE(hasView());
    EXPECT_EQ(grid().view().currentIndex(), grid().model().index(3, 0));
    EXPECT_EQ(grid().view().currentIndex().data().toString(), "> 7");
}

TEST_F(AGridAtRest, IsThereForWhoeverAsksForAPlace) {
    EXPECT_FALSE(hasView());
    EXPECT_GT(grid().cellRect(1, 1).left(), 0);
    EXPECT_TRUE(hasView());
}

TEST_F(AGridAtRest, EndsWithTheWindowAroundAControlThatWasNeverShown) {
    bind();
    // Its output column goes with it, and asks the grid for a width.
    model->definition(model->table(u"ORDER", {u"*", u"ORDER_ID"}), u"ORDER_ID");
    auto window = std::make_unique<QWidget>();
    open(window.get());
    widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(model));
    EXPECT_FALSE(hasView());
    const QPointer<QWidget> part = widget.release();
    window.reset();
    EXPECT_FALSE(part);
}
