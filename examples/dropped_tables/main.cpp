#include <Zandor/Library.h>
#include <Zandor/ZandorWidget.h>
#include <Zandor/qt/Text.h>
#include <Zandor/reader/Connection.h>
#include <Zandor/reader/addTables.h>

#include <QApplication>
#include <QDropEvent>
#include <QListWidget>
#include <QMessageBox>
#include <QMimeData>
#include <QSplitter>

using namespace zandor;

const QString tableFormat = QStringLiteral("application/x-example-table");

/// The program's own list of tables, which can be dragged out of it.
class TableList final : public QListWidget {
public:
    TableList() { setDragEnabled(true); }

protected:
    QMimeData* mimeData(const QList<QListWidgetItem*>& items) const override {
        auto* const data = new QMimeData;
        data->setData(tableFormat, items.front()->text().toUtf8());
        return data;
    }
};

/// The designer, which takes them. What it knows nothing of it leaves to whoever derives from it,
/// and to the widgets around.
class Designer final : public ZandorWidget {
public:
    explicit Designer(TalvikZandorLib::Library& library) : ZandorWidget(library) {
        setAcceptDrops(true);
    }
    std::function<void(const QString& table, QPointF twips)> dropped;

protected:
    void dragEnterEvent(QDragEnterEvent* event) override { dragMoveEvent(event); }
    void dragMoveEvent(QDragMoveEvent* event) override {
        const bool overGrid = event->position().y() > height() * upperPaneShare();
        event->setAccepted(!overGrid && event->mimeData()->hasFormat(tableFormat));
    }
    void dropEvent(QDropEvent* event) override {
        event->acceptProposedAction();
        dropped(QString::fromUtf8(event->mimeData()->data(tableFormat)),
                toCanvas(event->position()));
    }
};

int fail(const QString& why) {
    std::fprintf(stderr, "%s\n", qPrintable(why));
    return 1;
}

int main(int argc, char** argv) {
    const QApplication application(argc, argv);
    const auto database = reader::openSqlite(argc > 1 ? argv[1] : "trading.sqlite");
    if (!database) return fail(database.error());
    const auto schema = reader::makeSqliteReader(database->database());
    const auto tables = schema->tables();
    if (!tables) return fail(tables.error());
    const auto query = platform::makeRef<model::Query>();
    model::Library library; // outlives the widget

    QSplitter window;
    TableList list;
    for (const auto& table : *tables) list.addItem(platform::qt::toQt(table.id.name));
    Designer designer(library);
    designer.setDebugSwitch(0);
    designer.setOnlyJoin(false);
    designer.setModel(query);
    designer.dropped = [&](const QString& name, QPointF twips) {
        // With the joins to what is there already.
        const auto added =
            reader::addTables(*query, *schema, {{u"", platform::qt::fromQt(name)}}, 12000);
        if (!added) {
            QMessageBox::warning(&window, name, added.error());
            return;
        }
        added->front()->Left(static_cast<float>(twips.x()));
        added->front()->Top(static_cast<float>(twips.y()));
        designer.showAnew();
    };
    window.addWidget(&list);
    window.addWidget(&designer);
    window.setStretchFactor(1, 1);
    window.resize(1100, 600);
    window.show();
    return QApplication::exec();
}
