#include <Zandor/sql/Dialect.h>

#include "model/sql/ReservedWords.h"

#include <gtest/gtest.h>

#include <algorithm>

using namespace zandor;

using namespace model::sql;
using model::ColumnType;
using platform::toUtf8;

namespace {

std::string quoted(platform::StringView name, Dialect dialect) {
    return toUtf8(identifier(name, dialect));
}

std::string refused(const platform::String& name, Dialect dialect) {
    return toUtf8(cannotCarry(name, dialect).value_or(model::Message()).text());
}

std::string written(ColumnType type, platform::String text, Dialect dialect) {
    return toUtf8(literal({type, std::move(text)}, dialect));
}

} // namespace

TEST(AnIdentifier, StandsBareWhenItIsPlain) {
    for (const Dialect dialect : allDialects) {
        if (dialect == Dialect::Standard) continue;
        for (const auto* name : {u"orders", u"_x1", u"order_lines", u"a$b"})
            EXPECT_EQ(quoted(name, dialect), toUtf8(name));
    }
}

TEST(AnIdentifier, IsQuotedWhenItIsNot) {
    for (const auto* name : {u"", u"two words", u"1st", u"a.b", u"a-b", u"$a", u"a;b", u"a?b",
                             u"a\u00A0b", u"a\u00D7b", u"a\u0301"}) {
        const std::string text = toUtf8(name);
        EXPECT_EQ(quoted(name, Dialect::SQLite), '"' + text + '"');
        EXPECT_EQ(quoted(name, Dialect::PostgreSQL), '"' + text + '"');
        EXPECT_EQ(quoted(name, Dialect::Standard), '"' + text + '"');
        EXPECT_EQ(quoted(name, Dialect::MySQL), '`' + text + '`');
        EXPECT_EQ(quoted(name, Dialect::SqlServer), '[' + text + ']');
    }
}

TEST(AnIdentifier, StandsBareInTheLettersOfItsLanguage) {
    for (const auto* name : {u"größe", u"œuvre", u"μέτρο", u"цена", u"商品"})
        for (const Dialect dialect : {Dialect::SQLite, Dialect::MySQL})
            EXPECT_EQ(quoted(name, dialect), toUtf8(name));
    EXPECT_EQ(quoted(u"größe", Dialect::SqlServer), "[größe]");
    for (const auto* name : {u"größe", u"цена", u"商品"})
        EXPECT_EQ(quoted(name, Dialect::PostgreSQL), toUtf8(name));
    // Some of its databases fold these.
    for (const auto* name : {u"Größe", u"größE", u"grÖsse", u"Цена", u"œuvre"})
        EXPECT_EQ(quoted(name, Dialect::PostgreSQL), '"' + toUtf8(name) + '"');
}

// The norm reads a bare name in capitals.
TEST(AnIdentifier, StandsBareInTheStandardInCapitalsOnly) {
    for (const auto* name : {u"ORDERS", u"X1", u"ORDER_LINES"})
        EXPECT_EQ(quoted(name, Dialect::Standard), toUtf8(name));
    for (const auto* name : {u"orders", u"Orders", u"ORDER", u"_X", u"GRÖSSE", u"A$B", u"1X"})
        EXPECT_EQ(quoted(name, Dialect::Standard), '"' + toUtf8(name) + '"');
}

TEST(AnIdentifier, HasItsQuotationMarksDoubled) {
    EXPECT_EQ(quoted(u"a\"b`c]d[e", Dialect::SQLite), "\"a\"\"b`c]d[e\"");
    EXPECT_EQ(quoted(u"a\"b`c]d[e", Dialect::PostgreSQL), "\"a\"\"b`c]d[e\"");
    EXPECT_EQ(quoted(u"a\"b`c]d[e", Dialect::Standard), "\"a\"\"b`c]d[e\"");
    EXPECT_EQ(quoted(u"a\"b`c]d[e", Dialect::MySQL), "`a\"b``c]d[e`");
    EXPECT_EQ(quoted(u"a\"b`c]d[e", Dialect::SqlServer), "[a\"b`c]]d[e]");
}

TEST(AnIdentifier, KeepsItsCapitalsOnPostgres) {
    EXPECT_EQ(quoted(u"Orders", Dialect::PostgreSQL), "\"Orders\"");
    EXPECT_EQ(quoted(u"Orders", Dialect::SQLite), "Orders");
}

TEST(AnIdentifier, IsQuotedWhereItsDialectReservesIt) {
    for (const auto* name : {u"select", u"SELECT", u"Order", u"table"})
        for (const Dialect dialect : allDialects)
            EXPECT_NE(quoted(name, dialect), toUtf8(name)) << toUtf8(name);
    const auto onlyIn = [](const char16_t* name, std::vector<Dialect> reserving) {
        for (const Dialect dialect : allDialects) {
            const bool reserves =
                std::find(reserving.begin(), reserving.end(), dialect) != reserving.end();
            EXPECT_EQ(isReserved(name, dialect), reserves)
                << toUtf8(name) << " in " << toUtf8(nameOf(dialect));
        }
    };
    onlyIn(u"glob", {});
    onlyIn(u"ilike", {Dialect::PostgreSQL});
    onlyIn(u"TOP", {Dialect::SqlServer});
    onlyIn(u"rank", {Dialect::MySQL, Dialect::Standard});
    onlyIn(u"year", {Dialect::Standard});
    onlyIn(u"_latin1", {Dialect::MySQL});
    onlyIn(u"notnull", {Dialect::SQLite, Dialect::PostgreSQL});
    onlyIn(u"user", {Dialect::PostgreSQL, Dialect::SqlServer, Dialect::Standard});
    for (const auto* name : {u"name", u"status", u"title", u"quantity", u"city", u"selects", u""})
        onlyIn(name, {});
}

TEST(AName, IsNotCarriedWhenItIsTooLong) {
    const auto name = [](std::size_t length) { return platform::String(length, u'n'); };
    const std::string beginning = "The name \"" + std::string(40, 'n') + "…\" is too long for ";
    EXPECT_EQ(refused(name(63), Dialect::PostgreSQL), "");
    EXPECT_EQ(refused(name(64), Dialect::PostgreSQL),
              beginning + "PostgreSQL, which takes 63 bytes (one for a letter from A to Z, more "
                          "for most others): choose a shorter one.");
    EXPECT_EQ(refused(name(64), Dialect::MySQL), "");
    EXPECT_EQ(refused(name(65), Dialect::MySQL),
              beginning + "MySQL/MariaDB, which takes 64 characters: choose a shorter one.");
    EXPECT_EQ(refused(name(128), Dialect::SqlServer), "");
    EXPECT_EQ(refused(name(129), Dialect::SqlServer),
              beginning + "SQL Server, which takes 128 characters: choose a shorter one.");
    EXPECT_EQ(refused(name(129), Dialect::Standard),
              beginning + "Standard SQL, which takes 128 characters: choose a shorter one.");
    EXPECT_EQ(refused(name(5000), Dialect::SQLite), "");
}

TEST(AName, IsMeasuredInBytesOnPostgres) {
    EXPECT_EQ(refused(platform::String(31, u'ö') + u"n", Dialect::PostgreSQL), "");
    EXPECT_NE(refused(platform::String(32, u'ö'), Dialect::PostgreSQL), "");
    EXPECT_EQ(refused(platform::String(64, u'ö'), Dialect::MySQL), "");
}

TEST(AName, IsNotCarriedWithACharacterThatIsNone) {
    for (const Dialect dialect : allDialects) {
        const std::string who = toUtf8(nameOf(dialect));
        EXPECT_EQ(refused(platform::String(u"a\0b", 3), dialect),
                  who + " takes no name with the character zero in it: choose another one.");
        EXPECT_EQ(refused(u"", dialect), who + " takes no name that is empty: write one.");
        for (const platform::String& torn :
             {platform::String(u"a\xD83D"), platform::String(u"\xDE00z"),
              platform::String(u"\xD83D\xD83D\xDE00"),
              platform::String(u"\xD83D"
                               u"a"),
              platform::String(u"a\xDBFF"), platform::String(u"\xDFFF")})
            EXPECT_EQ(refused(torn, dialect),
                      who + " takes no name with half a character in it: type it afresh.");
    }
}

TEST(AName, IsCarriedWithTheFirstAndTheLastOfTheRareCharacters) {
    for (const auto* name : {u"\U00010000", u"\U000103FF", u"\U0010FC00", u"\U0010FFFF"})
        for (const Dialect dialect : {Dialect::SQLite, Dialect::PostgreSQL, Dialect::SqlServer})
            EXPECT_EQ(refused(name, dialect), "");
}

TEST(AName, IsNotCarriedByMySqlWhenItLiesBeyondTheBasicPlaneOrEndsWithABlank) {
    EXPECT_EQ(
        refused(u"a😀", Dialect::MySQL),
        "The name \"a😀\" has a rare character in it that MySQL/MariaDB does not take, such as "
        "an emoji: write it without.");
    EXPECT_EQ(
        refused(u"a ", Dialect::MySQL),
        "The name \"a \" ends with a blank, which MySQL/MariaDB does not take: write it without.");
    EXPECT_EQ(refused(u"a😀", Dialect::PostgreSQL), "");
}

TEST(AName, IsShortenedInAMessageBetweenTwoCharacters) {
    const platform::String name = platform::String(39, u'n') + u"😀" + platform::String(99, u'n');
    EXPECT_EQ(refused(name, Dialect::Standard),
              "The name \"" + std::string(39, 'n') +
                  "…\" is too long for Standard SQL, which takes 128 characters: choose a shorter "
                  "one.");
}

TEST(AName, OfFortyLettersStandsWholeInAMessage) {
    const platform::String name = platform::String(39, u'n') + u' ';
    EXPECT_EQ(refused(name, Dialect::MySQL),
              "The name \"" + toUtf8(name) +
                  "\" ends with a blank, which MySQL/MariaDB does not take: write it without.");
}

TEST(ALiteral, OfTextHasItsApostrophesDoubled) {
    const platform::String hostile = u"'; drop table x; --";
    for (const Dialect dialect :
         {Dialect::SQLite, Dialect::PostgreSQL, Dialect::MySQL, Dialect::Standard})
        EXPECT_EQ(written(ColumnType::Text, hostile, dialect), "'''; drop table x; --'");
    EXPECT_EQ(written(ColumnType::Text, hostile, Dialect::SqlServer), "N'''; drop table x; --'");
}

TEST(ALiteral, OfTextHasItsBackslashesDoubledOnMySqlOnly) {
    EXPECT_EQ(written(ColumnType::Text, u"a\\'", Dialect::MySQL), "'a\\\\'''");
    EXPECT_EQ(written(ColumnType::Text, u"a\\'", Dialect::PostgreSQL), "'a\\'''");
}

TEST(ALiteral, OfAMomentSaysWhatItIsWhereTheEngineKnows) {
    EXPECT_EQ(written(ColumnType::Date, u"2024-05-01", Dialect::SQLite), "'2024-05-01'");
    EXPECT_EQ(written(ColumnType::Date, u"2024-05-01", Dialect::PostgreSQL), "DATE '2024-05-01'");
    EXPECT_EQ(written(ColumnType::Time, u"10:30:00", Dialect::MySQL), "TIME '10:30:00'");
    EXPECT_EQ(written(ColumnType::Timestamp, u"2024-05-01 10:30:00", Dialect::Standard),
              "TIMESTAMP '2024-05-01 10:30:00'");
    EXPECT_EQ(written(ColumnType::Timestamp, u"2024-05-01 10:30:00", Dialect::SqlServer),
              "CAST('2024-05-01 10:30:00' AS datetime2)");
}

TEST(ALiteral, OfBytesIsInHexadecimalDigits) {
    EXPECT_EQ(written(ColumnType::Blob, u"0AFF", Dialect::SQLite), "X'0AFF'");
    EXPECT_EQ(written(ColumnType::Blob, u"0AFF", Dialect::PostgreSQL), "BYTEA '\\x0AFF'");
    EXPECT_EQ(written(ColumnType::Blob, u"0AFF", Dialect::MySQL), "X'0AFF'");
    EXPECT_EQ(written(ColumnType::Blob, u"0AFF", Dialect::SqlServer), "0x0AFF");
    EXPECT_EQ(written(ColumnType::Blob, u"", Dialect::Standard), "X''");
}

TEST(ALiteral, OfABooleanIsADigitOnSqlServer) {
    EXPECT_EQ(written(ColumnType::Boolean, u"true", Dialect::SqlServer), "1");
    EXPECT_EQ(written(ColumnType::Boolean, u"false", Dialect::SqlServer), "0");
    EXPECT_EQ(written(ColumnType::Boolean, u"true", Dialect::SQLite), "TRUE");
    EXPECT_EQ(written(ColumnType::Boolean, u"false", Dialect::Standard), "FALSE");
}

TEST(APlaceholder, IsAQuestionMarkWithItsTypeOnPostgres) {
    for (const Dialect dialect : allDialects)
        if (dialect != Dialect::PostgreSQL) {
            EXPECT_EQ(toUtf8(placeholder(ColumnType::Date, dialect)), "?");
        }
    EXPECT_EQ(toUtf8(placeholder(ColumnType::Date, Dialect::PostgreSQL)), "CAST(? AS date)");
    EXPECT_EQ(toUtf8(placeholder(ColumnType::Integer, Dialect::PostgreSQL)), "CAST(? AS bigint)");
    EXPECT_EQ(toUtf8(placeholder(ColumnType::Text, Dialect::PostgreSQL)), "?");
}

TEST(APattern, HasItsBracketsEscapedOnSqlServer) {
    EXPECT_EQ(toUtf8(likePattern(u"a[b]%", Dialect::SqlServer)), "a\\[b]%");
    EXPECT_EQ(toUtf8(likePattern(u"a[b]%", Dialect::SQLite)), "a[b]%");
}
