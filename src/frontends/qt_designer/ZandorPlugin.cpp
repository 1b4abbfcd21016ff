#include "frontends/qt_designer/ZandorPlugin.h"

#include "frontends/qt_designer/PreviewQuery.h"

#include <Zandor/ZandorWidget.h>

#include <QIcon>
#include <QMetaProperty>
#include <QtDesigner/abstractformeditor.h>
#include <QtDesigner/qextensionmanager.h>

namespace zandor::platform::qt_designer {

QString ZandorPlugin::name() const { return QStringLiteral("ZandorWidget"); }

QString ZandorPlugin::group() const { return QStringLiteral("Zandor"); }

QString ZandorPlugin::toolTip() const { return tr("A query designer: tables, joins, criteria"); }

QString ZandorPlugin::whatsThis() const {
    return tr("Tables as movable boxes, joins as lines between their columns, and a grid of output "
              "columns below. In code, setLibrary and then setModel give it a query.");
}

QString ZandorPlugin::includeFile() const { return QStringLiteral("<Zandor/ZandorWidget.h>"); }

QIcon ZandorPlugin::icon() const { return QIcon(QStringLiteral(":/zandor/ZandorWidget.png")); }

QWidget* ZandorPlugin::createWidget(QWidget* parent) {
    auto* const widget = new ZandorWidget(parent);
    if (isInitialized()) {
        widget->setSilent(true);
        widget->setLibrary(mLibrary);
        widget->setModel(makePreviewQuery());
    }
    return widget;
}

QString ZandorPlugin::domXml() const {
    QString texts; // of one line each
    const QMetaObject& meta = ZandorWidget::staticMetaObject;
    for (int i = meta.propertyOffset(); i < meta.propertyCount(); ++i)
        if (meta.property(i).typeId() == QMetaType::QString)
            texts +=
                QStringLiteral("<stringpropertyspecification name=\"%1\" type=\"singleline\"/>\n")
                    .arg(QLatin1String(meta.property(i).name()));
    return QStringLiteral(R"(<ui language="c++" displayname="Query Designer">
<widget class="ZandorWidget" name="zandorWidget">
<property name="geometry"><rect><x>0</x><y>0</y><width>640</width><height>420</height></rect></property>
</widget>
<customwidgets><customwidget>
<class>ZandorWidget</class>
<extends>QWidget</extends>
<propertyspecifications>
%1</propertyspecifications>
</customwidget></customwidgets>
</ui>)")
        .arg(texts);
}

void ZandorPlugin::initialize(QDesignerFormEditorInterface* editor) {
    if (isInitialized() || !editor || !editor->extensionManager()) return;
    mGroups = std::make_unique<PropertyGroups>(*editor->extensionManager());
}

} // namespace zandor::platform::qt_designer
