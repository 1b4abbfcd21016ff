#include "control/ShellFixture.h"
#include "support/PublicInterface.h"

#include <Zandor/Interface.h>

using namespace zandor;

using platform::Variant;
using TalvikDBxZandor::automation::Member;
using TalvikDBxZandor::automation::members;

namespace {

const Member& memberNamed(platform::StringView name) {
    for (const Member& member : members())
        if (member.name == name) return member;
    throw std::logic_error(platform::toUtf8(name));
}

/// A value of the type of another, and another one than it.
Variant otherThan(const Variant& value) {
    if (const auto* flag = std::get_if<bool>(&value)) return !*flag;
    if (const auto* number = std::get_if<std::int16_t>(&value))
        return static_cast<std::int16_t>(*number + 1);
    return std::get<platform::String>(value) + u"\u00DC";
}

Variant promisedDefault(const promised::Field& field) {
    if (const auto* text = std::get_if<promised::Text>(&field.byDefault))
        return platform::String(*text);
    if (const auto* flag = std::get_if<bool>(&field.byDefault)) return *flag;
    return std::get<std::int16_t>(field.byDefault);
}

class TheFields : public AControl {};

/// Name by name the plain members among the property procedures, with their defaults.
struct Plain {
    platform::StringView name;
    Variant byDefault;
};
const Plain plainProperties[] = {
    {u"JoinModifyDisabled", std::int16_t{0}},
    {u"UseJoinTypeNormal", true},
    {u"UseJoinTypeLeft", true},
    {u"UseJoinTypeRight", true},
    {u"UseJoinTypeBoth", true},
    {u"UseJoinCompareOperatorEquals", true},
    {u"UseJoinCompareOperatorNotEquals", true},
    {u"UseJoinCompareOperatorLess", true},
    {u"UseJoinCompareOperatorGreater", true},
    {u"UseJoinCompareOperatorLessEquals", true},
    {u"UseJoinCompareOperatorGreaterEquals", true},
};

class ThePlainProperties : public AControl {
protected:
    Variant get(platform::StringView name) { return memberNamed(name).get(zandor()); }
    void set(platform::StringView name, const Variant& value) {
        memberNamed(name).set(zandor(), value);
    }

    /// The names of the plain properties that do not have their default.
    std::vector<platform::String> changed() {
        std::vector<platform::String> names;
        for (const Plain& plain : plainProperties)
            if (get(plain.name) != plain.byDefault) names.emplace_back(plain.name);
        return names;
    }
};

} // namespace

TEST_F(TheFields, HaveTheirDefaults) {
    for (const promised::Field& field : promised::fields)
        EXPECT_TRUE(memberNamed(field.name).get(zandor()) == promisedDefault(field))
            << platform::toUtf8(field.name);
}

TEST_F(TheFields, KeepWhatIsSetEachForItself) {
    for (const promised::Field& field : promised::fields) {
        const Variant value = otherThan(promisedDefault(field));
        memberNamed(field.name).set(zandor(), value);
        for (const promised::Field& each : promised::fields) {
            const bool reached = &each <= &field;
            const Variant expected =
                reached ? otherThan(promisedDefault(each)) : promisedDefault(each);
            EXPECT_TRUE(memberNamed(each.name).get(zandor()) == expected)
                << platform::toUtf8(each.name) << " after " << platform::toUtf8(field.name);
        }
    }
    EXPECT_TRUE(stage->transcript.empty()) << "nothing happens when one is set";
}

TEST_F(TheFields, RefuseAValueOfAnotherType) {
    for (const promised::Field& field : promised::fields) {
        const Member& member = memberNamed(field.name);
        try {
            member.set(zandor(), std::int32_t{1});
            ADD_FAILURE() << platform::toUtf8(field.name) << " took it";
        } catch (const platform::RuntimeError& error) {
            EXPECT_EQ(error.Number, 13);
        }
        EXPECT_TRUE(member.get(zandor()) == promisedDefault(field));
    }
}

TEST_F(ThePlainProperties, HaveTheirDefaults) { EXPECT_TRUE(changed().empty()); }

TEST_F(ThePlainProperties, KeepWhatIsSetEachForItself) {
    for (const Plain& plain : plainProperties) {
        set(plain.name, otherThan(plain.byDefault));
        EXPECT_EQ(changed(), std::vector<String>{String(plain.name)});
        set(plain.name, plain.byDefault);
        EXPECT_TRUE(changed().empty());
    }
}

TEST_F(ThePlainProperties, TakeTheDebugSwitchAtItsFullRange) {
    set(u"DebugSwitch", std::int16_t{-32768});
    EXPECT_EQ(zandor().DebugSwitch(), -32768);
    set(u"DebugSwitch", std::int16_t{0});
    EXPECT_EQ(zandor().DebugSwitch(), 0);
}

TEST(TheDebugSwitch, IsOneInANewControl) {
    fake::Library library;
    EXPECT_EQ(Stage::open(library)->control().DebugSwitch(), 1);
}

TEST_F(ThePlainProperties, ShareTheFlagOfLessOrEqualUnderTwoNames) {
    zandor().UseJoinCompareOperatorLE(false);
    EXPECT_FALSE(zandor().UseJoinCompareOperatorLessEquals());
    EXPECT_EQ(changed(), std::vector<String>{u"UseJoinCompareOperatorLessEquals"});
    zandor().UseJoinCompareOperatorLessEquals(true);
    EXPECT_TRUE(zandor().UseJoinCompareOperatorLE());
    zandor().UseJoinCompareOperatorLessEquals(false);
    EXPECT_FALSE(zandor().UseJoinCompareOperatorLE());
}

TEST_F(ThePlainProperties, ShareTheFlagOfGreaterOrEqualUnderTwoNames) {
    zandor().UseJoinCompareOperatorGE(false);
    EXPECT_FALSE(zandor().UseJoinCompareOperatorGreaterEquals());
    EXPECT_EQ(changed(), std::vector<String>{u"UseJoinCompareOperatorGreaterEquals"});
    zandor().UseJoinCompareOperatorGreaterEquals(true);
    EXPECT_TRUE(zandor().UseJoinCompareOperatorGE());
    zandor().UseJoinCompareOperatorGreaterEquals(false);
    EXPECT_FALSE(zandor().UseJoinCompareOperatorGE());
}

TEST_F(ThePlainProperties, GiveNothingForTheObjectsOfTheEvents) {
    EXPECT_EQ(get(u"lastjoin"), Variant(platform::Ref<TalvikZandorLib::ZDJoin>()));
    EXPECT_EQ(get(u"activetable"), Variant(platform::Ref<TalvikZandorLib::ZDTable>()));
    EXPECT_EQ(get(u"ActiveColumn"), Variant(platform::Ref<TalvikZandorLib::ZDColumn>()));
}

TEST_F(ThePlainProperties, HandTheModelOverAndBackThroughTheTable) {
    const auto model = library.newModel();
    model->table(u"ORDERS", {u"ID"});
    const platform::Ref<TalvikZandorLib::Zandor> given = model;
    set(u"Zandor", given);
    EXPECT_TRUE(stage->exists("lstTable(1)"));
    EXPECT_EQ(get(u"Zandor"), Variant(given));
}

TEST_F(ThePlainProperties, RefuseAModelThatIsNoneThroughTheTable) {
    const auto model = library.newModel();
    const auto table = model->table(u"ORDERS", {u"ID"});
    const platform::Ref<TalvikZandorLib::Zandor> given = model;
    set(u"Zandor", given);
    const Variant strangers[] = {platform::Ref<TalvikZandorLib::ZDTable>(table),
                                 std::shared_ptr<void>(std::make_shared<int>(3)), true,
                                 platform::String(u"ORDERS"), Variant()};
    for (const Variant& stranger : strangers) {
        try {
            set(u"Zandor", stranger);
            ADD_FAILURE() << stranger.index();
        } catch (const platform::RuntimeError& error) {
            EXPECT_EQ(error.Number, 13) << stranger.index();
        }
    }
    EXPECT_EQ(get(u"Zandor"), Variant(given));
}

TEST_F(ThePlainProperties, HaveTheMethodsBesideThemInTheTable) {
    const auto model = library.newModel();
    const auto orders = model->table(u"ORDERS", {u"ID", u"TOTAL"});
    const auto parts = model->table(u"PARTS", {u"ID"});
    bind(model);
    const auto call = [&](platform::StringView name, std::vector<Variant> arguments) {
        memberNamed(name).invoke(zandor(), arguments);
    };
    call(u"SetCurrentTable", {platform::String(u"PARTS")});
    EXPECT_EQ(parts->selected, 1);
    call(u"SelectColumnNames", {platform::String(u"ORDERS"), platform::String(u"TOTAL")});
    EXPECT_TRUE(orders->column(u"TOTAL").selected);
    call(u"Terminate", {});
    EXPECT_FALSE(stage->exists("lstTable(1)"));
    for (const Member& member : members())
        EXPECT_EQ(member.invoke != nullptr,
                  member.kind == TalvikDBxZandor::automation::Kind::method)
            << platform::toUtf8(member.name);
}

TEST_F(ThePlainProperties, HaveMethodsBesideThemThatRefuseOtherArguments) {
    const auto model = library.newModel();
    model->table(u"ORDERS", {u"ID"});
    bind(model);
    for (const Member& member : members()) {
        if (!member.invoke) continue;
        const auto errorWith = [&](const std::vector<Variant>& arguments) {
            try {
                member.invoke(zandor(), arguments);
            } catch (const platform::RuntimeError& error) {
                return error.Number;
            }
            return 0;
        };
        const std::size_t count = member.parameters.size();
        EXPECT_EQ(errorWith(std::vector<Variant>(count + 1, platform::String())), 450);
        if (count == 0) continue;
        EXPECT_EQ(errorWith(std::vector<Variant>(count - 1, platform::String())), 450);
        EXPECT_EQ(errorWith(std::vector<Variant>(count, true)), 13);
    }
    EXPECT_TRUE(stage->exists("lstTable(1)")) << "and nothing is called then";
}

TEST_F(ThePlainProperties, RaiseErrorForNoModelThroughTheTable) {
    set(u"Zandor", std::shared_ptr<void>());
    ASSERT_EQ(stage->raised.size(), 1U);
    EXPECT_EQ(stage->raised[0].event, TalvikDBxZandor::Event::Error);
}
