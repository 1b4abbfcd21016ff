#include "Drawing.h"

#include "designer/document/FileDialogs.h"
#include "designer/document/QueryFile.h"
#include "designer/document/RecentFiles.h"
#include "designer/tables/MissingTables.h"
#include "designer/tables/SavedQueryCommands.h"

#include <Zandor/QueryDocument.h>

#include <gmock/gmock.h>

#include <QFile>
#include <QSettings>

using namespace zandor;

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

namespace {

class SavedQueriesOfTheDrawing : public Drawing {
protected:
    SavedQueriesOfTheDrawing() {
        area.setWindowTitle("[*]");
        QObject::connect(&commands, &designer::SavedQueryCommands::refused,
                         [this](const QString& why) { refused << why; });
        QObject::connect(&commands, &designer::SavedQueryCommands::noted,
                         [this](const QString& what) { noted << what; });
        openSample();
    }

    /// A query file with the ids of a table in it, and of some column more.
    QString saved(const QString& name, const char16_t* column = u"") {
        model::Query inner;
        const auto orders = database.reader().table({u"", u"orders"});
        const auto table = inner.addTable(*orders);
        for (const platform::StringView each : {platform::StringView(u"id"), {column}}) {
            if (each.empty()) continue;
            const auto definition = platform::makeRef<model::ColumnDefinition>();
            definition->Column(table->columnNamed(each));
            inner.AddColumnDefinition(definition);
        }
        return save(name, model::Query::restored(inner.record()));
    }
    QString save(const QString& name, const platform::Ref<model::Query>& query) {
        const QString path = folder.path(name);
        EXPECT_FALSE(files::saveQuery(path.toStdString(), query));
        return path;
    }
    std::string columns(const char16_t* table) {
        std::string all;
        for (const auto& column :
             platform::Each<TalvikZandorLib::ZDColumn>(query().tableNamed(table)->Columns()))
            all += platform::toUtf8(column->Name()) + ' ';
        return all;
    }

    DatabaseFolder folder;
    designer::QueryFile file{document};
    QSettings settings{folder.path("settings"), QSettings::IniFormat};
    designer::RecentFiles recent{settings, QStringLiteral("queries")};
    designer::FileDialogs dialogs{document, file, recent, area};
    designer::SavedQueryCommands commands{document, file, dialogs, adding, nullptr};
    QStringList noted;
};

} // namespace

TEST_F(SavedQueriesOfTheDrawing, StandThereAsTablesByAStep) {
    add({QStringLiteral("customers")});
    EXPECT_FALSE(commands.readAgain.isEnabled());
    commands.add(saved("late ones.json", u"customer_id"));
    EXPECT_THAT(refused, IsEmpty());
    EXPECT_EQ(added.back(), "late ones");
    EXPECT_EQ(columns(u"late ones"), "* id customer_id ");
    EXPECT_EQ(document.steps().undoText(), "Add query late ones");
    EXPECT_TRUE(commands.readAgain.isEnabled());
    const QRect own = place("late ones");
    EXPECT_GT(own.width(), 0);
    EXPECT_FALSE(own.intersects(place("customers")));
    document.undo();
    EXPECT_EQ(query().Tables().Count(), 1);
    EXPECT_FALSE(commands.readAgain.isEnabled());
}

TEST_F(SavedQueriesOfTheDrawing, AreJoinedByNoForeignKey) {
    commands.add(saved("orders.json"));
    add({QStringLiteral("customers")});
    EXPECT_THAT(joins(), IsEmpty());
    add({QStringLiteral("orders")});
    EXPECT_THAT(joins(), ElementsAre("orders_1.customer_id = customers.id"));
}

TEST_F(SavedQueriesOfTheDrawing, AreRefusedWhereNothingCanBeReadFromThem) {
    commands.add(folder.path("gone.json"));
    commands.add(save("empty.json", platform::makeRef<model::Query>()));
    ASSERT_EQ(refused.size(), 2);
    EXPECT_THAT(refused[0].toStdString(), HasSubstr("gone.json\" cannot be read"));
    EXPECT_THAT(refused[1].toStdString(), HasSubstr("No column comes out of that query"));
    EXPECT_EQ(query().Tables().Count(), 0);
    EXPECT_EQ(document.steps().count(), 0);
}

TEST_F(SavedQueriesOfTheDrawing, NeverReadFromThemselves) {
    commands.add(saved("inner.json"));
    ASSERT_FALSE(file.saveAs(folder.path("outer.json")));
    commands.add(folder.path("outer.json"));
    ASSERT_EQ(refused.size(), 1);
    EXPECT_EQ(refused[0], "The query \"" + folder.path("outer.json") +
                              "\" would read from itself, by itself or by way of the saved queries "
                              "in it: choose another one, or take one out.");
    // The one inside is given the one outside.
    file.startNew();
    commands.add(folder.path("outer.json"));
    ASSERT_FALSE(file.saveAs(folder.path("inner.json")));
    refused.clear();
    ASSERT_FALSE(file.open(folder.path("outer.json")));
    const auto before = query().record();
    commands.followFiles();
    EXPECT_EQ(noted.size(), 1);
    EXPECT_THAT(noted.value(0).toStdString(), HasSubstr("would read from itself"));
    EXPECT_EQ(query().record(), before);
}

TEST_F(SavedQueriesOfTheDrawing, FollowTheirFilesAsOneStep) {
    commands.add(saved("inner.json"));
    ASSERT_FALSE(file.saveAs(folder.path("outer.json")));
    commands.followFiles();
    EXPECT_FALSE(document.isModified());
    saved("inner.json", u"status");
    ASSERT_FALSE(file.open(folder.path("outer.json")));
    EXPECT_EQ(columns(u"inner"), "* id ");
    commands.followFiles();
    EXPECT_EQ(columns(u"inner"), "* id status ");
    EXPECT_TRUE(document.isModified());
    EXPECT_EQ(document.steps().undoText(), "Read saved queries again");
    EXPECT_THAT(noted, IsEmpty());
    document.undo();
    EXPECT_EQ(columns(u"inner"), "* id ");
    commands.readAgain.trigger();
    commands.readAgain.trigger();
    EXPECT_THAT(noted,
                ElementsAre("Read again: inner.", "The saved queries are as they are here."));
}

TEST_F(SavedQueriesOfTheDrawing, FollowFilesThatTheirOwnFileReadsFrom) {
    commands.add(saved("inner.json"));
    const auto definition = platform::makeRef<model::ColumnDefinition>();
    definition->Column(query().tableNamed(u"inner")->Columns().Item(1));
    query().AddColumnDefinition(definition);
    ASSERT_FALSE(file.saveAs(folder.path("middle.json")));
    file.startNew();
    commands.add(folder.path("middle.json"));
    EXPECT_EQ(columns(u"middle"), "* id ");
    saved("inner.json", u"status");
    commands.readAgain.trigger();
    EXPECT_EQ(columns(u"middle"), "* id status ");
}

TEST_F(SavedQueriesOfTheDrawing, StayWhenTheirFileIsLost) {
    designer::MissingTables missing(document, database, area);
    commands.add(saved("inner.json"));
    ASSERT_FALSE(file.saveAs(folder.path("outer.json")));
    ASSERT_TRUE(QFile::remove(folder.path("inner.json")));
    ASSERT_FALSE(file.open(folder.path("outer.json")));
    commands.followFiles();
    ASSERT_EQ(noted.size(), 1);
    EXPECT_THAT(noted[0].toStdString(), HasSubstr("inner.json\" cannot be read"));
    EXPECT_EQ(columns(u"inner"), "* id ");
    EXPECT_FALSE(document.isModified());
}

TEST_F(SavedQueriesOfTheDrawing, AreFoundFromTheFolderOfTheirFile) {
    commands.add(saved("inner.json"));
    ASSERT_FALSE(file.saveAs(folder.path("outer.json")));
    QFile text(folder.path("outer.json"));
    ASSERT_TRUE(text.open(QIODevice::ReadOnly));
    EXPECT_THAT(text.readAll().toStdString(), HasSubstr("\"file\": \"inner.json\""));
    ASSERT_FALSE(file.open(folder.path("outer.json")));
    EXPECT_EQ(query().tableNamed(u"inner")->savedQuery()->file,
              folder.path("inner.json").toStdU16String());
}
