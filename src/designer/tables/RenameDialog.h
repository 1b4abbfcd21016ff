#pragma once

#include <QDialog>

class QComboBox;
class QLabel;
class QLineEdit;

namespace zandor::designer {

class Document;

/// Gives a table of the query another name there: what the statement calls it by. Only for a query
/// with tables.
class RenameDialog final : public QDialog {
    Q_OBJECT

public:
    /// Begins with the table of a key, or with the first.
    explicit RenameDialog(Document& document, QWidget* parent = nullptr, const QString& key = {});

    /// Renames, as one step. What is wrong with the name is shown, and the dialog stays.
    void accept() override;

private:
    void chooseTable();
    void showFault(const QString& fault);

    Document& mDocument;
    QComboBox* mTables;
    QLineEdit* mName;
    QLabel* mFault;
};

} // namespace zandor::designer
