#pragma once

#include <QRect>

class QPainter;
class QWidget;

/// What a table's list looks like before anybody has touched it, without there being one: a list
/// is five widgets, and of most tables of a drawing it is only looked at.
namespace zandor::platform::qt {

class ColumnListModel;

/// Whether a list at a place of a box is known to look like that. Not where the host dresses lists
/// otherwise than boxes, nor where there is no room for what a style draws.
bool canStandForList(const QWidget& box, const QRect& place);

/// Paints what a list at a place of a box shows: its first entries, and its bar where there are
/// more.
void paintListAtRest(QPainter& painter, const QWidget& box, const QRect& place,
                     const ColumnListModel& model);

} // namespace zandor::platform::qt
