#include "designer/options/ControlProperties.h"

#include "designer/options/ControlTexts.h"

#include <Zandor/Library.h>
#include <Zandor/ZandorWidget.h>

#include <QCoreApplication>
#include <QMetaProperty>

#include <algorithm>
#include <optional>

namespace zandor::designer {

namespace {

using Page = ControlProperty::Page;

struct Words {
    const char* property;
    const char* words;
};

constexpr Words flagWords[] = {
    {"LNGMnuShowJoinDefVis", QT_TRANSLATE_NOOP("ControlFlags", "Show join definition")},
    {"LNGMnuDelJoinVis", QT_TRANSLATE_NOOP("ControlFlags", "Delete join")},
    {"LNGMnuCopyColVis", QT_TRANSLATE_NOOP("ControlFlags", "Copy column")},
    {"LNGMnuCreateJoinVis", QT_TRANSLATE_NOOP("ControlFlags", "Create join")},
    {"LNGMnuDelTableVis", QT_TRANSLATE_NOOP("ControlFlags", "Delete table")},
    {"LNGMnuPasteColVis", QT_TRANSLATE_NOOP("ControlFlags", "Paste column")},
    {"LNGMnuDelColVis", QT_TRANSLATE_NOOP("ControlFlags", "Delete output column")},
    {"LNGMnuSep1Vis", QT_TRANSLATE_NOOP("ControlFlags", "Separator below the join entries")},
    {"LNGMnuSep2Vis", QT_TRANSLATE_NOOP("ControlFlags", "Separator below the table entries")},
    {"JoinModifyDisabled",
     QT_TRANSLATE_NOOP("ControlFlags", "Type and operator of a join can be changed")},
    {"OnlyJoin", QT_TRANSLATE_NOOP("ControlFlags", "Tables and joins only, no output columns")},
    {"UseJoinTypeNormal", QT_TRANSLATE_NOOP("ControlFlags", "Normal: only rows that match")},
    {"UseJoinTypeLeft",
     QT_TRANSLATE_NOOP("ControlFlags", "Left outer: all rows of the left table")},
    {"UseJoinTypeRight",
     QT_TRANSLATE_NOOP("ControlFlags", "Right outer: all rows of the right table")},
    {"UseJoinTypeBoth", QT_TRANSLATE_NOOP("ControlFlags", "Both outer: all rows of both tables")},
    {"UseJoinCompareOperatorEquals", QT_TRANSLATE_NOOP("ControlFlags", "=  equal")},
    {"UseJoinCompareOperatorNotEquals", QT_TRANSLATE_NOOP("ControlFlags", "<>  not equal")},
    {"UseJoinCompareOperatorLess", QT_TRANSLATE_NOOP("ControlFlags", "<  less")},
    {"UseJoinCompareOperatorGreater", QT_TRANSLATE_NOOP("ControlFlags", ">  greater")},
    {"UseJoinCompareOperatorLessEquals", QT_TRANSLATE_NOOP("ControlFlags", "<=  less or equal")},
    {"UseJoinCompareOperatorGreaterEquals",
     QT_TRANSLATE_NOOP("ControlFlags", ">=  greater or equal")},
    {"DebugSwitch", QT_TRANSLATE_NOOP("ControlFlags", "Show a box at each step of the control")},
};

std::optional<Page> pageOf(const QString& name, int type) {
    if (name.startsWith(QLatin1String("LNG")))
        return type == QMetaType::QString ? Page::texts : Page::menu;
    if (name.contains(QLatin1String("Join")) && type != QMetaType::UnknownType &&
        (type == QMetaType::Bool || type == QMetaType::Int))
        return Page::joins;
    if (name == QLatin1String("DebugSwitch")) return Page::debug;
    return {};
}

/// The longer name of a property that has two.
QString firstNameOf(const QString& name) {
    if (name == QLatin1String("UseJoinCompareOperatorLE"))
        return QStringLiteral("UseJoinCompareOperatorLessEquals");
    if (name == QLatin1String("UseJoinCompareOperatorGE"))
        return QStringLiteral("UseJoinCompareOperatorGreaterEquals");
    return name;
}

/// What the designer wants otherwise than the control has it at first.
QVariant byDefault(const QString& name, const QVariant& atFirst) {
    if (name == QLatin1String("DebugSwitch")) return 0;
    if (name == QLatin1String("OnlyJoin")) return false;
    // Nonzero lets the user change them: the reverse of its name.
    if (name == QLatin1String("JoinModifyDisabled")) return 1;
    return atFirst;
}

std::vector<ControlProperty> walk() {
    model::Library library;
    ZandorWidget control(library);
    control.setDebugSwitch(0);
    std::vector<ControlProperty> result;
    const QMetaObject& meta = ZandorWidget::staticMetaObject;
    for (int i = meta.propertyOffset(); i < meta.propertyCount(); ++i) {
        const QMetaProperty property = meta.property(i);
        const QString name = QString::fromLatin1(property.name());
        const auto page = pageOf(name, property.metaType().id());
        if (!page || !property.isWritable()) continue;
        const QString first = firstNameOf(name);
        if (first == name) {
            result.push_back({name, *page, byDefault(name, property.read(&control))});
            continue;
        }
        const auto known = std::find_if(result.begin(), result.end(),
                                        [&](const auto& one) { return one.name == first; });
        if (known != result.end()) known->also = name;
    }
    return result;
}

} // namespace

const std::vector<ControlProperty>& controlProperties() {
    static const std::vector<ControlProperty> all = walk();
    return all;
}

QString wordsFor(const ControlProperty& property) {
    for (const auto& [name, words] : flagWords)
        if (property.name == QLatin1String(name))
            return QCoreApplication::translate("ControlFlags", words);
    return controlTexts::useOf(property.name);
}

} // namespace zandor::designer
