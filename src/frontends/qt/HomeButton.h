#pragma once

#include <QToolButton>

namespace zandor::platform::qt {

/// The square between the scroll bars that brings the canvas back to its origin.
class HomeButton : public QToolButton {
public:
    explicit HomeButton(QWidget* parent);

protected:
    void paintEvent(QPaintEvent* event) override;
};

} // namespace zandor::platform::qt
