#include <Zandor/Library.h>
#include <Zandor/ZandorWidget.h>
#include <Zandor/model/Layout.h>
#include <Zandor/qt/Text.h>
#include <Zandor/qt/Twips.h>
#include <Zandor/sql/Builder.h>

#include <QLabel>

#include <gtest/gtest.h>

using namespace zandor;

// The parts between marks are shown in docs/embedding.md.

namespace {

// [text]
QString titleOf(const platform::Ref<model::Table>& table) {
    return platform::qt::toQt(table->Name()); // std::u16string to QString
}

void rename(model::Query& query, const platform::Ref<model::Table>& table, const QString& name) {
    query.renameTable(table, platform::qt::fromQt(name)); // and back
}
// [text]

// [twips]
QSize sizeOnScreen(TalvikZandorLib::ZDTable& table) {
    return {platform::qt::toPixels(static_cast<float>(table.Width())),
            platform::qt::toPixels(static_cast<float>(table.Height()))};
}

void move(TalvikZandorLib::ZDTable& table, QPoint pixels) {
    table.Left(platform::qt::toTwips(pixels.x()));
    table.Top(platform::qt::toTwips(pixels.y()));
}
// [twips]

// [showing]
/// Puts a table into the query that a designer shows.
void addTable(ZandorWidget& designer, model::Query& query, const model::TableDescription& table) {
    query.addTable(table);
    designer.showAnew();
}

/// Has the designer show another query, with nothing left of the one before.
void show(ZandorWidget& designer, const platform::Ref<model::Query>& query) {
    designer.setModel(query);
    designer.showAnew();
}
// [showing]

// [sql]
QString statementOf(model::Query& query) {
    using namespace model::sql;
    return platform::qt::toQt(statementText(query, Dialect::SQLite, ValueForm::literal).text);
}
// [sql]

// [errors]
bool join(model::Query& query, const platform::Ref<model::Column>& left,
          const platform::Ref<model::Column>& right, QString& why) {
    try {
        const auto join = platform::makeRef<model::Join>();
        join->LeftColumn(left);
        join->RightColumn(right);
        query.AddJoin(join);
        return true;
    } catch (const platform::RuntimeError& error) {
        why = platform::qt::toQt(error.Description);
        return false;
    }
}
// [errors]

const model::TableDescription orders = {
    .schema = {}, .name = u"orders", .columns = {{.name = u"id"}, {.name = u"customer"}}};

struct WhatThePageAboutEmbeddingShows : testing::Test {
    WhatThePageAboutEmbeddingShows() {
        designer.setDebugSwitch(0);
        designer.setOnlyJoin(false);
        designer.setModel(query);
    }
    QStringList shown() const {
        QStringList names;
        for (const auto& table : platform::Each<TalvikZandorLib::ZDTable>(query->Tables()))
            for (const auto* box : designer.findChildren<QWidget*>())
                if (box->objectName().startsWith("lstTable(") &&
                    box->accessibleName() == platform::qt::toQt(table->Name()))
                    names << box->accessibleName();
        return names;
    }

    platform::Ref<model::Query> query = platform::makeRef<model::Query>();
    model::Library library;
    ZandorWidget designer{library};
};

} // namespace

TEST_F(WhatThePageAboutEmbeddingShows, ConvertsTexts) {
    const auto table = query->addTable(orders);
    rename(*query, table, QStringLiteral("Aufträge 😀"));
    EXPECT_EQ(table->Name(), u"Aufträge 😀");
    EXPECT_EQ(titleOf(table), QStringLiteral("Aufträge 😀"));
}

TEST_F(WhatThePageAboutEmbeddingShows, ConvertsTwips) {
    const auto table = query->addTable(orders);
    table->Width(1500);
    table->Height(3000);
    EXPECT_EQ(sizeOnScreen(*table), QSize(100, 200));
    move(*table, {20, 10});
    EXPECT_EQ(table->Left(), 300);
    EXPECT_EQ(table->Top(), 150);
}

TEST_F(WhatThePageAboutEmbeddingShows, ShowsWhatTheHostHasChanged) {
    addTable(designer, *query, orders);
    EXPECT_EQ(shown(), QStringList{"orders"});
    query = platform::makeRef<model::Query>();
    show(designer, query);
    EXPECT_EQ(shown(), QStringList());
    EXPECT_EQ(designer.model(), query);
}

TEST_F(WhatThePageAboutEmbeddingShows, IsTheStatement) {
    query->addTable(orders);
    EXPECT_TRUE(statementOf(*query).contains("FROM orders")) << statementOf(*query).toStdString();
}

TEST_F(WhatThePageAboutEmbeddingShows, CatchesWhatAQueryRefuses) {
    const auto left = query->addTable(orders), right = query->addTable(orders);
    QString why;
    EXPECT_TRUE(join(*query, left->columnNamed(u"id"), right->columnNamed(u"customer"), why));
    EXPECT_FALSE(join(*query, left->columnNamed(u"id"), {}, why));
    EXPECT_EQ(why, QStringLiteral("Object variable or With block variable not set"));
    EXPECT_EQ(query->Joins().Count(), 1);
}
