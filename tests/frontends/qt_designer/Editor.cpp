#include "Editor.h"

#include <QApplication>
#include <QProcess>
#include <QtDesigner/QDesignerComponents>

#include <stdexcept>

Editor::Editor() {
    QDesignerComponents::initializeResources();
    mCore = QDesignerComponents::createFormEditor(nullptr);
    mCore->setTopLevel(&mWindow);
    mCore->setWidgetBox(QDesignerComponents::createWidgetBox(mCore, &mWindow));
    mCore->setPropertyEditor(QDesignerComponents::createPropertyEditor(mCore, &mWindow));
    mCore->setObjectInspector(QDesignerComponents::createObjectInspector(mCore, &mWindow));
    mCore->setActionEditor(QDesignerComponents::createActionEditor(mCore, &mWindow));
    new QDesignerIntegration(mCore, mCore);
    QDesignerComponents::initializePlugins(mCore);
}

bool Editor::open(const QString& contents) {
    delete mForm;
    mForm = mCore->formWindowManager()->createFormWindow(&mWindow);
    const bool opened = mForm->setContents(contents);
    mCore->formWindowManager()->setActiveFormWindow(mForm);
    qApp->processEvents();
    return opened;
}

QWidget* Editor::widget() const {
    for (QWidget* const widget : mForm->findChildren<QWidget*>())
        if (qstrcmp(widget->metaObject()->className(), "ZandorWidget") == 0) return widget;
    return nullptr;
}

QDesignerPropertySheetExtension& Editor::sheet(QWidget& widget) {
    auto* const found =
        qt_extension<QDesignerPropertySheetExtension*>(mCore->extensionManager(), &widget);
    if (!found) throw std::logic_error("the widget has no property sheet");
    return *found;
}

void Editor::change(QWidget& widget, const QString& property, const QVariant& value) {
    mForm->clearSelection(false);
    mForm->selectWidget(&widget);
    mForm->cursor()->setWidgetProperty(&widget, property, value);
}

void Editor::reset(QWidget& widget, const QString& property) {
    mForm->cursor()->resetWidgetProperty(&widget, property);
}

QString formAround(const QString& widget) {
    return QStringLiteral(R"(<ui version="4.0"><class>Form</class>
<widget class="QWidget" name="Form">%1</widget></ui>)")
        .arg(widget);
}

QString compiled(const QString& form) {
    QProcess uic;
    uic.start(QStringLiteral(ZANDOR_UIC), QStringList());
    uic.write(form.toUtf8());
    uic.closeWriteChannel();
    if (!uic.waitForFinished() || uic.exitCode() != 0) return {};
    return QString::fromUtf8(uic.readAllStandardOutput());
}
