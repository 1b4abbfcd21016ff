#include <Zandor/files/Messages.h>
#include <Zandor/model/Messages.h>
#include <Zandor/reader/Messages.h>

#include <gtest/gtest.h>

#include <array>
#include <set>
#include <vector>

using namespace zandor;

using model::Message;
using model::MessageCode;
using model::say;

namespace {

/// The rows of the tables of all houses.
std::vector<model::MessageText> allTexts() {
    std::vector<model::MessageText> all;
    all.insert(all.end(), std::begin(model::messageTexts), std::end(model::messageTexts));
    all.insert(all.end(), std::begin(files::messageTexts), std::end(files::messageTexts));
    all.insert(all.end(), std::begin(reader::messageTexts), std::end(reader::messageTexts));
    return all;
}

/// Shows where each text was put in.
platform::String marked(const char* english) { return u"<" + platform::fromUtf8(english) + u">"; }

} // namespace

TEST(TheTablesOfMessages, HaveOneCodeForEachText) {
    std::set<std::string> codes;
    for (const auto& [code, english] : allTexts()) {
        EXPECT_TRUE(codes.insert(code).second) << code << " stands twice";
        EXPECT_STRNE(english, "") << code;
    }
    EXPECT_GT(codes.size(), 150u);
}

TEST(TheTablesOfMessages, HaveEachPlaceUpToTheLast) {
    for (const auto& [code, english] : allTexts())
        for (std::size_t place = 1; place <= model::placesIn(english); ++place)
            EXPECT_NE(std::string(english).find('%' + std::to_string(place)), std::string::npos)
                << code << " has no %" << place;
}

TEST(AMessage, IsKnownByItsCode) {
    const Message message = say<MessageCode::nameEmpty>("/tables/0/name");
    EXPECT_TRUE(message.is(MessageCode::nameEmpty));
    EXPECT_FALSE(message.is(MessageCode::noTables));
    EXPECT_FALSE(message.is(reader::MessageCode::noDatabaseFile));
    EXPECT_EQ(message.code(), "nameEmpty");
    ASSERT_EQ(message.arguments().size(), 1u);
    EXPECT_EQ(message.arguments()[0], model::MessageArgument(u"/tables/0/name"));
    EXPECT_EQ(message, say<MessageCode::nameEmpty>(u"/tables/0/name"));
    EXPECT_NE(message, say<MessageCode::nameEmpty>(u"/tables/1/name"));
}

TEST(AMessage, SaysNothingWithoutACode) {
    EXPECT_EQ(Message().text(), u"");
    EXPECT_EQ(Message().code(), "");
    EXPECT_EQ(Message().words(marked), u"");
}

TEST(AMessage, HasMessagesInItsPlacesThatAreTranslatedToo) {
    const Message inner = say<MessageCode::incomparableColumn>(say<MessageCode::aNumber>());
    const Message message = say<MessageCode::badCriterion>(u"orders.id", 3, inner);
    EXPECT_EQ(message.text(),
              u"orders.id: At character 3: compare it with a column that holds a number.");
    EXPECT_EQ(message.words(marked),
              u"<orders.id: At character 3: <compare it with a column that holds <a number>>.>");
}

TEST(AMessage, KeepsNamesThatLookLikePlaces) {
    EXPECT_EQ(say<MessageCode::cartesianProduct>(u"%2", u"%1").text(),
              u"No join connects %2 with %1, so that every row of one comes with every row of the "
              u"other: draw a join between them, add the table that lies between, or delete one.");
}

TEST(AMessage, IsOneLineWhateverNamesAreInIt) {
    EXPECT_EQ(say<MessageCode::nameEmpty>(u"a\nb\u2028c").text(), u"a b c is empty");
}

TEST(AMessage, TakesBytesAsUtf8) {
    EXPECT_EQ(say<MessageCode::nameEmpty>("\xC3\xA4\xFF").text(), u"\u00e4\uFFFD is empty");
}
