#include "designer/options/ControlOptions.h"

#include "designer/options/ControlProperties.h"
#include "designer/options/ControlTexts.h"

#include <QSettings>

namespace zandor::designer {

namespace {

QString keyOf(const ControlProperty& property) {
    return QStringLiteral("control/") + property.name;
}

QVariant defaultOf(const ControlProperty& property) {
    for (const controlTexts::Text& text : controlTexts::all())
        if (property.name == QLatin1String(text.property)) return controlTexts::own(text);
    return property.byDefault;
}

} // namespace

ControlOptions ControlOptions::read(const QSettings& settings) {
    ControlOptions result;
    for (const ControlProperty& property : controlProperties())
        if (const QVariant stored = settings.value(keyOf(property)); stored.isValid())
            result.choose(property, stored);
    return result;
}

void ControlOptions::write(QSettings& settings) const {
    for (const ControlProperty& property : controlProperties()) {
        const auto chosen = mChosen.constFind(property.name);
        if (chosen == mChosen.constEnd())
            settings.remove(keyOf(property));
        else
            settings.setValue(keyOf(property), *chosen);
    }
}

QVariant ControlOptions::value(const ControlProperty& property) const {
    const auto chosen = mChosen.constFind(property.name);
    return chosen == mChosen.constEnd() ? defaultOf(property) : *chosen;
}

void ControlOptions::choose(const ControlProperty& property, const QVariant& value) {
    QVariant converted = value;
    // Integers among the options are switches.
    const bool isSwitch = property.byDefault.typeId() == QMetaType::Int;
    const bool understood =
        converted.convert(isSwitch ? QMetaType::fromType<bool>() : property.byDefault.metaType());
    if (isSwitch) converted = converted.toBool() ? 1 : 0;
    if (!understood || converted == defaultOf(property))
        mChosen.remove(property.name);
    else
        mChosen.insert(property.name, converted);
}

QVariantMap ControlOptions::properties() const {
    QVariantMap result;
    for (const ControlProperty& property : controlProperties()) {
        result.insert(property.name, value(property));
        if (!property.also.isEmpty()) result.insert(property.also, value(property));
    }
    return result;
}

} // namespace zandor::designer
