#pragma once

#include <QApplication>

#include <memory>

namespace zandor::designer {

/// From now on Qt does not write to the standard error what the program says itself or what is as
/// expected.
void keepRemarksQuiet();

/// Makes the application on the screen that can be had. QT_QPA_PLATFORM decides when it is set;
/// otherwise it is the desktop's display, and a surface in memory when `offscreen` asks for one or
/// no display can be reached. `argc` outlives the application.
std::unique_ptr<QApplication> makeApplication(int& argc, char** argv, bool offscreen);

/// Whether the application draws where nobody can see it.
bool isOffscreen();

} // namespace zandor::designer
