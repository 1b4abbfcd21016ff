#pragma once

#include <QDialog>

class QLineEdit;

namespace zandor::designer {

/// Asks for the password of a database.
class PasswordPrompt final : public QDialog {
    Q_OBJECT

public:
    /// `why` is shown below, when it is not empty.
    PasswordPrompt(const QString& address, const QString& why, QWidget* window);

    QString password() const;

private:
    QLineEdit* mPassword;
};

} // namespace zandor::designer
