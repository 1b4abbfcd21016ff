#include "ReportModel.h"

#include <Zandor/ZandorWidget.h>

#include <QApplication>
#include <QTimer>

using namespace zandor;

/// Shows the report in the designer, and says what it has become when the window is closed. With
/// "--close" the window closes by itself.
int main(int argc, char** argv) {
    const QApplication application(argc, argv);

    const auto ours = std::make_shared<report::Report>(report::someReport());
    report::Library library; // outlives the widget
    ZandorWidget designer(library);
    designer.setDebugSwitch(0);  // no trace boxes
    designer.setOnlyJoin(false); // with the grid below the canvas
    designer.setModel(platform::makeRef<report::Model>(ours));
    QObject::connect(&designer, &ZandorWidget::JoinCreated,
                     [&] { qInfo("now there are %zu links", ours->links.size()); });
    designer.resize(900, 600);
    designer.show();
    if (QApplication::arguments().contains("--close"))
        QTimer::singleShot(0, &designer, &QWidget::close);

    const int result = QApplication::exec();
    std::puts(report::describe(*ours).c_str());
    return result;
}
