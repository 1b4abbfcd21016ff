#include "designer/PlainBox.h"

#include "frontends/qt/ShownText.h"

#include <QLabel>

namespace zandor::designer {

PlainBox::PlainBox(Icon icon, const QString& title, const QString& text, StandardButtons buttons,
                   QWidget* parent)
    : QMessageBox(icon, title, linesAsSigns(text), buttons, parent) {
    setTextFormat(Qt::PlainText);
}

void PlainBox::setInformativeText(const QString& text) {
    QMessageBox::setInformativeText(linesAsSigns(text));
    // The box has a label of its own for it, which its text format says nothing to.
    for (auto* const label : findChildren<QLabel*>()) label->setTextFormat(Qt::PlainText);
}

void PlainBox::warn(QWidget* parent, const QString& title, const QString& text) {
    PlainBox(Warning, title, text, Ok, parent).exec();
}

QString linesAsSigns(const QString& text) {
    QStringList lines = text.split(u'\n');
    for (QString& line : lines) line = platform::qt::asSigns(line);
    return lines.join(u'\n');
}

} // namespace zandor::designer
