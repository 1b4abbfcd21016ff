#include "frontends/qt/KeyDesk.h"

#include <QDialog>
#include <QHeaderView>
#include <QPushButton>

// The control in a dialog of its host's, which has a default button and a menu of its own.

namespace {

class DialogHost : public QDialog {
public:
    int menus = 0;

protected:
    void contextMenuEvent(QContextMenuEvent*) override { ++menus; }
};

class AHostsDialog : public Desk {
protected:
    AHostsDialog() {
        auto* column = new QVBoxLayout(&host);
        column->addWidget(widget.get());
        column->addWidget(&field);
        column->addWidget(&other);
        column->addWidget(&ok);
        ok.setDefault(true);
        QObject::connect(&ok, &QPushButton::clicked, [this] { ++accepted; });
        host.resize(900, 700);
        host.show();
        host.activateWindow();
        bind();
        field.setFocus();
        settle();
    }
    ~AHostsDialog() override { widget.reset(); }

    void enter() {
        hands::key(*host.focusWidget(), Qt::Key_Return);
        settle();
    }

    /// A click with the right button as the window system reports it, a request for a menu
    /// included.
    void clickRight(QWidget& part, QPoint at) {
        const QPoint inside = part.mapTo(&host, at);
        for (const auto type : {QEvent::MouseButtonPress, QEvent::MouseButtonRelease}) {
            QMouseEvent event(type, inside, host.mapToGlobal(inside), Qt::RightButton,
                              type == QEvent::MouseButtonPress ? Qt::RightButton : Qt::NoButton,
                              {});
            QCoreApplication::sendEvent(host.windowHandle(), &event);
        }
        settle();
    }

    DialogHost host;
    QLineEdit field;
    QPushButton other{"Other"}, ok{"Ok"};
    int accepted = 0;
};

constexpr std::pair<int, const char*> editors[] = {
    {2, "fraSortOrder"}, {3, "fraVisibility"}, {4, "fraValue"}};

} // namespace

TEST_F(AHostsDialog, HasItsDefaultButtonWhateverEditorWasOpen) {
    for (const auto& [row, frame] : editors) {
        accepted = 0;
        press(row, 1);
        ASSERT_TRUE(child<QWidget>(frame).isVisible());
        EXPECT_TRUE(ok.isDefault()) << frame;
        enter();
        EXPECT_FALSE(child<QWidget>(frame).isVisible()) << frame;
        EXPECT_EQ(accepted, 0) << "Enter was the editor's";
        press(row, 1);
        hands::key(*host.focusWidget(), Qt::Key_Escape);
        EXPECT_FALSE(child<QWidget>(frame).isVisible()) << frame;
        EXPECT_TRUE(host.isVisible()) << frame;
        field.setFocus();
        enter();
        EXPECT_EQ(accepted, 1) << frame;
        EXPECT_TRUE(ok.isDefault()) << frame;
        // A button that is the default one while it has the focus gives that back as well.
        other.setFocus(Qt::TabFocusReason);
        field.setFocus();
        enter();
        EXPECT_EQ(accepted, 2) << frame;
    }
}

TEST_F(AHostsDialog, LeavesEnterToTheButtonOfAnEditor) {
    press(4, 1);
    child<QLineEdit>("txtValue").setText("> 1");
    auto& set = child<QPushButton>("cmdSetTextValue");
    hands::key(*host.focusWidget(), Qt::Key_Tab);
    ASSERT_EQ(host.focusWidget(), &set);
    enter();
    EXPECT_FALSE(child<QWidget>("fraValue").isVisible());
    EXPECT_EQ(grid().model().text(4, 1), "> 1");
    EXPECT_EQ(accepted, 0);
}

TEST_F(AHostsDialog, IsAskedForNoMenuWhereTheControlOpensItsOwn) {
    Menus menus;
    auto& list = table(1).list();
    QWidget& rows = *grid().view().verticalHeader();
    QWidget& columns = *grid().view().horizontalHeader();
    const struct {
        QWidget* part;
        QPoint at;
        int opened;
    } places[] = {
        {&grid(), grid().cellRect(2, 2).center(), 1},
        {&grid(), grid().cellRect(4, 3).center(), 1},
        {&columns, QPoint(40, 5), 1},
        {&rows, QPoint(20, 30), 1},
        {&grid(), QPoint(10, 5), 1}, // where rows and columns of titles meet
        {&child<QWidget>("fraTable"), QPoint(600, 20), 1},
        {list.viewport(), list.visualRect(list.model()->index(2, 0)).center(), 1},
    };
    int place = 0;
    for (const auto& [part, at, opened] : places) {
        menus.opened = 0;
        clickRight(*part, at);
        EXPECT_EQ(menus.opened, opened) << place;
        EXPECT_EQ(host.menus, 0) << place++;
    }
    clickRight(field, QPoint(5, 5));
    EXPECT_EQ(menus.opened, 2) << "an input has a menu of Qt's own";
}

TEST_F(AHostsDialog, TakesATextOfAnyLength) {
    const QString text(100'000, u'7');
    press(4, 1);
    child<QLineEdit>("txtValue").setText(text);
    enter();
    EXPECT_EQ(model->definitionAt(1).criteria.items.Item(1)->Criterium().size(), 100'000U);
    press(4, 1);
    EXPECT_EQ(child<QLineEdit>("txtValue").text(), text);
}
