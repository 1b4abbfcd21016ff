#include <Zandor/Library.h>
#include <Zandor/QueryDocument.h>
#include <Zandor/ZandorWidget.h>

#include <QApplication>
#include <QSplitter>

using namespace zandor;

/// Whatever is done in one of them is shown in the other, as soon as it has been done.
void follow(ZandorWidget& leader, ZandorWidget& follower) {
    const auto on = [&](auto... events) {
        (QObject::connect(&leader, events, &follower, &ZandorWidget::showAnew,
                          Qt::QueuedConnection),
         ...);
    };
    using Z = ZandorWidget;
    on(&Z::TableDeleted, &Z::TableMoved, &Z::ColumnCreated, &Z::ColumnModified, &Z::ColumnRemoved,
       &Z::JoinCreated, &Z::JoinModified, &Z::JoinRemoved);
}

/// Two designers side by side over one query: the drawing alone, and the drawing with the grid.
int main(int argc, char** argv) {
    const QApplication application(argc, argv);
    const auto document = files::loadQuery(argc > 1 ? argv[1] : "orders.json");
    if (!document) {
        std::fprintf(stderr, "%s\n", document.error().c_str());
        return 1;
    }

    model::Library library; // outlives the widgets
    QSplitter window;
    ZandorWidget left(library), right(library);
    for (ZandorWidget* designer : {&left, &right}) {
        designer->setDebugSwitch(0);
        designer->setOnlyJoin(designer == &left);
        designer->setModel(document->query);
        window.addWidget(designer);
    }
    follow(left, right);
    follow(right, left);
    window.resize(1400, 600);
    window.show();
    return QApplication::exec();
}
