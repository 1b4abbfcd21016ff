#pragma once

#include <Zandor/platform/Words.h>

#include <QWidget>

#include <functional>

namespace zandor::platform::qt {

/// The bar between canvas and grid that the user moves, by the mouse or with the arrow keys.
class PaneHandle : public QWidget {
    Q_OBJECT

public:
    explicit PaneHandle(QWidget* parent);

    void setWords(const Words& words);
    /// Told by how many logical pixels the bar is to move down.
    void setMover(std::function<void(int)> mover) { mMover = std::move(mover); }

    static constexpr int thickness = 7; ///< logical pixels

protected:
    bool event(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;

private:
    void moveBy(int down);

    std::function<void(int)> mMover;
    int mGrabbedAt = 0;
};

} // namespace zandor::platform::qt
