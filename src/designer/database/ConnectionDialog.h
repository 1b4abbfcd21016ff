#pragma once

#include "designer/database/Address.h"

#include <QDialog>

class QComboBox;
class QFormLayout;
class QLineEdit;
class QPushButton;
class QSpinBox;

namespace zandor::designer {

class Database;
class ErrorLine;

/// Asks for a database and opens it: accepted when it is open. Fields and address follow each
/// other; a password in the address goes over into its own field at once.
class ConnectionDialog final : public QDialog {
    Q_OBJECT

public:
    explicit ConnectionDialog(Database& database, QWidget* window = nullptr);

    /// Fills the form in. May have a password in it.
    void setAddress(const QString& address);
    /// What is in the form; never with a password.
    QString address() const;

private:
    void addKinds();
    void lay();
    void showFieldsOf(Engine engine);
    void growToContent();
    Engine engine() const;

    void takeAddress();
    void takeFields();
    void browse();
    void connectToIt();

    Database& mDatabase;
    QString mOptions; ///< of the address, for which there are no fields
    QFormLayout* mForm;
    QComboBox* mKind;
    QLineEdit* mFile;
    QWidget* mFileRow;
    QLineEdit* mHost;
    QSpinBox* mPort;
    QWidget* mHostRow;
    QLineEdit* mSource;
    QLineEdit* mName;
    QLineEdit* mUser;
    QLineEdit* mPassword;
    QLineEdit* mAddress;
    ErrorLine* mError;
    QPushButton* mOpen;
};

} // namespace zandor::designer
