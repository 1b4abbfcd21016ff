#pragma once

#include <QPoint>
#include <QStringList>

#include <optional>

class QWidget;
class ZandorWidget;

/// Where on the screen a thing stands that the user points at, or nothing while it is not shown:
///
///     entry TABLE COLUMN      a column in a table's list
///     title TABLE, close TABLE
///     cell ROW COL            of the grid
///     join NUMBER             the middle of a line
///     menu NAME               an entry of the open menu
///     control NAME            a control on the widget or in the open dialog
///     item NAME NUMBER        an item of an open list, counted from 0
std::optional<QPoint> placeOf(const ZandorWidget& widget, const QStringList& words);

/// A control on the widget or in the open dialog; nullptr when there is none.
QWidget* shownControl(const ZandorWidget& widget, const QString& name);
