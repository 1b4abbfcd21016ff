#pragma once

#include <QString>
#include <QStringList>
#include <QVariant>

#include <vector>

namespace zandor::designer {

/// A property of the control that a person may set.
struct ControlProperty {
    enum class Page { texts, menu, joins, debug };

    QString name;
    Page page;
    QVariant byDefault; ///< as the designer uses the control, of the property's type
    QString also = {};  ///< a second name of the same property
};

/// All of them in the order of the control's interface, found by walking the widget's properties:
/// its texts, flags and switches, and not what it says about its state. Made once.
const std::vector<ControlProperty>& controlProperties();

/// In the designer's language: what setting the property does.
QString wordsFor(const ControlProperty& property);

} // namespace zandor::designer
