#include "support/FakeModel.h"

#include <Zandor/Interface.h>
#include <Zandor/ZandorWidget.h>
#include <Zandor/qt/Text.h>

#include <QMetaMethod>
#include <QMetaProperty>

#include <gtest/gtest.h>

#include <algorithm>
#include <set>

using namespace zandor;

using namespace TalvikDBxZandor;
using automation::Carries;
using automation::Kind;
using automation::Member;
using automation::Setter;
using automation::Type;

namespace {

using Names = std::set<std::string>;

const QMetaObject& meta() { return ZandorWidget::staticMetaObject; }

QMetaType qtTypeOf(Type type) {
    switch (type) {
    case Type::String: return QMetaType::fromType<QString>();
    case Type::Boolean: return QMetaType::fromType<bool>();
    case Type::Integer: return QMetaType::fromType<int>();
    case Type::Zandor: return QMetaType::fromType<ZandorWidget::ZandorModel>();
    case Type::ZDJoin: return QMetaType::fromType<ZandorWidget::ZDJoin>();
    case Type::ZDTable: return QMetaType::fromType<ZandorWidget::ZDTable>();
    case Type::ZDColumn: return QMetaType::fromType<ZandorWidget::ZDColumn>();
    case Type::none: break;
    }
    return {};
}

std::vector<QMetaType> qtTypesOf(Carries carries) {
    switch (carries) {
    case Carries::nothing: return {};
    case Carries::definition: return {QMetaType::fromType<ZandorWidget::ZDColumnDefinition>()};
    case Carries::join: return {QMetaType::fromType<ZandorWidget::ZDJoin>()};
    case Carries::textAndNumber:
        return {QMetaType::fromType<QString>(), QMetaType::fromType<int>()};
    }
    return {};
}

std::vector<QMetaType> parameterTypes(const QMetaMethod& method) {
    std::vector<QMetaType> types;
    for (int i = 0; i < method.parameterCount(); ++i) types.push_back(method.parameterMetaType(i));
    return types;
}

/// The widget's own methods of one kind.
std::vector<QMetaMethod> methodsOf(QMetaMethod::MethodType kind) {
    std::vector<QMetaMethod> methods;
    for (int i = meta().methodOffset(); i < meta().methodCount(); ++i)
        if (meta().method(i).methodType() == kind) methods.push_back(meta().method(i));
    return methods;
}

QMetaMethod methodNamed(QMetaMethod::MethodType kind, const std::string& name) {
    for (const QMetaMethod& method : methodsOf(kind))
        if (method.name().toStdString() == name) return method;
    ADD_FAILURE() << "the widget has no " << name;
    return {};
}

Names namesOf(const std::vector<QMetaMethod>& methods) {
    Names names;
    for (const QMetaMethod& method : methods)
        EXPECT_TRUE(names.insert(method.name().toStdString()).second) << method.name().data();
    return names;
}

Names memberNames(bool methods) {
    Names names;
    for (const Member& member : automation::members())
        if ((member.kind == Kind::method) == methods) names.insert(platform::toUtf8(member.name));
    return names;
}

/// What a member holds, as the widget's property of the same name should hold it.
QVariant heldBy(const Member& member, Zandor& zandor) {
    const platform::Variant value = member.get(zandor);
    if (const auto* text = std::get_if<platform::String>(&value)) return platform::qt::toQt(*text);
    if (const auto* flag = std::get_if<bool>(&value)) return *flag;
    return int{std::get<std::int16_t>(value)};
}

QVariant otherThan(const QVariant& value) {
    if (value.typeId() == QMetaType::QString) return value.toString() + QStringLiteral("\u00DC");
    if (value.typeId() == QMetaType::Bool) return !value.toBool();
    return value.toInt() + 1;
}

bool isPlain(const Member& member) {
    return member.type == Type::String || member.type == Type::Boolean ||
           member.type == Type::Integer;
}

/// A widget with its traces off.
class TheWidget : public testing::Test {
protected:
    TheWidget() { widget.control().DebugSwitch(0); }

    fake::Library library;
    ZandorWidget widget{library};
};

} // namespace

TEST_F(TheWidget, HasEveryPropertyOfTheInterfaceAndNoOther) {
    Names properties;
    for (int i = meta().propertyOffset(); i < meta().propertyCount(); ++i)
        properties.insert(meta().property(i).name());
    EXPECT_EQ(properties, memberNames(false));
}

TEST_F(TheWidget, HasItsPropertiesInTheTypesAndWithTheSettersOfTheInterface) {
    for (const Member& member : automation::members()) {
        if (member.kind == Kind::method) continue;
        const std::string name = platform::toUtf8(member.name);
        const QMetaProperty property = meta().property(meta().indexOfProperty(name.c_str()));
        EXPECT_EQ(property.metaType(), qtTypeOf(member.type)) << name;
        EXPECT_TRUE(property.isReadable()) << name;
        EXPECT_EQ(property.isWritable(), member.setter != Setter::none) << name;
    }
}

TEST_F(TheWidget, HasEveryMethodOfTheInterfaceAndNoOther) {
    EXPECT_EQ(namesOf(methodsOf(QMetaMethod::Method)), memberNames(true));
    EXPECT_TRUE(methodsOf(QMetaMethod::Slot).empty());
}

TEST_F(TheWidget, TakesTheParametersOfTheMethodsUnderTheirNames) {
    for (const Member& member : automation::members()) {
        if (member.kind != Kind::method) continue;
        const QMetaMethod method = methodNamed(QMetaMethod::Method, platform::toUtf8(member.name));
        ASSERT_EQ(method.parameterCount(), static_cast<int>(member.parameters.size()))
            << method.name().data();
        for (int i = 0; i < method.parameterCount(); ++i) {
            const automation::Parameter& parameter = member.parameters[static_cast<std::size_t>(i)];
            EXPECT_EQ(method.parameterNames().at(i).toStdString(),
                      platform::toUtf8(parameter.name));
            EXPECT_EQ(method.parameterMetaType(i), QMetaType::fromType<QString>());
        }
        EXPECT_EQ(method.returnMetaType(), QMetaType::fromType<void>());
    }
}

TEST_F(TheWidget, HasEveryEventOfTheInterfaceAsASignalAndNoOther) {
    Names events;
    for (const auto& event : automation::events()) events.insert(platform::toUtf8(event.name));
    // What stands beside the interface begins with a small letter.
    Names raised = namesOf(methodsOf(QMetaMethod::Signal));
    std::erase_if(raised, [](const std::string& name) { return name[0] >= 'a'; });
    EXPECT_EQ(raised, events);
    EXPECT_TRUE(std::none_of(events.begin(), events.end(),
                             [](const std::string& name) { return name[0] >= 'a'; }));
}

TEST_F(TheWidget, CarriesInItsSignalsWhatTheEventsCarry) {
    for (const auto& event : automation::events()) {
        const QMetaMethod signal = methodNamed(QMetaMethod::Signal, platform::toUtf8(event.name));
        EXPECT_EQ(parameterTypes(signal), qtTypesOf(event.arguments)) << signal.name().data();
    }
}

TEST_F(TheWidget, ReadsEachPropertyFromTheMemberOfItsName) {
    for (const Member& member : automation::members()) {
        if (!isPlain(member)) continue;
        const std::string name = platform::toUtf8(member.name);
        EXPECT_EQ(widget.property(name.c_str()), heldBy(member, widget.control())) << name;
    }
}

TEST_F(TheWidget, WritesEachPropertyToTheMemberOfItsName) {
    for (const Member& member : automation::members()) {
        if (!isPlain(member)) continue;
        const std::string name = platform::toUtf8(member.name);
        const QVariant before = heldBy(member, widget.control());
        const QVariant wanted = otherThan(before);
        EXPECT_TRUE(widget.setProperty(name.c_str(), wanted)) << name;
        EXPECT_EQ(heldBy(member, widget.control()), wanted) << name;
        EXPECT_EQ(widget.property(name.c_str()), wanted) << name;
        widget.setProperty(name.c_str(), before);
    }
}

TEST_F(TheWidget, HandsTheModelOverAndBackAsAProperty) {
    const ZandorWidget::ZandorModel model = library.newModel();
    EXPECT_TRUE(widget.setProperty("Zandor", QVariant::fromValue(model)));
    EXPECT_EQ(widget.property("Zandor").value<ZandorWidget::ZandorModel>(), model);
    EXPECT_FALSE(widget.property("lastjoin").value<ZandorWidget::ZDJoin>());
    EXPECT_FALSE(widget.property("activetable").value<ZandorWidget::ZDTable>());
    EXPECT_FALSE(widget.property("ActiveColumn").value<ZandorWidget::ZDColumn>());
}

TEST_F(TheWidget, RaisesErrorWithItsTextAndNumberForNoModel) {
    QString text;
    int number = 0;
    QObject::connect(&widget, &ZandorWidget::Error, [&](const QString& t, int n) {
        text = t;
        number = n;
    });
    widget.setProperty("Zandor", QVariant::fromValue(ZandorWidget::ZandorModel()));
    EXPECT_EQ(text, QStringLiteral("New Zanodr is nothing!"));
    EXPECT_EQ(number, -1);
}

TEST_F(TheWidget, RunsItsMethodsOnTheControl) {
    const auto model = library.newModel();
    const auto orders = model->table(u"ORDERS", {u"ID"});
    const auto items = model->table(u"ITEMS", {u"ID", u"NOTE"});
    widget.setModel(model);
    EXPECT_TRUE(QMetaObject::invokeMethod(&widget, "SetCurrentTable",
                                          Q_ARG(QString, QStringLiteral("ITEMS"))));
    EXPECT_EQ(items->selected, 1);
    EXPECT_EQ(orders->selected, 0);
    EXPECT_TRUE(QMetaObject::invokeMethod(&widget, "SelectColumnNames",
                                          Q_ARG(QString, QStringLiteral("ITEMS")),
                                          Q_ARG(QString, QStringLiteral("NOTE"))));
    EXPECT_TRUE(items->column(u"NOTE").selected);
    EXPECT_TRUE(QMetaObject::invokeMethod(&widget, "Terminate"));
    EXPECT_EQ(widget.property("DeletedTable"), QStringLiteral("ITEMS"));
    EXPECT_NE(widget.model().get(), model.get());
}
