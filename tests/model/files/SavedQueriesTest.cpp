#include "Files.h"

#include "model/SmallQuery.h"
#include "support/FailingFiles.h"

#include <Zandor/files/SavedQueries.h>

#include <functional>

using namespace zandor;

// Saved queries in each other's files. What the designer makes of it, its own tests say.

namespace {

namespace fs = std::filesystem;

using platform::Ref;
using platform::toUtf8;

class SavedQueriesInFiles : public testing::Test {
protected:
    SavedQueriesInFiles() { fs::create_directory(folder / "below"); }

    static Ref<model::Query> reading(const platform::String& table) {
        auto query = platform::makeRef<model::Query>();
        query->addTable(SmallQuery::described(table));
        return query;
    }
    static void add(const Ref<model::Query>& query, const platform::String& name,
                    const fs::path& file) {
        const auto saved = files::readSavedQuery(file);
        ASSERT_TRUE(saved) << saved.error();
        query->addQuery(name, *saved);
    }
    /// A query that reads from a file.
    static Ref<model::Query> around(const fs::path& file) {
        auto query = platform::makeRef<model::Query>();
        add(query, u"inner", file);
        return query;
    }
    void save(const std::string& name, const Ref<model::Query>& query) {
        const auto error = files::saveQuery(folder / name, query);
        EXPECT_FALSE(error) << error->text();
    }
    static std::string columns(model::Query& query) {
        std::string all;
        for (const auto& column :
             platform::Each<TalvikZandorLib::ZDColumn>(query.Tables().Item(1)->Columns()))
            all += toUtf8(column->Name()) + ' ';
        return all;
    }

    TemporaryFolder folder;
};

} // namespace

TEST_F(SavedQueriesInFiles, AreNamedFromTheFolderOfTheFileThatTheyStandIn) {
    save("below/inner.json", reading(u"orders"));
    save("middle.json", around(folder / "below/inner.json"));
    save("below/outer.json", around(folder / "middle.json"));
    const std::string text = contentOf(folder / "below/outer.json");
    EXPECT_NE(text.find("\"file\": \"../middle.json\""), std::string::npos) << text;
    EXPECT_NE(text.find("\"file\": \"inner.json\""), std::string::npos) << text;

    const auto document = files::loadQuery(folder / "below/outer.json");
    ASSERT_TRUE(document) << document.error();
    const auto table = document->query->tableNamed(u"inner");
    EXPECT_EQ(toUtf8(table->savedQuery()->file), fs::canonical(folder / "middle.json").string());
    EXPECT_EQ(toUtf8(table->savedQuery()->record.tables.front().query->file),
              fs::canonical(folder / "below/inner.json").string());
}

TEST_F(SavedQueriesInFiles, LeaveTheirOwnDrawingBehind) {
    const auto inner = reading(u"orders");
    inner->tableNamed(u"orders")->Left(1500);
    save("inner.json", inner);
    const auto outer = around(folder / "inner.json");
    EXPECT_EQ(outer->tableNamed(u"inner")->savedQuery()->record.tables.front().left, -1);
    inner->tableNamed(u"orders")->Left(3000);
    save("inner.json", inner);
    EXPECT_TRUE(files::readSavedAgain(*outer).changed.empty());
}

TEST_F(SavedQueriesInFiles, AreTheSameHoweverTheyAreDrawn) {
    const auto inner = reading(u"orders");
    const auto definition = platform::makeRef<model::ColumnDefinition>();
    const auto table = inner->tableNamed(u"orders");
    definition->Column(table->columnNamed(u"id"));
    inner->AddColumnDefinition(definition);
    save("inner.json", inner);
    const auto outer = around(folder / "inner.json");
    const auto isTheSame = [&](const char* what, const std::function<void()>& change) {
        const auto before = inner->record();
        change();
        EXPECT_NE(inner->record(), before) << what;
        save("inner.json", inner);
        EXPECT_TRUE(files::readSavedAgain(*outer).changed.empty()) << what;
    };
    isTheSame("moved down", [&] { table->Top(1500); });
    isTheSame("made wider", [&] { table->Width(4500); });
    isTheSame("made higher", [&] { table->Height(4500); });
    isTheSame("selected", [&] { table->Selected(-1); });
    isTheSame("with a selected column", [&] { table->columnNamed(u"id")->Selected(true); });
    isTheSame("with a wider output column", [&] { definition->Width(3000); });
}

TEST_F(SavedQueriesInFiles, HaveNoFileWhereTheyNeverHadOne) {
    const auto outer = platform::makeRef<model::Query>();
    outer->addQuery(u"inner", {u"", reading(u"orders")->record()});
    EXPECT_TRUE(files::readSavedAgain(*outer).kept.empty());
    save("outer.json", outer);
    EXPECT_EQ(contentOf(folder / "outer.json").find("\"file\""), std::string::npos);
    const auto document = files::loadQuery(folder / "outer.json");
    ASSERT_TRUE(document) << document.error();
    EXPECT_EQ(document->query->tableNamed(u"inner")->savedQuery()->file, u"");
}

TEST_F(SavedQueriesInFiles, KeepTheNameOfAFileThatCannotBeFollowed) {
    save("inner.json", reading(u"orders"));
    save("outer.json", around(folder / "inner.json"));
    fs::remove(folder / "inner.json");
    fs::create_symlink("inner.json", folder / "inner.json"); // to itself
    const auto document = files::loadQuery(folder / "outer.json");
    ASSERT_TRUE(document) << document.error();
    EXPECT_EQ(fs::path(toUtf8(document->query->tableNamed(u"inner")->savedQuery()->file)),
              fs::canonical(folder / "") / "inner.json");
}

TEST_F(SavedQueriesInFiles, AreReadOnceHoweverManyReadFromThem) {
    save("inner.json", reading(u"orders"));
    const auto outer = around(folder / "inner.json");
    const auto calls = [&] {
        const FailingFiles counting(fs::canonical(folder / ""), 0);
        EXPECT_TRUE(files::readSavedAgain(*outer).kept.empty());
        return counting.calls();
    };
    const std::size_t once = calls();
    EXPECT_GT(once, 0U);
    add(outer, u"again", folder / "inner.json");
    EXPECT_LT(calls(), once + once / 2) << "its name is looked up again, and no more";
}

TEST_F(SavedQueriesInFiles, AreReadAgainWhereSomethingIsNew) {
    save("inner.json", reading(u"orders"));
    save("other.json", reading(u"orders"));
    const auto outer = around(folder / "inner.json");
    add(outer, u"other", folder / "other.json");
    const auto changed = reading(u"orders");
    changed->options({.first = 3});
    save("inner.json", changed);
    const auto again = files::readSavedAgain(*outer);
    EXPECT_EQ(again.changed, std::vector<platform::String>{u"inner"});
    EXPECT_TRUE(again.kept.empty());
    EXPECT_EQ(outer->tableNamed(u"inner")->savedQuery()->record.options.first, 3);
}

TEST_F(SavedQueriesInFiles, AreTakenAsTheyStandWhereAFileWithinIsLost) {
    save("inner.json", reading(u"orders"));
    save("outer.json", around(folder / "inner.json"));
    fs::remove(folder / "inner.json");
    const auto far = around(folder / "outer.json");
    EXPECT_EQ(columns(*far), "* id name ");
    const auto again = files::readSavedAgain(*far);
    EXPECT_TRUE(again.changed.empty());
    EXPECT_TRUE(again.kept.empty()); // its own file is there
    fs::remove(folder / "outer.json");
    ASSERT_EQ(files::readSavedAgain(*far).kept.size(), 1u);
    EXPECT_EQ(columns(*far), "* id name ");
}

TEST_F(SavedQueriesInFiles, NeverReadFromThemselvesByWayOfOthers) {
    save("a.json", reading(u"orders"));
    save("b.json", around(folder / "a.json"));
    save("c.json", around(folder / "b.json"));
    const auto refused = [&](const std::string& path, const std::string& into) {
        const auto saved = files::readSavedQuery(folder / path, folder / into);
        return saved ? std::string() : saved.error();
    };
    const std::string circle = " would read from itself, by itself or by way of the saved queries "
                               "in it: choose another one, or take one out.";
    EXPECT_EQ(refused("c.json", "a.json"),
              "The query \"" + fs::canonical(folder / "a.json").string() + '"' + circle);
    EXPECT_EQ(refused("a.json", "a.json"),
              "The query \"" + (folder / "a.json").string() + '"' + circle);
    EXPECT_EQ(refused("b.json", "c.json"), "");

    // Another program has closed the circle, and beside it something else is new.
    const auto c = around(folder / "b.json");
    save("d.json", reading(u"orders"));
    add(c, u"other", folder / "d.json");
    save("a.json", around(folder / "c.json"));
    save("d.json", reading(u"customers"));
    const auto again = files::readSavedAgain(*c, folder / "c.json");
    ASSERT_EQ(again.kept.size(), 1u);
    EXPECT_NE(again.kept.front().text().find(circle), std::string::npos);
    EXPECT_EQ(again.changed, std::vector<platform::String>{u"other"});
}

TEST_F(SavedQueriesInFiles, AreRefusedWithTheirFile) {
    save("empty.json", platform::makeRef<model::Query>());
    const auto path = (folder / "empty.json").string();
    EXPECT_EQ(
        files::readSavedQuery(path).error(),
        "The file \"" + path +
            "\" cannot be used: No column comes out of that query, so that it cannot stand as "
            "a table: give it output columns, and save it.");
}
