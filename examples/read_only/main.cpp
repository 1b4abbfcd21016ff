#include <Zandor/Library.h>
#include <Zandor/QueryDocument.h>
#include <Zandor/Questions.h>
#include <Zandor/ZandorWidget.h>

#include <QApplication>
#include <QCheckBox>
#include <QVBoxLayout>

using namespace zandor;

// [rules]
/// Lets its user join what belongs together, and take no table away.
class Rules : public TalvikDBxZandor::Questions {
public:
    bool MayJoin(const TalvikDBxZandor::JoinEnd& left,
                 const TalvikDBxZandor::JoinEnd& right) override {
        return isKey(left) != isKey(right);
    }
    bool MayCloseTable(const platform::Ref<TalvikZandorLib::ZDTable>&) override { return false; }

private:
    static bool isKey(const TalvikDBxZandor::JoinEnd& end) { return end.Column->Marker(); }
};
// [rules]

/// A drawing with rules of its own, or, as long as the box is ticked, one to look at alone.
int main(int argc, char** argv) {
    const QApplication application(argc, argv);
    const auto document = files::loadQuery(argc > 1 ? argv[1] : "orders.json");
    if (!document) {
        std::fprintf(stderr, "%s\n", document.error().c_str());
        return 1;
    }

    model::Library library; // outlives the widget
    QWidget window;
    QCheckBox readOnly("Only look");
    ZandorWidget designer(library);
    designer.setDebugSwitch(0);
    designer.setOnlyJoin(false);
    designer.setQuestions(std::make_shared<Rules>());
    designer.setModel(document->query);
    QObject::connect(&readOnly, &QCheckBox::toggled, &designer, &ZandorWidget::setReadOnly);
    readOnly.setChecked(true);

    QVBoxLayout layout(&window);
    layout.addWidget(&readOnly);
    layout.addWidget(&designer, 1);
    window.resize(900, 640);
    window.show();
    return QApplication::exec();
}
