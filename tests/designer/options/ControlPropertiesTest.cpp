#include "designer/options/ControlProperties.h"
#include "designer/options/ControlOptions.h"
#include "designer/options/ControlTexts.h"

#include "designer/DrawingArea.h"
#include "designer/document/Document.h"
#include "support/PublicInterface.h"

#include <gmock/gmock.h>

#include <QSettings>
#include <QTemporaryDir>

using namespace zandor;

using designer::ControlOptions;
using designer::ControlProperty;
using testing::Contains;
using testing::UnorderedElementsAre;

namespace {

QString toQt(std::u16string_view text) {
    return QString::fromUtf16(text.data(), static_cast<qsizetype>(text.size()));
}

const ControlProperty& property(const char* name) {
    for (const ControlProperty& one : designer::controlProperties())
        if (one.name == QLatin1String(name)) return one;
    throw std::runtime_error(std::string("no property ") + name);
}

class TheOptions : public testing::Test {
protected:
    ControlOptions kept(const ControlOptions& options) {
        {
            QSettings settings(file(), QSettings::IniFormat);
            options.write(settings);
        }
        return ControlOptions::read(QSettings(file(), QSettings::IniFormat));
    }
    QString file() const { return folder.filePath("settings.ini"); }

    QTemporaryDir folder;
};

} // namespace

TEST(ThePropertiesOnOffer, AreAllOfTheInterfaceThatIsNotItsState) {
    std::vector<std::string> others;
    const auto look = [&](std::u16string_view name) {
        const auto& all = designer::controlProperties();
        if (std::none_of(all.begin(), all.end(), [&](const ControlProperty& one) {
                return one.name == toQt(name) || one.also == toQt(name);
            }))
            others.push_back(toQt(name).toStdString());
    };
    for (const auto& field : promised::fields) look(field.name);
    for (const auto& member : promised::properties) look(member.name);
    EXPECT_THAT(others, UnorderedElementsAre("MXHorzFrameSize", "MXVertFrameSize", "DeletedTable",
                                             "VisibleFrameLeft", "VisibleFrameTop", "Zandor",
                                             "HorizMaxScrollPos", "VertMaxScrollPos",
                                             "HorizontalScrollbarPos", "VerticalScrollbarPos",
                                             "lastjoin", "activetable", "ActiveColumn"));
}

TEST(ThePropertiesOnOffer, AreAllPutIntoWords) {
    for (const ControlProperty& one : designer::controlProperties())
        EXPECT_NE(designer::wordsFor(one), one.name) << one.name.toStdString();
}

TEST(ThePropertiesOnOffer, HaveTheControlsOwnTextsInEnglishButSpeltRight) {
    std::map<std::string, std::string> expected;
    for (const auto& field : promised::fields)
        if (const auto* text = std::get_if<promised::Text>(&field.byDefault);
            text && field.name != u"DeletedTable")
            expected[toQt(field.name).toStdString()] = toQt(*text).toStdString();
    std::map<std::string, std::string> texts;
    for (const auto& text : designer::controlTexts::all())
        texts[text.property] = QString(text.english).remove('&').toStdString();
    for (auto& [property, text] : expected) std::erase(text, '&');
    expected["LNGJoinForm"] = "Join Definition";
    expected["LNGMnuDelCol"] = "Delete Column";
    EXPECT_EQ(texts, expected);
    EXPECT_EQ(texts.size(), 25U);
}

TEST(ThePropertiesOnOffer, GiveEachEntryOfTheMenuALetterOfItsOwn) {
    std::set<QChar> letters;
    for (const auto& text : designer::controlTexts::all()) {
        if (!QByteArray(text.property).startsWith("LNGMnu")) continue;
        const QString words = text.english;
        ASSERT_EQ(words.count('&'), 1) << text.english;
        EXPECT_TRUE(letters.insert(words[words.indexOf('&') + 1].toLower()).second) << text.english;
    }
    EXPECT_EQ(letters.size(), 7U);
}

TEST(ThePropertiesOnOffer, HaveATextInEachLanguage) {
    for (const char* code : {"de", "fr", "es"}) {
        std::set<QString> all;
        for (const auto& text : designer::controlTexts::all())
            all.insert(designer::controlTexts::inLanguage(text, code));
        EXPECT_EQ(all.size(), 25U) << code;
    }
    const auto& first = designer::controlTexts::all().front();
    EXPECT_EQ(designer::controlTexts::inLanguage(first, "en"), "Join Definition");
}

TEST_F(TheOptions, LetTheUserChangeJoinsAndShowNoTraces) {
    const QVariantMap properties = ControlOptions().properties();
    EXPECT_EQ(properties.value("JoinModifyDisabled"), QVariant(1));
    EXPECT_EQ(properties.value("DebugSwitch"), QVariant(0));
    EXPECT_EQ(properties.value("OnlyJoin"), QVariant(false));
    EXPECT_EQ(properties.value("UseJoinTypeNormal"), QVariant(true));
    EXPECT_EQ(properties.value("LNGJoinForm"), QVariant("Join Definition"));
}

TEST_F(TheOptions, AreKeptInTheSettings) {
    ControlOptions options;
    options.choose(property("LNGMnuDelTable"), "Away with it; \"now\"");
    options.choose(property("LNGMnuSep1Vis"), false);
    options.choose(property("DebugSwitch"), true);
    EXPECT_EQ(kept(options), options);
    const QVariantMap properties = kept(options).properties();
    EXPECT_EQ(properties.value("LNGMnuDelTable"), QVariant("Away with it; \"now\""));
    EXPECT_EQ(properties.value("LNGMnuSep1Vis"), QVariant(false));
    EXPECT_EQ(properties.value("DebugSwitch"), QVariant(1));
}

TEST_F(TheOptions, LeaveNothingInTheSettingsWhenAllIsAsByDefault) {
    ControlOptions options;
    options.choose(property("LNGMnuDelTable"), "Away with it");
    kept(options);
    options.choose(property("LNGMnuDelTable"), "Delete &Table");
    kept(options);
    EXPECT_EQ(QSettings(file(), QSettings::IniFormat).allKeys(), QStringList());
}

TEST_F(TheOptions, IgnoreSettingsOfAnotherKind) {
    QSettings settings(file(), QSettings::IniFormat);
    settings.setValue("control/LNGMnuDelTable", QStringList{"a", "b"});
    settings.setValue("control/DebugSwitch", QStringList{"a", "b"});
    EXPECT_EQ(ControlOptions::read(settings), ControlOptions());
}

TEST_F(TheOptions, SetBothNamesOfAPropertyThatHasTwo) {
    ControlOptions options;
    options.choose(property("UseJoinCompareOperatorGreaterEquals"), false);
    EXPECT_EQ(options.properties().value("UseJoinCompareOperatorGE"), QVariant(false));
    EXPECT_EQ(options.properties().value("UseJoinCompareOperatorGreaterEquals"), QVariant(false));
    EXPECT_EQ(options.properties().value("UseJoinCompareOperatorLE"), QVariant(true));
}

TEST_F(TheOptions, ReachTheControl) {
    ControlOptions options;
    for (const ControlProperty& one : designer::controlProperties()) {
        if (one.page == ControlProperty::Page::texts)
            options.choose(one, one.name + u'!');
        else
            options.choose(one, !one.byDefault.toBool());
    }
    options.choose(property("DebugSwitch"), false); // no boxes in a test
    designer::Document document;
    designer::DrawingArea area(document);
    area.setOptions(options.properties());
    for (const ControlProperty& one : designer::controlProperties())
        for (const QString& name : {one.name, one.also}) {
            if (name.isEmpty()) continue;
            EXPECT_EQ(area.control().property(name.toLatin1()), options.value(one))
                << name.toStdString();
        }
}
