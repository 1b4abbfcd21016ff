#pragma once

#include <QVariantMap>

class QSettings;

namespace zandor::designer {

struct ControlProperty;

/// What a person has chosen of the control's properties. What is not chosen is as the designer has
/// it by default, and texts follow its language.
class ControlOptions {
public:
    /// Those of the settings; one that cannot be read is as if it were not chosen.
    static ControlOptions read(const QSettings& settings);
    void write(QSettings& settings) const;

    /// What is in force.
    QVariant value(const ControlProperty& property) const;
    /// The default is as good as not chosen. A value of another type than the property's is
    /// converted.
    void choose(const ControlProperty& property, const QVariant& value);

    /// All of the control's properties that a person may set, with the values in force: what
    /// DrawingArea::setOptions takes.
    QVariantMap properties() const;

    friend bool operator==(const ControlOptions&, const ControlOptions&) = default;

private:
    QVariantMap mChosen; ///< by the property's first name
};

} // namespace zandor::designer
