#include "designer/run/ParameterDialog.h"

#include <QDialogButtonBox>
#include <QFormLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

namespace designer {

ParameterDialog::ParameterDialog(std::vector<Question> questions, const Answers& answers,
                                 QWidget* parent)
    : QDialog(parent), mQuestions(std::move(questions)), mComplaint(new QLabel(this)),
      mButtons(new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, this)) {
    setWindowTitle(tr("Values for the query"));
    auto* layout = new QFormLayout(this);
    layout->setFieldGrowthPolicy(QFormLayout::ExpandingFieldsGrow);
    layout->setRowWrapPolicy(QFormLayout::WrapLongRows);
    for (const Question& question : mQuestions) {
        auto* field = new QLineEdit(answers.value(question.name), this);
        field->setObjectName(question.name);
        field->setPlaceholderText(wanted(question));
        field->setToolTip(wanted(question));
        field->setMinimumWidth(field->fontMetrics().horizontalAdvance(wanted(question)) + 24);
        field->selectAll();
        connect(field, &QLineEdit::textChanged, this, &ParameterDialog::check);
        auto* label = new QLabel(this);
        label->setTextFormat(Qt::PlainText);
        label->setText(QString(question.name).replace(u'&', QStringLiteral("&&")));
        label->setBuddy(field);
        layout->addRow(label, field);
        mFields.push_back(field);
    }
    mComplaint->setTextFormat(Qt::PlainText);
    mComplaint->setWordWrap(true);
    mComplaint->setForegroundRole(QPalette::PlaceholderText);
    layout->addRow(mComplaint);
    layout->addRow(mButtons);
    mButtons->button(QDialogButtonBox::Ok)->setText(tr("&Run"));
    connect(mButtons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(mButtons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    // The buttons were there before the fields.
    QWidget* before = this;
    for (QWidget* field : mFields) {
        if (before != this) setTabOrder(before, field);
        before = field;
    }
    if (!mFields.empty()) {
        setTabOrder(before, mButtons);
        mFields.front()->setFocus();
    }
    check();
}

Answers ParameterDialog::answers() const {
    Answers result;
    for (std::size_t i = 0; i < mFields.size(); ++i)
        result.insert(mQuestions[i].name, mFields[i]->text());
    return result;
}

void ParameterDialog::check() {
    QString complaint;
    for (std::size_t i = 0; complaint.isEmpty() && i < mFields.size(); ++i)
        if (!fits(mQuestions[i], mFields[i]->text()))
            complaint = tr("%1 has to be %2.").arg(mQuestions[i].name, wanted(mQuestions[i]));
    mComplaint->setText(complaint);
    mButtons->button(QDialogButtonBox::Ok)->setEnabled(complaint.isEmpty());
}

} // namespace designer
