#pragma once

#include <QPointer>
#include <QtDesigner/QtDesigner>

/// Qt Designer's editor of forms, without its window around. It stays until the program ends.
class Editor {
public:
    Editor();

    QDesignerFormEditorInterface& core() { return *mCore; }
    /// Opens a form, in place of the one before; false when it is none.
    bool open(const QString& contents);
    /// The form as it would be saved.
    QString contents() const { return mForm->contents(); }
    QDesignerFormWindowInterface& form() { return *mForm; }

    /// The query designer on the form, or nothing.
    QWidget* widget() const;
    QDesignerPropertySheetExtension& sheet(QWidget& widget);
    /// As somebody does in the property editor.
    void change(QWidget& widget, const QString& property, const QVariant& value);
    void reset(QWidget& widget, const QString& property);

private:
    QDesignerFormEditorInterface* mCore;
    QWidget mWindow;
    QPointer<QDesignerFormWindowInterface> mForm;
};

/// A form with nothing but what a piece of XML puts there.
QString formAround(const QString& widget);
/// What uic makes of a form; empty when it takes it for none.
QString compiled(const QString& form);
