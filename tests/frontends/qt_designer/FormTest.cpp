#include "frontends/qt/GridModel.h"
#include "frontends/qt/GridWidget.h"
#include "support/FakeModel.h"

#include "ui_form.h"

#include <gtest/gtest.h>

// A form that uic has made code of.

using namespace zandor;
using platform::qt::GridWidget;

TEST(ACompiledForm, HasTheWidgetWithItsPropertiesAndTakesAQuery) {
    fake::Library library;
    QDialog dialog;
    Ui::QueryForm form;
    form.setupUi(&dialog);
    EXPECT_EQ(form.query->DebugSwitch(), 0);
    EXPECT_FALSE(form.query->OnlyJoin());
    EXPECT_EQ(form.query->MXHorzFrameSize(), 20'000);
    EXPECT_EQ(form.query->LNGMnuDelCol(), u"Delete Column");

    form.query->setLibrary(library);
    const auto model = library.newModel();
    model->table(u"ORDERS", {u"ORDER_ID"});
    form.query->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(model));
    EXPECT_EQ(form.query->model().get(), model.get());
    EXPECT_TRUE(form.query->findChild<QWidget*>(QStringLiteral("lstTable(1)")));
}

TEST(ACompiledForm, HasTheTitlesOfTheGridThatItSays) {
    fake::Library library;
    QDialog dialog;
    Ui::QueryForm form;
    form.setupUi(&dialog);
    form.query->setLibrary(library);
    const auto* const grid =
        dynamic_cast<GridWidget*>(form.query->findChild<QWidget*>(QStringLiteral("sprColumn")));
    ASSERT_TRUE(grid);
    const platform::qt::GridModel& titles = grid->model();
    EXPECT_EQ(titles.text(0, 0), u"Column:");
    EXPECT_EQ(titles.text(1, 0), u"Synonym:");
}
