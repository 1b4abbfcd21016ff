#include "designer/run/ResultTable.h"

#include "Databases.h"
#include "Queries.h"
#include "support/QtHands.h"

#include <gtest/gtest.h>

#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QFile>
#include <QHeaderView>
#include <QScrollBar>

#include <malloc.h>

using namespace zandor;

using designer::ResultModel;
using designer::ResultTable;
using designer::Row;
using designer::Spool;
using Kind = designer::Cell::Kind;

namespace {

class ShownRows : public testing::Test {
protected:
    void add(const Row& row) { ASSERT_FALSE(spool->add(row)); }
    void addNumbered(int rows) {
        for (int n = 0; n < rows; ++n)
            add({{Kind::number, QString::number(n)}, {Kind::text, QString("row %1").arg(n)}});
        table.rows().refresh();
    }
    void SetUp() override {
        ASSERT_FALSE(spool->begin({"n", "text"}));
        table.rows().setSpool(spool);
        table.rows().refresh();
        table.resize(400, 300);
        table.show();
    }
    QVariant at(int row, int column, int role = Qt::DisplayRole) {
        return table.rows().index(row, column).data(role);
    }
    QString copied(const QItemSelection& selection) {
        table.selectionModel()->select(selection, QItemSelectionModel::ClearAndSelect);
        table.copyAction()->trigger();
        return QApplication::clipboard()->text();
    }
    QItemSelection range(int top, int left, int bottom, int right) {
        return {table.rows().index(top, left), table.rows().index(bottom, right)};
    }

    DatabaseFolder folder;
    std::shared_ptr<Spool> spool = std::make_shared<Spool>();
    ResultTable table;
};

/// In bytes, of this process.
qint64 memory() {
    QFile file("/proc/self/statm");
    if (!file.open(QIODevice::ReadOnly)) return 0;
    return file.readAll().split(' ').value(1).toLongLong() * 4096;
}

} // namespace

TEST_F(ShownRows, HaveTheColumnsNames) {
    EXPECT_EQ(table.rows().headerData(1, Qt::Horizontal), "text");
    EXPECT_EQ(table.rows().columnCount(), 2);
    EXPECT_EQ(table.rows().rowCount(), 0);
}

TEST_F(ShownRows, GrowAsTheyCome) {
    addNumbered(300);
    EXPECT_EQ(at(299, 1), "row 299");
    addNumbered(100);
    EXPECT_EQ(table.rows().rowCount(), 400);
    EXPECT_EQ(at(399, 1), "row 99");
}

TEST_F(ShownRows, StandInAnotherOrderWhenTheyAreSorted) {
    addNumbered(600);
    const auto order = designer::sortedRows(*spool, 0, Qt::DescendingOrder, 600, false);
    ASSERT_TRUE(order);
    table.rows().setOrder(*order);
    EXPECT_EQ(at(0, 1), "row 599");
    EXPECT_EQ(at(599, 0), "0");
    // Copied as they stand.
    EXPECT_EQ(copied(range(342, 0, 345, 0)), "257\n256\n255\n254");
    // What comes later stands behind them.
    addNumbered(1);
    EXPECT_EQ(at(600, 0), "0");
    table.rows().setOrder({});
    EXPECT_EQ(at(0, 1), "row 0");
}

TEST_F(ShownRows, AreAlignedByTheirKind) {
    addNumbered(1);
    EXPECT_EQ(at(0, 0, Qt::TextAlignmentRole).toInt(), Qt::AlignRight | Qt::AlignVCenter);
    EXPECT_EQ(at(0, 1, Qt::TextAlignmentRole).toInt(), Qt::AlignLeft | Qt::AlignVCenter);
}

TEST_F(ShownRows, TellNothingFromTextsAndBlobs) {
    add({{}, {Kind::blob, {}, QByteArray(1234, 'x')}});
    table.rows().refresh();
    EXPECT_EQ(at(0, 0), "NULL");
    EXPECT_EQ(at(0, 0, Qt::ForegroundRole).value<QBrush>(),
              QApplication::palette().brush(QPalette::PlaceholderText));
    EXPECT_EQ(at(0, 1), "(blob, 1,234 bytes)");
}

TEST_F(ShownRows, PutALongTextIntoOneLine) {
    add({{Kind::text, "two\nlines"}, {Kind::text, QString(100'000, u'x')}});
    table.rows().refresh();
    EXPECT_EQ(at(0, 0), "two lines");
    EXPECT_EQ(at(0, 0, Qt::ToolTipRole), "two\nlines");
    EXPECT_LT(at(0, 1, Qt::ToolTipRole).toString().size(), 5000);
    EXPECT_EQ(copied(range(0, 1, 0, 1)), QString(100'000, u'x'));
}

TEST_F(ShownRows, LookAsTheQuerySaysOnTheClipboardToo) {
    const QString file = folder.database("shown.db", {"CREATE TABLE sales (price, at)"});
    const auto query = draw(file, {"sales"}, {{"sales.price"}, {"sales.at"}});
    const auto definition = [&](std::int32_t position) -> auto& {
        return dynamic_cast<model::ColumnDefinition&>(*query->ColumnDefinitions().Item(position));
    };
    definition(1).format(model::Format::Thousands);
    definition(1).decimals(1);
    definition(2).format(model::Format::IsoDate);
    add({{Kind::number, "12345.678"}, {Kind::text, "2026-07-21 14:30:00"}});
    add({{Kind::number, "1"}, {}});
    table.rows().refresh();
    int changes = 0;
    QObject::connect(&table.rows(), &QAbstractItemModel::dataChanged, [&] { ++changes; });
    EXPECT_TRUE(table.rows().setFormats(designer::ColumnFormats(*query)));
    EXPECT_FALSE(table.rows().setFormats(designer::ColumnFormats(*query)));
    EXPECT_EQ(changes, 1);
    EXPECT_EQ(at(0, 0), "12,345.7");
    EXPECT_EQ(at(0, 0, Qt::ToolTipRole), "12,345.7");
    EXPECT_EQ(at(0, 1), "2026-07-21");
    EXPECT_EQ(at(1, 1), "NULL");
    EXPECT_EQ(at(0, 0, Qt::TextAlignmentRole).toInt(), Qt::AlignRight | Qt::AlignVCenter);
    EXPECT_EQ(copied(range(0, 0, 1, 1)), "12,345.7\t2026-07-21\n1.0\t");
    EXPECT_EQ(table.rows().cell(table.rows().index(0, 0)).text, "12345.678");
}

TEST_F(ShownRows, AreCopiedWithTabs) {
    addNumbered(600);
    EXPECT_EQ(copied(range(254, 0, 257, 1)),
              "254\trow 254\n255\trow 255\n256\trow 256\n257\trow 257");
}

TEST_F(ShownRows, AreCopiedFromSeveralPlaces) {
    addNumbered(10);
    QItemSelection selection = range(1, 0, 1, 0);
    selection.merge(range(8, 1, 9, 1), QItemSelectionModel::Select);
    EXPECT_EQ(copied(selection), "1\t\n\trow 8\n\trow 9");
}

TEST_F(ShownRows, AreCopiedByTheUsualKeys) {
    addNumbered(3);
    table.selectAll();
    table.activateWindow();
    table.setFocus();
    QCoreApplication::processEvents();
    hands::key(table, Qt::Key_C, "c", Qt::ControlModifier);
    EXPECT_EQ(QApplication::clipboard()->text(), "0\trow 0\n1\trow 1\n2\trow 2");
}

TEST_F(ShownRows, KeepTabsAndLinesWithinACellWhenCopied) {
    add({{Kind::text, "a\tb"}, {Kind::text, "say \"x\"\nagain"}});
    add({{}, {Kind::text, "plain \"y\""}});
    table.rows().refresh();
    EXPECT_EQ(copied(range(0, 0, 1, 1)), "\"a\tb\"\t\"say \"\"x\"\"\nagain\"\n\tplain \"y\"");
}

TEST_F(ShownRows, AreNotCopiedByTheMillion) {
    addNumbered(300'000);
    QApplication::clipboard()->setText("before");
    bool told = false;
    QObject::connect(&table, &ResultTable::tooMuchToCopy, &table, [&] { told = true; });
    EXPECT_EQ(copied(range(0, 0, 299'999, 1)), "before");
    EXPECT_TRUE(told);
}

TEST_F(ShownRows, DoNotFillTheMemoryWhenTheyAreScrolled) {
    addNumbered(300'000);
    const auto scrollTo = [&](int row) {
        table.scrollTo(table.rows().index(row, 0));
        table.grab();
    };
    scrollTo(0);
    const qint64 before = memory();
    for (int row = 0; row < 300'000; row += 200) scrollTo(row);
    for (int row = 299'999; row >= 0; row -= 5000) scrollTo(row);
    EXPECT_LT(memory() - before, 16 << 20);
    EXPECT_EQ(at(123'456, 1), "row 123456");
}

TEST_F(ShownRows, GiveTheirRoomBackWhenTheyGo) {
    const auto inUse = [] {
        const auto all = mallinfo2();
        return all.uordblks + all.hblkhd;
    };
    const auto before = inUse();
    addNumbered(600'000);
    table.rows().setSpool(nullptr);
    spool.reset();
    EXPECT_LT(inUse(), before + (std::size_t{1} << 20));
}

TEST_F(ShownRows, AreNumberedAfterOthers) {
    addNumbered(3);
    spool = std::make_shared<Spool>();
    SetUp();
    addNumbered(2);
    EXPECT_TRUE(table.verticalHeader()->isVisible());
    EXPECT_EQ(table.verticalHeader()->count(), 2);
    const QPoint second(5, table.rowViewportPosition(1) + table.rowHeight(1) / 2);
    hands::click(*table.verticalHeader()->viewport(), second);
    EXPECT_TRUE(table.selectionModel()->isRowSelected(1));
}
