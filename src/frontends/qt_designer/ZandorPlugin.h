#pragma once

#include "frontends/qt_designer/PropertyGroups.h"

#include <Zandor/Library.h>

#include <QtUiPlugin/QDesignerCustomWidgetInterface>

#include <memory>

namespace zandor::platform::qt_designer {

/// The widget for forms: in Qt Designer, which initialises the plug-in, with a query to look at and
/// without boxes; elsewhere (QUiLoader) as a program has it that calls setLibrary next.
class ZandorPlugin final : public QObject, public QDesignerCustomWidgetInterface {
    Q_OBJECT
    Q_PLUGIN_METADATA(IID QDesignerCustomWidgetInterface_iid)
    Q_INTERFACES(QDesignerCustomWidgetInterface)

public:
    QString name() const override;
    QString group() const override;
    QString toolTip() const override;
    QString whatsThis() const override;
    QString includeFile() const override;
    QIcon icon() const override;
    bool isContainer() const override { return false; }
    QWidget* createWidget(QWidget* parent) override;
    QString domXml() const override;

    bool isInitialized() const override { return mGroups != nullptr; }
    void initialize(QDesignerFormEditorInterface* editor) override;

private:
    model::Library mLibrary;
    std::unique_ptr<PropertyGroups> mGroups;
};

} // namespace zandor::platform::qt_designer
