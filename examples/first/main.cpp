#include <Zandor/Library.h>
#include <Zandor/ZandorWidget.h>
#include <Zandor/reader/Connection.h>
#include <Zandor/reader/addTables.h>

#include <QApplication>

using namespace zandor;

int fail(const QString& why) {
    std::fprintf(stderr, "%s\n", qPrintable(why));
    return 1;
}

int main(int argc, char** argv) {
    const QApplication application(argc, argv);

    const auto database = reader::openSqlite(argc > 1 ? argv[1] : "trading.sqlite"); // read only
    if (!database) return fail(database.error());
    const auto schema = reader::makeSqliteReader(database->database());

    // Two tables for a canvas of 12000 twips (800 pixels), joined as the foreign key says.
    const auto query = platform::makeRef<model::Query>();
    const std::vector<reader::TableId> tables = {{u"", u"customers"}, {u"", u"orders"}};
    const auto added = reader::addTables(*query, *schema, tables, 12000);
    if (!added) return fail(added.error());

    model::Library library; // outlives the widget
    ZandorWidget designer(library);
    designer.setDebugSwitch(0);  // 1, the default, shows trace boxes
    designer.setOnlyJoin(false); // with the grid below the canvas
    designer.setModel(query);
    QObject::connect(&designer, &ZandorWidget::JoinCreated, [](const ZandorWidget::ZDJoin& join) {
        qInfo("a join from %s", platform::toUtf8(join->LeftTable()->Name()).c_str());
    });
    designer.resize(900, 600);
    designer.show();
    return QApplication::exec();
}
