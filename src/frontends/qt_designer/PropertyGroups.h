#pragma once

#include <QtDesigner/extension.h>

#include <QString>

namespace zandor::platform::qt_designer {

/// The heading under which the property editor shows a property of the widget: "Run Time" for what
/// only the running control has or changes.
QString groupOf(const QString& property);

/// Puts the properties of the widget under these headings, in the sheets that Qt Designer makes.
class PropertyGroups final : public QAbstractExtensionFactory {
public:
    /// The manager outlives it.
    explicit PropertyGroups(QAbstractExtensionManager& manager);

    QObject* extension(QObject* object, const QString& iid) const override;

private:
    QAbstractExtensionManager& mManager;
    mutable bool mAsking = false;
};

} // namespace zandor::platform::qt_designer
