#include "ui_form.h"

#include <Zandor/Library.h>
#include <Zandor/QueryDocument.h>

using namespace zandor;

/// A dialog that was made in Qt Designer, with the query designer on it.
int main(int argc, char** argv) {
    const QApplication application(argc, argv);
    const auto document = files::loadQuery(argc > 1 ? argv[1] : "orders.json");
    if (!document) {
        std::fprintf(stderr, "%s\n", document.error().c_str());
        return 1;
    }

    model::Library library; // outlives the dialog
    QDialog dialog;
    Ui::QueryForm form;
    form.setupUi(&dialog);
    form.query->setLibrary(library); // a form cannot say it
    form.query->setModel(document->query);
    if (dialog.exec() == QDialog::Accepted)
        qInfo("%d output columns", static_cast<int>(document->query->ColumnDefinitions().Count()));
    return 0;
}
