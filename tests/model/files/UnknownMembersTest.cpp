#include "Files.h"

#include "model/SmallQuery.h"

using namespace zandor;

// A file of a program that knows more than this one, changed by this one, is whole again there.

namespace {

/// A file that has something unknown in every object, each time with the object's path in it.
std::string everywhere() { return contentOf(testFile("everything-unknown.json")); }

std::size_t count(const std::string& text, const std::string& part) {
    std::size_t found = 0;
    for (auto at = text.find(part); at != std::string::npos; at = text.find(part, at + 1)) ++found;
    return found;
}

} // namespace

TEST(UnknownMembers, AreKeptAtEveryObjectByteForByte) {
    const std::string text = everywhere();
    EXPECT_EQ(count(text, "\"unknown"), 14U);
    EXPECT_EQ(jsonOf(documentOf(text)), text);
}

TEST(UnknownMembers, KeepNumbersThatNoMachineNumberHolds) {
    const std::string text = everywhere();
    for (const char* digits : {"123456789012345678901234567890", "1.10", "2.50e-300"})
        EXPECT_EQ(count(jsonOf(documentOf(text)), digits), 1U) << digits;
}

TEST(UnknownMembers, StayWithTheirObjectWhenOthersComeAndGo) {
    files::QueryDocument document = documentOf(everywhere());
    auto& query = *document.query;
    query.DeleteTable(query.tableNamed(u"customers"));
    query.addTable(SmallQuery::described(u"customers"));
    query.tableNamed(u"orders")->Left(1);
    const std::string text = jsonOf(document);
    EXPECT_EQ(count(text, "\"unknown at t1\""), 1U);
    EXPECT_EQ(count(text, "\"unknown at c2\""), 1U);
    EXPECT_EQ(count(text, "\"unknown at t2\""), 0U);
    EXPECT_EQ(count(text, "\"unknown at j1\""), 0U);
}

TEST(UnknownMembers, ComeBackWithAnObjectThatIsPutBack) {
    files::QueryDocument document = documentOf(everywhere());
    const auto join = document.query->Joins().Item(1);
    document.query->Joins().Remove(join->Key());
    EXPECT_EQ(count(jsonOf(document), "\"unknown at j1\""), 0U);
    document.query->AddJoin(join);
    EXPECT_EQ(jsonOf(document), everywhere());
}

TEST(UnknownMembers, AreKeptInSavedQueriesToo) {
    const std::string text =
        jsonOf(documentOf(contentOf(testFile("unknown-in-saved-queries.json"))));
    EXPECT_EQ(count(text, "\"unknown"), 6U) << text;
    EXPECT_EQ(jsonOf(documentOf(text)), text);
    files::QueryDocument document = documentOf(text);
    document.query->DeleteTable(document.query->tableNamed(u"some"));
    EXPECT_EQ(count(jsonOf(document), "\"unknown"), 1U);
}
