#include <gmock/gmock.h>

#include <QFile>
#include <QFileInfo>
#include <QProcess>
#include <QRegularExpression>
#include <QTemporaryDir>
#include <QXmlStreamReader>

#include <set>

using testing::ContainerEq;

namespace {

const QString folder = QStringLiteral(SOURCE_ROOT "/src/designer/translations/");

struct Message {
    QString context;
    QString source;
    bool numerus = false;
    QString state; ///< "unfinished" and the like; empty: done
    QStringList translations;
};

QString pathOf(const QString& language) { return folder + "zandor_designer_" + language + ".ts"; }

QByteArray contentOf(const QString& path) {
    QFile file(path);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << path.toStdString();
    return file.readAll();
}

std::vector<Message> messagesIn(const QString& path) {
    QXmlStreamReader xml(contentOf(path));
    std::vector<Message> result;
    QString context;
    while (!xml.atEnd()) {
        if (xml.readNext() != QXmlStreamReader::StartElement) continue;
        const auto name = xml.name();
        if (name == u"name") context = xml.readElementText();
        if (name == u"message")
            result.push_back({context, {}, xml.attributes().value("numerus") == u"yes", {}, {}});
        if (name == u"source") result.back().source = xml.readElementText();
        if (name == u"translation") {
            result.back().state = xml.attributes().value("type").toString();
            if (!result.back().numerus) result.back().translations << xml.readElementText();
        }
        if (name == u"numerusform") result.back().translations << xml.readElementText();
    }
    EXPECT_FALSE(xml.hasError()) << xml.errorString().toStdString();
    return result;
}

std::set<std::string> sourcesIn(const QString& path) {
    std::set<std::string> result;
    for (const Message& message : messagesIn(path))
        result.insert((message.context + ": " + message.source).toStdString());
    return result;
}

QStringList sortedMatches(const QString& text, const QString& pattern) {
    QStringList result;
    for (auto all = QRegularExpression(pattern).globalMatch(text); all.hasNext();)
        result << all.next().captured();
    result.sort();
    return result;
}

class TheTranslations : public testing::TestWithParam<const char*> {
protected:
    TheTranslations() : messages(messagesIn(pathOf(QString::fromLatin1(GetParam())))) {
        for (const Message& message : messages)
            if (message.state.isEmpty()) finished.push_back(message);
    }

    const std::vector<Message> messages;
    std::vector<Message> finished;
};

} // namespace

TEST_P(TheTranslations, AreFinished) {
    EXPECT_FALSE(messages.empty());
    for (const Message& message : messages) {
        EXPECT_EQ(message.state.toStdString(), "")
            << message.context.toStdString() << ": " << message.source.toStdString();
        EXPECT_FALSE(message.translations.isEmpty()) << message.source.toStdString();
        for (const QString& text : message.translations)
            EXPECT_FALSE(text.isEmpty()) << message.source.toStdString();
    }
}

TEST_P(TheTranslations, HaveThePlaceholdersOfTheirSource) {
    for (const Message& message : finished)
        for (const QString& text : message.translations)
            EXPECT_EQ(sortedMatches(text, "%(L?\\d|n)"),
                      sortedMatches(message.source, "%(L?\\d|n)"))
                << message.source.toStdString() << "\n"
                << text.toStdString();
}

TEST_P(TheTranslations, HaveTheMnemonicsOfTheirSource) {
    for (const Message& message : finished)
        for (const QString& text : message.translations)
            EXPECT_EQ(sortedMatches(text, "&(?=[\\p{L}\\d])").size(),
                      sortedMatches(message.source, "&(?=[\\p{L}\\d])").size())
                << message.source.toStdString() << "\n"
                << text.toStdString();
}

TEST_P(TheTranslations, EndAsTheirSourceDoes) {
    for (const Message& message : finished) {
        if (message.source.size() < 4) continue; // an abbreviation
        for (const QString& text : message.translations)
            for (const char16_t end : {u'.', u':', u'\u2026', u'\n', u'?'})
                EXPECT_EQ(text.endsWith(end), message.source.endsWith(end))
                    << message.source.toStdString() << "\n"
                    << text.toStdString();
    }
}

INSTANTIATE_TEST_SUITE_P(OfEveryLanguage, TheTranslations, testing::Values("de", "fr", "es", "en"),
                         [](const auto& info) { return std::string(info.param); });

TEST(TheTranslations, KnowWhatTheSourcesSay) {
    const QTemporaryDir copies;
    const QString copy = copies.filePath("zandor_designer_de.ts");
    ASSERT_TRUE(QFile::copy(pathOf("de"), copy));
    QProcess lupdate;
    lupdate.setWorkingDirectory(QStringLiteral(SOURCE_ROOT));
    lupdate.setProcessChannelMode(QProcess::MergedChannels);
    lupdate.start(LUPDATE, {"-I", "src", "-I", "src/frontends/qt/include", "-no-ui-lines",
                            "-locations", "none", "-no-obsolete", "-source-language", "en",
                            "-extensions", "cpp,h,def", "-tr-function-alias",
                            "QT_TRANSLATE_NOOP+=ZANDOR_TEXT", "src/designer", "src/frontends/qt",
                            "src/model", "-ts", copy});
    ASSERT_TRUE(lupdate.waitForFinished(120000));
    ASSERT_EQ(lupdate.exitCode(), 0);
    EXPECT_THAT(sourcesIn(copy), ContainerEq(sourcesIn(pathOf("de"))))
        << "Build the target update-translations, and translate what is new.";
    // A text of such a class is kept under its name, and looked for under that of another.
    const QRegularExpression lost("(\\S+):\\d+: Class '(\\S+)' lacks Q_OBJECT macro");
    const QString said = QString::fromUtf8(lupdate.readAll());
    for (auto all = lost.globalMatch(said); all.hasNext();) {
        const auto one = all.next();
        const QByteArray source = contentOf(one.captured(1));
        EXPECT_TRUE(source.contains("translate(\"" + one.captured(2).toUtf8() + '"') ||
                    source.contains("#include \"designer/tr.h\"")) // which looks for it there
            << one.captured().toStdString();
    }
}
