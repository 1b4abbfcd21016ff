#include "Editor.h"

#include <QApplication>
#include <QDomDocument>
#include <QEvent>
#include <QFile>
#include <QMessageBox>
#include <QMetaProperty>
#include <QPluginLoader>
#include <QTimer>
#include <QtUiPlugin/QDesignerCustomWidgetInterface>

#include <gtest/gtest.h>

#include <map>
#include <set>

// The plug-in inside Qt Designer.

namespace {

QDesignerCustomWidgetInterface& plugin() {
    static QPluginLoader loader(
        QStringLiteral(ZANDOR_PLUGINS "/designer/libZandorWidgetPlugin.so"));
    auto* const found = qobject_cast<QDesignerCustomWidgetInterface*>(loader.instance());
    if (!found) throw std::runtime_error(loader.errorString().toStdString());
    return *found;
}

QString formOfTests() {
    QFile file(QStringLiteral(ZANDOR_FORM));
    if (!file.open(QIODevice::ReadOnly)) throw std::runtime_error("no " ZANDOR_FORM);
    return QString::fromUtf8(file.readAll());
}

/// The names of the widget's own properties that a form gives it.
std::set<std::string> ownProperties(const QString& form) {
    QDomDocument document;
    document.setContent(form);
    const QDomNodeList widgets = document.elementsByTagName(QStringLiteral("widget"));
    std::set<std::string> names;
    for (int i = 0; i < widgets.size(); ++i) {
        const QDomElement widget = widgets.at(i).toElement();
        if (widget.attribute(QStringLiteral("class")) != u"ZandorWidget") continue;
        for (auto property = widget.firstChildElement(QStringLiteral("property"));
             !property.isNull(); property = property.nextSiblingElement(QStringLiteral("property")))
            names.insert(property.attribute(QStringLiteral("name")).toStdString());
    }
    names.erase("geometry");
    names.erase("sizePolicy");
    return names;
}

/// Notes message boxes; each is closed as soon as it opens.
class Boxes : public QObject {
public:
    Boxes() { qApp->installEventFilter(this); }
    bool eventFilter(QObject* watched, QEvent* event) override {
        auto* box = event->type() == QEvent::Show ? qobject_cast<QMessageBox*>(watched) : nullptr;
        if (!box) return false;
        texts += box->text();
        QTimer::singleShot(0, box, &QMessageBox::accept);
        return false;
    }
    QStringList texts;
};

class TheEditor : public testing::Test {
protected:
    /// The widget on a form, as it falls there from the box of widgets.
    QWidget& fresh() {
        QDomDocument document;
        if (!document.setContent(plugin().domXml())) throw std::logic_error("no XML");
        QString widget;
        QTextStream stream(&widget);
        document.documentElement().firstChildElement(QStringLiteral("widget")).save(stream, 1);
        if (!editor.open(formAround(widget))) throw std::logic_error("no form");
        if (!editor.widget()) throw std::logic_error("no widget");
        return *editor.widget();
    }

    /// One for all tests: a plug-in is initialised once in a program.
    static Editor& theEditor() {
        static Editor& editor = *new Editor;
        return editor;
    }

    Boxes boxes;
    Editor& editor = theEditor();
};

} // namespace

TEST(ThePlugin, SaysWhatTheBoxOfWidgetsAndUicAskFor) {
    EXPECT_EQ(plugin().name(), u"ZandorWidget");
    EXPECT_EQ(plugin().includeFile(), u"<Zandor/ZandorWidget.h>");
    EXPECT_FALSE(plugin().isContainer());
    EXPECT_FALSE(plugin().group().isEmpty());
    EXPECT_FALSE(plugin().toolTip().isEmpty());
    EXPECT_FALSE(plugin().whatsThis().isEmpty());
    EXPECT_EQ(plugin().icon().pixmap(QSize(24, 24)).size(), QSize(24, 24));
}

TEST_F(TheEditor, HasTheWidgetItselfInTheForm) {
    ASSERT_TRUE(editor.open(formOfTests()));
    ASSERT_TRUE(editor.widget());
    EXPECT_EQ(editor.widget()->objectName(), u"query");
    const auto* const known = editor.core().widgetDataBase();
    const auto* const item = known->item(known->indexOfObject(editor.widget()));
    ASSERT_TRUE(item);
    EXPECT_TRUE(item->isCustom());
    EXPECT_FALSE(item->isPromoted());
    EXPECT_TRUE(item->pluginPath().endsWith(u"libZandorWidgetPlugin.so"));
}

TEST_F(TheEditor, ShowsTablesJoinsAndColumnsWithoutABox) {
    QWidget& widget = fresh();
    EXPECT_EQ(widget.property("DebugSwitch").toInt(), 1);
    for (const char* table : {"lstTable(1)", "lstTable(2)", "lstTable(3)"}) {
        const auto* const box = widget.findChild<QWidget*>(QLatin1String(table));
        ASSERT_TRUE(box) << table;
        EXPECT_TRUE(widget.rect().contains(QRect(box->mapTo(&widget, QPoint()), box->size())))
            << table;
    }
    editor.change(widget, QStringLiteral("OnlyJoin"), false);
    editor.change(widget, QStringLiteral("MXHorzFrameSize"), 40'000); // error 6
    EXPECT_EQ(widget.property("MXHorzFrameSize").toInt(), 16'000);
    EXPECT_TRUE(editor.open(formOfTests())); // which ends the widget
    EXPECT_EQ(boxes.texts, QStringList());
}

TEST_F(TheEditor, PutsEachPropertyUnderAHeading) {
    QWidget& widget = fresh();
    auto& sheet = editor.sheet(widget);
    const QMetaObject& meta = *widget.metaObject();
    std::map<std::string, int> headings;
    for (int i = meta.propertyOffset(); i < meta.propertyCount(); ++i) {
        const int index = sheet.indexOf(QLatin1String(meta.property(i).name()));
        ASSERT_GE(index, 0) << meta.property(i).name();
        if (sheet.isVisible(index)) ++headings[sheet.propertyGroup(index).toStdString()];
    }
    EXPECT_EQ(headings, (std::map<std::string, int>{{"Appearance", 3},
                                                    {"Behaviour", 13},
                                                    {"Diagnostics", 1},
                                                    {"Menu", 9},
                                                    {"Run Time", 7},
                                                    {"Texts", 25}}));
    // Those of QWidget are where they were.
    EXPECT_EQ(sheet.propertyGroup(sheet.indexOf(QStringLiteral("enabled"))), u"QWidget");
}

TEST_F(TheEditor, WritesNoPropertyThatNobodyChanged) {
    fresh();
    EXPECT_EQ(ownProperties(editor.contents()), std::set<std::string>());
    const QString code = compiled(editor.contents());
    EXPECT_TRUE(code.contains(u"#include <Zandor/ZandorWidget.h>")) << qPrintable(code);
    EXPECT_TRUE(code.contains(u"zandorWidget = new ZandorWidget(Form);")) << qPrintable(code);
    for (const char* setter : {"LNG", "MX", "OnlyJoin", "DebugSwitch", "UseJoin", "JoinModify"})
        EXPECT_FALSE(code.contains(QLatin1String(setter))) << setter;
}

TEST_F(TheEditor, WritesWhatWasChangedAndNoLongerWhatWasReset) {
    QWidget& widget = fresh();
    editor.change(widget, QStringLiteral("DebugSwitch"), 0);
    editor.change(widget, QStringLiteral("OnlyJoin"), false);
    EXPECT_EQ(ownProperties(editor.contents()), (std::set<std::string>{"DebugSwitch", "OnlyJoin"}));
    editor.reset(widget, QStringLiteral("DebugSwitch"));
    EXPECT_EQ(widget.property("DebugSwitch").toInt(), 1);
    EXPECT_EQ(ownProperties(editor.contents()), (std::set<std::string>{"OnlyJoin"}));
}

TEST_F(TheEditor, KeepsWhatAFormSays) {
    ASSERT_TRUE(editor.open(formOfTests()));
    EXPECT_EQ(editor.widget()->property("LNGSpreadField"), QStringLiteral("Column:"));
    EXPECT_EQ(editor.widget()->property("MXHorzFrameSize").toInt(), 20'000);
    EXPECT_EQ(ownProperties(editor.contents()), ownProperties(formOfTests()));
    EXPECT_EQ(ownProperties(formOfTests()).size(), 6U);
}

TEST_F(TheEditor, WritesTextsOfOneLineThatCanBeTranslated) {
    QWidget& widget = fresh();
    editor.change(widget, QStringLiteral("LNGSpreadField"), QStringLiteral("Column:"));
    EXPECT_TRUE(editor.contents().contains(u"<string>Column:</string>"));
    const QString code = compiled(editor.contents());
    EXPECT_TRUE(code.contains(u"setLNGSpreadField(QCoreApplication::translate("))
        << qPrintable(code);

    QDomDocument document;
    ASSERT_TRUE(document.setContent(plugin().domXml()));
    const auto texts = document.elementsByTagName(QStringLiteral("stringpropertyspecification"));
    EXPECT_EQ(texts.size(), 26);
    for (int i = 0; i < texts.size(); ++i)
        EXPECT_EQ(texts.at(i).toElement().attribute(QStringLiteral("type")), u"singleline");
}
