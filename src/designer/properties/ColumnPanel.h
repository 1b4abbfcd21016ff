#pragma once

#include "designer/properties/CurrentColumn.h"

#include <QTimer>
#include <QWidget>

class QCheckBox;
class QComboBox;
class QLabel;
class QLineEdit;
class QSpinBox;

namespace zandor::designer {

class FieldEdit;

/// What the output column is that the grid is in, to be read and changed. In a blank column a field
/// makes a new one.
class ColumnPanel final : public QWidget {
    Q_OBJECT

public:
    /// Both outlive the panel.
    ColumnPanel(Document& document, CurrentColumn& column, QWidget* parent = nullptr);

protected:
    void showEvent(QShowEvent* event) override;

private:
    void makeLayout();
    void follow();
    void show(const model::ColumnDefinition& definition);
    void takeOver();
    void takeField();
    void takeName();
    void check();
    void change(const std::function<void(model::ColumnDefinition&)>& how);

    Document& mDocument;
    CurrentColumn& mColumn;
    platform::String mKey; ///< of what is shown; empty for a new one
    QTimer mSoon;          ///< what is typed is checked
    bool mTaking = false;

    FieldEdit* mField;
    QComboBox* mTotal;
    QLineEdit* mName;
    QComboBox* mSort;
    QSpinBox* mPriority;
    QCheckBox* mShown;
    QComboBox* mFormat;
    QSpinBox* mDecimals;
    QLabel* mFinding;
};

} // namespace zandor::designer
