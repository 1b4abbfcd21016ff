#include "designer/database/PasswordPrompt.h"

#include "designer/database/Address.h"
#include "designer/database/ErrorLine.h"

#include <QDialogButtonBox>
#include <QFormLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

namespace zandor::designer {

PasswordPrompt::PasswordPrompt(const QString& address, const QString& why, QWidget* window)
    : QDialog(window), mPassword(new QLineEdit(this)) {
    setWindowTitle(tr("Password"));
    const auto parts = parseAddress(address).value_or(Address());
    auto* const question =
        new QLabel(parts.user.isEmpty() ? tr("The database %1 on %2 asks for a password.")
                                              .arg(nameOfDatabase(address), parts.host)
                                        : tr("The database %1 on %2 asks for the password of %3.")
                                              .arg(nameOfDatabase(address), parts.host, parts.user),
                   this);
    question->setTextFormat(Qt::PlainText);
    question->setWordWrap(true);
    mPassword->setEchoMode(QLineEdit::Password);
    auto* const buttons =
        new QDialogButtonBox(QDialogButtonBox::Open | QDialogButtonBox::Cancel, this);
    connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);

    auto* const form = new QFormLayout;
    form->addRow(tr("&Password:"), mPassword);
    auto* const layout = new QVBoxLayout(this);
    layout->addWidget(question);
    layout->addLayout(form);
    auto* const reason = new ErrorLine(this);
    reason->say(why);
    layout->addWidget(reason);
    layout->addStretch();
    layout->addWidget(buttons);
    setMinimumWidth(380);
}

QString PasswordPrompt::password() const { return mPassword->text(); }

} // namespace zandor::designer
