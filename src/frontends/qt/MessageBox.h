#pragma once

#include <Zandor/platform/String.h>

class QWidget;

namespace zandor::platform::qt {

/// The text of a box as it was asked for, and its style, kept with the box as properties: what
/// the box shows has its line ends changed to Qt's.
inline constexpr char promptProperty[] = "prompt";
inline constexpr char styleProperty[] = "style";

/// Whose box, dialog or menu it is: a control that ends closes its own.
inline constexpr char ownerProperty[] = "zandorOwner";

/// Shows a box and returns when it has closed, be it by its user or because its parent or its owner
/// has gone. Does nothing without an application.
void showMessageBox(QWidget* parent, const String& prompt, std::int32_t style, const String& title,
                    const void* owner = nullptr);

} // namespace zandor::platform::qt
