#include "Drawing.h"

#include "support/QtHands.h"

#include <QAction>

using namespace zandor;

namespace {

std::string text(const QString& name) { return name.toStdString(); }

/// How often a signal came while something was done.
template <class Signal, class Body>
int count(designer::Document& document, Signal signal, Body&& body) {
    int times = 0;
    const auto connection = QObject::connect(&document, signal, [&times] { ++times; });
    body();
    QObject::disconnect(connection);
    return times;
}

} // namespace

TEST(ADocument, BeginsWithAnEmptyQueryAndNoSteps) {
    designer::Document document;
    EXPECT_EQ(document.query()->Tables().Count(), 0);
    EXPECT_FALSE(document.steps().canUndo());
    EXPECT_FALSE(document.isModified());
}

TEST(ADocument, MakesOneStepOfOneGesture) {
    Drawing drawing;
    for (int n = 0; n < 3; ++n) {
        drawing.define(u"orders", u"status");
        drawing.document.changedByControl();
    }
    const int told = count(drawing.document, &designer::Document::changed, returnToTheEventLoop);
    EXPECT_EQ(told, 1);
    EXPECT_EQ(drawing.document.steps().count(), 1);
    EXPECT_EQ(text(drawing.lastStep()), "Add 3 column(s)");
    drawing.document.undo();
    EXPECT_EQ(drawing.query().ColumnDefinitions().Count(), 0);
    drawing.document.redo();
    EXPECT_EQ(drawing.query().ColumnDefinitions().Count(), 3);
}

TEST(ADocument, MakesTwoStepsOfTwoMoves) {
    Drawing drawing;
    for (const float left : {100.F, 200.F}) {
        drawing.table(u"orders")->Left(left);
        drawing.document.changedByControl();
        returnToTheEventLoop();
    }
    drawing.document.undo();
    EXPECT_EQ(drawing.table(u"orders")->Left(), 100);
    drawing.document.undo();
    EXPECT_EQ(drawing.table(u"orders")->Left(), -1);
}

TEST(ADocument, SettlesBeforeItUndoes) {
    Drawing drawing;
    drawing.join(u"customers", u"orders");
    drawing.document.changedByControl();
    drawing.document.undo();
    EXPECT_EQ(drawing.query().Joins().Count(), 0) << "although the event loop has not run";
    drawing.document.redo();
    EXPECT_EQ(drawing.query().Joins().Count(), 1);
}

TEST(ADocument, SettlesBeforeItIsChanged) {
    Drawing drawing;
    drawing.join(u"customers", u"orders");
    drawing.document.change(QStringLiteral("Rename it"), [&](model::Query& query) {
        query.renameTable(drawing.table(u"orders"), u"o");
    });
    EXPECT_EQ(drawing.document.steps().count(), 2);
    EXPECT_EQ(text(drawing.lastStep()), "Rename it");
}

TEST(ADocument, ShowsTheDrawingAnewOnlyWhenTheControlDidNotChangeIt) {
    Drawing drawing;
    auto& document = drawing.document;
    const auto outdated = &designer::Document::outdated;
    EXPECT_EQ(count(document, outdated,
                    [&] {
                        drawing.join(u"customers", u"orders");
                        document.changedByControl();
                        returnToTheEventLoop();
                    }),
              0);
    EXPECT_EQ(count(document, outdated, [&] { document.undo(); }), 1);
    EXPECT_EQ(count(document, outdated, [&] { document.redo(); }), 1);
    EXPECT_EQ(count(document, outdated, [&] { document.redo(); }), 0) << "there is nothing to redo";
    EXPECT_EQ(count(document, outdated,
                    [&] {
                        document.change(QStringLiteral("x"),
                                        [&](model::Query& query) { query.Joins().Remove(u"j1"); });
                    }),
              1);
    EXPECT_EQ(count(document, outdated,
                    [&] { document.change(QStringLiteral("x"), [](model::Query&) {}); }),
              0);
}

TEST(ADocument, HasTheNewStateWhenItTellsOfIt) {
    Drawing drawing;
    drawing.join(u"customers", u"orders");
    drawing.document.setModified(false);
    std::vector<std::string> told;
    QObject::connect(&drawing.document, &designer::Document::changed, [&] {
        told.push_back(std::to_string(drawing.query().Joins().Count()) +
                       (drawing.document.isModified() ? " modified" : " saved"));
    });
    drawing.document.undo();
    drawing.document.redo();
    EXPECT_EQ(told, (std::vector<std::string>{"0 modified", "1 saved"}));
}

TEST(ADocument, MakesNoStepOfASelection) {
    Drawing drawing;
    drawing.table(u"orders")->Selected(1);
    drawing.table(u"orders")->columnNamed(u"id")->Selected(true);
    drawing.document.changedByControl();
    returnToTheEventLoop();
    EXPECT_EQ(drawing.document.steps().count(), 0);
    EXPECT_FALSE(drawing.document.isModified());
}

TEST(ADocument, MakesNoStepOfWhatComesAndGoesWithinAGesture) {
    Drawing drawing;
    drawing.define(u"orders", u"id");
    drawing.document.settle();
    const auto before = drawing.query().record();
    drawing.query().Joins().Remove(drawing.join(u"customers", u"orders")->Key());
    drawing.document.changedByControl();
    returnToTheEventLoop();
    EXPECT_EQ(drawing.document.steps().count(), 1);
    EXPECT_EQ(drawing.query().record(), before);
    drawing.document.undo();
    EXPECT_EQ(drawing.query().ColumnDefinitions().Count(), 0);
}

TEST(ADocument, KeepsWhatAFailedChangeHadDoneAsAStep) {
    Drawing drawing;
    const auto failing = [&](model::Query& query) {
        query.renameTable(drawing.table(u"orders"), u"o");
        query.renameTable(drawing.table(u"o"), u"customers");
    };
    EXPECT_THROW(drawing.document.change(QStringLiteral("Rename"), failing),
                 platform::RuntimeError);
    EXPECT_TRUE(drawing.table(u"o"));
    drawing.document.undo();
    EXPECT_TRUE(drawing.table(u"orders"));
}

TEST(ADocument, UndoesARenamedTableInTheCriteriaToo) {
    Drawing drawing;
    const auto definition = drawing.define(u"customers", u"id");
    definition->AddCriterium(u"> orders.id", u"4");
    drawing.document.settle();
    drawing.document.change(
        {}, [&](model::Query& query) { query.renameTable(drawing.table(u"orders"), u"sales"); });
    EXPECT_EQ(text(drawing.lastStep()), "Rename table orders to sales");
    EXPECT_EQ(definition->Criteria().Item(u"4")->Criterium(), u"> sales.id");
    drawing.document.undo();
    EXPECT_EQ(definition->Criteria().Item(u"4")->Criterium(), u"> orders.id");
    EXPECT_TRUE(drawing.table(u"orders"));
}

TEST(ADocument, ForgetsItsStepsWithItsQuery) {
    Drawing drawing;
    drawing.join(u"customers", u"orders");
    drawing.document.settle();
    EXPECT_EQ(count(drawing.document, &designer::Document::outdated,
                    [&] { drawing.document.setQuery(platform::makeRef<model::Query>()); }),
              1);
    EXPECT_EQ(drawing.document.steps().count(), 0);
    EXPECT_FALSE(drawing.document.isModified());
}

TEST(ADocument, IsModifiedUntilItIsSavedOrUndone) {
    Drawing drawing;
    std::vector<bool> told;
    QObject::connect(&drawing.document, &designer::Document::modifiedChanged,
                     [&told](bool modified) { told.push_back(modified); });
    drawing.join(u"customers", u"orders");
    EXPECT_TRUE(drawing.document.isModified()) << "a change that has not settled counts";
    drawing.document.undo();
    EXPECT_FALSE(drawing.document.isModified());
    drawing.document.redo();
    drawing.document.setModified(false);
    EXPECT_FALSE(drawing.document.isModified());
    drawing.document.undo();
    EXPECT_TRUE(drawing.document.isModified());
    EXPECT_EQ(told, (std::vector<bool>{true, false, true, false, true}));
    drawing.document.setQuery(platform::makeRef<model::Query>());
    drawing.document.setModified(true);
    EXPECT_TRUE(drawing.document.isModified()) << "as after a recovery";
}

TEST(ADocument, SeesWhatAMouseDidWithoutBeingTold) {
    Drawing drawing;
    QWidget somewhere;
    somewhere.show();
    drawing.table(u"orders")->Width(3000);
    hands::click(somewhere, {5, 5});
    returnToTheEventLoop();
    EXPECT_EQ(text(drawing.lastStep()), "Resize table orders");
    drawing.table(u"orders")->Width(4000);
    hands::key(somewhere, Qt::Key_Right);
    returnToTheEventLoop();
    drawing.document.undo();
    EXPECT_EQ(drawing.table(u"orders")->Width(), 3000);
}

TEST(ADocument, UndoesFromTheMenuWhatHasNotSettled) {
    Drawing drawing;
    QObject menu;
    QAction* undo = drawing.document.makeUndoAction(&menu);
    QAction* redo = drawing.document.makeRedoAction(&menu);
    EXPECT_FALSE(undo->isEnabled());
    drawing.join(u"customers", u"orders");
    drawing.document.settle();
    EXPECT_EQ(text(undo->text()), "&Undo Add join customers - orders");
    EXPECT_EQ(undo->shortcut(), QKeySequence(QKeySequence::Undo));
    drawing.define(u"orders", u"id");
    undo->trigger();
    EXPECT_EQ(drawing.query().ColumnDefinitions().Count(), 0);
    EXPECT_EQ(drawing.query().Joins().Count(), 1) << "one step, not two";
    undo->trigger();
    EXPECT_EQ(drawing.query().Joins().Count(), 0);
    EXPECT_EQ(text(redo->text()), "&Redo Add join customers - orders");
    redo->trigger();
    EXPECT_EQ(drawing.query().Joins().Count(), 1);
}

TEST(ADocument, StaysWholeWhenTheStackIsUsedBehindItsBack) {
    Drawing drawing;
    QUndoStack& steps = drawing.document.steps();
    const auto empty = drawing.query().record();
    drawing.join(u"customers", u"orders");
    drawing.document.settle();
    const auto joined = drawing.query().record();
    drawing.define(u"orders", u"id");
    steps.undo();
    EXPECT_EQ(drawing.query().record(), empty);
    steps.redo();
    EXPECT_EQ(drawing.query().record(), joined);
}

TEST(AStep, IsNamedAfterWhatChanged) {
    Drawing drawing(3);
    const auto named = [&](auto&& change) {
        change();
        drawing.document.settle();
        return text(drawing.lastStep());
    };
    auto& query = drawing.query();
    const auto orders = drawing.table(u"orders");
    const auto customers = drawing.table(u"customers");
    EXPECT_EQ(named([&] { query.addTable(Drawing::described(u"items")); }), "Add table items");
    EXPECT_EQ(named([&] { orders->Left(5); }), "Move table orders");
    EXPECT_EQ(named([&] { orders->Height(50), orders->Top(3); }), "Resize table orders");
    EXPECT_EQ(named([&] { orders->Top(9), customers->Top(8); }), "Move 2 table(s)");
    EXPECT_EQ(named([&] { drawing.join(u"customers", u"orders"); }), "Add join customers - orders");
    EXPECT_EQ(named([&] { query.Joins().Item(1)->JoinType(1); }), "Change join customers - orders");
    EXPECT_EQ(named([&] { query.Joins().Remove(u"j1"); }), "Delete join customers - orders");
    const auto status = drawing.define(u"orders", u"status");
    EXPECT_EQ(named([] {}), "Add column status");
    EXPECT_EQ(named([&] { status->AddCriterium(u"'open'", u"4"); }), "Change criterion of status");
    EXPECT_EQ(named([&] { status->Synonym(u"State"); }), "Rename column status");
    EXPECT_EQ(named([&] { status->SortOrder(1); }), "Change sorting by status");
    EXPECT_EQ(named([&] { dynamic_cast<model::ColumnDefinition&>(*status).sortPriority(2); }),
              "Change sorting by status");
    EXPECT_EQ(
        named([&] { dynamic_cast<model::ColumnDefinition&>(*status).total(model::Total::Count); }),
        "Change total of status");
    EXPECT_EQ(named([&] { dynamic_cast<model::ColumnDefinition&>(*status).decimals(2); }),
              "Change format of status");
    const auto setOptions = [&](const model::QueryOptions& options) {
        return named([&] { drawing.query().options(options); });
    };
    EXPECT_EQ(setOptions({true, 10, u""}), "Change which rows come out");
    EXPECT_EQ(setOptions({true, 10, u"for Monday"}), "Describe the query");
    EXPECT_EQ(named([&] { status->Visible(false); }), "Hide column status");
    EXPECT_EQ(named([&] { status->Visible(true); }), "Show column status");
    EXPECT_EQ(named([&] { status->Visible(false), status->SortOrder(0); }), "Change column status");
    EXPECT_EQ(named([&] { query.ColumnDefinitions().Remove(status->Key()); }),
              "Delete column status");
    drawing.define(u"orders", u"status");
    drawing.define(u"orders", u"id");
    EXPECT_EQ(named([&] { drawing.join(u"customers", u"orders"); }), "Change the query");
    const auto last = drawing.define(u"customers", u"id");
    drawing.document.settle();
    EXPECT_EQ(named([&] { query.StandsBehind(last, {}); }), "Move column id");
    EXPECT_EQ(named([&] {
                  query.StandsBehind(query.ColumnDefinitions().Item(3), {});
                  query.StandsBehind(query.ColumnDefinitions().Item(3),
                                     query.ColumnDefinitions().Item(1));
              }),
              "Move 2 column(s)");
    EXPECT_EQ(named([&] { query.StandsBehind(last, {}), last->Synonym(u"first"); }),
              "Change columns");
    EXPECT_EQ(named([&] { query.DeleteTable(orders); }), "Delete table orders")
        << "not what hangs on it";
    EXPECT_EQ(
        named([&] { query.DeleteTable(customers), query.DeleteTable(drawing.table(u"items")); }),
        "Delete 2 table(s)");
}

TEST(AStep, HasANameOfOneLineWhateverTheTableIsCalled) {
    Drawing drawing;
    QObject menu;
    const QAction* undo = drawing.document.makeUndoAction(&menu);
    drawing.query().addTable(Drawing::described(u"a & b\n" + platform::String(100, u'c')));
    drawing.document.settle();
    EXPECT_EQ(text(drawing.lastStep()), "Add table a & b " + std::string(33, 'c') + "\u2026");
    EXPECT_EQ(text(undo->text()), "&Undo Add table a && b " + std::string(33, 'c') + "\u2026");
}
