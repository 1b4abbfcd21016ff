#include "frontends/qt/Fonts.h"
#include "frontends/qt/Around.h"
#include "frontends/qt/Desk.h"
#include "frontends/qt/GridCells.h"

#include <Zandor/qt/Twips.h>

#include <QApplication>
#include <QComboBox>
#include <QDialog>
#include <QFontInfo>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>

using namespace zandor;

namespace {

/// A font that is set somewhere around the control, at some time.
class AFont : public Desk, public testing::WithParamInterface<Case> {
protected:
    AFont() { open(&host); }
    ~AFont() override {
        widget.reset();
        QApplication::setFont(before);
    }

    void set(qreal points) {
        QFont font = before;
        font.setPointSizeF(points);
        switch (GetParam().where) {
        case Where::application: QApplication::setFont(font); break;
        case Where::window: host.setFont(font); break;
        case Where::widget: widget->setFont(font); break;
        }
        settle();
    }

    void lay(qreal points) {
        host.resize(widget->size());
        host.show();
        if (GetParam().when == When::before) set(points);
        bind();
        if (GetParam().when == When::after) set(points);
    }

    int textWidth(const char* text) {
        return QFontMetrics(grid().view().font()).horizontalAdvance(QString::fromUtf8(text));
    }

    /// A cell's text as its column has room for it.
    QString shownIn(int row, int col) {
        grid().bringUpToDate();
        auto& view = grid().view();
        const auto index = view.model()->index(row - 1, col - 1);
        QStyleOptionViewItem option;
        option.initFrom(&view);
        option.widget = &view;
        option.rect = view.visualRect(index);
        option.features = QStyleOptionViewItem::HasDisplay;
        static_cast<platform::qt::GridCellDelegate*>(view.itemDelegate())
            ->initStyleOption(&option, index);
        return option.text;
    }

    const QFont before = QApplication::font();
    QWidget host;
};

} // namespace

TEST_P(AFont, ReachesEveryPartOfTheControl) {
    lay(19);
    for (const QWidget* part : std::initializer_list<const QWidget*>{
             &table(1), &table(1).list(), &grid(), &grid().view(), grid().view().horizontalHeader(),
             grid().view().verticalHeader(), &child<QWidget>("cobSortOrder"),
             &child<QWidget>("txtValue"), &child<QWidget>("cmdSetTextValue")})
        EXPECT_EQ(part->font().pointSizeF(), 19)
            << part->metaObject()->className() << (part == grid().view().horizontalHeader());
    bind(); // a table made later has it, too
    EXPECT_EQ(table(2).list().font().pointSizeF(), 19);
}

TEST_P(AFont, IsThatOfTheDialog) {
    lay(19);
    qreal label = 0, input = 0;
    QTimer::singleShot(0, [&] {
        if (auto* open = qobject_cast<QDialog*>(QApplication::activeModalWidget())) {
            label = open->findChild<QLabel*>()->font().pointSizeF();
            input = open->findChild<QLineEdit*>()->font().pointSizeF();
            open->reject();
        }
    });
    auto& canvas = child<platform::qt::Canvas>("fraTable");
    canvas.focusOn(canvas.lines().front(), Qt::TabFocusReason);
    canvas.openCurrentLine();
    EXPECT_EQ(label, 19);
    EXPECT_EQ(input, 19);
}

TEST_P(AFont, FindsRowsAndColumnsThatItFitsInto) {
    lay(24);
    const int height = QFontMetrics(grid().view().font()).height();
    EXPECT_GE(grid().cellRect(0, 1).height(), height);
    EXPECT_GE(grid().cellRect(4, 1).height(), height);
    EXPECT_GE(table(1).list().visualRect(table(1).list().model()->index(0, 0)).height(), height);
    EXPECT_GE(table(1).listTop(), height);
    for (const char* word : {"Ascending", "Descending", "Not Visible"})
        EXPECT_GE(grid().cellRect(2, 9).width(), textWidth(word)) << "in a blank column: " << word;
    EXPECT_GE(grid().cellRect(0, 1).width(), textWidth("ORDER_ID"));
    EXPECT_GE(grid().cellRect(0, 0).width(), textWidth("Synonym:"));
}

TEST_P(AFont, ShowsASortOrderWholeOrAsAnArrow) {
    for (const qreal points : {9.0, 12.0, 16.0}) {
        widget->setComforts({});
        lay(points);
        for (const auto& [word, arrow] : {std::pair{"Ascending", "▲"}, {"Descending", "▼"}})
            for (const int width : {20, 40, 60, 80, 120, 160}) {
                grid().model().setText(2, 1, word);
                grid().model().setWidth(1, platform::qt::toTwips(width));
                grid().touch();
                grid().bringUpToDate();
                const QString shown = shownIn(2, 1);
                EXPECT_LE(textWidth(shown.toUtf8()), width) << points << ' ' << width;
                EXPECT_EQ(shown, width < textWidth(word) + 4 ? arrow : shown);
                EXPECT_EQ(shown, width > textWidth(word) + 12 ? word : shown);
            }
        widget->setComforts({.FitsColumns = true});
        EXPECT_EQ(shownIn(2, 2), "Ascending") << points;
        model->definitionAt(1).sortOrder = 2;
        widget->showAnew();
        EXPECT_EQ(shownIn(2, 1), "Descending") << points;
    }
}

TEST_P(AFont, FitsIntoTheEditors) {
    lay(24);
    for (const auto& [row, name] :
         {std::pair{2, "fraSortOrder"}, std::pair{3, "fraVisibility"}, std::pair{4, "fraValue"}}) {
        press(row, 1);
        const auto& editor = child<QWidget>(name);
        ASSERT_TRUE(editor.isVisible()) << name;
        for (const QWidget* part : editor.findChildren<QWidget*>()) {
            if (part->window() != editor.window()) continue; // of a list that is not open
            EXPECT_GE(part->width(), part->minimumSizeHint().width()) << name;
            EXPECT_GE(part->height(), part->sizeHint().height()) << name;
        }
    }
}

TEST_P(AFont, LeavesWhatIsAskedForInTwipsTrue) {
    lay(24);
    for (int row = 0; row < 6; ++row)
        for (int col = 1; col < 4; ++col) {
            const QPoint middle = grid().cellRect(row, col).center();
            QWidget* part = grid().childAt(middle);
            if (!part) continue; // beyond the window
            hands::mouse(*part, QEvent::MouseButtonPress, part->mapFrom(&grid(), middle),
                         Qt::LeftButton, Qt::LeftButton);
            if (row == 0) continue;
            EXPECT_EQ(grid().currentRow(), row);
            EXPECT_EQ(grid().currentCol(), col);
        }
}

INSTANTIATE_TEST_SUITE_P(Of, AFont, testing::ValuesIn(everywhere));

TEST(ASizeOfAFont, InPointsIsKeptToTheFraction) {
    QFont font;
    for (const float points : {8.25F, 9.5F, 9.75F, 10.0F, 12.5F}) {
        font.setPointSizeF(static_cast<qreal>(points));
        EXPECT_FLOAT_EQ(platform::qt::fromQt(font).Size, points);
        EXPECT_FLOAT_EQ(static_cast<float>(
                            platform::qt::toQt(platform::qt::fromQt(font), QFont()).pointSizeF()),
                        points);
    }
}

TEST(ASizeOfAFont, InPixelsIsAsLargeInPoints) {
    for (int pixels = 9; pixels <= 32; ++pixels) {
        QFont font;
        font.setPixelSize(pixels);
        const platform::Font told = platform::qt::fromQt(font);
        EXPECT_FLOAT_EQ(told.Size, static_cast<float>(QFontInfo(font).pointSizeF()));
        const QFont back = platform::qt::toQt(told, QFont());
        EXPECT_EQ(QFontInfo(back).pixelSize(), pixels);
        EXPECT_EQ(platform::qt::toQt(told, font).pixelSize(), pixels) << "it stays one in pixels";
    }
}
