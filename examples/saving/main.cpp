#include <Zandor/Library.h>
#include <Zandor/QueryDocument.h>
#include <Zandor/ZandorWidget.h>

#include <QApplication>
#include <QSettings>

using namespace zandor;

int fail(const std::string& why) {
    std::fprintf(stderr, "%s\n", why.c_str());
    return 1;
}

/// Opens the query of a file, and saves it when the window is closed; how its user looked at it is
/// kept in a file beside it.
int main(int argc, char** argv) {
    const QApplication application(argc, argv);
    const QString path = argc > 1 ? QString::fromLocal8Bit(argv[1]) : QString("orders.json");
    const auto document = files::loadQuery(path.toStdString());
    if (!document) return fail(document.error());
    QSettings view(path + ".view", QSettings::IniFormat);

    model::Library library; // outlives the widget
    ZandorWidget designer(library);
    designer.setDebugSwitch(0);
    designer.setComforts(comforts::Flags::all()); // the divider is one of them
    designer.setOnlyJoin(false);
    designer.setModel(document->query);
    designer.resize(view.value("size", QSize(900, 600)).toSize());
    designer.setUpperPaneShare(view.value("share", 0.5).toDouble());
    designer.show();
    // Once the layout is made, for it says how far the canvas scrolls.
    designer.setVisibleFrameLeft(view.value("left").toInt());
    designer.setVisibleFrameTop(view.value("top").toInt());
    QApplication::exec();

    designer.takeOver(); // what is still being typed
    view.setValue("size", designer.size());
    view.setValue("share", designer.upperPaneShare());
    view.setValue("left", designer.VisibleFrameLeft());
    view.setValue("top", designer.VisibleFrameTop());
    const auto failed = files::saveQuery(path.toStdString(), *document);
    return failed ? fail(failed->text()) : 0;
}
