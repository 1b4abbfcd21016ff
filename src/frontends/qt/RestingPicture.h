#pragma once

#include <QObject>
#include <QPalette>
#include <QPixmap>

class QPaintEvent;
class QWidget;

namespace zandor::platform::qt {

/// What a box with all its parts looks like while nothing happens to them, kept so that being
/// uncovered is a matter of copying pixels. It is taken once the box has been painted a few times
/// at rest; any event of the box or of a part other than to be painted ends that.
class RestingPicture : public QObject {
public:
    /// An opaque box, which the picture belongs to.
    explicit RestingPicture(QWidget& box);

    /// Has a part asked about before its own event filters are. To be called with one that has been
    /// made after the picture, when it has all of those.
    void watch(QWidget& part);
    /// To be called when the box looks otherwise without an event that says so.
    void drop();

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void take();
    bool isRight() const;
    bool paint(QWidget& part, const QPaintEvent& event);

    QWidget& mBox;
    QPixmap mPicture;
    QPalette mPalette; ///< that the picture was taken with
    int mPaintings = 0;
    bool mTaking = false;
    bool mShown = false; ///< by the last painting of the box
};

} // namespace zandor::platform::qt
