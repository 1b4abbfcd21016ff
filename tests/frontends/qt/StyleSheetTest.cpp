#include "frontends/qt/Around.h"
#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/Desk.h"

#include <QAbstractButton>
#include <QApplication>
#include <QComboBox>
#include <QHeaderView>
#include <QLineEdit>

using namespace zandor;

namespace {

constexpr const char* sheets[] = {
    "* { font-size: 22px }",
    "* { padding: 6px }",
    "* { border: 3px solid red }",
    "* { margin: 4px }",
    "* { padding: 5px; border: 2px solid red; margin: 3px; font-size: 19px }",
    "QTableView { padding: 9px; border: 4px solid blue; font-size: 21px }",
    "QTableView::item { padding: 7px; border: 1px solid green }",
    "QHeaderView::section { padding: 8px; border: 2px solid green; font: bold 18px }",
    "QHeaderView { font-size: 24px; border: 3px solid green }",
    "QListView { padding: 6px; border: 3px solid blue; font-size: 20px }",
    "QLineEdit { padding: 9px; border: 3px solid red; font-size: 24px }",
    "QComboBox { padding: 9px 30px; border: 3px solid red; font-size: 24px }",
    "QPushButton { padding: 9px 40px; border: 3px solid red; font-size: 24px; min-width: 120px }",
    "QScrollBar:vertical { width: 26px } QScrollBar:horizontal { height: 24px }",
    "QFrame { border: 4px solid red; padding: 7px }",
    "QWidget { background: #fffff0; color: navy; border: 1px solid silver }",
};

/// A host that dresses its window by a style sheet.
class AStyleSheet : public Desk, public testing::WithParamInterface<std::tuple<const char*, When>> {
protected:
    AStyleSheet() { open(&host); }
    ~AStyleSheet() override { widget.reset(); }

    void lay() {
        const QString sheet = QString::fromLatin1(std::get<0>(GetParam()));
        host.resize(widget->size());
        host.show();
        if (std::get<1>(GetParam()) == When::before) host.setStyleSheet(sheet);
        bind();
        if (std::get<1>(GetParam()) == When::after) host.setStyleSheet(sheet);
        settle();
        settle();
    }

    QRect inGrid(const QWidget& part, QRect place) {
        return place.translated(part.mapTo(&grid(), QPoint()));
    }

    QWidget host;
};

} // namespace

TEST_P(AStyleSheet, LeavesEveryCellWhereItIsPainted) {
    lay();
    const auto& view = grid().view();
    const auto& across = *view.horizontalHeader();
    const auto& down = *view.verticalHeader();
    for (int step = 0; step < 2; ++step) {
        for (int row = grid().firstRow(); row < grid().firstRow() + 4; ++row)
            for (int col = grid().firstCol(); col < grid().firstCol() + 3; ++col) {
                const QModelIndex index = view.model()->index(row - 1, col - 1);
                const QRect painted = inGrid(*view.viewport(), view.visualRect(index));
                const QRect cell = grid().cellRect(row, col);
                EXPECT_EQ(cell.topLeft(), painted.topLeft()) << row << ' ' << col;
                EXPECT_EQ(cell.left(),
                          across.viewport()
                              ->mapTo(&grid(), QPoint(across.sectionViewportPosition(col - 1), 0))
                              .x())
                    << "the field stands over its column " << col;
                EXPECT_EQ(cell.top(),
                          down.viewport()
                              ->mapTo(&grid(), QPoint(0, down.sectionViewportPosition(row - 1)))
                              .y())
                    << "the title stands beside its row " << row;
            }
        view.horizontalScrollBar()->setValue(2);
        view.verticalScrollBar()->setValue(1);
        settle();
    }
}

TEST_P(AStyleSheet, LeavesEveryCellUnderTheMouse) {
    lay();
    for (int row = 1; row < 5; ++row)
        for (int col = 1; col < 4; ++col)
            for (const bool atTheEnd : {false, true}) {
                const QRect cell = grid().cellRect(row, col);
                const QPoint at = atTheEnd ? cell.bottomRight() - QPoint(2, 2) : cell.topLeft();
                QWidget* part = grid().childAt(at);
                if (!part || part != grid().view().viewport()) continue; // beyond the window
                hands::mouse(*part, QEvent::MouseButtonPress, part->mapFrom(&grid(), at),
                             Qt::LeftButton, Qt::LeftButton);
                EXPECT_EQ(grid().currentRow(), row) << at.x() << ' ' << at.y();
                EXPECT_EQ(grid().currentCol(), col) << at.x() << ' ' << at.y();
            }
}

TEST_P(AStyleSheet, CutsNoTextInTheGrid) {
    lay();
    auto& view = grid().view();
    const auto metrics = [](const QWidget& part) { return QFontMetrics(part.font()); };
    const QStyle& style = *view.style();
    // What a row has to be so that a text stands within padding and border.
    QStyleOptionViewItem item;
    item.initFrom(&view);
    item.widget = &view;
    item.features = QStyleOptionViewItem::HasDisplay;
    item.text = QStringLiteral("Descending");
    const QSize wanted = style.sizeFromContents(QStyle::CT_ItemViewItem, &item, {}, &view);
    EXPECT_GE(grid().cellRect(2, 9).height(), wanted.height());
    EXPECT_GE(grid().cellRect(2, 9).width(), wanted.width()) << "a blank column";
    EXPECT_GE(grid().cellRect(1, 1).height(), metrics(view).height());
    EXPECT_GE(view.horizontalHeader()->viewport()->height(),
              metrics(*view.horizontalHeader()).height());
    EXPECT_GE(view.verticalHeader()->viewport()->width(),
              metrics(*view.verticalHeader()).horizontalAdvance(QStringLiteral("Synonym:")));
    for (const int col : {1, 2, 3}) {
        const int field =
            metrics(*view.horizontalHeader()).horizontalAdvance(grid().model().text(0, col));
        EXPECT_GE(grid().cellRect(0, col).width(), field) << col;
    }
}

TEST_P(AStyleSheet, CutsNothingInTheEditors) {
    lay();
    for (const auto& [row, name] :
         {std::pair{2, "fraSortOrder"}, std::pair{3, "fraVisibility"}, std::pair{4, "fraValue"}}) {
        press(row, 1);
        const auto& editor = child<QWidget>(name);
        ASSERT_TRUE(editor.isVisible()) << name;
        EXPECT_TRUE(widget->rect().contains(editor.geometry())) << name;
        for (const QWidget* part : editor.findChildren<QWidget*>()) {
            if (part->window() != editor.window()) continue; // of a list that is not open
            EXPECT_GE(part->width(), part->minimumSizeHint().width()) << name;
            EXPECT_GE(part->height(), part->sizeHint().height())
                << name << part->metaObject()->className();
            const QRect place(part->mapTo(&editor, QPoint()), part->size());
            EXPECT_TRUE(editor.rect().contains(place)) << name;
        }
    }
}

TEST_P(AStyleSheet, LeavesTheEndsOfJoinsAtTheirEntries) {
    lay();
    auto& canvas = child<platform::qt::Canvas>("fraTable");
    auto& line = *canvas.lines().front(); // ORDERS.CUSTOMER_ID, the third entry
    auto& list = table(1).list();
    const QRect entry = list.visualRect(list.model()->index(2, 0));
    const QPoint middle = list.viewport()->mapTo(&canvas, entry.center());
    const int end = qRound(line.at(0).y() / 15);
    const int last = list.viewport()->mapTo(&canvas, list.viewport()->rect().bottomLeft()).y();
    if (middle.y() < last - entry.height()) {
        EXPECT_NEAR(end, middle.y(), 1);
    }
    EXPECT_GE(entry.height(), QFontMetrics(list.font()).height());
}

TEST_P(AStyleSheet, LeavesTheControlAsLargeAsItsBars) {
    lay();
    const auto& across = child<QScrollBar>("hsbTable");
    const auto& down = child<QScrollBar>("vsbTable");
    EXPECT_GE(across.height(), across.sizeHint().height());
    EXPECT_GE(down.width(), down.sizeHint().width());
    EXPECT_EQ(across.geometry().bottom() + 1, grid().geometry().top());
    EXPECT_EQ(down.geometry().right() + 1, widget->width());
    EXPECT_EQ(across.geometry().right() + 1, down.geometry().left());
}

INSTANTIATE_TEST_SUITE_P(Of, AStyleSheet,
                         testing::Combine(testing::ValuesIn(sheets),
                                          testing::Values(When::before, When::after)));
