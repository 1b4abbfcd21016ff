#include "examples/own_model/Report.h"

#include "frontends/qt/GridWidget.h"
#include "frontends/qt/QtToolkit.h"
#include "frontends/qt/TabuletWidget.h"
#include "support/QtHands.h"

#include <Zandor/ZandorWidget.h>

#include <QAbstractItemView>

#include <gtest/gtest.h>

using namespace zandor;

// The example's model under the user's hands.

namespace {

using platform::qt::TabuletWidget;

class OwnModel : public testing::Test {
protected:
    OwnModel() {
        widget.setDebugSwitch(0);
        widget.setOnlyJoin(false);
        widget.resize(900, 600);
        QObject::connect(&widget, &ZandorWidget::Error,
                         [](const QString& text) { ADD_FAILURE() << text.toStdString(); });
        const auto orders = add(u"orders", 600, {u"id", u"customer"});
        const auto customers = add(u"customers", 4800, {u"id", u"name"});
        const auto link = platform::makeRef<report::Link>();
        link->from = orders;
        link->fromField = orders->fields.Item(2);
        link->to = customers;
        link->toField = customers->fields.Item(1);
        ours->AddJoin(link);
        const auto output = platform::makeRef<report::Output>();
        output->field = customers->fields.Item(2);
        output->AddCriterium(u"Like 'A*'", u"4");
        ours->AddColumnDefinition(output);
        widget.setModel(ours);
        widget.show();
        settle();
    }

    platform::Ref<report::Source> add(const platform::String& name, std::int32_t left,
                                      const std::vector<platform::String>& fields) {
        const auto source = platform::makeRef<report::Source>(name, left);
        for (const auto& field : fields) source->add(field);
        ours->sources.Add(source, source->Key());
        return source;
    }

    static void settle() {
        for (int i = 0; i < 3; ++i) {
            qApp->processEvents();
            QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        }
    }

    TabuletWidget* table(int index) {
        return dynamic_cast<TabuletWidget*>(
            widget.findChild<QWidget*>(QStringLiteral("lstTable(%1)").arg(index)));
    }

    /// The middle of an entry of a table's list.
    QPointF entry(int index, int row) {
        auto& list = table(index)->list();
        return QRectF(list.visualRect(list.model()->index(row, 0))).center();
    }

    void drag(int from, int row, int to, int target) {
        widget.toolkit().drags().setCarrier([&](QDrag& drag) {
            hands::carry(drag, *table(to)->list().viewport(), entry(to, target));
        });
        QWidget& viewport = *table(from)->list().viewport();
        hands::mouse(viewport, QEvent::MouseButtonPress, entry(from, row), Qt::LeftButton,
                     Qt::LeftButton);
        hands::mouse(viewport, QEvent::MouseMove, entry(from, row) + QPointF(1, 1), Qt::NoButton,
                     Qt::LeftButton);
        settle();
    }

    platform::Ref<report::Report> ours = platform::makeRef<report::Report>();
    report::Library library;
    ZandorWidget widget{library};
};

} // namespace

TEST_F(OwnModel, ShowsWhatTheReportHas) {
    ASSERT_TRUE(table(1));
    ASSERT_TRUE(table(2));
    EXPECT_FALSE(table(3));
    EXPECT_EQ(table(1)->list().model()->rowCount(), 2);
    auto* grid = dynamic_cast<platform::qt::GridWidget*>(
        widget.findChild<QWidget*>(QStringLiteral("sprColumn")));
    ASSERT_TRUE(grid);
}

TEST_F(OwnModel, GetsThePlaceThatTheUserMovesATableTo) {
    const auto customers = ours->sources.Item(2);
    const int before = customers->Left();
    TabuletWidget& box = *table(2);
    const QPointF grip = QRectF(box.titleBar()).center();
    const QPointF start = box.mapToGlobal(grip);
    const QPointF way(30, 20); // pixels, of 15 twips
    hands::mouse(box, QEvent::MouseButtonPress, grip, Qt::LeftButton, Qt::LeftButton);
    hands::mouse(box, QEvent::MouseMove, box.mapFromGlobal(start + way), Qt::NoButton,
                 Qt::LeftButton);
    hands::mouse(box, QEvent::MouseButtonRelease, box.mapFromGlobal(start + way), Qt::LeftButton);
    settle();
    EXPECT_EQ(customers->Left(), before + 450);
    EXPECT_EQ(customers->Top(), 600 + 300);
}

TEST_F(OwnModel, GetsTheJoinThatADropMakes) {
    ASSERT_EQ(ours->links.Count(), 1);
    drag(1, 0, 2, 1);
    ASSERT_EQ(ours->links.Count(), 2);
    const auto link = ours->links.Item(2);
    EXPECT_EQ(link->LeftColumn()->Key(), u"orders.id");
    EXPECT_EQ(link->RightColumn()->Key(), u"customers.name");
    EXPECT_NE(link->Key(), ours->links.Item(1)->Key());
}

TEST_F(OwnModel, ForgetsATableWithAllThatHangsOnIt) {
    ours->DeleteTable(ours->sources.Item(2));
    EXPECT_EQ(ours->sources.Count(), 1);
    EXPECT_EQ(ours->links.Count(), 0);
    EXPECT_EQ(ours->outputs.Count(), 0);
}

TEST_F(OwnModel, KeepsWhatHangsOnOtherTables) {
    ours->DeleteTable(ours->sources.Item(1));
    EXPECT_EQ(ours->links.Count(), 0);
    EXPECT_EQ(ours->outputs.Count(), 1);
}

TEST_F(OwnModel, AnswersAWrongKeyWithAnErrorOfTheRuntimes) {
    EXPECT_THROW(ours->Tables().Item(u"t99"), platform::RuntimeError);
    EXPECT_THROW(ours->Joins().Remove(u"j99"), platform::RuntimeError);
    EXPECT_THROW(ours->Tables().Item(3), platform::RuntimeError);
}

TEST_F(OwnModel, KeepsConditionsByRow) {
    const auto definition = ours->ColumnDefinitions().Item(1);
    definition->AddCriterium(u"= 'B'", u"6");
    ASSERT_EQ(definition->Criteria().Count(), 3);
    EXPECT_EQ(definition->Criteria().Item(2)->Criterium(), u"");
    EXPECT_EQ(definition->Criteria().Item(3)->Criterium(), u"= 'B'");
    definition->Criteria().Remove(u"6");
    EXPECT_EQ(definition->Criteria().Count(), 1);
    EXPECT_FALSE(definition->HasCriterium(u"6"));
}
