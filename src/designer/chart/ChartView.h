#pragma once

#include "designer/chart/ChartDrawing.h"

#include <QWidget>

#include <memory>

namespace zandor::designer {

/// Shows a chart, or says why there is none. The value under the mouse, or the one that the arrow
/// keys have reached, stands out and is told.
class ChartView final : public QWidget {
    Q_OBJECT

public:
    explicit ChartView(QWidget* parent = nullptr);

    void show(ChartData data);
    void say(const QString& why);
    const std::optional<ChartData>& data() const { return mData; }
    const QString& said() const { return mWhy; }
    /// What is laid out for the size of the moment; nullptr when there is no chart.
    const ChartDrawing* drawing();

protected:
    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void changeEvent(QEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void leaveEvent(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    void layOutAnew();
    void setCurrent(int mark);
    bool step(int key);
    void tell(const QPoint& at);

    std::optional<ChartData> mData;
    QString mWhy;
    std::unique_ptr<ChartDrawing> mDrawing; ///< none before it is needed
    int mCurrent = -1;                      ///< of its marks
};

} // namespace zandor::designer
