#pragma once

#include <Zandor/Query.h>

#include <QSize>

/// The size of the control's canvas.
namespace zandor::designer {

inline constexpr int twipsPerPixel = 15;

/// What a canvas must have for all tables of a query and a margin around them, in twips; empty for
/// a query without tables.
QSize canvasNeeded(model::Query& query);

/// Of a canvas' width or height in logical pixels, as much as the control's 16-bit sizes can say.
int twips(int pixels);
/// A number of twips as the control takes it.
int canvasLength(int twips);
QSize pixels(QSize twips);

} // namespace zandor::designer
