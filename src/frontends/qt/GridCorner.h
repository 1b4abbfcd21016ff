#pragma once

#include <QWidget>

namespace zandor::platform::qt {

class GridModel;

/// The fixed cell at row 0 and column 0, where the view's headers meet; looks like them.
class GridCorner : public QWidget {
public:
    GridCorner(const GridModel& model, QWidget* parent);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    const GridModel& mModel;
};

} // namespace zandor::platform::qt
