#pragma once

#include "frontends/qt/FocusTracker.h"

class QInputMethodEvent;
class QInputMethodQueryEvent;

namespace zandor::platform::qt {

/// A text that an input method composes while the grid has the focus. The cell's editor opens for
/// it and shows it; the focus stays with the grid until the text is whole, for an input method
/// breaks off when the focus moves.
class CellComposer : public QObject {
public:
    explicit CellComposer(FocusTracker& focus) : mFocus(focus) {}

    bool isComposing() const { return box(); }
    /// nullptr while nothing is composed.
    QWidget* box() const { return mBox && mBox->isVisible() ? mBox.data() : nullptr; }
    /// Opens by `open` what is to have the text. False when nothing has asked for the focus then.
    bool begin(const std::function<void()>& open);
    void goOn(QInputMethodEvent& event);
    /// The focus has gone elsewhere.
    void breakOff();
    /// Answers an input method for the box, in the coordinates of a widget.
    void answer(QInputMethodQueryEvent& query, const QWidget& asked) const;

    /// An editor that closes has the text no more, whatever cell it opens for afterwards.
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void giveUp(QWidget& box) const;

    FocusTracker& mFocus;
    QPointer<QWidget> mBox;
    QString mBefore; ///< what stood in the box
};

} // namespace zandor::platform::qt
