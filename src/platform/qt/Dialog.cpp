#include "platform/qt/Dialog.h"

#include "platform/qt/Text.h"

#include <QFormLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

namespace platform::qt {

namespace {

void showReadOnly(QLineEdit& text) {
    text.setReadOnly(true);
    text.setFocusPolicy(Qt::ClickFocus);
    QPalette palette = text.palette();
    palette.setBrush(QPalette::Base, palette.window());
    text.setPalette(palette);
}

} // namespace

FormDialog::FormDialog(QWidget* parent, PlainEvent Close)
    : QDialog(parent), mForm(new QFormLayout), mButtons(new QHBoxLayout), mClose(std::move(Close)) {
    setModal(true);
    setMinimumWidth(380);
    mForm->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);
    mButtons->addStretch();
    auto* column = new QVBoxLayout(this);
    column->addLayout(mForm);
    column->addStretch();
    column->addSpacing(8);
    column->addLayout(mButtons);
}

void FormDialog::place(QWidget* child, Role role) {
    switch (role) {
    case Role::label: mForm->setWidget(mLabels++, QFormLayout::LabelRole, child); break;
    case Role::button: mButtons->addWidget(child); break;
    case Role::field:
    case Role::frame:
        if (auto* text = qobject_cast<QLineEdit*>(child)) showReadOnly(*text);
        if (mFields < mLabels)
            if (auto* item = mForm->itemAt(mFields, QFormLayout::LabelRole))
                if (auto* label = qobject_cast<QLabel*>(item->widget())) label->setBuddy(child);
        mForm->setWidget(mFields++, QFormLayout::FieldRole, child);
        break;
    }
}

void FormDialog::reject() {
    const PlainEvent close = mClose;
    if (close) close();
    if (isVisible()) QDialog::reject();
}

DialogAdapter::~DialogAdapter() {
    if (mWidget) mWidget->setCloseEvent({});
}

void DialogAdapter::place(QWidget* child, Role role) {
    if (mWidget) mWidget->place(child, role);
}

void DialogAdapter::Caption(const String& value) {
    if (mWidget) mWidget->setWindowTitle(toQt(value));
}

void DialogAdapter::ShowModal() {
    if (mWidget) mWidget->exec();
}

void DialogAdapter::Hide() {
    if (mWidget) mWidget->hide();
}

} // namespace platform::qt
