#include "Files.h"

#include "model/SmallQuery.h"

using namespace zandor;

using files::TypedStatement;
using model::sql::Dialect;
using platform::String;

// What somebody has typed for a query, and the query does not say, stays beside it in its file.

namespace {

files::QueryDocument with(const TypedStatement& typed) {
    files::QueryDocument document(SmallQuery().query);
    document.typed = typed;
    return document;
}

void expectKept(const String& text) {
    const auto loaded = documentOf(jsonOf(with({text, Dialect::SQLite})));
    ASSERT_TRUE(loaded.typed);
    EXPECT_TRUE(loaded.typed->text == text) << loaded.typed->text.size();
}

} // namespace

TEST(ATypedStatement, StandsInTheFileLineByLine) {
    const auto document = with({u"SELECT id,\n  rank() OVER ()\nFROM t", Dialect::PostgreSQL});
    const std::string text = jsonOf(document);
    EXPECT_NE(text.find(R"("typed": {"dialect": "postgresql", "text": )"
                        R"(["SELECT id,\n", "  rank() OVER ()\n", "FROM t"]},)"),
              std::string::npos)
        << text;
    const auto loaded = documentOf(text);
    EXPECT_EQ(loaded.typed, document.typed);
    EXPECT_EQ(loaded.query->record(), document.query->record());
    EXPECT_FALSE(loaded.unknown) << "it is known";
}

TEST(ATypedStatement, IsMissingWhereThereIsNone) {
    const std::string text = jsonOf(files::QueryDocument(SmallQuery().query));
    EXPECT_EQ(text.find("typed"), std::string::npos);
    EXPECT_FALSE(documentOf(text).typed);
}

TEST(ATypedStatement, IsKeptWhateverItsLines) {
    for (const char16_t* text : {u"", u"\n", u"\n\n x \n", u"a", u"a\r\n\u2028\u00a0b\t"})
        expectKept(text);
}

TEST(ATypedStatement, IsKeptWhateverTheLengthOfALine) {
    constexpr std::size_t most = 100'000; // of one text in a file
    for (const std::size_t length : {most - 1, most, most + 1, 10 * most + 7}) {
        expectKept(String(length, u'x'));
        expectKept(String(length, u'x') + u"\ny");
    }
    // A character of two halves is not parted.
    expectKept(String(most - 1, u'x') + u"\U0001F600 y");
    expectKept(String(most - 2, u'x') + u"\U0001F600 y");
}

TEST(ATypedStatement, KnowsEachDialect) {
    for (const Dialect dialect : model::sql::allDialects)
        EXPECT_EQ(documentOf(jsonOf(with({u"x", dialect}))).typed->dialect, dialect);
}

TEST(ATypedStatement, WithHalfACharacterIsNotSaved) {
    const auto text = files::toJson(with({u"a\nb" + String(1, char16_t{0xD800}), Dialect::SQLite}));
    EXPECT_EQ(text.error(),
              "/typed/text/1 has half a character in it (an unpaired surrogate). Type that text "
              "afresh and save again.");
}
