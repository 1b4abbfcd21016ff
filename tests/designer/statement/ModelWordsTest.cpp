#include "designer/statement/ModelWords.h"

#include <Zandor/QueryDocument.h>
#include <Zandor/reader/Connection.h>
#include <Zandor/sql/Builder.h>
#include <Zandor/sql_reader/Messages.h>

#include <gtest/gtest.h>

#include <QCoreApplication>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>
#include <QTranslator>
#include <QXmlStreamReader>

#include <set>

using namespace zandor;

using designer::inWords;
using model::say;

namespace {

/// Turns every text into one that shows where it was put together.
class Marking final : public QTranslator {
public:
    Marking() { QCoreApplication::installTranslator(this); }
    ~Marking() override { QCoreApplication::removeTranslator(this); }
    bool isEmpty() const override { return false; }
    QString translate(const char* context, const char* text, const char*, int) const override {
        if (qstrcmp(context, "Model") != 0) return {};
        return u'<' + QString::fromUtf8(text) + u'>';
    }
};

std::set<std::string> textsOfTheTables() {
    std::set<std::string> texts;
    for (const auto& each : model::messageTexts) texts.insert(each.english);
    for (const auto& each : files::messageTexts) texts.insert(each.english);
    for (const auto& each : reader::messageTexts) texts.insert(each.english);
    for (const auto& each : sql_reader::messageTexts) texts.insert(each.english);
    return texts;
}

/// What lupdate takes from the sources of the model for the context "Model", as it is called for
/// the catalogues.
std::set<std::string> textsForTranslators() {
    const QTemporaryDir folder;
    const QString file = folder.filePath(QStringLiteral("texts.ts"));
    QStringList arguments = QStringLiteral(LUPDATE_OPTIONS).split(u' ');
    arguments << QStringLiteral(SOURCE_ROOT "/src/model") << QStringLiteral("-ts") << file;
    EXPECT_EQ(QProcess::execute(QStringLiteral(LUPDATE), arguments), 0);
    QFile found(file);
    EXPECT_TRUE(found.open(QIODevice::ReadOnly));
    std::set<std::string> texts;
    bool ours = false;
    for (QXmlStreamReader xml(&found); !xml.atEnd();) {
        if (xml.readNext() != QXmlStreamReader::StartElement) continue;
        if (xml.name() == QLatin1String("name"))
            ours = xml.readElementText() == QLatin1String("Model");
        else if (xml.name() == QLatin1String("source") && ours)
            texts.insert(xml.readElementText().toStdString());
    }
    return texts;
}

} // namespace

TEST(TheModelsWords, AreAllFoundByTheTranslatorsTool) {
    EXPECT_EQ(textsForTranslators(), textsOfTheTables());
}

TEST(TheModelsWords, AreTranslatedAroundTheNamesInThem) {
    const Marking translations;
    const auto query = platform::makeRef<model::Query>();
    const model::TableDescription table{u"", u"orders", {{u"id", model::ColumnType::Integer}}};
    query->addTable(table);
    query->addTable({u"", u"items", {{u"id", model::ColumnType::Integer}}});
    const auto findings = model::sql::validate(*query, model::sql::Dialect::SQLite);
    ASSERT_EQ(findings.size(), 1u);
    EXPECT_EQ(inWords(findings[0].message).toStdString(),
              "<No join connects items with orders, so that every row of one comes with every row "
              "of the other: draw a join between them, add the table that lies between, or delete "
              "one.>");
    EXPECT_EQ(findings[0].text(),
              u"No join connects items with orders, so that every row of one comes with every row "
              u"of the other: draw a join between them, add the table that lies between, or delete "
              u"one.");
}

TEST(TheModelsWords, AreTranslatedWithinOneAnother) {
    const Marking translations;
    const auto query = platform::makeRef<model::Query>();
    const auto table = query->addTable({u"", u"orders", {{u"id", model::ColumnType::Integer}}});
    const auto definition = platform::makeRef<model::ColumnDefinition>();
    definition->Column(table->columnNamed(u"id"));
    query->AddColumnDefinition(definition);
    definition->AddCriterium(u">", u"4");
    const auto findings = model::sql::validate(*query, model::sql::Dialect::SQLite);
    ASSERT_EQ(findings.size(), 1u);
    EXPECT_EQ(inWords(findings[0].message).toStdString(),
              "<orders.id: At character 2: <a number is missing>.>");
}

TEST(TheModelsWords, AreTranslatedForABrokenFile) {
    const Marking translations;
    const auto broken = files::fromJson("{\"format\": \"zandor-query\", \"version\": 2}");
    ASSERT_FALSE(broken);
    EXPECT_EQ(inWords(broken.failure()).toStdString(),
              "<</tables is missing>. <Mend the file there, or restore it from a copy>.>");
    const auto none = files::fromJson("[]");
    ASSERT_FALSE(none);
    EXPECT_EQ(inWords(none.failure()).toStdString(),
              "<<<The file> is not an object>. <Choose a query file>.>");
}

TEST(TheModelsWords, AreTranslatedAroundWhatTheSystemSays) {
    const Marking translations;
    const auto unread = files::loadQuery("/nowhere/a.json");
    ASSERT_FALSE(unread);
    EXPECT_EQ(unread.failure().reason(), "No such file or directory");
    EXPECT_EQ(inWords(unread.failure()).toStdString(),
              "<<The file \"/nowhere/a.json\" cannot be read> (No such file or directory); "
              "<check the path>.>");
}

TEST(TheModelsWords, AreTranslatedForAReader) {
    const Marking translations;
    const auto opened = reader::openSqlite(QStringLiteral("/nowhere/a.sqlite"));
    ASSERT_FALSE(opened);
    EXPECT_EQ(inWords(opened.failure()).toStdString(),
              "<There is no file \"/nowhere/a.sqlite\"; check the path.>");
    EXPECT_EQ(opened.error(), "There is no file \"/nowhere/a.sqlite\"; check the path.");
}

TEST(TheModelsWords, LeaveWordsOfOthersAsTheyStand) {
    EXPECT_EQ(inWords(reader::Error(QStringLiteral("near \"FORM\": syntax error"))),
              "near \"FORM\": syntax error");
    EXPECT_EQ(inWords(files::Error(std::string_view("no %1 lock"))), "no %1 lock");
}
