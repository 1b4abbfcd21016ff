#include "frontends/qt/Dialog.h"

#include <Zandor/qt/Text.h>

#include <QComboBox>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QStyleOptionFrame>
#include <QVBoxLayout>

#include <algorithm>

namespace zandor::platform::qt {

NameBox::NameBox(QWidget* parent) : QLineEdit(parent) {
    setReadOnly(true);
    QPalette shown = palette();
    shown.setBrush(QPalette::Base, shown.window());
    setPalette(shown);
    connect(this, &QLineEdit::textChanged, this, [this] { updateGeometry(); });
}

QSize NameBox::minimumSizeHint() const {
    constexpr int margin = 4;   // around the text inside the frame
    constexpr int longest = 40; // in letters; what is longer scrolls
    const QFontMetrics metrics = fontMetrics();
    const int width =
        std::min(metrics.horizontalAdvance(text()), longest * metrics.averageCharWidth());
    QStyleOptionFrame option;
    initStyleOption(&option);
    const QSize content(width + 2 * margin, metrics.height());
    return QLineEdit::minimumSizeHint().expandedTo(
        style()->sizeFromContents(QStyle::CT_LineEdit, &option, content, this));
}

FormDialog::FormDialog(QWidget* parent, PlainEvent Close)
    : QDialog(parent), mForm(new QFormLayout), mButtons(new QHBoxLayout), mClose(std::move(Close)) {
    setModal(true);
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
        if (mFields < mLabels)
            if (auto* item = mForm->itemAt(mFields, QFormLayout::LabelRole))
                if (auto* label = qobject_cast<QLabel*>(item->widget())) label->setBuddy(child);
        mForm->setWidget(mFields++, QFormLayout::FieldRole, child);
        break;
    }
}

// No minimum: that of the layout would be off, and texts could be cut.
QSize FormDialog::sizeHint() const { return QDialog::sizeHint().expandedTo({380, 0}); }

void FormDialog::focusFirst() {
    for (auto* list : findChildren<QComboBox*>())
        if (list->isEnabled()) return list->setFocus();
    for (auto* button : findChildren<QPushButton*>())
        if (button->isDefault()) return button->setFocus();
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
    if (!mWidget) return;
    mWidget->prepare();
    mWidget->focusFirst();
    mWidget->exec();
}

void DialogAdapter::Hide() {
    if (mWidget) mWidget->hide();
}

} // namespace zandor::platform::qt
