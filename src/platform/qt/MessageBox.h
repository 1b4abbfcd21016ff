#pragma once

#include "platform/String.h"

class QWidget;

namespace platform::qt {

/// The text of a box as it was asked for, and its style, kept with the box as properties: what
/// the box shows has its line ends changed to Qt's.
inline constexpr char promptProperty[] = "prompt";
inline constexpr char styleProperty[] = "style";

/// Shows a box and returns when the user has closed it. Does nothing without an application.
void showMessageBox(QWidget* parent, const String& prompt, std::int32_t style, const String& title);

} // namespace platform::qt
