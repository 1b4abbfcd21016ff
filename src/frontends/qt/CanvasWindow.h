#pragma once

#include <QPointer>
#include <QScrollBar>
#include <QWidget>

namespace zandor::platform::qt {

/// The window that the canvas moves behind. It ends where the scroll bars begin: with nothing over
/// the canvas, scrolling moves its pixels instead of painting them anew. It begins where the
/// control does, so that the canvas has the same place in both.
class CanvasWindow : public QWidget {
    // Of a plain QWidget a style sheet would paint frame and background.
    Q_OBJECT

public:
    explicit CanvasWindow(QWidget* surface);

    /// Ends at the bar for as long as that is shown.
    void endAt(QScrollBar& bar);
    /// What neither the bars nor the edges of the control cut off, in coordinates of either.
    QRect seen() const;

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void fit();

    QPointer<QScrollBar> mAcross;
    QPointer<QScrollBar> mDown;
};

} // namespace zandor::platform::qt
