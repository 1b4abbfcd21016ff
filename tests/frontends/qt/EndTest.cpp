#include "frontends/qt/Desk.h"

#include "frontends/qt/QtToolkit.h"

#include <QAction>
#include <QDialog>
#include <QLineEdit>
#include <QMenu>

using namespace zandor;

namespace {

enum class Moment {
    inASlotOfActivate,
    inASlotOfTableMoved,
    inASlotOfTableDeleted,
    inASlotOfColumnModified,
    whileABoxStandsOpen,
    whileTheMenuStandsOpen,
    whileTheDialogStandsOpen,
    whileADragIsOn,
};

constexpr Moment moments[] = {
    Moment::inASlotOfActivate,        Moment::inASlotOfTableMoved, Moment::inASlotOfTableDeleted,
    Moment::inASlotOfColumnModified,  Moment::whileABoxStandsOpen, Moment::whileTheMenuStandsOpen,
    Moment::whileTheDialogStandsOpen, Moment::whileADragIsOn,
};

/// The widget under a user's hands when its host deletes it, by `delete` or by deleteLater().
class TheWidgetDeleted : public Desk, public testing::WithParamInterface<std::tuple<Moment, bool>> {
protected:
    TheWidgetDeleted() {
        show();
        bind();
        part = &table(1);
    }
    ~TheWidgetDeleted() override { qApp->removeEventFilter(&mFilter); }

    void end() {
        if (!widget) return;
        ++ended;
        widget->setDebugSwitch(0);
        if (std::get<bool>(GetParam()))
            widget.release()->deleteLater();
        else
            widget.reset();
    }

    /// Deletes the widget once something modal of a kind stands open.
    template <class Modal>
    void endInside() {
        mFilter.opened = [this](QWidget& shown) {
            if (qobject_cast<Modal*>(&shown)) QTimer::singleShot(0, &mFilter, [this] { end(); });
        };
        qApp->installEventFilter(&mFilter);
    }

    void pressEntry(Qt::MouseButton button) {
        auto& list = table(2).list();
        const QPointer<QWidget> viewport = list.viewport();
        const QPointF at = list.visualRect(list.model()->index(1, 0)).center();
        hands::mouse(*viewport, QEvent::MouseButtonPress, at, button, button);
        if (viewport) hands::mouse(*viewport, QEvent::MouseButtonRelease, at, button);
    }

    /// With the keyboard: the first join's line, and Enter.
    void openDialog() {
        auto& canvas = child<platform::qt::Canvas>("fraTable");
        canvas.focusOn(canvas.lines().front(), Qt::TabFocusReason);
        hands::key(canvas, Qt::Key_Return);
    }

    void drag() {
        widget->toolkit().drags().setCarrier([this](QDrag&) { end(); });
        auto& list = table(2).list();
        const QPointer<QWidget> viewport = list.viewport();
        const QPointF at = list.visualRect(list.model()->index(1, 0)).center();
        hands::mouse(*viewport, QEvent::MouseButtonPress, at, Qt::LeftButton, Qt::LeftButton);
        if (viewport)
            hands::mouse(*viewport, QEvent::MouseMove, at + QPointF(0, 1), Qt::NoButton,
                         Qt::LeftButton);
    }

    void setCell() {
        press(1, 1);
        hands::key(child<QWidget>("txtValue"), Qt::Key_Return);
    }

    QPointer<QWidget> part;
    int ended = 0;

private:
    struct Filter : QObject {
        bool eventFilter(QObject* watched, QEvent* event) override {
            auto* widget = qobject_cast<QWidget*>(watched);
            if (widget && event->type() == QEvent::Show && opened) opened(*widget);
            return false;
        }
        std::function<void(QWidget&)> opened;
    } mFilter;
};

TEST_P(TheWidgetDeleted, EndsInQuiet) {
    const auto endIn = [this](auto signal) {
        QObject::connect(widget.get(), signal, qApp, [this] { end(); });
    };
    switch (std::get<Moment>(GetParam())) {
    case Moment::inASlotOfActivate:
        endIn(&ZandorWidget::Activate);
        pressEntry(Qt::RightButton);
        break;
    case Moment::inASlotOfTableMoved:
        endIn(&ZandorWidget::TableMoved);
        table(2).list().setFocus();
        hands::key(table(2).list(), Qt::Key_Right, {}, Qt::AltModifier);
        break;
    case Moment::inASlotOfTableDeleted:
        endIn(&ZandorWidget::TableDeleted);
        hands::click(table(2).closeButton(), QRectF(table(2).closeButton().rect()).center());
        break;
    case Moment::inASlotOfColumnModified:
        endIn(&ZandorWidget::ColumnModified);
        setCell();
        break;
    case Moment::whileABoxStandsOpen:
        table(1).list().setFocus();
        settle();
        widget->setDebugSwitch(1);
        endInside<QMessageBox>();
        pressEntry(Qt::LeftButton);
        break;
    case Moment::whileTheMenuStandsOpen:
        endInside<QMenu>();
        pressEntry(Qt::RightButton);
        break;
    case Moment::whileTheDialogStandsOpen:
        endInside<QDialog>();
        openDialog();
        break;
    case Moment::whileADragIsOn: drag(); break;
    }
    settle();
    EXPECT_EQ(ended, 1);
    EXPECT_FALSE(part) << "its parts go, too";
    for (const QWidget* window : QApplication::topLevelWidgets())
        EXPECT_FALSE(window->isVisible()) << window->metaObject()->className();
}

INSTANTIATE_TEST_SUITE_P(AtAnyTime, TheWidgetDeleted,
                         testing::Combine(testing::ValuesIn(moments), testing::Bool()));

} // namespace

namespace {

class AWidgetWithComforts : public Desk {};

} // namespace

/// The comforts ask the model before the host's slots are told.
TEST_F(AWidgetWithComforts, IsDeletedByItsModelWhileASignalIsOnItsWay) {
    widget->setComforts(comforts::Flags::all());
    show();
    bind();
    press(1, 1);
    child<QLineEdit>("txtValue").setText("Number");
    bool set = false;
    library.calls->onPass = [&](const std::string& call) {
        set = set || call == "ZDColumnDefinition.Synonym=";
        if (set && call == "ZDColumnDefinition.Key") widget.reset();
    };
    hands::key(child<QWidget>("txtValue"), Qt::Key_Return);
    library.calls->onPass = nullptr;
    settle();
    EXPECT_TRUE(set);
    EXPECT_FALSE(widget);
    EXPECT_EQ(model->definitionAt(1).synonym, u"Number");
}
