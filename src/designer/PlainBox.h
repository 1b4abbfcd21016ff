#pragma once

#include <QMessageBox>

namespace zandor::designer {

/// A message box for texts that may hold anything, such as paths and names from files and
/// databases: they are plain text, and what cannot be seen in them stands as a sign. The designer
/// shows no other boxes.
class PlainBox final : public QMessageBox {
public:
    PlainBox(Icon icon, const QString& title, const QString& text, StandardButtons buttons,
             QWidget* parent);

    void setInformativeText(const QString& text);

    /// With one button.
    static void warn(QWidget* parent, const QString& title, const QString& text);
};

/// Text of several lines with signs for what cannot be seen in it.
QString linesAsSigns(const QString& text);

} // namespace zandor::designer
