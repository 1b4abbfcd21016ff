#include "designer/tables/TableListModel.h"
#include "designer/tables/tableMime.h"

#include <gmock/gmock.h>

#include <QMimeData>

using namespace zandor;

using designer::TableListModel;
using reader::TableId;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

class TheListOfTables : public testing::Test {
protected:
    TheListOfTables() {
        model.setTables({{{u"", u"BackOrders"}, false},
                         {{u"", u"customers"}, false},
                         {{u"", u"order_lines"}, false},
                         {{u"", u"orders"}, false},
                         {{u"archive", u"orders"}, false},
                         {{u"", u"order_totals"}, true},
                         {{u"", u"\u00c4mter"}, false}});
    }

    std::vector<std::string> shown(const QString& filter) {
        model.setFilter(filter);
        std::vector<std::string> names;
        for (int row = 0; row < model.rowCount(); ++row) {
            const auto index = model.index(row);
            const QString schema = index.data(TableListModel::SchemaRole).toString();
            names.push_back((schema.isEmpty() ? QString() : schema + u'.').toStdString() +
                            index.data().toString().toStdString());
        }
        return names;
    }

    TableListModel model;
};

} // namespace

TEST_F(TheListOfTables, HasAllOfThemWithoutAFilter) {
    EXPECT_EQ(shown(QString()).size(), 7U);
    EXPECT_EQ(shown(QStringLiteral("  ")).size(), 7U);
    EXPECT_EQ(model.count(), 7U);
}

TEST_F(TheListOfTables, HasThoseThatBeginWithTheWordFirst) {
    EXPECT_THAT(
        shown(QStringLiteral("order")),
        ElementsAre("order_lines", "orders", "archive.orders", "order_totals", "BackOrders"));
}

TEST_F(TheListOfTables, HasThoseWithEveryWordWhateverTheirCaseAndOrder) {
    EXPECT_THAT(shown(QStringLiteral("LINE order")), ElementsAre("order_lines"));
    EXPECT_THAT(shown(QStringLiteral("back orders")), ElementsAre("BackOrders"));
    EXPECT_THAT(shown(QStringLiteral("archive ord")), ElementsAre("archive.orders"));
    EXPECT_THAT(shown(QStringLiteral("archive.orders")), ElementsAre("archive.orders"));
    EXPECT_THAT(shown(QStringLiteral("\u00e4MT")), ElementsAre("\u00c4mter"));
    EXPECT_THAT(shown(QStringLiteral("order nothing")), IsEmpty());
}

TEST_F(TheListOfTables, TellsViewsFromTables) {
    shown(QStringLiteral("order_"));
    EXPECT_FALSE(model.index(0).data(TableListModel::IsViewRole).toBool());
    EXPECT_TRUE(model.index(1).data(TableListModel::IsViewRole).toBool());
    EXPECT_EQ(model.index(0).data(Qt::AccessibleTextRole).toString(), "order_lines, table");
    EXPECT_EQ(model.index(1).data(Qt::AccessibleTextRole).toString(), "order_totals, view");
}

TEST_F(TheListOfTables, GivesWhatIsDraggedFromIt) {
    shown(QStringLiteral("orders"));
    const std::unique_ptr<QMimeData> data(model.mimeData({model.index(0), model.index(1)}));
    EXPECT_TRUE(designer::hasTables(*data));
    EXPECT_THAT(designer::tablesOfMime(*data),
                ElementsAre(TableId{u"", u"orders"}, TableId{u"archive", u"orders"}));
    EXPECT_FALSE(data->hasText()) << "an editor would take it";
}

TEST(DraggedTables, AreNoneWhenTheDataCannotBeRead) {
    QMimeData data;
    EXPECT_FALSE(designer::hasTables(data));
    data.setData(QStringLiteral("application/x-zandor-tables"), "\xff\x00\x00");
    EXPECT_THAT(designer::tablesOfMime(data), IsEmpty());
}
