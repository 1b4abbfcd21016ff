#include "designer/statement/ModelWords.h"

#include <gtest/gtest.h>

#include <QCoreApplication>
#include <QDirIterator>
#include <QFile>
#include <QRegularExpression>
#include <QTranslator>

using namespace zandor;

using designer::inWords;

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

/// What the sources of a folder say in texts of their own that begin in a certain way.
QStringList textsOf(const QString& folder, const QString& beginning) {
    const QRegularExpression texts("[u({ ]\"(" + beginning + "[^\"\\\\]*)");
    QStringList result;
    QDirIterator files(QStringLiteral(SOURCE_ROOT "/src/model/") + folder, {"*.cpp"});
    while (files.hasNext()) {
        QFile file(files.next());
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        QString source = QString::fromUtf8(file.readAll());
        source.replace(QRegularExpression("\"\\s*u?\""), ""); // a text in two pieces
        for (auto all = texts.globalMatch(source); all.hasNext();) result << all.next().captured(1);
    }
    return result;
}

bool isKnown(const QString& text) {
    static const QRegularExpression placeholder(QStringLiteral("\\\\%[1-9]"));
    for (const QString& message : designer::knownMessages()) {
        if (message.contains(text)) return true;
        const QString shape = QRegularExpression::escape(message).replace(placeholder, ".");
        if (QRegularExpression(QRegularExpression::anchoredPattern(shape)).match(text).hasMatch())
            return true;
    }
    return false;
}

} // namespace

TEST(TheModelsWords, AreTranslatedAroundTheNamesInThem) {
    const Marking translations;
    EXPECT_EQ(inWords("Two output columns are named id, so that nobody can tell them apart: give "
                      "one of them a synonym.")
                  .toStdString(),
              "<Two output columns are named id, so that nobody can tell them apart: give one of "
              "them a synonym.>");
    EXPECT_EQ(inWords("No join connects a with b, so that every row of one comes with every row of "
                      "the other: draw a join between them, or delete one.")
                  .toStdString(),
              "<No join connects a with b, so that every row of one comes with every row of the "
              "other: draw a join between them, or delete one.>");
}

TEST(TheModelsWords, AreTranslatedWithinOneAnother) {
    const Marking translations;
    EXPECT_EQ(inWords("orders.id: At character 3: a number is missing.").toStdString(),
              "<orders.id: At character 3: <a number is missing>.>");
    EXPECT_EQ(
        inWords("a.b: At character 1: compare it with a column that holds a text.").toStdString(),
        "<a.b: At character 1: <compare it with a column that holds <a text>>.>");
}

TEST(TheModelsWords, AreTranslatedAroundWhatTheEngineSays) {
    const Marking translations;
    EXPECT_EQ(
        inWords("The database \"a.db\" cannot be opened (Connection refused (111)): check the "
                "name of the host.")
            .toStdString(),
        "<<The database \"a.db\" cannot be opened> (Connection refused (111)): <check the name "
        "of the host>.>");
}

TEST(TheModelsWords, KeepNamesThatLookLikePlaceholders) {
    EXPECT_EQ(
        inWords("No join connects %2 with %1, so that every row of one comes with every row of "
                "the other: draw a join between them, or delete one.")
            .toStdString(),
        "No join connects %2 with %1, so that every row of one comes with every row of the other: "
        "draw a join between them, or delete one.");
}

TEST(TheModelsWords, LeaveWhatNobodyKnows) {
    const Marking translations;
    EXPECT_EQ(inWords("near \"FORM\": syntax error"), "near \"FORM\": syntax error");
}

TEST(TheModelsWords, AreAllKnown) {
    const QStringList said = textsOf("criteria", "[A-Za-z]+ [^\"]");
    EXPECT_GE(said.size(), 35);
    for (QString text : said) {
        if (text.endsWith(", as in [")) text.chop(1); // the names in brackets are put in
        if (text.startsWith("At character ")) continue;
        EXPECT_TRUE(isKnown(text)) << text.toStdString();
    }
    for (const QString& text : textsOf("reader", "(open|check|see that|ask|give|the file) "))
        EXPECT_TRUE(isKnown(text)) << text.toStdString();
    const QStringList sentences = textsOf("sql", "(The|These|Two|No|PostgreSQL|MySQL/MariaDB) ");
    EXPECT_GE(sentences.size(), 9);
    for (const QString& text : sentences) EXPECT_TRUE(isKnown(text)) << text.toStdString();
}
