#pragma once

#include <QString>

class QWidget;

namespace zandor::designer {

class Picture;

/// Asks where a picture is to go and writes it there, as PNG, SVG or PDF; says what went wrong.
/// `proposed` is the path to begin with; where its folder is not there only its name counts.
void askForPicture(QWidget* window, const QString& title, const QString& proposed,
                   const Picture& picture);

/// Puts it on the clipboard, fine enough for documents that are printed.
void copyPicture(const Picture& picture);

} // namespace zandor::designer
