#pragma once

class QAccessibleInterface;

namespace zandor::platform::qt {

class Canvas;
class CanvasLine;

/// What stands for a join line, which is no widget, in the tree of accessible objects.
QAccessibleInterface* makeAccessible(CanvasLine& line, Canvas& canvas);

/// Has Qt ask for the accessible objects of canvas and tables here. Safe to call again.
void installAccessibleObjects();

} // namespace zandor::platform::qt
