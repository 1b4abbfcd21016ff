#include "designer/tables/RenameDialog.h"

#include "designer/document/Document.h"
#include "frontends/qt/ShownText.h"

#include <QComboBox>
#include <QDialogButtonBox>
#include <QFormLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

namespace zandor::designer {

RenameDialog::RenameDialog(Document& document, QWidget* parent, const QString& key)
    : QDialog(parent), mDocument(document), mTables(new QComboBox), mName(new QLineEdit),
      mFault(new QLabel) {
    setWindowTitle(tr("Rename table"));
    mTables->setObjectName(QStringLiteral("renameTable"));
    mName->setObjectName(QStringLiteral("renameName"));
    mFault->setObjectName(QStringLiteral("renameFault"));
    for (const auto& table : platform::Each<TalvikZandorLib::ZDTable>(document.query()->Tables())) {
        mTables->addItem(QString::fromStdU16String(table->Name()));
        if (QString::fromStdU16String(table->Key()) == key)
            mTables->setCurrentIndex(mTables->count() - 1);
    }
    mFault->setTextFormat(Qt::PlainText);
    mFault->setWordWrap(true);

    auto* const buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    buttons->button(QDialogButtonBox::Ok)->setText(tr("&Rename"));
    connect(buttons, &QDialogButtonBox::accepted, this, &RenameDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &RenameDialog::reject);
    connect(mTables, &QComboBox::currentIndexChanged, this, &RenameDialog::chooseTable);
    connect(mName, &QLineEdit::textEdited, this, [this] { showFault({}); });

    auto* const note = new QLabel(tr("The name is the table's in this query only; the database "
                                     "stays as it is."));
    note->setWordWrap(true);
    auto* const form = new QFormLayout(this);
    form->addRow(tr("&Table:"), mTables);
    form->addRow(tr("&New name:"), mName);
    form->addRow(note);
    form->addRow(mFault);
    form->addRow(buttons);
    setMinimumWidth(360);
    chooseTable();
    mName->setFocus();
}

void RenameDialog::chooseTable() {
    mName->setText(mTables->currentText());
    mName->selectAll();
    showFault({});
}

void RenameDialog::showFault(const QString& fault) {
    mFault->setText(platform::qt::asSigns(fault));
    mFault->setVisible(!fault.isEmpty());
}

void RenameDialog::accept() {
    const QString before = mTables->currentText();
    const QString name = mName->text().trimmed();
    if (name.isEmpty()) return showFault(tr("A table needs a name; type one."));
    if (name == before) return QDialog::accept();
    const auto table = mDocument.query()->tableNamed(before.toStdU16String());
    const auto bearer = mDocument.query()->tableNamed(name.toStdU16String());
    if (bearer && bearer != table)
        return showFault(
            tr("Another table of this query is called \"%1\"; choose another name.").arg(name));
    if (table)
        mDocument.change(tr("Rename table %1").arg(before), [&](model::Query& query) {
            query.renameTable(table, name.toStdU16String());
        });
    QDialog::accept();
}

} // namespace zandor::designer
