#include "Drawing.h"

#include "designer/document/Autosave.h"
#include "designer/document/QueryFile.h"

#include <QAction>
#include <QCoreApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QTemporaryDir>
#include <QUndoStack>

using namespace zandor;

using designer::Document;
using files::TypedStatement;
using model::sql::Dialect;

// A statement that is typed and not drawn belongs to the document.

namespace {

const Document::Typed one = TypedStatement{u"SELECT one", Dialect::SQLite};
const Document::Typed two = TypedStatement{u"SELECT two", Dialect::MySQL};

class ATypedText : public testing::Test {
protected:
    ATypedText() {
        QObject::connect(&document, &Document::modifiedChanged,
                         [this](bool modified) { told.push_back(modified); });
    }
    QString path(const char* name) const { return folder.filePath(QLatin1String(name)); }
    void describe(const platform::String& text) {
        document.change("Describe",
                        [&](model::Query& query) { query.options({.description = text}); });
    }
    platform::String described() { return document.query()->options().description; }

    QTemporaryDir folder;
    Document document;
    designer::QueryFile file{document};
    std::vector<bool> told;
};

} // namespace

TEST_F(ATypedText, ModifiesAndIsNoStep) {
    document.setTyped(one);
    EXPECT_TRUE(document.isModified());
    EXPECT_EQ(document.steps().count(), 0);
    document.setTyped({});
    EXPECT_FALSE(document.isModified()) << "it is as it was";
    EXPECT_EQ(told, (std::vector<bool>{true, false}));
}

TEST_F(ATypedText, IsSavedAndOpenedWithItsQuery) {
    describe(u"mine");
    document.setTyped(one);
    ASSERT_FALSE(file.saveAs(path("a.json")));
    EXPECT_FALSE(document.isModified());
    document.setTyped({});
    EXPECT_TRUE(document.isModified()) << "there is one in the file";
    ASSERT_FALSE(file.open(path("a.json")));
    EXPECT_EQ(document.typed(), one);
    EXPECT_EQ(described(), u"mine");
    EXPECT_FALSE(document.isModified());
    file.startNew();
    EXPECT_FALSE(document.typed());
}

TEST_F(ATypedText, IsGivenUpInAStepThatBringsItBack) {
    document.setTyped(one);
    document.giveUpTyped("Give up");
    EXPECT_FALSE(document.typed());
    EXPECT_FALSE(document.isModified()) << "nothing is lost with it that was there before";
    int heard = 0;
    QObject::connect(&document, &Document::typedChanged, [&] { ++heard; });
    document.undo();
    EXPECT_EQ(document.typed(), one);
    EXPECT_TRUE(document.isModified());
    EXPECT_EQ(heard, 1);
    document.redo();
    EXPECT_FALSE(document.typed());
    EXPECT_EQ(heard, 2);
}

TEST_F(ATypedText, ThatStandsThereWhenAnotherComesBackIsNotLost) {
    document.setTyped(one);
    document.giveUpTyped("Give up");
    document.setTyped(two);
    document.undo();
    EXPECT_EQ(document.typed(), one);
    document.redo();
    EXPECT_EQ(document.typed(), two);
    document.undo();
    EXPECT_EQ(document.typed(), one);
}

TEST_F(ATypedText, StaysWhileTheQueryIsChangedAndUndone) {
    document.setTyped(one);
    describe(u"a");
    document.undo();
    EXPECT_EQ(described(), u"");
    document.redo();
    EXPECT_EQ(described(), u"a");
    EXPECT_EQ(document.typed(), one);
}

TEST_F(ATypedText, ThatWasGivenUpLeavesOtherChangesToBeSaved) {
    describe(u"a");
    ASSERT_FALSE(file.saveAs(path("a.json")));
    document.setTyped(one);
    document.giveUpTyped("Give up");
    EXPECT_FALSE(document.isModified());
    describe(u"b");
    EXPECT_TRUE(document.isModified());
    document.undo();
    EXPECT_FALSE(document.isModified());
    document.undo(); // the text
    document.undo(); // what was saved
    EXPECT_TRUE(document.isModified());
    document.setTyped({});
    EXPECT_TRUE(document.isModified()) << "the query is another";
}

TEST_F(ATypedText, IsKeptSafe) {
    designer::Autosave autosave(document, file, path("autosave"), std::chrono::milliseconds(1));
    document.setTyped(one);
    ASSERT_FALSE(autosave.saveAtOnce());
    const QDir saved(path("autosave"));
    const auto names = saved.entryList({"*.autosave"}, QDir::Files);
    ASSERT_EQ(names.size(), 1);
    QFile content(saved.filePath(names[0]));
    ASSERT_TRUE(content.open(QIODevice::ReadOnly));
    const auto read = designer::Autosaved::read(content.readAll());
    ASSERT_TRUE(read);
    EXPECT_EQ(read->content.typed, one);

    Document other;
    designer::QueryFile recovered(other);
    recovered.recover({}, read->content);
    EXPECT_EQ(other.typed(), one);
    EXPECT_TRUE(other.isModified());
    document.giveUpTyped("Give up");
    EXPECT_TRUE(saved.entryList({"*.autosave"}, QDir::Files).isEmpty()) << "nothing is to be kept";
}
