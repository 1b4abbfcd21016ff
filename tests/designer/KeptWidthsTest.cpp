#include "OpenWindow.h"

#include "designer/document/Document.h"
#include "frontends/qt/GridModel.h"
#include "frontends/qt/PaneHandle.h"

#include <Zandor/QueryDocument.h>

#include <QHeaderView>
#include <QLabel>
#include <QTableView>
#include <QUndoStack>

using namespace zandor;

using platform::qt::GridWidget;

namespace {

/// The sample's drawing with two output columns.
class TheWidthsOfTheDesigner : public OpenWindow {
protected:
    TheWidthsOfTheDesigner() {
        open();
        window->resize(1340, 800);
        window->document().change("Add columns", [](model::Query& query) {
            const auto table = query.Tables().Item(1);
            for (const std::int32_t n : {2, 3}) {
                const auto definition = platform::makeRef<model::ColumnDefinition>();
                definition->Column(table->Columns().Item(n));
                query.AddColumnDefinition(definition);
            }
        });
        window->document().setModified(false);
        calm();
    }

    GridWidget& grid() { return part<GridWidget>("sprColumn"); }
    float shown(int column) { return grid().model().width(column); }
    std::int32_t kept(std::int32_t column) {
        return dynamic_cast<model::ColumnDefinition&>(*query().ColumnDefinitions().Item(column))
            .Width();
    }

    void dragBorder(int column, int pixels) {
        QHeaderView& head = *grid().view().horizontalHeader();
        const int section = column - 1;
        const QPointF border(head.sectionViewportPosition(section) + head.sectionSize(section) - 1,
                             head.height() / 2.0);
        const QPointF end = border + QPointF(pixels, 0);
        QWidget& view = *head.viewport();
        hands::mouse(view, QEvent::MouseMove, border, Qt::NoButton);
        hands::mouse(view, QEvent::MouseButtonPress, border, Qt::LeftButton, Qt::LeftButton);
        hands::mouse(view, QEvent::MouseMove, border + QPointF(pixels / 2.0, 0), Qt::NoButton,
                     Qt::LeftButton);
        hands::mouse(view, QEvent::MouseMove, end, Qt::NoButton, Qt::LeftButton);
        hands::mouse(view, QEvent::MouseButtonRelease, end, Qt::LeftButton);
        calm();
    }

    void doubleClickBorder(int column) {
        QHeaderView& head = *grid().view().horizontalHeader();
        const int section = column - 1;
        const QPointF border(head.sectionViewportPosition(section) + head.sectionSize(section) - 1,
                             head.height() / 2.0);
        QWidget& view = *head.viewport();
        hands::click(view, border);
        hands::mouse(view, QEvent::MouseButtonDblClick, border, Qt::LeftButton, Qt::LeftButton);
        hands::mouse(view, QEvent::MouseButtonRelease, border, Qt::LeftButton);
        calm();
    }
};

} // namespace

TEST_F(TheWidthsOfTheDesigner, AreOneStepForABorderThatIsDragged) {
    const float fitted = shown(1);
    EXPECT_EQ(kept(1), 0);
    dragBorder(1, 60);
    const float wide = shown(1);
    EXPECT_NEAR(wide, fitted + 900, 15) << "borders stand between pixels";
    EXPECT_EQ(kept(1), wide);
    EXPECT_TRUE(window->document().isModified());
    EXPECT_TRUE(window->isWindowModified());
    EXPECT_TRUE(window->document().steps().undoText().startsWith("Resize column "))
        << window->document().steps().undoText().toStdString();

    command("undo");
    EXPECT_EQ(shown(1), fitted);
    EXPECT_EQ(kept(1), 0);
    EXPECT_FALSE(window->document().isModified());
    command("redo");
    EXPECT_EQ(shown(1), wide);
    EXPECT_EQ(kept(1), wide);
}

TEST_F(TheWidthsOfTheDesigner, AreOneStepForABorderThatIsFitted) {
    const float fitted = shown(1);
    dragBorder(1, 60);
    const float wide = shown(1);
    EXPECT_GT(wide, fitted);
    doubleClickBorder(1);
    EXPECT_EQ(shown(1), fitted);
    EXPECT_EQ(kept(1), 0);
    command("undo");
    EXPECT_EQ(shown(1), wide);
    command("undo");
    EXPECT_EQ(shown(1), fitted);
    EXPECT_FALSE(window->document().isModified());
}

TEST_F(TheWidthsOfTheDesigner, AreNoStepForABorderThatWasFittedAlready) {
    doubleClickBorder(1);
    EXPECT_FALSE(window->document().isModified());
}

TEST_F(TheWidthsOfTheDesigner, ComeBackWithTheFile) {
    dragBorder(2, 45);
    const float wide = shown(2);
    const QString path = folder.path("widths.json");
    commandWithFile("saveAs", path);
    EXPECT_FALSE(window->document().isModified());
    const auto file = files::loadQuery(path.toStdString());
    ASSERT_TRUE(file) << file.error();
    EXPECT_EQ(file->query->record().definitions.at(1).width, wide);

    open({.file = path});
    EXPECT_EQ(shown(2), wide);
    EXPECT_EQ(kept(2), wide);
    EXPECT_EQ(kept(1), 0);
    EXPECT_FALSE(window->document().isModified());
}

TEST_F(TheWidthsOfTheDesigner, KeepTheRowsOfTheLastRun) {
    command("run");
    ASSERT_TRUE(until([this] { return !window->findChild<QAction*>("cancel")->isEnabled(); }));
    auto& status = *window->findChild<QLabel*>("runStatus");
    const QString before = status.text();
    dragBorder(1, 60);
    EXPECT_EQ(status.text(), before);
}

TEST_F(TheWidthsOfTheDesigner, LeaveTheShareOfTheUpperPaneToTheSettings) {
    const double before = window->drawing().control().upperPaneShare();
    EXPECT_NEAR(before, 0.6, 1e-6);
    QWidget& handle = grid().handle();
    const QPointF at(100, 3);
    const QPointF up = at - QPointF(0, 40);
    hands::mouse(handle, QEvent::MouseButtonPress, at, Qt::LeftButton, Qt::LeftButton);
    hands::mouse(handle, QEvent::MouseMove, up, Qt::NoButton, Qt::LeftButton);
    hands::mouse(handle, QEvent::MouseButtonRelease, at, Qt::LeftButton);
    calm();
    const double share = window->drawing().control().upperPaneShare();
    EXPECT_LT(share, before - 0.02);
    EXPECT_FALSE(window->document().isModified()) << "it is the window's, not the query's";
    open();
    EXPECT_NEAR(window->drawing().control().upperPaneShare(), share, 1e-6);
    QSettings().setValue("window/paneShare", "wide");
    open();
    EXPECT_GE(window->drawing().control().upperPaneShare(), 0.05);
    EXPECT_LE(window->drawing().control().upperPaneShare(), 0.95);
}
