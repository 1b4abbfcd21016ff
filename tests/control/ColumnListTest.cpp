#include "CanvasTest.h"

using namespace zandor;

namespace {

struct TheEntriesOfATableList : CanvasTest {
    TheEntriesOfATableList() {
        table(u"ORDERS", {u"ORDER_NUMBER", u"CUSTOMER"}, 600);
        bind();
    }

    TalvikTabulet::ColumnList& entries() { return element(1)->ColumnItems(); }
    std::int32_t errorOf(const std::function<void()>& body) {
        try {
            body();
        } catch (const platform::RuntimeError& error) {
            return error.Number;
        }
        return 0;
    }
};

TEST_F(TheEntriesOfATableList, SayTheirTextsAndKeysInTheirOrder) {
    const std::vector<std::pair<String, String>> all = {{u"same as the text", u"same as the text"},
                                                        {u"k", u"a text far longer than its key"},
                                                        {u"", u"without a key"},
                                                        {u"without a text", u""},
                                                        {u"", u""},
                                                        {u"na\u00EFve", u"\u00FF"},
                                                        {u"k2", u"\u65E5\u672C\u8A9E"},
                                                        {u"\u65E5\u672C", u"\u0100"},
                                                        {u"\u65E5", u"\u65E5"},
                                                        {u"half a letter", String(1, u'\xD800')},
                                                        {u"nul", String(2, u'\0')},
                                                        {u"last", u"LAST"}};
    for (const auto& [key, text] : all) {
        const auto made = entries().Add(key, text);
        EXPECT_EQ(made->Key(), key);
        EXPECT_EQ(made->Text(), text);
    }
    ASSERT_EQ(entries().Count(), 2 + static_cast<std::int32_t>(all.size()));
    std::int32_t position = 2;
    for (const auto& [key, text] : all) {
        const auto entry = entries().Item(++position);
        EXPECT_EQ(entry->Key(), key);
        EXPECT_EQ(entry->Text(), text);
        EXPECT_TRUE(entries().Reads(position, text));
        EXPECT_FALSE(entries().Reads(position, text + u"x"));
        EXPECT_FALSE(entries().Reads(position, u"\u6500" + text));
        EXPECT_FALSE(entries().Reads(position, key + u"y"));
    }
    EXPECT_EQ(entries().Item(1)->Text(), u"ORDER_NUMBER");
    EXPECT_FALSE(entries().Reads(1, u"ORDER_NUMBE"));
}

TEST_F(TheEntriesOfATableList, AreTheSameAsLongAsSomebodyHoldsThem) {
    auto first = entries().Item(1);
    const auto second = entries().Item(2);
    EXPECT_EQ(entries().Item(1), first);
    EXPECT_TRUE(entries().IsAt(1, *first));
    EXPECT_FALSE(entries().IsAt(2, *first));
    first->Selected(true);
    first = nullptr;
    EXPECT_TRUE(entries().Item(1)->Selected());
    EXPECT_TRUE(entries().IsAt(2, *second));
    const auto later = entries().Add(u"k", u"MADE_LATER");
    EXPECT_EQ(entries().Item(3), later);
}

TEST_F(TheEntriesOfATableList, AreThoseOfTheirOwnTable) {
    table(u"CUSTOMERS", {u"ORDER_NUMBER"}, 3000);
    bind();
    const auto entry = entries().Item(1);
    EXPECT_FALSE(element(2)->ColumnItems().IsAt(1, *entry));
    entries().Item(2)->Selected(true);
    EXPECT_EQ(selectedIn(1), std::vector<String>{u"CUSTOMER"});
    EXPECT_EQ(selectedIn(2), std::vector<String>{});
}

TEST_F(TheEntriesOfATableList, StandAtPositionsFromOneOn) {
    const auto entry = entries().Item(2);
    for (const std::int32_t position : {-1, 0, 3}) {
        EXPECT_EQ(errorOf([&] { entries().Item(position); }), 9) << position;
        EXPECT_EQ(errorOf([&] { entries().Reads(position, u"CUSTOMER"); }), 9) << position;
        EXPECT_EQ(errorOf([&] { entries().IsAt(position, *entry); }), 9) << position;
    }
}

TEST_F(TheEntriesOfATableList, SayWhatTheySaidWhenTheyHaveGone) {
    const auto asked = entries().Item(1);
    const auto neverAsked = entries().Item(2);
    neverAsked->Selected(true);
    EXPECT_EQ(asked->Text(), u"ORDER_NUMBER");
    const String key = asked->Key();

    element(1)->Terminate();
    EXPECT_EQ(entries().Count(), 0);
    const auto another = entries().Add(u"another", u"ANOTHER");
    EXPECT_FALSE(entries().IsAt(1, *asked));
    EXPECT_NE(entries().Item(1), asked);
    EXPECT_EQ(asked->Text(), u"ORDER_NUMBER");
    EXPECT_EQ(asked->Key(), key);
    EXPECT_FALSE(asked->Selected());
    EXPECT_EQ(neverAsked->Text(), u"CUSTOMER");
    EXPECT_TRUE(neverAsked->Selected());
    EXPECT_EQ(another->Text(), u"ANOTHER");
    EXPECT_FALSE(another->Selected());
}

} // namespace
