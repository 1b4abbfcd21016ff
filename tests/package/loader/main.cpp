#include <Zandor/Library.h>
#include <Zandor/ZandorWidget.h>

#include <QApplication>
#include <QFile>
#include <QUiLoader>

#include <cstdio>
#include <memory>

// A program that loads a form at run time: the widget in it comes from the installed plug-in, and
// is of the same class as the program's own.
int main(int argc, char** argv) {
    const QApplication application(argc, argv);
    if (argc < 2) return std::fprintf(stderr, "name a form\n"), 1;
    QFile file(QString::fromLocal8Bit(argv[1]));
    QUiLoader loader; // looks for plug-ins in QT_PLUGIN_PATH
    const std::unique_ptr<QWidget> form(file.open(QIODevice::ReadOnly) ? loader.load(&file)
                                                                       : nullptr);
    if (!form) return std::fprintf(stderr, "no form: %s\n", argv[1]), 1;
    auto* const designer = form->findChild<ZandorWidget*>(QStringLiteral("query"));
    if (!designer) return std::fprintf(stderr, "no designer on the form\n"), 1;

    zandor::model::Library library;
    designer->setLibrary(library);
    const auto query = zandor::platform::makeRef<zandor::model::Query>();
    query->addTable({.name = u"customers", .columns = {{.name = u"name"}}});
    designer->setModel(query);
    const bool shown = designer->findChild<QWidget*>(QStringLiteral("lstTable(1)"));
    std::printf("the form shows %s\n", shown ? "the table" : "nothing");
    const std::unique_ptr<QWidget> gone(designer); // before its library
    return shown ? 0 : 1;
}
