#pragma once

#include "designer/chart/ChartData.h"

#include <QWidget>

class QComboBox;
class QPushButton;

namespace zandor::designer {

class ChartView;
class ValuesMenu;

/// A chart of a result, and what it is made of, which it chooses by itself until somebody else
/// does. A choice is kept for further results with the same columns.
class ChartPanel final : public QWidget {
    Q_OBJECT

public:
    explicit ChartPanel(QWidget* parent = nullptr);

    /// Draws a result. What the source refers to has to live until the next call.
    void show(const ChartSource& source);
    /// There is no result at the moment.
    void say(const QString& why);
    /// What the file of an export is called unless the user calls it otherwise; empty: as at first.
    void proposeFile(const QString& path) { mProposed = path; }

    QAction* copyAction() { return mCopy; }
    QAction* exportAction() { return mExport; }
    const ChartChoice& choice() const { return mChoice; }

private:
    void makeActions();
    void makeLayout();
    void offer();
    void choose();
    void draw();
    bool isPossible(const ChartChoice& choice) const;
    std::vector<int> numbers() const;
    void copy();
    void askForFile();

    ChartSource mSource;
    std::vector<ColumnUse> mUses;
    ChartChoice mChoice;
    QString mProposed;

    QAction* mCopy;
    QAction* mExport;
    QComboBox* mKind;
    QComboBox* mAxis;
    QPushButton* mValues;
    ValuesMenu* mMenu;
    ChartView* mView;
};

} // namespace zandor::designer
