#include "ReportModel.h"

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
        widget.setModel(platform::makeRef<report::Model>(ours));
        widget.show();
        settle();
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

    std::shared_ptr<report::Report> ours = std::make_shared<report::Report>(report::someReport());
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
    const int before = ours->sources[1]->left;
    TabuletWidget& box = *table(2);
    const QPointF grip = QRectF(box.titleBar()).center();
    const QPointF start = box.mapToGlobal(grip);
    const QPointF way(30, 20); // pixels, of 15 twips
    hands::mouse(box, QEvent::MouseButtonPress, grip, Qt::LeftButton, Qt::LeftButton);
    hands::mouse(box, QEvent::MouseMove, box.mapFromGlobal(start + way), Qt::NoButton,
                 Qt::LeftButton);
    hands::mouse(box, QEvent::MouseButtonRelease, box.mapFromGlobal(start + way), Qt::LeftButton);
    settle();
    EXPECT_EQ(ours->sources[1]->left, before + 450);
    EXPECT_EQ(ours->sources[1]->top, 600 + 300);
}

TEST_F(OwnModel, GetsTheJoinThatADropMakes) {
    ASSERT_EQ(ours->links.size(), 1U);
    drag(1, 0, 2, 1);
    ASSERT_EQ(ours->links.size(), 2U);
    const report::Link& link = *ours->links.back();
    EXPECT_EQ(link.from->name, "orders");
    EXPECT_EQ(link.from->fields.at(static_cast<std::size_t>(link.fromField)).name, "id");
    EXPECT_EQ(link.to->name, "customers");
    EXPECT_EQ(link.to->fields.at(static_cast<std::size_t>(link.toField)).name, "name");
    EXPECT_GT(link.id, 0);
}

TEST_F(OwnModel, ForgetsATableWithAllThatHangsOnIt) {
    report::Model model(ours);
    model.DeleteTable(model.Tables().Item(2));
    EXPECT_EQ(report::describe(*ours), "source orders\n");
}

TEST_F(OwnModel, AnswersAWrongKeyWithAnErrorOfTheRuntimes) {
    report::Model model(ours);
    EXPECT_THROW(model.Tables().Item(u"t99"), platform::RuntimeError);
    EXPECT_THROW(model.Joins().Remove(u"j99"), platform::RuntimeError);
    EXPECT_THROW(model.Tables().Item(3), platform::RuntimeError);
}

TEST_F(OwnModel, KeepsConditionsByRow) {
    report::Model model(ours);
    const auto definition = model.ColumnDefinitions().Item(1);
    definition->AddCriterium(u"= 'B'", u"6");
    ASSERT_EQ(definition->Criteria().Count(), 3);
    EXPECT_EQ(definition->Criteria().Item(2)->Criterium(), u"");
    EXPECT_EQ(definition->Criteria().Item(3)->Criterium(), u"= 'B'");
    definition->Criteria().Remove(u"6");
    EXPECT_EQ(definition->Criteria().Count(), 1);
    EXPECT_EQ(ours->outputs[0]->conditions.size(), 1U);
}
