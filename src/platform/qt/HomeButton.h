#pragma once

#include <QCoreApplication>
#include <QToolButton>

namespace platform::qt {

/// The square between the scroll bars that brings the canvas back to its origin.
class HomeButton : public QToolButton {
    Q_DECLARE_TR_FUNCTIONS(platform::qt::HomeButton)

public:
    explicit HomeButton(QWidget* parent);

protected:
    void paintEvent(QPaintEvent* event) override;
};

} // namespace platform::qt
