#pragma once

#include <QPoint>
#include <QStringList>

#include <optional>

class QWidget;

/// Where on the screen a thing of a window stands that the user points at, or nothing while it is
/// not shown:
///
///     entry TABLE COLUMN      a column in a table's list
///     title TABLE, close TABLE
///     cell ROW COL            of the grid
///     join NUMBER             the middle of a line
///     canvas X Y              a place of the canvas, in pixels from its corner
///     menu NAME               an entry of the open menu, or of the menu bar
///     control NAME            a control on the window or in the open dialog
///     item NAME NUMBER        an item of an open list, counted from 0
///     row NAME TEXT           the first row of a list or table that has this text
///     button TEXT             a button of the open dialog
std::optional<QPoint> placeOf(const QWidget& window, const QStringList& words);

/// A control on the window or in the open dialog; nullptr when there is none.
QWidget* shownControl(const QWidget& window, const QString& name);
