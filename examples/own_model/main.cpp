#include "Report.h"

#include <Zandor/ZandorWidget.h>

#include <QApplication>

using namespace zandor;

/// Two sources and the link between them, to begin with.
platform::Ref<report::Report> someReport() {
    const auto orders = platform::makeRef<report::Source>(u"orders", 600);
    orders->add(u"id", true);
    orders->add(u"customer");
    const auto customers = platform::makeRef<report::Source>(u"customers", 4800);
    customers->add(u"id", true);
    customers->add(u"name");
    const auto link = platform::makeRef<report::Link>();
    link->from = orders;
    link->fromField = orders->fields.Item(u"orders.customer");
    link->to = customers;
    link->toField = customers->fields.Item(u"customers.id");

    auto report = platform::makeRef<report::Report>();
    report->sources.Add(orders, orders->name);
    report->sources.Add(customers, customers->name);
    report->AddJoin(link);
    return report;
}

/// Shows the report in the designer, and says what it has become when the window is closed.
int main(int argc, char** argv) {
    const QApplication application(argc, argv);
    const auto ours = someReport();
    report::Library library; // outlives the widget
    ZandorWidget designer(library);
    designer.setDebugSwitch(0);  // no trace boxes
    designer.setOnlyJoin(false); // with the grid below the canvas
    designer.setModel(ours);
    designer.resize(900, 600);
    designer.show();

    const int result = QApplication::exec();
    for (const auto& link : platform::Each<TalvikZandorLib::ZDJoin>(ours->links))
        std::printf("link %s to %s\n", platform::toUtf8(link->LeftColumn()->Key()).c_str(),
                    platform::toUtf8(link->RightColumn()->Key()).c_str());
    for (const auto& output : platform::Each<TalvikZandorLib::ZDColumnDefinition>(ours->outputs))
        std::printf("output %s\n", platform::toUtf8(output->Column()->Key()).c_str());
    return result;
}
