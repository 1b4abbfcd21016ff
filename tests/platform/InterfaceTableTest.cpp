#include "support/PublicInterface.h"

#include <Zandor/Interface.h>

#include <gtest/gtest.h>

using namespace zandor;

using namespace TalvikDBxZandor;
using automation::Kind;
using automation::Member;
using automation::Setter;
using automation::Type;

namespace {

std::span<const Member> table() { return automation::members(); }

constexpr std::size_t fieldCount = std::size(promised::fields);
constexpr std::size_t propertyCount = std::size(promised::properties);

Type typeOf(const promised::Field& field) {
    constexpr Type types[] = {Type::String, Type::Boolean, Type::Integer};
    return types[field.byDefault.index()];
}

platform::String parametersOf(const Member& method) {
    platform::String text;
    for (const automation::Parameter& parameter : method.parameters) {
        if (!text.empty()) text += u", ";
        text += parameter.name;
        if (parameter.byReference) text += u"&";
    }
    return text;
}

} // namespace

TEST(TheInterfaceTable, HasEveryMemberAndEventOnce) {
    EXPECT_EQ(table().size(), 37U + 25U + 3U);
    EXPECT_EQ(automation::events().size(), 10U);
}

TEST(TheInterfaceTable, BeginsWithTheFields) {
    ASSERT_GE(table().size(), fieldCount);
    for (std::size_t i = 0; i < fieldCount; ++i) {
        const Member& row = table()[i];
        const promised::Field& field = promised::fields[i];
        EXPECT_EQ(row.dispatchId, field.dispatchId);
        EXPECT_EQ(row.name, field.name);
        EXPECT_EQ(row.kind, Kind::field) << platform::toUtf8(row.name);
        EXPECT_EQ(row.type, typeOf(field)) << platform::toUtf8(row.name);
        EXPECT_EQ(row.setter, Setter::byValue) << platform::toUtf8(row.name);
        EXPECT_TRUE(row.get && row.set) << platform::toUtf8(row.name);
        EXPECT_TRUE(row.parameters.empty());
    }
}

TEST(TheInterfaceTable, GoesOnWithThePropertyProceduresAndTheNamesTheyReport) {
    ASSERT_GE(table().size(), fieldCount + propertyCount);
    for (std::size_t i = 0; i < propertyCount; ++i) {
        const Member& row = table()[fieldCount + i];
        const promised::Property& property = promised::properties[i];
        EXPECT_EQ(row.dispatchId, property.dispatchId);
        EXPECT_EQ(row.name, property.name);
        EXPECT_EQ(row.kind, Kind::property) << platform::toUtf8(row.name);
        EXPECT_EQ(row.type, property.type) << platform::toUtf8(row.name);
        EXPECT_EQ(row.setter, property.setter) << platform::toUtf8(row.name);
        EXPECT_EQ(row.getterReport, property.getterReport);
        EXPECT_EQ(row.setterReport, property.setterReport);
        EXPECT_TRUE(row.get) << platform::toUtf8(row.name);
        EXPECT_EQ(row.set != nullptr, property.setter != Setter::none)
            << platform::toUtf8(row.name);
        EXPECT_TRUE(row.parameters.empty());
    }
}

TEST(TheInterfaceTable, EndsWithTheMethods) {
    ASSERT_EQ(table().size(), fieldCount + propertyCount + std::size(promised::methods));
    for (std::size_t i = 0; i < std::size(promised::methods); ++i) {
        const Member& row = table()[fieldCount + propertyCount + i];
        const promised::Method& method = promised::methods[i];
        EXPECT_EQ(row.dispatchId, method.dispatchId);
        EXPECT_EQ(row.name, method.name);
        EXPECT_EQ(row.kind, Kind::method) << platform::toUtf8(row.name);
        EXPECT_EQ(row.type, Type::none) << platform::toUtf8(row.name);
        EXPECT_EQ(parametersOf(row), method.parameters);
        EXPECT_FALSE(row.get || row.set) << platform::toUtf8(row.name);
    }
}

TEST(TheInterfaceTable, HasTheEventsUnderTheirNumbers) {
    ASSERT_EQ(automation::events().size(), std::size(promised::events));
    for (std::size_t i = 0; i < std::size(promised::events); ++i) {
        const automation::EventMember& row = automation::events()[i];
        const promised::Event& event = promised::events[i];
        EXPECT_EQ(static_cast<std::int16_t>(row.number), event.number);
        EXPECT_EQ(row.name, event.name);
        EXPECT_EQ(row.arguments, event.carries) << platform::toUtf8(row.name);
    }
}
