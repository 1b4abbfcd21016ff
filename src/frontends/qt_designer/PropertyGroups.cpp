#include "frontends/qt_designer/PropertyGroups.h"

#include <Zandor/ZandorWidget.h>

#include <QMetaProperty>
#include <QtDesigner/propertysheet.h>

#include <utility>

namespace zandor::platform::qt_designer {

QString groupOf(const QString& property) {
    if (property.startsWith(u"LNG"))
        return property.endsWith(u"Vis") ? QStringLiteral("Menu") : QStringLiteral("Texts");
    if (property == u"OnlyJoin" || property.startsWith(u"MX")) return QStringLiteral("Appearance");
    if (property == u"JoinModifyDisabled" || property.startsWith(u"UseJoin"))
        return QStringLiteral("Behaviour");
    if (property == u"DebugSwitch") return QStringLiteral("Diagnostics");
    return QStringLiteral("Run Time");
}

PropertyGroups::PropertyGroups(QAbstractExtensionManager& manager) : mManager(manager) {
    mManager.registerExtensions(this, Q_TYPEID(QDesignerPropertySheetExtension));
}

QObject* PropertyGroups::extension(QObject* object, const QString& iid) const {
    // The sheet is the one that Qt Designer makes itself: for that it is asked once more, this
    // factory having nothing.
    if (mAsking || !qobject_cast<ZandorWidget*>(object)) return nullptr;
    mAsking = true;
    QObject* const made = mManager.extension(object, iid);
    mAsking = false;
    auto* const sheet = qobject_cast<QDesignerPropertySheetExtension*>(made);
    if (!sheet) return made;

    const QMetaObject& meta = ZandorWidget::staticMetaObject;
    for (int i = meta.propertyOffset(); i < meta.propertyCount(); ++i) {
        const int index = sheet->indexOf(QString::fromLatin1(meta.property(i).name()));
        if (index >= 0) sheet->setPropertyGroup(index, groupOf(sheet->propertyName(index)));
    }
    return made;
}

} // namespace zandor::platform::qt_designer
