#include <QFile>
#include <QUiLoader>
#include <QWidget>

#include <gtest/gtest.h>

// A form that is loaded at run time: the widget as a program has it, nothing of an editor.

TEST(ALoadedForm, HasTheWidgetWithTheProperties) {
    QUiLoader loader;
    loader.addPluginPath(QStringLiteral(ZANDOR_PLUGINS "/designer"));
    EXPECT_TRUE(loader.availableWidgets().contains(QStringLiteral("ZandorWidget")));
    QFile file(QStringLiteral(ZANDOR_FORM));
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    const std::unique_ptr<QWidget> form(loader.load(&file));
    ASSERT_TRUE(form) << qPrintable(loader.errorString());
    const auto* const query = form->findChild<QWidget*>(QStringLiteral("query"));
    ASSERT_TRUE(query);
    EXPECT_STREQ(query->metaObject()->className(), "ZandorWidget");
    EXPECT_EQ(query->property("DebugSwitch").toInt(), 0);
    EXPECT_EQ(query->property("OnlyJoin").toBool(), false);
    EXPECT_EQ(query->property("LNGMnuDelCol"), QStringLiteral("Delete Column"));
}
