#include <Zandor/DatabaseReader.h>
#include <Zandor/Library.h>
#include <Zandor/ZandorWidget.h>
#include <Zandor/qt/Text.h>
#include <Zandor/reader/Connection.h>
#include <Zandor/reader/addTables.h>
#include <Zandor/sql/Builder.h>

#include <QApplication>

#include <cstdio>

// A program outside the tree. It crosses the border of the libraries in each way that can go
// wrong there: exceptions are caught, casts ask for a type, Qt looks for signals by name.

using namespace zandor;

namespace {

int fails(const char* what) {
    std::fprintf(stderr, "%s\n", what);
    return 1;
}

} // namespace

int main(int argc, char** argv) {
    const QApplication application(argc, argv);
    if (argc < 2) return fails("name a database");
    const auto database = reader::openSqlite(QString::fromLocal8Bit(argv[1]));
    if (!database) return fails(qPrintable(database.error()));
    const auto schema = reader::makeSqliteReader(database->database());

    const auto query = platform::makeRef<model::Query>();
    const std::vector<reader::TableId> tables = {{u"", u"customers"}, {u"", u"orders"}};
    const auto added = reader::addTables(*query, *schema, tables, 12000);
    if (!added) return fails(qPrintable(added.error()));

    model::Library library;
    ZandorWidget designer(library);
    designer.setDebugSwitch(0);
    designer.setOnlyJoin(false);
    designer.setModel(query);
    designer.show();

    if (!std::dynamic_pointer_cast<TalvikZandorLib::OrderedDefinitions>(designer.model()))
        return fails("the type of a model is not known across the libraries");
    try {
        query->Tables().Item(u"no such key");
        return fails("a key that is not there was found");
    } catch (const platform::RuntimeError& error) {
        if (error.Number != 5) return fails("another error than expected");
    }
    bool deleted = false;
    QObject::connect(&designer, &ZandorWidget::TableDeleted, [&] { deleted = true; });
    designer.Terminate();
    std::printf("%d tables, SQL %s\n", static_cast<int>(query->Tables().Count()),
                designer.property("LNGSpreadField").toString() == "Field:" ? "ready" : "not ready");
    return 0;
}
