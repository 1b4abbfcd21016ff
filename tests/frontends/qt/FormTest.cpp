#include "frontends/qt/LaterLibrary.h"
#include "support/FakeModel.h"

#include <Zandor/ZandorWidget.h>

#include <QApplication>
#include <QEvent>
#include <QMessageBox>
#include <QTimer>

#include <gtest/gtest.h>

// The widget as a form makes it: from its parent alone.

using namespace zandor;
using platform::RuntimeError;
using platform::qt::LaterLibrary;

namespace {

template <class Call>
std::int32_t errorOf(Call&& call) {
    try {
        call();
    } catch (const RuntimeError& error) {
        return error.Number;
    }
    return 0;
}

/// How many boxes were shown; each is closed as soon as it opens.
class ShownBoxes : public QObject {
public:
    ShownBoxes() { qApp->installEventFilter(this); }
    bool eventFilter(QObject* watched, QEvent* event) override {
        auto* box = event->type() == QEvent::Show ? qobject_cast<QMessageBox*>(watched) : nullptr;
        if (!box) return false;
        ++count;
        QTimer::singleShot(0, box, &QMessageBox::accept);
        return false;
    }
    int count = 0;
};

} // namespace

TEST(AWidgetOfAForm, HasAnEmptyModelUntilItHasALibrary) {
    ZandorWidget widget;
    widget.setDebugSwitch(0);
    const auto model = widget.model();
    ASSERT_TRUE(model);
    EXPECT_EQ(model->Tables().Count(), 0);
    EXPECT_EQ(model->Joins().Count(), 0);
    EXPECT_EQ(model->ColumnDefinitions().Count(), 0);
    EXPECT_EQ(errorOf([&] { model->Tables().Item(1); }), 9);
    EXPECT_EQ(errorOf([&] { model->Joins().Item(u"j1"); }), 5);
    EXPECT_EQ(errorOf([&] { model->Joins().Remove(u"j1"); }), 5);
    EXPECT_EQ(errorOf([&] { model->AddJoin({}); }), 5);
    EXPECT_EQ(errorOf([&] { model->AddColumnDefinition({}); }), 5);
    EXPECT_EQ(errorOf([&] { model->DeleteTable({}); }), 5);
}

TEST(AWidgetOfAForm, HasItsModelsFromTheLibraryThatItIsGiven) {
    fake::Library library;
    QWidget form;
    ZandorWidget widget(&form);
    widget.setDebugSwitch(0);
    widget.setLibrary(library);
    EXPECT_TRUE(std::dynamic_pointer_cast<fake::Model>(widget.model()));
    EXPECT_EQ(widget.parentWidget(), &form);
}

TEST(AWidgetOfAForm, SaysWhatToDoWhenAModelComesBeforeTheLibrary) {
    LaterLibrary library;
    EXPECT_EQ(errorOf([&] { library.NewZDJoin(); }), 91);
    try {
        library.NewZDColumnDefinition();
        ADD_FAILURE() << "made a definition of nothing";
    } catch (const RuntimeError& error) {
        EXPECT_NE(error.Description.find(u"setLibrary"), platform::String::npos);
    }
    fake::Library given;
    library.set(given);
    EXPECT_TRUE(library.NewZDJoin());
    EXPECT_TRUE(library.NewZDColumnDefinition());
}

TEST(ASilentWidget, ShowsNoBoxes) {
    fake::Library library;
    ShownBoxes boxes;
    const auto bindAndEnd = [&](bool silent) {
        ZandorWidget widget;
        widget.setSilent(silent);
        widget.setLibrary(library);
        widget.setModel(library.newModel()); // traced
        widget.setDebugSwitch(40'000);       // error 6
        EXPECT_EQ(widget.DebugSwitch(), 1);
    };
    bindAndEnd(false);
    EXPECT_GE(boxes.count, 4);
    boxes.count = 0;
    bindAndEnd(true);
    EXPECT_EQ(boxes.count, 0);
}
