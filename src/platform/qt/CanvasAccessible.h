#pragma once

class QAccessibleInterface;

namespace platform::qt {

class Canvas;
class CanvasLine;

/// What stands for a join line, which is no widget, in the tree of accessible objects.
QAccessibleInterface* makeAccessible(CanvasLine& line, Canvas& canvas);

/// Has Qt ask for the accessible objects of canvas and tables here. Safe to call again.
void installAccessibleObjects();

} // namespace platform::qt
