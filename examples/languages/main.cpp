#include "German.h"

#include <Zandor/Library.h>
#include <Zandor/QueryDocument.h>
#include <Zandor/ZandorWidget.h>

#include <QApplication>

using namespace zandor;

/// The designer with every text in German.
int main(int argc, char** argv) {
    const QApplication application(argc, argv);
    const auto document = files::loadQuery(argc > 1 ? argv[1] : "orders.json");
    if (!document) {
        std::fprintf(stderr, "%s\n", document.error().c_str());
        return 1;
    }

    model::Library library; // outlives the widget
    ZandorWidget designer(library);
    designer.setDebugSwitch(0);
    designer.setComforts(comforts::Flags::all()); // with all that has something to say
    for (const auto& [name, text] : german::properties)
        designer.setProperty(name, QString::fromUtf8(text));
    designer.setWords(german::words());
    designer.setOnlyJoin(false); // behind the texts: it takes the grid's titles of the moment
    designer.setModel(document->query);
    designer.resize(900, 600);
    designer.show();
    return QApplication::exec();
}
