#include "Host.h"

#include <Zandor/Library.h>
#include <Zandor/reader/Connection.h>
#include <Zandor/reader/addTables.h>

#include <QApplication>

using namespace zandor;

// A window with nothing but the control on it, over some of the sample's tables.

namespace {

constexpr QSize windowSize(1240, 800);

/// The sample's tables as they stand when the journey begins, in twips.
struct Start {
    platform::StringView table;
    float left, top, width, height;
};

constexpr Start tables[] = {{u"suppliers", 450, 300, 2550, 2250},
                            {u"customers", 5250, 300, 2850, 3450},
                            {u"orders", 9900, 300, 2550, 2850},
                            {u"order_lines", 14100, 300, 2550, 2550}};

platform::Ref<model::Query> makeQuery(const QString& file) {
    const auto database = reader::openSqlite(file);
    if (!database) qFatal("%s", qPrintable(database.error()));
    const auto schema = reader::makeSqliteReader(database->database());
    std::vector<reader::TableId> names;
    for (const Start& start : tables) names.push_back({{}, platform::String(start.table)});
    const auto query = platform::makeRef<model::Query>();
    const auto added = reader::addTables(*query, *schema, names, windowSize.width() * 15);
    if (!added) qFatal("%s", qPrintable(added.error()));
    for (const Start& start : tables) {
        const auto table = query->tableNamed(start.table);
        table->Left(start.left);
        table->Top(start.top);
        table->Width(start.width);
        table->Height(start.height);
    }
    return query;
}

} // namespace

int main(int argc, char** argv) {
    const QApplication application(argc, argv);
    const auto query = makeQuery(QString::fromLocal8Bit(argc > 1 ? argv[1] : "trading.sqlite"));
    model::Library library;
    ZandorWidget widget(library);
    widget.setDebugSwitch(0);
    widget.setOnlyJoin(false);
    widget.setJoinModifyDisabled(1); // lets joins be modified
    widget.setMXHorzFrameSize(windowSize.width() * 15);
    widget.setModel(query);
    widget.setWindowTitle(QStringLiteral("Journey"));
    widget.setGeometry(QRect(QPoint(60, 40), windowSize));
    Host host(widget, [&]() -> model::Query& { return *query; });
    host.listen(widget);
    widget.show();
    widget.activateWindow();
    return QApplication::exec();
}
