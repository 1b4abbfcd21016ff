#include "Files.h"

#include <algorithm>
#include <random>

using namespace zandor;

namespace {

std::string valid() { return contentOf(testFile("version-2.json")); }

/// That a message is for a person: one line of printable characters, not too long, ended.
void expectOneLine(const std::string& message) {
    EXPECT_FALSE(message.empty());
    EXPECT_LT(message.size(), 400U) << message;
    EXPECT_TRUE(std::all_of(message.begin(), message.end(), [](char c) {
        return c >= 0x20 && c < 0x7f;
    })) << message;
    EXPECT_EQ(message.back(), '.');
}

std::string errorOf(const std::string& text) {
    const auto document = files::fromJson(text);
    EXPECT_FALSE(document);
    const std::string message = document.error();
    expectOneLine(message);
    return message;
}

std::string repeated(const std::string& part, std::size_t count) {
    std::string text;
    text.reserve(part.size() * count);
    for (std::size_t n = 0; n < count; ++n) text += part;
    return text;
}

/// A file with these tables and nothing else.
std::string withTables(const std::string& tables) {
    return R"({"format": "zandor-query", "version": 2, "lastKeys": {"table": 1000000, "column": )"
           R"(1000000, "join": 0, "definition": 0}, "joins": [], "definitions": [], "tables": [)" +
           tables + "]}";
}

std::string tableWithColumns(std::size_t number, std::size_t count) {
    const std::string n = std::to_string(number);
    std::string text = R"({"key": "t)" + n + R"(", "name": "t)" + n +
                       R"(", "source": {"name": "t"}, "columns": [)";
    for (std::size_t column = 0; column < count; ++column)
        text += (column ? R"(, {"name": "a", "key": "c)" : R"({"name": "*", "key": "c)") +
                std::to_string(number * count + column + 1) + "\"}";
    return text + "]}";
}

} // namespace

TEST(ATruncatedFile, IsRefusedWhereverItEnds) {
    const std::string text = valid();
    const auto end = text.find_last_of('}');
    for (std::size_t size = 0; size <= end; ++size) errorOf(text.substr(0, size));
}

TEST(AChangedFile, IsAnotherQueryOrRefusedWithOneLine) {
    const std::string text = valid();
    std::mt19937 random(1);
    const auto upTo = [&](std::size_t most) {
        return std::uniform_int_distribution<std::size_t>(0, most)(random);
    };
    std::size_t refused = 0;
    constexpr std::size_t changes = 5'000;
    for (std::size_t n = 0; n < changes; ++n) {
        std::string changed = text;
        for (std::size_t times = upTo(2) + 1; times > 0; --times) {
            const std::size_t at = upTo(changed.size() - 1);
            switch (upTo(3)) {
            case 0: changed[at] = static_cast<char>(upTo(255)); break;
            case 1: changed.erase(at, upTo(20) + 1); break;
            case 2: changed.insert(at, 1, "\"{}[],:0-e\\"[upTo(10)]); break;
            default: changed.insert(at, changed.substr(upTo(changed.size() - 1), upTo(80))); break;
            }
        }
        const auto document = files::fromJson(changed);
        if (document) {
            ASSERT_EQ(documentOf(jsonOf(*document)).query->record(), document->query->record());
        } else {
            expectOneLine(document.error());
            ++refused;
        }
    }
    EXPECT_GT(refused, changes / 2);
    EXPECT_LT(refused, changes);
}

TEST(AHostileFile, OfManyMegabytesOfBracketsIsRefusedAtTheDepthLimit) {
    EXPECT_EQ(errorOf(repeated("[", 6'000'000)).substr(0, 10), "/0/0/0/0/0");
    errorOf(repeated("{\"a\":", 1'000'000));
}

TEST(AHostileFile, OfManyValuesIsRefusedBeforeItTakesMuchMemory) {
    EXPECT_EQ(errorOf("[" + repeated("0,", 3'000'000) + "0]"),
              "/2000000 is one value too many: a file may have 2000000. Mend the file there, or "
              "restore it from a copy.");
    errorOf("[" + repeated("[],", 3'000'000) + "[]]");
}

TEST(AHostileFile, WithAnEndlessTextOrNumberOrNameIsRefused) {
    EXPECT_EQ(
        errorOf("{\"a\": \"" + std::string(3'000'000, 'x') + "\"}"),
        "/a is longer than 100000 characters. Mend the file there, or restore it from a copy.");
    errorOf("{\"" + std::string(3'000'000, 'x') + "\": 1}");
    errorOf("[" + std::string(3'000'000, '1') + "]");
    errorOf("[0." + std::string(3'000'000, '1') + "]");
    errorOf("{\"a\": \"" + std::string(3'000'000, 'x'));
}

TEST(AHostileFile, WithTooManyObjectsOfAKindIsRefused) {
    std::string tables = tableWithColumns(0, 1);
    tables.replace(tables.find("t0"), 2, "t1");
    EXPECT_EQ(
        errorOf(withTables(repeated(tables + ',', 1000) + tables)),
        "/tables has more than 1000 entries. Mend the file there, or restore it from a copy.");
    EXPECT_EQ(
        errorOf(withTables(tableWithColumns(1, 5001))),
        "/tables/0/columns has more than 5000 entries. Mend the file there, or restore it from "
        "a copy.");
    std::string many = tableWithColumns(1, 5000);
    for (std::size_t n = 2; n <= 21; ++n) many += ',' + tableWithColumns(n, 5000);
    EXPECT_EQ(errorOf(withTables(many)),
              "/tables/20/columns makes the columns of all tables more than 100000. Mend the file "
              "there, or restore it from a copy.");
}

TEST(TheWidestTable, LoadsAndIsSavedAgain) {
    const auto document = documentOf(withTables(tableWithColumns(1, 5000)));
    EXPECT_EQ(document.query->tableNamed(u"t1")->Columns().Count(), 5000);
    EXPECT_EQ(documentOf(jsonOf(document)).query->record(), document.query->record());
}

TEST(AFileThatIsRefused, LeavesTheQueryInMemoryAlone) {
    const auto document = documentOf(valid());
    const auto before = document.query->record();
    errorOf(valid().substr(0, 300));
    EXPECT_EQ(document.query->record(), before);
}
