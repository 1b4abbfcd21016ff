#pragma once

#include "designer/run/SelectedCells.h"

#include <QLineEdit>
#include <QTimer>

namespace zandor::designer {

class ResultTable;

/// What the selected cells of a table come to, a line to be read and copied; hidden while fewer
/// than two are selected. It is made bit by bit, so that a large selection holds nothing up.
class SummaryLine final : public QLineEdit {
    Q_OBJECT

public:
    /// The table outlives the line.
    explicit SummaryLine(ResultTable& table, QWidget* parent = nullptr);

    QSize sizeHint() const override;
    /// Puts the line as it is on the clipboard, unless it is empty.
    void copyAll();

private:
    void begin();
    void goOn();
    void say(const QString& text);

    ResultTable& mTable;
    SelectedCells mCells;
    QTimer mNext;
};

} // namespace zandor::designer
