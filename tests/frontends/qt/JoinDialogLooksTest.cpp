#include "frontends/qt/KeyDesk.h"

#include "frontends/qt/Adapter.h"

#include <QComboBox>
#include <QDialog>
#include <QFontInfo>
#include <QLabel>
#include <QPushButton>

// The join dialog and the sizes of its texts, at every size of the host's font.

namespace {

class TheJoinDialog : public KeyDesk {
protected:
    /// Opens the dialog of the first join for as long as something looks at it.
    void look(const std::function<void(QDialog&)>& at) {
        bool opened = false;
        QTimer::singleShot(0, [&] {
            auto* const dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
            if (!dialog) return;
            opened = true;
            settle();
            at(*dialog);
            dialog->reject();
        });
        canvas().focusOn(canvas().lines().front(), Qt::TabFocusReason);
        canvas().openCurrentLine();
        calm();
        EXPECT_TRUE(opened);
    }

    static QString focusIn(const QDialog& dialog) {
        return dialog.focusWidget() ? dialog.focusWidget()->objectName() : QString();
    }
};

} // namespace

TEST_F(TheJoinDialog, ShowsItsTextsInFullHoweverNarrowItIsMade) {
    for (const int points : {8, 10, 12, 16, 24}) {
        QFont font = host.font();
        font.setPointSize(points);
        host.setFont(font);
        settle();
        look([&](QDialog& dialog) {
            dialog.resize(1, 1);
            settle();
            for (const auto* label : dialog.findChildren<QLabel*>())
                EXPECT_GE(label->width(), label->sizeHint().width())
                    << points << " " << label->text().toStdString();
            for (const auto* box : dialog.findChildren<QLineEdit*>())
                EXPECT_GE(box->width(), box->fontMetrics().horizontalAdvance(box->text()) + 8)
                    << points << " " << box->text().toStdString();
            for (const auto* list : dialog.findChildren<QComboBox*>())
                EXPECT_GE(list->width(), list->minimumSizeHint().width()) << points;
            for (const auto* button : dialog.findChildren<QPushButton*>()) {
                EXPECT_GE(button->width(), button->sizeHint().width()) << points;
                EXPECT_GE(button->height(), button->sizeHint().height()) << points;
                EXPECT_TRUE(dialog.rect().contains(button->geometry())) << points;
            }
        });
    }
}

TEST_F(TheJoinDialog, CanBeReadByKeys) {
    look([](QDialog& dialog) {
        EXPECT_EQ(focusIn(dialog), "cmdOk") << "nothing else can be changed";
        QStringList way;
        for (int n = 0; n < 6; ++n) {
            hands::key(*dialog.focusWidget(), Qt::Key_Tab);
            way += focusIn(dialog);
            const auto* box = qobject_cast<QLineEdit*>(dialog.focusWidget());
            if (!box) continue;
            EXPECT_EQ(box->selectedText(), box->text());
        }
        EXPECT_EQ(way, QStringList({"cmdCancel", "txtLeftTable", "txtLeftColumn", "txtRightTable",
                                    "txtRightColumn", "cmdOk"}));
    });
}

TEST_F(TheJoinDialog, BeginsWithWhatCanBeChanged) {
    widget->setJoinModifyDisabled(1);
    look([](QDialog& dialog) {
        EXPECT_EQ(focusIn(dialog), "cboJoinType");
        hands::key(*dialog.focusWidget(), Qt::Key_Tab);
        EXPECT_EQ(focusIn(dialog), "cboJoinCompareOperator");
    });
}

TEST_F(TheJoinDialog, AndAllElseHaveOneSizeWhereTheFontIsGivenInPixels) {
    for (const int pixels : {11, 13, 17, 19, 23, 31}) {
        QFont font = host.font();
        font.setPixelSize(pixels);
        host.setFont(font);
        widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(model));
        settle();
        const auto check = [pixels](const QWidget& whole) {
            for (const auto* part : whole.findChildren<QWidget*>())
                EXPECT_EQ(part->font().pixelSize(), pixels)
                    << part->metaObject()->className() << " " << part->objectName().toStdString();
        };
        check(host);
        look([&](QDialog& dialog) { check(dialog); });
    }
}
