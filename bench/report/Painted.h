#pragma once

#include <QWidget>

namespace report {

/// Waits until a window has painted what is to be painted and the window system has it.
class Painted final : public QObject {
public:
    /// Of a window that is shown already, or will be.
    explicit Painted(QWidget& window);

    /// Lets the program go on until nothing is left to paint. Fails where nothing was painted since
    /// it was waited for last.
    void wait();

private:
    bool eventFilter(QObject* watched, QEvent* event) override;

    QWidget& mWindow;
    int mPaints = 0;
    int mWaitedFor = 0;
};

} // namespace report
