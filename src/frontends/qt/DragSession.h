#pragma once

#include <Zandor/platform/Control.h>

#include <QByteArray>
#include <QObject>
#include <QPixmap>
#include <QPointer>
#include <QStringList>

#include <functional>
#include <memory>

class QDrag;
class QMimeData;
class QWidget;

namespace zandor::platform::qt {

/// The drags of one control. Only drags that began in the same control are taken: the data of a
/// drag carry the identity of the session, and texts, files and other controls do not have it.
class DragSession : public QObject {
public:
    /// Carries a drag from its start to the drop or to its end without one.
    using Carrier = std::function<void(QDrag&)>;

    DragSession();

    /// For platforms that carry no drags themselves, such as those without a screen. The default
    /// is Qt's own modal loop.
    void setCarrier(Carrier carrier) { mCarrier = std::move(carrier); }

    /// What a running drag stands on, which the host may take away while it runs.
    void setKeeper(std::weak_ptr<void> keeper) { mKeeper = std::move(keeper); }
    /// The control has ended: a drag that runs ends, and drops nothing.
    void cancel();
    /// Ends the drag of a source where it is, as Escape does; without one nothing happens.
    void giveUp(const Control* source);

    /// Asks for a drag with `source` as its source. It begins as soon as the event at hand has
    /// been dealt with; while a drag runs, requests are ignored.
    void request(QWidget* widget, Control* source, const QStringList& names);
    /// Runs a requested drag to its end, the drop included. Safe to call without a request.
    void runRequested();
    /// The source has gone: its drag, if any, drops nothing.
    void forget(const Control* source);

    bool accepts(const QMimeData* data) const;
    /// Gives the running drag the cursor of forbidden places, or takes it back.
    void showWhetherDropCounts(bool counts);
    Control* source() const { return mSource; }
    /// Keeps the drop until the drag's own event loop has ended: a handler may open message
    /// boxes, which must not stand inside the drag. It is told whether the drop still counts, for
    /// the drag may be given up meanwhile.
    void drop(std::function<void(bool counts)> deliver) { mDrop = std::move(deliver); }

private:
    static QPixmap picture(const QWidget& widget, const QStringList& names);

    const QByteArray mIdentity;
    QPointer<QWidget> mRequestedBy;
    QStringList mNames;
    Control* mSource = nullptr;
    bool mRunning = false;
    bool mGivenUp = false;
    QPointer<QDrag> mDrag;
    Carrier mCarrier;
    std::function<void(bool)> mDrop;
    std::weak_ptr<void> mKeeper;
};

} // namespace zandor::platform::qt
