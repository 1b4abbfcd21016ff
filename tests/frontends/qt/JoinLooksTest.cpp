#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/Desk.h"

#include <QAccessible>
#include <QComboBox>
#include <QDialog>
#include <QHelpEvent>
#include <QLabel>
#include <QToolTip>

using namespace zandor;

namespace {

/// Two tables, ORDERS to the left of LINES, and one join from left to right.
class AJoinToRead : public Desk {
protected:
    void join(std::int16_t type, std::int16_t compareOperator, bool turned = false,
              bool comfort = true) {
        comforts::Flags flags;
        flags.ReadsJoins = comfort;
        widget->setComforts(flags);
        show();
        model = library.newModel();
        orders = model->table(u"ORDERS", {u"*", u"ID"});
        lines = model->table(u"LINES", {u"*", u"ORDER_ID"});
        orders->place(turned ? 7500 : 600, 600, 2400, 1800);
        lines->place(turned ? 600 : 7500, 900, 2400, 1800);
        model->join(orders, u"ID", lines, u"ORDER_ID", type)->compareOperator = compareOperator;
        widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(model));
        settle();
    }

    platform::qt::Canvas& canvas() { return child<platform::qt::Canvas>("fraTable"); }
    platform::qt::CanvasLine& line() { return *canvas().lines().front(); }
    QPoint middle() { return (line().at(0.5) / 15).toPoint(); }

    std::string note(const platform::String& text) { return platform::toUtf8(text); }

    std::string toolTip(QPoint at) {
        const QDeadlineTimer moment(1000); // one that is to go stays for a while
        QToolTip::hideText();
        while (QToolTip::isVisible() && !moment.hasExpired()) qApp->processEvents();
        QHelpEvent help(QEvent::ToolTip, at, canvas().mapToGlobal(at));
        QCoreApplication::sendEvent(&canvas(), &help);
        const QString shown = QToolTip::isVisible() ? QToolTip::text() : QString();
        return QString(shown).replace(u'\n', u' ').toStdString();
    }
};

} // namespace

TEST_F(AJoinToRead, HasNoNotesWithoutTheComfort) {
    join(1, 2, false, false);
    EXPECT_EQ(line().notes(), platform::LineNotes());
    EXPECT_EQ(toolTip(middle()), "");
}

TEST_F(AJoinToRead, ShowsWhichTableKeepsAllItsRows) {
    struct Case {
        std::int16_t type;
        bool turned;
        const char* west;
        const char* east;
    };
    for (const Case c :
         {Case{0, false, "", ""}, Case{1, false, "all", ""}, Case{2, false, "", "all"},
          Case{3, false, "all", "all"}, Case{1, true, "", "all"}, Case{2, true, "all", ""}}) {
        join(c.type, 0, c.turned);
        EXPECT_EQ(note(line().notes().First), c.west) << c.type << c.turned;
        EXPECT_EQ(note(line().notes().Second), c.east) << c.type << c.turned;
        EXPECT_EQ(note(line().notes().Middle), "");
    }
}

TEST_F(AJoinToRead, ShowsAnOperatorOtherThanEqualsAsItReadsFromWestToEast) {
    const char* const fromTheLeft[] = {"", "<>", "<", ">", "<=", ">="};
    const char* const fromTheRight[] = {"", "<>", ">", "<", ">=", "<="};
    for (std::int16_t code = 0; code < 6; ++code) {
        join(0, code);
        EXPECT_EQ(note(line().notes().Middle), fromTheLeft[code]);
        join(0, code, true);
        EXPECT_EQ(note(line().notes().Middle), fromTheRight[code]);
    }
}

TEST_F(AJoinToRead, IsOneSentenceInItsTooltipAndToAScreenReader) {
    const char* const sentences[] = {
        "the rows of ORDERS and LINES that match",
        "all rows of ORDERS, and those of LINES that match",
        "all rows of LINES, and those of ORDERS that match",
        "all rows of ORDERS and of LINES, side by side where they match"};
    for (std::int16_t type = 0; type < 4; ++type) {
        join(type, 0);
        EXPECT_EQ(toolTip(middle()), sentences[type]);
        EXPECT_EQ(line().accessible()->text(QAccessible::Description).toStdString(),
                  sentences[type]);
    }
    join(1, 2);
    EXPECT_EQ(toolTip(middle()),
              "all rows of ORDERS, and those of LINES that match: ORDERS.ID < LINES.ORDER_ID");
    EXPECT_EQ(toolTip(middle() + QPoint(0, 40)), "") << "beside the line";
}

TEST_F(AJoinToRead, IsSaidInItsDialogAsItIsChosenThere) {
    join(1, 0);
    widget->setJoinModifyDisabled(1);
    std::string before, after;
    QTimer::singleShot(0, [&] {
        auto* open = qobject_cast<QDialog*>(QApplication::activeModalWidget());
        if (!open) return;
        auto* sentence = open->findChild<QLabel*>("joinSentence");
        before = sentence ? sentence->text().toStdString() : "";
        open->findChild<QComboBox*>("cboJoinType")->setCurrentIndex(2);
        after = sentence ? sentence->text().toStdString() : "";
        open->reject();
    });
    canvas().focusOn(&line(), Qt::TabFocusReason);
    canvas().openCurrentLine();
    EXPECT_EQ(before, "all rows of ORDERS, and those of LINES that match");
    EXPECT_EQ(after, "all rows of LINES, and those of ORDERS that match");
}

TEST_F(AJoinToRead, OpensItsDefinitionByADoubleClick) {
    for (const bool comfort : {true, false}) {
        join(0, 0, false, comfort);
        bool opened = false;
        QTimer::singleShot(50, [&] {
            if (auto* open = qobject_cast<QDialog*>(QApplication::activeModalWidget())) {
                opened = true;
                open->reject();
            }
        });
        hands::click(canvas(), middle());
        hands::mouse(canvas(), QEvent::MouseButtonDblClick, middle(), Qt::LeftButton,
                     Qt::LeftButton);
        hands::mouse(canvas(), QEvent::MouseButtonRelease, middle(), Qt::LeftButton);
        const QDeadlineTimer end(300);
        while (!end.hasExpired()) qApp->processEvents(QEventLoop::AllEvents, 20);
        EXPECT_EQ(opened, comfort);
    }
}

TEST_F(AJoinToRead, OpensNothingByADoubleClickOfAnotherButton) {
    join(0, 0);
    bool opened = false;
    hands::click(canvas(), middle());
    hands::mouse(canvas(), QEvent::MouseButtonDblClick, middle(), Qt::RightButton, Qt::RightButton);
    QTimer::singleShot(0, [&] { // behind what the press has asked for
        auto* open = qobject_cast<QDialog*>(QApplication::activeModalWidget());
        opened = open != nullptr;
        if (open) open->reject();
    });
    settle();
    EXPECT_FALSE(opened);
}

TEST_F(AJoinToRead, HasATooltipOfItsOwnBesideAnotherOne) {
    join(0, 0);
    model->join(orders, u"*", lines, u"ORDER_ID")->compareOperator = 2;
    widget->showAnew();
    settle();
    const auto both = canvas().lines();
    ASSERT_EQ(both.size(), 2U);
    for (const auto* each : both) {
        const QPointF near = each->at(0.85);
        ASSERT_LT(both[0]->distanceTo(near) + both[1]->distanceTo(near), 90) << "they converge";
        EXPECT_EQ(toolTip((near / 15).toPoint()), platform::toUtf8(each->notes().Sentence));
    }
}

TEST_F(AJoinToRead, HasNoTooltipBeyondItsEnds) {
    join(0, 0);
    EXPECT_EQ(toolTip((line().at(1.2) / 15).toPoint()), "");
    EXPECT_EQ(toolTip((line().at(-0.2) / 15).toPoint()), "");
}

TEST_F(AJoinToRead, HasItsWordsAtTheirEnds) {
    // The line runs down to the right; a word stands out above its beginning, or below its end.
    const auto isPainted = [&](double share, int below) {
        return line().extent().contains((line().at(share) / 15).toPoint() + QPoint(0, below));
    };
    join(1, 0);
    EXPECT_TRUE(isPainted(0.06, -5));
    EXPECT_FALSE(isPainted(0.94, 5));
    join(2, 0);
    EXPECT_FALSE(isPainted(0.06, -5));
    EXPECT_TRUE(isPainted(0.94, 5));
}

TEST_F(AJoinToRead, HasItsWordsOnOnePlateWhereTheLineIsShort) {
    join(3, 2);
    lines->place(3360, 900, 2400, 1800);
    widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(model));
    settle();
    ASSERT_LT(std::abs(line().X2() - line().X1()), 400);
    QFont font = canvas().font();
    font.setPointSizeF(font.pointSizeF() * 0.85);
    EXPECT_GE(line().extent().boundingRect().width(),
              QFontMetrics(font).horizontalAdvance("all < all"));
}

TEST_F(AJoinToRead, IsPaintedAsWideAsItShinesWithTheFocus) {
    join(0, 0, false, false);
    const auto reaches = [&](int above) {
        return line().extent().contains((line().at(0) / 15).toPoint() + QPoint(1, -above));
    };
    EXPECT_FALSE(reaches(3));
    canvas().focusOn(&line(), Qt::TabFocusReason);
    EXPECT_TRUE(reaches(3));
}

TEST_F(AJoinToRead, TakesItsNotesAwayWithTheComfort) {
    join(3, 2);
    ASSERT_NE(line().notes(), platform::LineNotes());
    widget->setComforts({});
    EXPECT_EQ(line().notes(), platform::LineNotes());
}

TEST_F(AJoinToRead, SpeaksTheHostsWords) {
    join(1, 0);
    platform::Words words;
    words.All = u"alle";
    words.AllOfOne = u"alle von %1, dazu passende von %2";
    widget->setWords(words);
    EXPECT_EQ(note(line().notes().First), "alle");
    EXPECT_EQ(toolTip(middle()), "alle von ORDERS, dazu passende von LINES");
}
