#pragma once

#include <Zandor/Query.h>
#include <Zandor/ZandorWidget.h>

#include <QPointer>
#include <QSocketNotifier>

#include <functional>
#include <optional>

/// Lets a test see what a user sees on a window with the control: questions come in on the standard
/// input, a line each, and every one is answered on the standard output with as many lines as the
/// answer's first line says.
///
///     events              the control's events so far
///     query               what the query is (QueryText.h)
///     place THING         where a thing stands (Places.h); nothing while it is not shown
///     selected TABLE      the selected entries of a table
///     text NAME           what an input, a label or a table of results reads
///     dragged             where the drag that is on was seen last, "nowhere" or nothing
///     focus               the name of the control that keys go to, or of what that is part of
///     focused NAME        "yes" when keys go to a control
///     cell                row and column of the grid's current cell
///     scrolls             how far the canvas scrolls across and down, in twips
///     active              "yes" when the window or a dialog of it has the keyboard
///     picture FILE        saves what the window shows; "1" when that worked
///     quit                ends the program
class Host final : public QObject {
public:
    using Query = std::function<zandor::model::Query&()>;

    /// The query of the moment is asked for each time.
    Host(QWidget& window, Query query);

    /// Logs the events of a control from now on.
    void listen(ZandorWidget& control);

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void read();
    QString answer(const QString& question);
    QString onScreen(const std::optional<QPoint>& place) const;
    QString currentCell() const;
    static QString focusedName();
    bool isFocused(const QString& name);
    QString selected(const QString& title);
    QString shownText(const QString& name);
    bool savePicture(const QString& file);

    QWidget& mWindow;
    const Query mQuery;
    QSocketNotifier mInput{0, QSocketNotifier::Read};
    QByteArray mPending;
    QStringList mLog;
    std::optional<QPoint> mDraggedOver;
    QPointer<ZandorWidget> mControl; ///< listened to last
};
