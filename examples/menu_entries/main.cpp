#include <Zandor/Library.h>
#include <Zandor/QueryDocument.h>
#include <Zandor/Questions.h>
#include <Zandor/ZandorWidget.h>
#include <Zandor/qt/Text.h>

#include <QApplication>
#include <QClipboard>

using namespace zandor;

/// Entries of the program's own in the menu, for what it opens over.
class Entries : public TalvikDBxZandor::Questions {
public:
    explicit Entries(ZandorWidget& designer) : mDesigner(designer) {}

    std::vector<TalvikDBxZandor::HostEntry>
    MenuEntries(const TalvikDBxZandor::MenuPlace& place) override {
        if (place.Table) return {entry(u"Copy the &name", place.Table->Name())};
        if (place.Definition) return {entry(u"Copy the &name", place.Definition->Column()->Name())};
        if (place.Join) return {}; // the control's own will do
        return {{u"To the &top", [this] { mDesigner.setVisibleFrameTop(0); },
                 mDesigner.VisibleFrameTop() > 0}};
    }

private:
    static TalvikDBxZandor::HostEntry entry(platform::String caption, platform::String name) {
        return {std::move(caption), [name = platform::qt::toQt(name)] {
                    QGuiApplication::clipboard()->setText(name);
                    qInfo("copied %s", qPrintable(name));
                }};
    }

    ZandorWidget& mDesigner;
};

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
    designer.setOnlyJoin(false);
    designer.setQuestions(std::make_shared<Entries>(designer));
    designer.setModel(document->query);
    designer.resize(900, 600);
    designer.show();
    return QApplication::exec();
}
