#pragma once

#include "frontends/qt/Adapter.h"
#include "frontends/qt/RestingPicture.h"

#include <Zandor/platform/Intrinsic.h>

#include <QScrollBar>

class QWheelEvent;

namespace zandor::platform::qt {

/// Moves the canvas; shows that it has the focus, which scroll bars of most styles do not.
class CanvasScrollBar : public QScrollBar {
public:
    CanvasScrollBar(Qt::Orientation orientation, QWidget* parent);

protected:
    void paintEvent(QPaintEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;
    void sliderChange(SliderChange change) override;

private:
    RestingPicture mPicture{*this}; ///< styles take their time to paint a bar
};

class ScrollBarAdapter final : public Adapter<platform::ScrollBar, QScrollBar> {
public:
    ScrollBarAdapter(QScrollBar* widget, FocusTracker& focus, const ScrollBarEvents& events);

    /// As thick as the style has it at the moment.
    Bounds bounds() const override;

    std::int16_t Max() const override;
    void Max(std::int16_t value) override;
    std::int16_t Value() const override;
    void Value(std::int16_t value) override;
    void LargeChange(std::int16_t value) override;
    void Enabled(bool value) override { enable(value); }
};

/// Scrolls by a turn of the wheel or a stroke on a touchpad; a bar may be missing or disabled.
void scrollByWheel(QScrollBar* horizontal, QScrollBar* vertical, QWheelEvent& event);

} // namespace zandor::platform::qt
