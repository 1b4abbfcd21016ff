#include "OpenWindow.h"

#include "designer/document/Document.h"
#include "frontends/qt/CanvasItems.h"

#include <QAccessible>
#include <QHelpEvent>
#include <QToolTip>

using namespace zandor;

using platform::qt::Canvas;

namespace {

/// The join of two tables of the sample in the designer.
class AJoinInTheDesigner : public OpenWindow {
protected:
    AJoinInTheDesigner() { open({.tables = {"customers", "orders"}}); }
    ~AJoinInTheDesigner() override { window->document().setModified(false); }

    Canvas& canvas() { return part<Canvas>("fraTable"); }

    /// What the mouse and a screen reader are told at the one line there is.
    std::string said() {
        if (canvas().lines().size() != 1) return "no line, or many";
        auto& line = *canvas().lines().front();
        const QPoint at = (line.at(0.5) / 15).toPoint();
        QToolTip::hideText();
        until([] { return !QToolTip::isVisible(); }); // it stays for a while
        QHelpEvent help(QEvent::ToolTip, at, canvas().mapToGlobal(at));
        QCoreApplication::sendEvent(&canvas(), &help);
        const QString shown = QToolTip::isVisible() ? QToolTip::text() : QString();
        const std::string sentence = shown.simplified().toStdString(); // in one line
        EXPECT_EQ(line.accessible()->text(QAccessible::Description).toStdString(), sentence);
        return sentence;
    }

    void make(std::int16_t type) {
        window->document().change(
            "Join", [&](model::Query& query) { query.Joins().Item(1)->JoinType(type); });
        calm();
    }
};

} // namespace

TEST_F(AJoinInTheDesigner, IsReadInOneSentenceThatFollowsIt) {
    const auto join = query().Joins().Item(1);
    const std::string left = platform::toUtf8(join->LeftTable()->Name());
    const std::string right = platform::toUtf8(join->RightTable()->Name());
    EXPECT_EQ(said(), "the rows of " + left + " and " + right + " that match");
    make(1);
    EXPECT_EQ(said(), "all rows of " + left + ", and those of " + right + " that match");
    EXPECT_EQ(canvas().lines().front()->notes().First.empty(),
              !canvas().lines().front()->notes().Second.empty())
        << "one end says that all rows are kept";
    command("undo");
    EXPECT_EQ(said(), "the rows of " + left + " and " + right + " that match");
}

TEST_F(AJoinInTheDesigner, IsReadWithTheNamesThatItsTablesHaveNow) {
    make(3);
    window->document().change("Rename", [](model::Query& query) {
        query.renameTable(query.tableNamed(u"orders"), u"sales");
    });
    calm();
    const std::string sentence = said();
    EXPECT_THAT(sentence, testing::HasSubstr("sales"));
    EXPECT_THAT(sentence, testing::Not(testing::HasSubstr("orders")));
    EXPECT_THAT(sentence, testing::StartsWith("all rows of "));
}
